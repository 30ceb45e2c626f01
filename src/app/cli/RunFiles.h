#pragma once
// The files of one command: what it reads (the job, a neutral file, a CSV file) and what it
// writes. Every command that writes a file checks them here before it does any work, so that
// an output never replaces an input of the same run, two outputs never fall on one file, and
// an output that cannot be written is refused before the job is touched.
//
// An input that is DEBUG.DAT of the working directory is refused too: every reduction removes
// that file as it starts, and it would take the user's data with it.
//
// Two paths are the same file when they lead to the same device and inode, whatever links or
// spellings lead there.

#include <string>
#include <vector>

class RunFiles {
  public:
    /// A file the command reads; "" is none.
    RunFiles& Reads(const std::string& path);
    /// A file the command writes; "" and "-" (standard output) are none.
    RunFiles& Writes(const std::string& path);
    /// True when every output may be written; else false after "sxnedit: cannot write …" on
    /// standard error.
    bool Check() const;

  private:
    std::vector<std::string> inputs_;
    std::vector<std::string> outputs_;
};
