#include "command/ParseRefusal.h"

#include "command/NearestNames.h"

#include <CLI/CLI.hpp>

namespace orvela {

namespace {

// The first of the program and its chosen subcommands that was given what it does not know; the last of them
// when all did.
const CLI::App& refusing(const CLI::App& program) {
    const CLI::App* app = &program;
    while (app->remaining().empty() && !app->get_subcommands().empty())
        app = app->get_subcommands().front();
    return *app;
}

std::string fullName(const CLI::App& app) {
    return app.get_parent() ? fullName(*app.get_parent()) + " " + app.get_name() : app.get_name();
}

std::vector<std::string> optionsOf(const CLI::App& app) {
    std::vector<std::string> names;
    for (const CLI::Option* option : app.get_options())
        for (const std::string& name : option->get_lnames())
            names.push_back("--" + name);
    return names;
}

std::vector<std::string> commandsOf(const CLI::App& app) {
    std::vector<std::string> names;
    for (const CLI::App* command : app.get_subcommands([](const CLI::App*) { return true; }))
        names.push_back(command->get_name());
    return names;
}

} // namespace

std::string parseRefusal(const CLI::App& program, const CLI::ParseError& error) {
    const CLI::App& app = refusing(program);
    const std::string help = "`" + fullName(app) + " --help` tells";
    const std::vector<std::string> unknown = app.remaining();
    if (unknown.empty())
        return std::string(error.what()) + "; " + help;
    const std::string name = unknown.front().substr(0, unknown.front().find('='));
    if (name.starts_with('-'))
        return "there is no option " + name + NearestNames::advice(name, optionsOf(app), help);
    if (const std::vector<std::string> commands = commandsOf(app); !commands.empty())
        return "there is no command \"" + name + "\"" + NearestNames::advice(name, commands, help);
    return "\"" + unknown.front() + "\" is one argument too many; " + help;
}

} // namespace orvela
