// sxnedit rows FILE.neu: the rows of a neutral file as the record list holds them.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>
#include <string>

#include "Commands.h"
#include "RecordSession.h"
#include "platform/text/WideText.h"

namespace {

int Rows(const std::string& file) {
    RecordSession session;
    if (!session.Start()) return exit_status::Failed;
    if (!session.StartEngine().LoadNeFile(nedit::FromUtf8(file))) {
        if (session.host.Messages().empty()) {
            std::fprintf(stderr, "sxnedit: %s holds no records\n", file.c_str());
        }
        return exit_status::Unreadable;
    }
    std::string out;
    for (int row = 0; row < session.list->GetItemCount(); ++row) {
        out += session.list->GetRowUtf8(row);
        out += '\n';
        if (out.size() > (1 << 20)) {
            std::fwrite(out.data(), 1, out.size(), stdout);
            out.clear();
        }
    }
    std::fwrite(out.data(), 1, out.size(), stdout);
    return std::fflush(stdout) == 0 ? exit_status::Ok : exit_status::Failed;
}

}  // namespace

void AddRowsCommand(CLI::App& app, CommandRun& run) {
    auto file = std::make_shared<std::string>();
    CLI::App* rows = app.add_subcommand(
        "rows",
        "print the records of a neutral file, one per line, as\n"
        "the record list holds them (upper case, laid out,\nunknown keys as comments)");
    rows->add_option("FILE.neu", *file, "the neutral file")->required();
    rows->callback([file, &run] { run = [file] { return Rows(*file); }; });
}
