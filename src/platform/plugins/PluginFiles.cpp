#include "platform/plugins/PluginFiles.h"

#include <algorithm>
#include <filesystem>
#include <system_error>

namespace nedit {

std::string ProgramDirectory() {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return error ? std::string() : program.parent_path().string();
}

std::vector<std::string> SharedLibrariesIn(const std::string& directory) {
    std::vector<std::string> paths;
    std::error_code error;
    for (std::filesystem::directory_iterator entry(directory, error), end; !error && entry != end;
         entry.increment(error)) {
        if (entry->path().extension() == ".so" && entry->is_regular_file(error))
            paths.push_back(entry->path().string());
    }
    std::sort(paths.begin(), paths.end());
    return paths;
}

}  // namespace nedit
