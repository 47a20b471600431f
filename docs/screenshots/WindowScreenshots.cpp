#include "GUI/Windows/CDlgAboutImpl.h"
#include "GUI/Windows/CDlgCustomPresetImpl.h"
#include "GUI/Windows/CDlgProgramInfosImpl.h"
#include "Settings/FactoryPresets.h"
#include "Settings/SettingsStore.h"
#include "Shots.h"
#include "Update/UpdateMessage.h"

using namespace orvela;

namespace {

// The chooser with the presets that come with the program.
std::unique_ptr<QWidget> chooser() {
    SettingsEdit presets;
    for (const QString& name : FactoryPresets::names())
        PresetTree::write(presets, Mode_Advanced, name, FactoryPresets::contentOf(name));
    presets.commit();
    return std::make_unique<CDlgCustomPresetImpl>(nullptr, [](const QString&) {});
}

} // namespace

std::vector<Shot> windowShots() {
    std::vector<Shot> shots;
    shots.emplace_back("about", std::make_unique<CDlgAboutImpl>(nullptr));
    shots.emplace_back("program-infos", std::make_unique<CDlgProgramInfosImpl>(nullptr));
    shots.emplace_back("preset-chooser", chooser());
    shots.emplace_back("update-message", std::make_unique<UpdateMessage>(QStringLiteral(
                                             "An update to your version is available. You have version 2.00, "
                                             "latest available version is: 2.5.")));
    return shots;
}
