#pragma once
// The session of a driver whose format is made of text lines: bytes are cut into lines
// (LineSplitter), a translator of the format turns each line into records through a
// NeutralWriter, and the driver's five naming and starting functions come from one macro.
//
// A translator derives from LineTranslator and has the constants kTag ("RW5") and kName
// ("Carlson RW5").
//
// Decisions:
// - Blank lines give nothing. A line cut by the splitter for its length is not handed to the
//   translator: it stands as a line not read, with its true length.
// - Data that have not shown their format in their first kProbeBytes bytes are given up.
// - On a link every line read is acknowledged (ACK), every line refused with NAK.

#include <string>
#include <string_view>

#include "DriverSession.h"
#include "LineSplitter.h"
#include "NeutralWriter.h"

namespace sxn {

/// Turns the lines of one format into records, through the writer it is given.
class LineTranslator {
  public:
    explicit LineTranslator(NeutralWriter& out) : out_(out) {}
    virtual ~LineTranslator() = default;
    LineTranslator(const LineTranslator&) = delete;
    LineTranslator& operator=(const LineTranslator&) = delete;

    /// One line that is not blank; false when it could not be read.
    virtual bool Line(const RawLine& line) = 0;
    /// The data have ended: what is held back goes out.
    virtual void Finish() {}

  protected:
    NeutralWriter& out_;
};

template <class Translator>
class LineSession : public sxn_session {
  public:
    LineSession(const sxn_host& host, unsigned mode, unsigned flags, bool /*link*/)
        : sxn_session(host, mode, flags),
          writer_(
              Units(), Translator::kTag, Translator::kName,
              [this](std::string_view record) { Record(record); },
              [this](std::string_view text) { Message(std::string(text)); }),
          translator_(writer_),
          lines_([this](const RawLine& line) { OnLine(line); }) {}

    int Translate(const unsigned char* bytes, std::size_t size) override {
        const bool more = lines_.Feed(bytes, size);
        if (!writer_.Proven() && lines_.Bytes() > NeutralWriter::kProbeBytes) {
            writer_.NotFormat();
            return SXN_END;
        }
        return more ? SXN_MORE : SXN_END;
    }

    void Finish() override {
        lines_.Finish();
        translator_.Finish();
        writer_.Finish();
    }

  private:
    void OnLine(const RawLine& line) {
        if (line.bytes.find_first_not_of(" \t") == std::string_view::npos &&
            line.length == line.bytes.size())
            return;
        if (line.length > line.bytes.size()) {
            writer_.Unread(line.number, std::string(line.bytes.substr(0, 100)) + "... (" +
                                            std::to_string(line.length) + " CHARACTERS)");
            Acknowledge(false);
            return;
        }
        Acknowledge(translator_.Line(line));
    }

    NeutralWriter writer_;
    Translator translator_;
    LineSplitter lines_;
};

}  // namespace sxn

/// The five functions that name and start a driver of lines translated by `Translator`.
#define SXN_LINE_DRIVER(Translator, description, extensions)                                \
    extern "C" {                                                                            \
    SXN_DRIVER_EXPORT const char* sxn_driver_name(void) {                                   \
        return Translator::kName;                                                           \
    }                                                                                       \
    SXN_DRIVER_EXPORT const char* sxn_driver_description(void) {                            \
        return description;                                                                 \
    }                                                                                       \
    SXN_DRIVER_EXPORT const char* sxn_driver_extensions(void) {                             \
        return extensions;                                                                  \
    }                                                                                       \
    SXN_DRIVER_EXPORT sxn_session* sxn_driver_import(const sxn_host* host, unsigned mode) { \
        return sxn::Start<sxn::LineSession<Translator>>(host, mode, 0u, false);             \
    }                                                                                       \
    SXN_DRIVER_EXPORT sxn_session* sxn_driver_download(const sxn_host* host, unsigned mode, \
                                                       unsigned flags) {                    \
        return sxn::Start<sxn::LineSession<Translator>>(host, mode, flags, true);           \
    }                                                                                       \
    }
