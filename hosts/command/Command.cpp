#include "command/Command.h"

#include "Settings/PresetFile.h"
#include "Utility/CGenericEx.h"
#include "command/EditCommand.h"
#include "command/EnhanceCommand.h"
#include "command/Messages.h"
#include "command/ModesCommand.h"
#include "command/ParseRefusal.h"
#include "command/PresetsCommand.h"
#include "run/PresetFiles.h"
#include "run/UsageError.h"

#include <QCoreApplication>

#include <fcntl.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <csignal>
#include <iostream>
#include <system_error>

namespace orvela {

namespace {

// A subcommand parses into an object of its own and leaves here what it is to do.
using Action = std::function<ExitStatus()>;

void addEnhance(CLI::App& program, Action& action, StopSignals& signals) {
    CLI::App* command = program.add_subcommand("enhance", "Enhance photographs");
    const auto options = std::make_shared<EnhanceOptions>();
    options->declare(*command);
    command->callback([&action, &signals, options] {
        action = [&signals, options] {
            PresetFiles::checkStore();
            return enhancePhotographs(*options, signals);
        };
    });
}

void addEdit(CLI::App& program, Action& action, StopSignals& signals) {
    CLI::App* command = program.add_subcommand("edit", "Open photographs in the windows of the filter");
    const auto options = std::make_shared<EditOptions>();
    options->declare(*command);
    command->callback([&action, &signals, options] {
        action = [&signals, options] { return editPhotographs(*options, signals); };
    });
}

void addModes(CLI::App& program, Action& action) {
    CLI::App* command = program.add_subcommand("modes", "List the modes and their sliders");
    const auto asJson = std::make_shared<bool>(false);
    CLI::Option* json = command->add_flag("--json", *asJson, "as JSON");
    const auto kind = std::make_shared<std::string>();
    command->add_option("--names", *kind, "names only, one a line: modes, settings or final-touch")
        ->option_text("KIND")
        ->check(CLI::IsMember(nameKinds()))
        ->excludes(json);
    command->callback([&action, asJson, kind] {
        action = [asJson, kind] { return kind->empty() ? listModes(*asJson) : listNames(*kind); };
    });
}

void addPresets(CLI::App& program, Action& action, StopSignals& signals) {
    CLI::App* command = program.add_subcommand("presets", "List, export, import and remove stored presets");
    const auto options = std::make_shared<PresetsOptions>();
    options->declare(*command, [&action, &signals, options](Action chosen) {
        action = [&signals, chosen = std::move(chosen)] {
            const StopAction leave(signals, [&signals] { signals.leave(); });
            PresetFiles::checkStore();
            return chosen();
        };
    });
}

// No option and no argument means anything when it is empty; a script's variable often is.
void refuseEmptyValues(CLI::App& app) {
    for (CLI::Option* option : app.get_options())
        option->check([](const std::string& text) { return text.empty() ? "is empty" : std::string(); });
    for (CLI::App* command : app.get_subcommands({}))
        refuseEmptyValues(*command);
}

ExitStatus refuse(ExitStatus status, const std::string& text) {
    Messages::tell(text);
    return status;
}

ExitStatus perform(const Action& action) {
    try {
        return action();
    } catch (const UsageError& error) {
        return refuse(ExitStatus::WrongUsage, error.what());
    } catch (const PresetError& error) {
        return refuse(ExitStatus::WrongUsage, error.what());
    }
}

// A file that is opened under the number of a closed output would take what the program tells.
void occupyClosedOutputs() {
    int handle = -1;
    do
        handle = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
    while (handle >= 0 && handle <= STDERR_FILENO);
    ::close(handle);
}

int runProgram(int argc, char** argv) {
    occupyClosedOutputs();
    StopSignals signals;
    std::signal(SIGCHLD, SIG_DFL); // ignored, it would keep what becomes of the windows to itself
    std::signal(SIGXFSZ, SIG_IGN); // a file above the limit fails like a full disk
    QCoreApplication application(argc, argv);

    CLI::App program("Enhances photographs.", "orvela");
    program.set_version_flag("--version", "orvela " ORVELA_VERSION);
    program.require_subcommand(1);
    Action action;
    addEnhance(program, action, signals);
    addEdit(program, action, signals);
    addModes(program, action);
    addPresets(program, action, signals);
    refuseEmptyValues(program);
    try {
        program.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        if (error.get_exit_code() != 0)
            return static_cast<int>(refuse(ExitStatus::WrongUsage, parseRefusal(program, error)));
        program.exit(error); // --help and --version come this way, too
    }
    ExitStatus status = action ? perform(action) : ExitStatus::Done;
    if (!std::cout.flush())
        status = std::max(status, refuse(ExitStatus::TargetTrouble, "the output cannot be written"));
    return signals.received() ? kSignalBase + signals.received() : static_cast<int>(status);
}

// For whatever nothing deeper had a message for.
ExitStatus fail(const std::exception& failure) {
    const auto* system = dynamic_cast<const std::system_error*>(&failure);
    const bool noThread = system && system->code() == std::errc::resource_unavailable_try_again;
    if (noThread || isOutOfMemory(failure))
        return refuse(ExitStatus::OutOfMemory, "not enough memory; close other programs");
    return refuse(ExitStatus::PhotographFailed, innermostMessage(failure).toStdString());
}

} // namespace

int runCommand(int argc, char** argv) {
    try {
        return runProgram(argc, argv);
    } catch (const std::exception& failure) {
        return static_cast<int>(fail(failure));
    } catch (...) {
        return static_cast<int>(
            refuse(ExitStatus::PhotographFailed, "failed for an unknown reason; report this"));
    }
}

} // namespace orvela
