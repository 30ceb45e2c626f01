#pragma once
// What every driver shares: the session behind the C interface, the units of the records it
// writes, and locale-free number text. A driver derives its session from sxn_session and
// defines the five functions that name and start it; the others live in DriverSession.cpp.

#include <cstddef>
#include <string>
#include <string_view>

#include "sxnedit_driver.h"

namespace sxn {

enum class AngleOut { Dms, Degrees, Gons };
enum class LengthOut { Metres, Feet, UsFeet };

/// The units of the records, from the import mode; an unknown bit pattern gives the first
/// unit of its group.
struct OutputUnits {
    AngleOut angle = AngleOut::Dms;
    LengthOut length = LengthOut::Metres;

    static OutputUnits FromMode(unsigned mode);
    /// "UNIT UL=M,UA=S" and the like: the record that tells the reader these units.
    std::string UnitRecord() const;
};

/// `value` with `decimals` places after the point, whatever the user's locale.
std::string Fixed(double value, int decimals);
/// The exact decimal text of value / 10^decimals ("-0.005" for -5 and 3).
std::string ScaledInteger(long long value, int decimals);
/// An angle in degrees as the records write it: ddd.mmss with `decimals` places (at least
/// 4), decimal degrees or gons.
std::string AngleText(double degrees, AngleOut unit, int decimals);

/// Bytes that end a transmission: ETX, EOT and SUB (the old end-of-file mark). The drivers
/// take them so only at the start of a line, where noise seldom puts them.
bool IsEndOfTransmission(unsigned char byte);
/// XON and XOFF, which a port without software flow control passes through as data.
bool IsFlowControl(unsigned char byte);
/// A line of bytes as UTF-8: as it is when it is UTF-8 already, else read as Latin-1.
std::string LineToUtf8(std::string_view bytes);
/// Up to `limit` bytes of `bytes` for a message or comment: printable ASCII kept, anything
/// else shown as '?', and "..." behind when something was left out.
std::string Printable(std::string_view bytes, std::size_t limit);

}  // namespace sxn

/// One translation. Records and messages go to the host given at the start.
struct sxn_session {
    sxn_session(const sxn_host& host, unsigned mode, unsigned flags);
    virtual ~sxn_session();
    sxn_session(const sxn_session&) = delete;
    sxn_session& operator=(const sxn_session&) = delete;

    /// SXN_MORE, or SXN_END when the data ended the transfer.
    virtual int Translate(const unsigned char* bytes, std::size_t size) = 0;
    /// The source has ended: records held back go out.
    virtual void Finish() = 0;
    /// Dead when nothing at all came for the whole period.
    virtual int TimeOut(unsigned idle_ms, unsigned period_ms) const {
        return idle_ms >= period_ms ? 1 : 0;
    }

  protected:
    /// Hands a record to the host, cut to SXN_RECORD_MAX bytes at a character boundary.
    void Record(std::string_view text) const;
    void Message(const std::string& text) const;
    /// ACK for a block read, NAK for one refused, when the download asked for them.
    void Acknowledge(bool accepted) const;
    /// All of `bytes` to the instrument (or the file the program writes); false when the
    /// host has no send or its send fails or takes nothing.
    bool Send(std::string_view bytes) const;
    const sxn::OutputUnits& Units() const { return units_; }

  private:
    sxn_host host_;
    sxn::OutputUnits units_;
    unsigned flags_;
};

namespace sxn {

/// A new session of `Session` for the C interface: null without a host or when it cannot be
/// made. `link` tells a download from an import.
template <class Session>
sxn_session* Start(const sxn_host* host, unsigned mode, unsigned flags, bool link) noexcept {
    if (host == nullptr) return nullptr;
    try {
        return new Session(*host, mode, flags, link);
    } catch (...) {
        return nullptr;
    }
}

}  // namespace sxn
