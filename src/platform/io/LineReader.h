#pragma once
// Reads a text file line by line in large blocks. A line ends at LF, CR LF or a lone CR (as
// files from old instruments have it); a line
// longer than the limit keeps its first `max_line_bytes` bytes and the rest is skipped, so
// that a file without line ends cannot make the reader grow without bound.

#include <cstdio>
#include <string>
#include <vector>

namespace nedit {

class LineReader {
  public:
    explicit LineReader(std::size_t max_line_bytes = 64 * 1024);
    ~LineReader();
    LineReader(const LineReader&) = delete;
    LineReader& operator=(const LineReader&) = delete;

    /// Opens the file at a UTF-8 path; false when it cannot be opened for reading.
    bool Open(const std::string& path);
    /// The next line without its line end; false at the end of the file or on a read error. A UTF-8
    /// byte-order mark at the very start of the file is dropped.
    bool ReadLine(std::string& line);
    /// Bytes consumed so far and the size of the file, for progress.
    long long Position() const { return consumed_; }
    long long Size() const { return size_; }

  private:
    bool Fill();

    std::FILE* file_ = nullptr;
    std::size_t max_line_bytes_;
    std::vector<char> buffer_;
    std::size_t begin_ = 0;
    std::size_t end_ = 0;
    long long consumed_ = 0;
    long long size_ = 0;
    bool at_start_ = true;
    bool after_cr_ = false;  // the last line ended at a CR, so an LF right after it is skipped
};

}  // namespace nedit
