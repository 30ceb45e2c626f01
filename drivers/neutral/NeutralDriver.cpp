// The driver for instruments and programs that already write neutral records: the lines
// pass through, one record each.
//
// Decisions:
// - A raw file must begin with the neutral-file header, as a neutral file read directly
//   must; anything else is refused with the reader's message, so a file of another format
//   is not read as comments. An instrument on a link may leave the header out: the driver
//   then writes it itself.
// - Lines end at CR LF, LF or a lone CR (LineSplitter.h). Blank lines give no record. A line that
// is not
//   UTF-8 is read as Latin-1, and control characters in it become blanks.
// - A line longer than a record may be is not cut into a record with half its fields: it
//   becomes a comment that names its line, and the user is told how many there were.
// - ETX, EOT or SUB at the start of a line ends the transfer; inside a line it is a control
//   character like any other. XON and XOFF that reach the driver are dropped.

#include <string>

#include "DriverSession.h"
#include "LineSplitter.h"

namespace {

constexpr const char* kHeader = "#VERSION-1.0 NEUTRAL FILE";
// Bytes of a line that are kept; beyond this a line is too long for any record anyway.
constexpr std::size_t kKeep = SXN_RECORD_MAX + 1;
constexpr std::size_t kShownOfLongLine = 150;

bool IsHeader(const std::string& line) {
    std::string upper = line;
    for (char& c : upper) {
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
    }
    const std::string end = " NEUTRAL FILE";
    return upper.rfind("#VERSION-", 0) == 0 && upper.size() > end.size() &&
           upper.compare(upper.size() - end.size(), end.size(), end) == 0;
}

class NeutralSession : public sxn_session {
  public:
    NeutralSession(const sxn_host& host, unsigned mode, unsigned flags, bool link)
        : sxn_session(host, mode, flags),
          link_(link),
          lines_([this](const sxn::RawLine& line) { EndLine(line); }) {}

    int Translate(const unsigned char* bytes, std::size_t size) override {
        return lines_.Feed(bytes, size) && !ended_ ? SXN_MORE : SXN_END;
    }

    void Finish() override {
        if (!ended_) lines_.Finish();
        if (too_long_ > 0) {
            Message(std::to_string(too_long_) + (too_long_ == 1 ? " line was" : " lines were") +
                    " longer than " + std::to_string(SXN_RECORD_MAX) +
                    " characters; they stand as comments that name their lines.");
        }
    }

  private:
    void EndLine(const sxn::RawLine& raw) {
        if (ended_) return;
        std::string line = sxn::LineToUtf8(raw.bytes.substr(0, kKeep));
        if (raw.number == 1 && line.rfind("\xEF\xBB\xBF", 0) == 0) line.erase(0, 3);
        for (char& c : line) {
            if (static_cast<unsigned char>(c) < 0x20) c = ' ';
        }
        const std::size_t last = line.find_last_not_of(' ');
        if (last == std::string::npos) return;
        line.erase(last + 1);
        if (!header_seen_ && !TakeHeader(line)) return;
        if (raw.length > SXN_RECORD_MAX) {
            ++too_long_;
            Record("# LINE " + std::to_string(raw.number) + " TOO LONG (" +
                   std::to_string(raw.length) +
                   " CHARACTERS): " + sxn::Printable(line, kShownOfLongLine));
            Acknowledge(false);
            return;
        }
        Record(line);
        Acknowledge(true);
    }

    // Before the first record: true when `line` is still to be written as a record.
    bool TakeHeader(const std::string& line) {
        header_seen_ = true;
        if (IsHeader(line)) {
            Record(line);
            return false;
        }
        if (link_) {
            Record(kHeader);
            return true;
        }
        Message("Neutral file header not found.");
        ended_ = true;
        return false;
    }

    const bool link_;
    sxn::LineSplitter lines_;
    long too_long_ = 0;
    bool header_seen_ = false;
    bool ended_ = false;  // the data were refused
};

}  // namespace

extern "C" {

SXN_DRIVER_EXPORT const char* sxn_driver_name(void) {
    return "Neutral";
}

SXN_DRIVER_EXPORT const char* sxn_driver_description(void) {
    return "Neutral records (#VERSION-1.0 NEUTRAL FILE), from a file or an instrument";
}

SXN_DRIVER_EXPORT const char* sxn_driver_extensions(void) {
    return "neu";
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_import(const sxn_host* host, unsigned mode) {
    return sxn::Start<NeutralSession>(host, mode, 0u, false);
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_download(const sxn_host* host, unsigned mode,
                                                   unsigned flags) {
    return sxn::Start<NeutralSession>(host, mode, flags, true);
}

}  // extern "C"
