#include "edit/Edit.h"

#include "GUI/Windows/CDlgMainImpl.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/HelpWindow.h"
#include "GUI/Windows/MessageBoxes.h"
#include "GUI/Windows/Translations.h"
#include "PluginEntry/PictureSession.h"
#include "Settings/ModeTable.h"
#include "common/ImageHost.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"

#include <QApplication>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <iostream>

namespace orvela {

namespace {

struct Options {
    std::filesystem::path photo;
    std::filesystem::path target;
    std::string mode;
    WriteOptions writing;
};

std::vector<std::string> modeNames() {
    std::vector<std::string> names;
    for (const ModeDescription& mode : ModeTable::all())
        names.emplace_back(mode.displayName);
    return names;
}

bool runWindows(const std::string& mode, PictureSession& session) {
    if (mode.empty())
        return CDlgMainImpl(nullptr, &session.input(), &session.output()).run();
    const auto chosen =
        std::find_if(ModeTable::all().begin(), ModeTable::all().end(),
                     [&mode](const ModeDescription& each) { return each.displayName == mode; });
    CDlgSettingsImpl window(chosen->mode, &session.input(), &session.output());
    window.setHelp([&window](const QString& page) { openHelp(page, &window); });
    window.run();
    return window.appliesOnFinish();
}

void edit(const Options& options) {
    Photograph photograph = readPhotograph(options.photo);
    checkTarget(photograph, options.target, options.writing);
    ImageHost host(std::move(photograph));
    std::int16_t result = 0;
    PictureSession session(&host.record(), &result);
    if (!runWindows(options.mode, session)) {
        std::cout << options.photo.string() << ": left as it is\n";
        return;
    }
    session.writeBack();
    for (const std::string& note : writePhotograph(host.photograph(), options.target, options.writing))
        std::cerr << "orvela_edit: " << options.target.string() << ": " << note << '\n';
    std::cout << options.target.string() << '\n';
}

} // namespace

int runEdit(int argc, char** argv) {
    Options options;
    CLI::App usage("Opens a photograph in the windows of Orvela.", "orvela_edit");
    usage.add_option("photo", options.photo, "the photograph")->required();
    usage.add_option("-o,--output", options.target, "where the result goes")->required();
    usage.add_option("--mode", options.mode, "opens this way of working, without the main window")
        ->check(CLI::IsMember(modeNames()));
    usage.add_flag("--force", options.writing.overwrite, "overwrites the result of an earlier run");
    try {
        usage.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return usage.exit(error) == 0 ? 0 : 2;
    }
    const QApplication application(argc, argv);
    installMessageBoxes();
    Translations::install();
    try {
        edit(options);
        return 0;
    } catch (const std::exception& error) {
        std::cerr << "orvela_edit: " << options.photo.string() << ": " << error.what() << '\n';
        return 1;
    }
}

} // namespace orvela
