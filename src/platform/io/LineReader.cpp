#include "platform/io/LineReader.h"

#include <sys/stat.h>

#include <algorithm>
#include <cstring>

namespace nedit {

namespace {
constexpr std::size_t kBlockSize = 1 << 16;
}

LineReader::LineReader(std::size_t max_line_bytes)
    : max_line_bytes_(max_line_bytes), buffer_(kBlockSize) {}

LineReader::~LineReader() {
    if (file_ != nullptr) std::fclose(file_);
}

bool LineReader::Open(const std::string& path) {
    file_ = std::fopen(path.c_str(), "rb");
    if (file_ == nullptr) return false;
    struct stat info {};
    // A directory opens on Linux but cannot be read as text.
    if (fstat(fileno(file_), &info) != 0 || S_ISDIR(info.st_mode)) {
        std::fclose(file_);
        file_ = nullptr;
        return false;
    }
    size_ = static_cast<long long>(info.st_size);
    return true;
}

bool LineReader::Fill() {
    begin_ = 0;
    end_ = std::fread(buffer_.data(), 1, buffer_.size(), file_);
    return end_ > 0;
}

bool LineReader::ReadLine(std::string& line) {
    line.clear();
    if (file_ == nullptr) return false;
    bool any = false;
    for (;;) {
        if (begin_ == end_ && !Fill()) return any;
        if (at_start_) {
            at_start_ = false;
            if (end_ - begin_ >= 3 &&
                std::memcmp(buffer_.data() + begin_, "\xEF\xBB\xBF", 3) == 0) {
                begin_ += 3;
                consumed_ += 3;
                if (begin_ == end_) continue;
            }
        }
        if (after_cr_) {
            after_cr_ = false;
            if (buffer_[begin_] == '\n') {
                ++begin_;
                ++consumed_;
                continue;
            }
        }
        any = true;
        // The line ends at the first LF, or at a CR before it.
        const char* from = buffer_.data() + begin_;
        const char* newline = static_cast<const char*>(std::memchr(from, '\n', end_ - begin_));
        const std::size_t before =
            newline != nullptr ? static_cast<std::size_t>(newline - from) : end_ - begin_;
        const char* cr = static_cast<const char*>(std::memchr(from, '\r', before));
        const std::size_t stop =
            begin_ + (cr != nullptr ? static_cast<std::size_t>(cr - from) : before);
        const std::size_t piece = stop - begin_;
        if (line.size() < max_line_bytes_) {
            line.append(buffer_.data() + begin_, std::min(piece, max_line_bytes_ - line.size()));
        }
        const bool ended = stop < end_;
        const std::size_t used = piece + (ended ? 1 : 0);
        if (ended) after_cr_ = buffer_[stop] == '\r';
        begin_ += used;
        consumed_ += static_cast<long long>(used);
        if (ended) return true;
    }
}

}  // namespace nedit
