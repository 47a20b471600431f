#include "command/ParseRefusal.h"

#include "run/NearestNames.h"
#include "run/TextValues.h"

#include <CLI/CLI.hpp>
#include <algorithm>

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

// The commands that know an option which was given before them.
std::vector<std::string> commandsWith(const CLI::App& app, const std::string& option) {
    std::vector<std::string> names;
    for (const CLI::App* command : app.get_subcommands([](const CLI::App*) { return true; }))
        if (const auto options = optionsOf(*command); std::ranges::find(options, option) != options.end())
            names.push_back('`' + fullName(*command) + '`');
    return names;
}

// The library's texts begin with the name of the option.
std::string valueRefusal(const CLI::App& app, const CLI::ParseError& error) {
    std::string text = error.what();
    const std::string name = text.substr(0, text.find(':'));
    if (dynamic_cast<const CLI::ArgumentMismatch*>(&error)) {
        const CLI::Option* option = app.get_option_no_throw(name);
        return option && option->count() > 1 ? name + " is given more than once" : name + " needs a value";
    }
    if (dynamic_cast<const CLI::RequiredError*>(&error) && !commandsOf(app).empty())
        return "name a command: " + TextValues::joined(commandsOf(app), " or ");
    return text;
}

} // namespace

std::string parseRefusal(const CLI::App& program, const CLI::ParseError& error) {
    const CLI::App& app = refusing(program);
    const std::string help = "`" + fullName(app) + " --help` tells";
    const std::vector<std::string> unknown = app.remaining();
    if (unknown.empty())
        return valueRefusal(app, error) + "; " + help;
    const std::string name = unknown.front().substr(0, unknown.front().find('='));
    if (const std::vector<std::string> commands = commandsWith(app, name); !commands.empty())
        return name + " belongs behind " + TextValues::joined(commands, " or ") + "; " + help;
    if (name.starts_with('-'))
        return "there is no option " + name + NearestNames::advice(name, optionsOf(app), help);
    if (const std::vector<std::string> commands = commandsOf(app); !commands.empty())
        return "there is no command \"" + name + "\"" + NearestNames::advice(name, commands, help);
    return "\"" + unknown.front() + "\" is one argument too many; " + help;
}

} // namespace orvela
