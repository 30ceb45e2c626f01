// sxnedit: the command line of SXNedit. Thin over the engine; errors are caught only here.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <exception>
#include <memory>
#include <string>

#include "BuildInfo.h"
#include "Commands.h"
#include "HelpFormatter.h"

namespace {

const char* const kDescription = "Reads total-station observations held as neutral records.";

const char* const kFooter =
    "Run 'sxnedit COMMAND --help' for the options of a command.\n"
    "Exit status: 0 done, 1 failed (an output refused; for reduce also: the run did\n"
    "not reach its end, or points that are no finite numbers were left out; for\n"
    "traverse adjust and doc traverse: the traverse was not adjusted; for transfer\n"
    "and doc transfer: the transfer did not come to its end and was not kept),\n"
    "2 an input file could not be read, 64 the command line is wrong.\n"
    "Environment: SXNEDIT_DATA_DIR names the directory of the record definition,\n"
    "SXNEDIT_DRIVER_DIR the directory of the instrument drivers (else drivers/ beside\n"
    "the program).";

// The command that the words named, as deep as they went.
const CLI::App& GivenCommand(const CLI::App& app) {
    const std::vector<const CLI::App*> given = app.get_subcommands({});
    for (const CLI::App* command : given) {
        if (command->parsed()) return GivenCommand(*command);
    }
    return app;
}

// A wrong command line: what is wrong, and the usage of the command it was meant for.
int UsageError(const CLI::App& app, const CLI::ParseError& error) {
    const CLI::App& command = GivenCommand(app);
    const std::string name = HelpFormatter::FullName(command);
    const bool group = !command.get_subcommands({}).empty();
    const std::vector<std::string> rest = command.remaining();
    if (group && !rest.empty() && rest.front().rfind('-', 0) != 0) {
        const std::string words = name.substr(app.get_name().size()) + " " + rest.front();
        std::fprintf(stderr, "sxnedit: unknown command '%s' (see %s --help)\n", words.c_str() + 1,
                     name.c_str());
        return exit_status::Usage;
    }
    const std::string where = name.size() > app.get_name().size()
                                  ? name.substr(app.get_name().size() + 1) + ": "
                                  : std::string();
    std::string what = error.what();
    if (group)
        what = rest.empty() ? "a command is needed" : "unknown option '" + rest.front() + "'";
    std::fprintf(stderr, "sxnedit: %s%s\n%sRun '%s --help' for more information.\n", where.c_str(),
                 what.c_str(), HelpFormatter::Usage(command).c_str(), name.c_str());
    return exit_status::Usage;
}

int Run(int argc, char** argv) {
    CLI::App app(kDescription, "sxnedit");
    app.formatter(std::make_shared<HelpFormatter>());
    app.set_help_flag("-h,--help", "show this help and exit");
    app.set_version_flag("--version", std::string("sxnedit ") + SXNEDIT_VERSION,
                         "show the version and exit");
    app.require_subcommand(1);
    CommandRun run;
    AddRowsCommand(app, run);
    AddReduceCommand(app, run);
    AddTraverseCommands(app, run);
    AddTransferCommand(app, run);
    AddJobCommands(app, run);
    AddDocCommands(app, run);
    AddInstrumentsCommand(app, run);
    AddImportCommand(app, run);
    AddDownloadCommand(app, run);
    app.footer(kFooter);  // after the commands, which would take it over
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        // Help and version are "errors" that end the parse with success.
        if (error.get_exit_code() == 0) return app.exit(error);
        return UsageError(app, error);
    }
    return run();
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return Run(argc, argv);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "sxnedit: %s\n", error.what());
        return exit_status::Failed;
    }
}
