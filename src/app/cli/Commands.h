#pragma once
// The commands of the sxnedit program. Each adds itself to the command line with its
// arguments and options; when it is the command given, it leaves in `run` the work to do,
// which gives the process exit status.

#include <functional>

namespace CLI {
class App;
}

namespace exit_status {
constexpr int Ok = 0;
constexpr int Failed = 1;
constexpr int Unreadable = 2;  // an input file could not be read
constexpr int Usage = 64;      // the command line itself is wrong
}  // namespace exit_status

using CommandRun = std::function<int()>;

void AddRowsCommand(CLI::App& app, CommandRun& run);
void AddReduceCommand(CLI::App& app, CommandRun& run);
void AddJobCommands(CLI::App& app, CommandRun& run);
void AddDocCommands(CLI::App& app, CommandRun& run);
void AddTraverseCommands(CLI::App& app, CommandRun& run);
void AddTransferCommand(CLI::App& app, CommandRun& run);
void AddInstrumentsCommand(CLI::App& app, CommandRun& run);
void AddImportCommand(CLI::App& app, CommandRun& run);
void AddDownloadCommand(CLI::App& app, CommandRun& run);
