#include "instruments/RawFiles.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <iterator>

#include "platform/io/ReplaceFile.h"

namespace nedit {

std::string TemporaryRawFile() {
    const char* base = std::getenv("TMPDIR");
    const std::string folder = std::string(base != nullptr && *base != '\0' ? base : "/tmp") +
                               "/sxnedit-" + std::to_string(getuid());
    if (mkdir(folder.c_str(), 0700) != 0 && errno != EEXIST) return {};
    struct stat status {};
    if (lstat(folder.c_str(), &status) != 0 || !S_ISDIR(status.st_mode) ||
        status.st_uid != getuid())
        return {};
    return folder + "/" + kTemporaryRawFileName;
}

bool CopyRawFile(const std::string& from, const std::string& to) {
    std::ifstream in(from, std::ios::binary);
    if (!in) return false;
    const std::string bytes{std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
    return !in.bad() && ReplaceFile(to, bytes);
}

}  // namespace nedit
