// The driver for Leica GSI, GSI-8 and GSI-16 alike: raw files and downloads over a serial
// link. What the blocks become is told in GsiTranslator.h, how they are found in
// GsiBlockReader.h, and how words are read in GsiWord.h. Points go out as a GSI-16
// coordinate file (GsiUpload.h).

#include "DriverSession.h"
#include "GsiBlockReader.h"
#include "GsiTranslator.h"
#include "GsiUpload.h"

namespace {

class GsiSession : public sxn_session, private GsiBlockReader::Handler {
  public:
    GsiSession(const sxn_host& host, unsigned mode, unsigned flags, bool /*link*/)
        : sxn_session(host, mode, flags),
          translator_(
              Units(), [this](std::string_view record) { Record(record); },
              [this](std::string_view text) { Message(std::string(text)); }),
          reader_(*this) {}

    int Translate(const unsigned char* bytes, std::size_t size) override {
        return reader_.Feed(bytes, size) ? SXN_MORE : SXN_END;
    }

    void Finish() override {
        reader_.Finish();
        translator_.Finish();
    }

  private:
    void OnBlock(const std::vector<GsiWord>& words, std::string_view text, long line) override {
        Acknowledge(translator_.Block(words, text, line));
    }

    void OnUnreadable(std::string_view text, long line) override {
        translator_.Unreadable(text, line);
        Acknowledge(false);
    }

    void OnNotGsi() override { translator_.NotGsi(); }

    GsiTranslator translator_;
    GsiBlockReader reader_;
};

}  // namespace

extern "C" {

SXN_DRIVER_EXPORT const char* sxn_driver_name(void) {
    return "Leica GSI";
}

SXN_DRIVER_EXPORT const char* sxn_driver_description(void) {
    return "Leica GSI-8 and GSI-16 measurement, station and code blocks";
}

SXN_DRIVER_EXPORT const char* sxn_driver_extensions(void) {
    return "gsi,gs8,gs16";
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_import(const sxn_host* host, unsigned mode) {
    return sxn::Start<GsiSession>(host, mode, 0u, false);
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_download(const sxn_host* host, unsigned mode,
                                                   unsigned flags) {
    return sxn::Start<GsiSession>(host, mode, flags, true);
}

SXN_DRIVER_EXPORT sxn_session* sxn_driver_upload(const sxn_host* host, unsigned mode) {
    return sxn::Start<GsiUploadSession>(host, mode, 0u, true);
}

}  // extern "C"
