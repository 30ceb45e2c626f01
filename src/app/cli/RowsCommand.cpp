// sxnedit rows FILE.neu: the rows of a neutral file as the record list holds them.

#include <cstdio>

#include "Commands.h"
#include "RecordSession.h"
#include "platform/text/WideText.h"

int RunRows(const std::vector<std::string>& args) {
    if (args.size() != 1) {
        std::fprintf(stderr, "sxnedit: rows takes one neutral file (see sxnedit --help)\n");
        return exit_status::Usage;
    }
    RecordSession session;
    if (!session.Start()) return exit_status::Failed;
    if (!session.StartEngine(false).LoadNeFile(nedit::FromUtf8(args[0]))) {
        if (session.host.Messages().empty()) {
            std::fprintf(stderr, "sxnedit: %s holds no records\n", args[0].c_str());
        }
        return exit_status::Unreadable;
    }
    std::string out;
    for (int row = 0; row < session.list->GetItemCount(); ++row) {
        out += nedit::ToUtf8(session.list->GetItemText(row));
        out += '\n';
        if (out.size() > (1 << 20)) {
            std::fwrite(out.data(), 1, out.size(), stdout);
            out.clear();
        }
    }
    std::fwrite(out.data(), 1, out.size(), stdout);
    return std::fflush(stdout) == 0 ? exit_status::Ok : exit_status::Failed;
}
