#pragma once
// How the command line's help reads: a usage line that names a command's arguments, value
// names (JOB, OUT.csv) in place of type names, and, in the help of the program or of a group
// of commands, every command with its arguments on a line of its own.

#include <CLI/CLI.hpp>
#include <string>

class HelpFormatter : public CLI::Formatter {
  public:
    HelpFormatter();

    /// The usage line first, then what the command does, its arguments, options and commands.
    std::string make_help(const CLI::App* app, std::string name,
                          CLI::AppFormatMode mode) const override;
    /// "Usage: sxnedit reduce FILE.neu [OPTIONS]"; "Usage: sxnedit job COMMAND [ARGUMENTS]" for
    /// a group of commands.
    std::string make_usage(const CLI::App* app, std::string name) const override;
    /// Every command beneath `app`, nested ones by their whole name ("job new JOB").
    std::string make_subcommands(const CLI::App* app, CLI::AppFormatMode mode) const override;
    /// Nothing for an argument, whose name already says it; the value name for an option.
    std::string make_option_opts(const CLI::Option* option) const override;

    /// The usage line of `command`, as make_usage gives it.
    static std::string Usage(const CLI::App& command);
    /// The command's name as typed, from the program's name on: "sxnedit job new".
    static std::string FullName(const CLI::App& command);

  private:
    void ListCommands(std::string& out, const CLI::App& app, const std::string& prefix) const;
};
