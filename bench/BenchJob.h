#pragma once
// A job file of a benchmark's own, in a fresh folder under /tmp, and its removal.

#include <stdlib.h>
#include <unistd.h>

#include <cstdio>
#include <string>

namespace nedit::bench {

/// The path of a job in a new folder; the job itself is not made.
inline std::string TempJobPath() {
    char folder[] = "/tmp/sxnedit-bench-XXXXXX";
    const char* made = mkdtemp(folder);
    return std::string(made != nullptr ? made : "/tmp") + "/bench.job";
}

/// Removes the job and its folder.
inline void RemoveJob(const std::string& path) {
    std::remove(path.c_str());
    rmdir(path.substr(0, path.rfind('/')).c_str());
}

}  // namespace nedit::bench
