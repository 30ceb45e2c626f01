#pragma once
// The commands of the sxnedit program. Each takes the arguments after its name and gives
// the process exit status.

#include <string>
#include <vector>

namespace exit_status {
constexpr int Ok = 0;
constexpr int Failed = 1;
constexpr int Unreadable = 2;  // an input file could not be read
constexpr int Usage = 64;      // the command line itself is wrong
}  // namespace exit_status

int RunRows(const std::vector<std::string>& args);
int RunReduce(const std::vector<std::string>& args);
int RunDoc(const std::vector<std::string>& args);
int RunJob(const std::vector<std::string>& args);
int RunInstruments(const std::vector<std::string>& args);
int RunImport(const std::vector<std::string>& args);
int RunDownload(const std::vector<std::string>& args);
