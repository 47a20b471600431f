// Whole runs of every mode over real photographs, held against a record: the tasks that changed something,
// key statistics and a checksum of the result. `scripts/record-runs` writes the record anew.

#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "PluginEntry/Exchange/CARGBPlanePhotoshop.h"
#include "Settings/ModeTable.h"
#include "files/PhotographReader.h"
#include "support/HostedPicture.h"
#include "support/TestPlanes.h"

#include <QCryptographicHash>

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <sstream>

using namespace orvela;

namespace {

namespace fs = std::filesystem;

const fs::path kRecord = fs::path(ORVELA_TEST_DATA) / "records.tsv";

std::vector<fs::path> photographs() {
    std::vector<fs::path> found;
    for (const char* folder : {ORVELA_PHOTOS, ORVELA_SAMPLES}) {
        for (const auto& entry : fs::directory_iterator(folder)) {
            if (entry.is_regular_file() && entry.path().extension() != ".md")
                found.push_back(entry.path());
        }
    }
    std::sort(found.begin(), found.end(),
              [](const fs::path& a, const fs::path& b) { return a.filename() < b.filename(); });
    return found;
}

std::string checksum(const CARGBPlane& plane) {
    const auto all = testplanes::bytes(plane);
    const QByteArrayView view(all.data(), static_cast<qsizetype>(all.size()));
    return QCryptographicHash::hash(view.toByteArray(), QCryptographicHash::Sha1)
        .toHex()
        .left(16)
        .toStdString();
}

// One line of the record: photograph, mode, checksum, statistics, tasks that changed the picture.
std::string runLine(const std::string& photograph, const CARGBPlane& original, const ModeDescription& mode) {
    CARGBPlane in(original, QString());
    CARGBPlane out(original, QString());
    const CARGBPlaneProxyDirect proxy(original);
    CThreadedCore_Orvela core(&in, &out);
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [&core] { core.stepHandled(); });
    std::string tasks;
    std::string before = checksum(in);
    core.setObserver([&](const TaskReport& report) {
        if (report.kind != TaskKind::Filter || report.outcome != TaskOutcome::Applied)
            return;
        const std::string after = checksum(in);
        if (after != before)
            tasks += std::string(tasks.empty() ? "" : " ") + report.name;
        before = after;
    });
    core.setParams(CUserParamsPhotoshop(mode.mode));
    core.run();
    const CUserParams& p = core.params();
    std::ostringstream line;
    line << photograph << '\t' << static_cast<int>(mode.mode) << ' ' << mode.displayName << '\t'
         << checksum(in) << '\t';
    line.precision(7);
    line << "sumColor=" << p.mSum_Color << " luma0=" << p.m_OriginalLuma0 << " luma=" << p.m_OriginalLuma
         << " dark=" << p.m_Dark_Acu << " middle=" << p.m_Middle_Acu << " light=" << p.m_Light_Acu
         << " hazy=" << p.m_Opaco << " shadows=" << p.m_L_H_L_F << " midtones=" << p.m_M_H_L_F << '/'
         << p.m_M_H_H_F << " highlights=" << p.m_R_L_L_F << '\t' << tasks;
    return line.str();
}

std::vector<std::string> linesOf(const fs::path& photograph) {
    HostedPicture host(readPhotograph(photograph));
    std::int16_t result = 0;
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("record"));
    plane.FillFrom_Photoshop_Data(&host.record(), &result);
    std::vector<std::string> lines;
    for (const ModeDescription& mode : ModeTable::all()) {
        if (mode.hasSettings)
            lines.push_back(runLine(photograph.filename().string(), plane, mode));
    }
    return lines;
}

std::vector<std::string> recordedLines() {
    std::ifstream file(kRecord);
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);)
        lines.push_back(line);
    return lines;
}

TEST(RunRecord, EveryModeOnEveryPhotographGivesWhatWasRecorded) {
    const bool writing = qEnvironmentVariableIsSet("ORVELA_RECORD_RUNS");
    const std::vector<std::string> recorded = recordedLines();
    std::vector<std::string> current;
    for (const fs::path& photograph : photographs()) {
        for (const std::string& line : linesOf(photograph)) {
            if (!writing && current.size() < recorded.size()) {
                EXPECT_EQ(line, recorded[current.size()]);
            }
            current.push_back(line);
        }
    }
    ASSERT_EQ(current.size(), 10U * 31);
    if (!writing) {
        EXPECT_EQ(current.size(), recorded.size());
        return;
    }
    std::ofstream file(kRecord);
    for (const std::string& line : current)
        file << line << '\n';
}

} // namespace
