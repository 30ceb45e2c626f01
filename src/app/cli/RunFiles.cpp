#include "RunFiles.h"

#include <sys/stat.h>

#include <cstdio>

#include "platform/io/ReplaceFile.h"

namespace {

// The file that every engine removes from the working directory as it starts.
constexpr const char* kEngineScratchFile = "DEBUG.DAT";

bool SameFile(const std::string& a, const std::string& b) {
    struct stat first {};
    struct stat second {};
    return ::stat(a.c_str(), &first) == 0 && ::stat(b.c_str(), &second) == 0 &&
           first.st_dev == second.st_dev && first.st_ino == second.st_ino;
}

bool Refuse(const std::string& output, const std::string& why) {
    std::fprintf(stderr, "sxnedit: cannot write %s: %s\n", output.c_str(), why.c_str());
    return false;
}

}  // namespace

RunFiles& RunFiles::Reads(const std::string& path) {
    if (!path.empty()) inputs_.push_back(path);
    return *this;
}

RunFiles& RunFiles::Writes(const std::string& path) {
    if (!path.empty() && path != "-") outputs_.push_back(path);
    return *this;
}

bool RunFiles::Check() const {
    for (const std::string& input : inputs_) {
        if (SameFile(input, kEngineScratchFile)) {
            std::fprintf(stderr,
                         "sxnedit: cannot read %s: it is %s of the working directory, which "
                         "every reduction removes; give it another name or run from another "
                         "folder\n",
                         input.c_str(), kEngineScratchFile);
            return false;
        }
    }
    for (std::size_t i = 0; i < outputs_.size(); ++i) {
        const std::string& output = outputs_[i];
        for (const std::string& input : inputs_) {
            if (SameFile(output, input)) {
                return Refuse(output,
                              "it is the same file as " + input + ", which this command reads");
            }
        }
        for (std::size_t j = 0; j < i; ++j) {
            // Not there yet, both would still make one file.
            if (outputs_[j] == output || SameFile(outputs_[j], output)) {
                return Refuse(output, "it is the same file as " + outputs_[j] +
                                          ", which this command also writes");
            }
        }
        const std::string why = nedit::WhyNotWritable(output);
        if (!why.empty()) return Refuse(output, why);
    }
    return true;
}
