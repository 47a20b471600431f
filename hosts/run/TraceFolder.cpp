#include "run/TraceFolder.h"

#include "files/PhotographWriter.h"
#include "files/TargetFile.h"

#include <cstdio>
#include <cstring>
#include <nlohmann/json.hpp>

namespace orvela {

namespace fs = std::filesystem;

namespace {

bool isSamePicture(const CARGBPlane& a, const CARGBPlane& b) {
    for (const Channel channel : kChannels)
        if (std::memcmp(a.samples(channel), b.samples(channel), static_cast<std::size_t>(a.pixelCount())) !=
            0)
            return false;
    return true;
}

Photograph photographOf(const CARGBPlane& plane) {
    Photograph photograph;
    photograph.width = plane.width();
    photograph.height = plane.height();
    photograph.encoding.format = FileFormat::Png;
    photograph.samples.reserve(static_cast<std::size_t>(plane.pixelCount()) * 3);
    for (int i = 0; i < plane.pixelCount(); ++i)
        for (const Channel channel : kChannels)
            photograph.samples.push_back(plane.samples(channel)[i]);
    return photograph;
}

nlohmann::ordered_json statisticsOf(const CUserParams& params) {
    nlohmann::ordered_json statistics;
    for (const StatisticField& field : statisticFields())
        std::visit(
            [&](auto member) {
                // An infinite end of the range becomes null.
                statistics[field.name] = {{"value", params.*member},
                                          {"meaning", field.meaning},
                                          {"range", {field.low, field.high}},
                                          {"writer", field.writer}};
            },
            field.member);
    return statistics;
}

void writeText(const fs::path& target, const std::string& text, bool overwrite) {
    TargetFile file(target);
    file.write(text + '\n');
    file.commit(overwrite);
}

} // namespace

TraceFolder::TraceFolder(fs::path folder, bool overwrite, const CARGBPlane& original)
    : mFolder(std::move(folder)), mOverwrite(overwrite),
      mLast(std::make_unique<CARGBPlane>(original, QStringLiteral("Trace"))) {
    std::error_code error;
    fs::create_directories(mFolder, error);
    std::error_code unused;
    if (!fs::is_directory(mFolder, unused))
        throw TargetError(mFolder.string() + ": the folder cannot be made (" + error.message() +
                          "); name another folder for the trace");
    const bool holdsFiles = !fs::is_empty(mFolder, error);
    if (error)
        throw TargetError(mFolder.string() + ": the folder cannot be read (" + error.message() +
                          "); name another folder for the trace");
    if (!overwrite && holdsFiles)
        throw TargetError(mFolder.string() + ": holds files already; name an empty folder or use --force");
}

TraceFolder::~TraceFolder() = default;

void TraceFolder::taskDone(const TaskReport& report, const CThreadedCore& core) {
    if (report.kind != TaskKind::Filter || report.outcome != TaskOutcome::Applied)
        return;
    std::unique_ptr<CARGBPlane> picture = core.snapshot();
    if (isSamePicture(*picture, *mLast))
        return;
    mLast = std::move(picture);
    char name[160];
    std::snprintf(name, sizeof name, "%02d-%s", ++mNumber, report.name);
    WriteOptions options;
    options.overwrite = mOverwrite;
    writePhotograph(photographOf(*mLast), mFolder / (std::string(name) + ".png"), options);
    const CUserParams& params = core.params();
    const nlohmann::ordered_json content = {{"task", report.name},
                                            {"statistics", statisticsOf(params)},
                                            {"histograms",
                                             {{"luma", params.pHisto_Luma},
                                              {"red", params.pHisto_Red},
                                              {"green", params.pHisto_Green},
                                              {"blue", params.pHisto_Blue}}}};
    writeText(mFolder / (std::string(name) + ".json"), content.dump(1), mOverwrite);
}

} // namespace orvela
