#include "HelpFormatter.h"

#include <sstream>

namespace {

// "FILE.neu JOB": the arguments of a command in their order.
std::string Arguments(const CLI::App& command) {
    std::string out;
    for (const CLI::Option* option :
         command.get_options([](const CLI::Option* o) { return o->get_positional(); })) {
        out += " " + option->get_name(true, false);
    }
    return out;
}

bool HasOptions(const CLI::App& command) {
    return !command
                .get_options([&command](const CLI::Option* o) {
                    return o->nonpositional() && o != command.get_help_ptr();
                })
                .empty();
}

}  // namespace

HelpFormatter::HelpFormatter() {
    label("Positionals", "Arguments");
    column_width(34);
}

std::string HelpFormatter::FullName(const CLI::App& command) {
    const CLI::App* parent = command.get_parent();
    return parent == nullptr ? command.get_name() : FullName(*parent) + " " + command.get_name();
}

std::string HelpFormatter::make_help(const CLI::App* app, std::string name,
                                     CLI::AppFormatMode mode) const {
    if (mode == CLI::AppFormatMode::Sub) return make_expanded(app);
    return make_usage(app, name) + make_description(app) + make_positionals(app) +
           make_groups(app, mode) + make_subcommands(app, mode) + "\n" + make_footer(app);
}

std::string HelpFormatter::make_usage(const CLI::App* app, std::string /*name*/) const {
    return Usage(*app);
}

std::string HelpFormatter::Usage(const CLI::App& command) {
    std::string out = "Usage: " + FullName(command);
    if (!command.get_subcommands({}).empty()) return out + " COMMAND [ARGUMENTS]\n";
    out += Arguments(command);
    if (HasOptions(command)) out += " [OPTIONS]";
    return out + "\n";
}

std::string HelpFormatter::make_subcommands(const CLI::App* app,
                                            CLI::AppFormatMode /*mode*/) const {
    if (app->get_subcommands({}).empty()) return {};
    std::string out = "\nCommands:\n";
    ListCommands(out, *app, "");
    return out;
}

void HelpFormatter::ListCommands(std::string& out, const CLI::App& app,
                                 const std::string& prefix) const {
    for (const CLI::App* command : app.get_subcommands({})) {
        const std::string name = prefix + command->get_name();
        if (!command->get_subcommands({}).empty()) {
            ListCommands(out, *command, name + " ");
            continue;
        }
        std::ostringstream line;
        CLI::detail::format_help(line, name + Arguments(*command), command->get_description(),
                                 column_width_);
        out += line.str();
    }
}

std::string HelpFormatter::make_option_opts(const CLI::Option* option) const {
    if (option->get_positional()) return {};
    return CLI::Formatter::make_option_opts(option);
}
