#pragma once
// Cuts the bytes of a text format into lines, for the drivers whose records are lines.
//
// Decisions:
// - A line ends at CR LF, LF or a lone CR; the bytes are handed on as they came, terminator
//   left out, so that a driver may count columns and read framing characters itself.
// - ETX, EOT or SUB at the start of a line ends the transfer. XON and XOFF are dropped.
// - Of a line longer than kKept bytes (noise, a binary file) only the first kKept are kept;
//   the line handed on says how long it really was.

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>

namespace sxn {

/// One line of the data.
struct RawLine {
    std::string_view bytes;  // as kept
    long number = 0;         // from 1
    std::size_t length = 0;  // as it came; more than bytes.size() when it was cut
};

class LineSplitter {
  public:
    using Sink = std::function<void(const RawLine&)>;
    static constexpr std::size_t kKept = 4096;

    explicit LineSplitter(Sink sink) : sink_(std::move(sink)) {}

    /// Reads the bytes; false once the data have ended the transfer.
    bool Feed(const unsigned char* bytes, std::size_t size);
    /// The end of the data: a last line without terminator goes out.
    void Finish();
    /// Bytes read so far.
    std::size_t Bytes() const { return bytes_; }

  private:
    void EndLine();

    Sink sink_;
    std::string line_;
    std::size_t length_ = 0;
    long number_ = 0;
    std::size_t bytes_ = 0;
    bool last_cr_ = false;
    bool ended_ = false;
};

}  // namespace sxn
