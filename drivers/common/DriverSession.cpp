#include "DriverSession.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdlib>

namespace sxn {

OutputUnits OutputUnits::FromMode(unsigned mode) {
    OutputUnits units;
    switch (mode & 7u) {
        case SXN_MODE_DEGREES:
            units.angle = AngleOut::Degrees;
            break;
        case SXN_MODE_GONS:
            units.angle = AngleOut::Gons;
            break;
        default:
            break;
    }
    switch (mode & 56u) {
        case SXN_MODE_FEET:
            units.length = LengthOut::Feet;
            break;
        case SXN_MODE_US_FEET:
            units.length = LengthOut::UsFeet;
            break;
        default:
            break;
    }
    return units;
}

std::string OutputUnits::UnitRecord() const {
    const char* lengths[] = {"M", "F", "U"};
    const char* angles[] = {"S", "D", "G"};
    return std::string("UNIT UL=") + lengths[static_cast<int>(length)] +
           ",UA=" + angles[static_cast<int>(angle)];
}

std::string Fixed(double value, int decimals) {
    char text[64];
    const auto result =
        std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, decimals);
    std::string out(text, result.ptr);
    // "-0.000" says nothing that "0.000" does not.
    if (out.find_first_not_of("-0.") == std::string::npos && out[0] == '-') out.erase(0, 1);
    return out;
}

std::string ScaledInteger(long long value, int decimals) {
    std::string digits = std::to_string(std::llabs(value));
    if (decimals > 0) {
        if (digits.size() <= static_cast<std::size_t>(decimals))
            digits.insert(0, static_cast<std::size_t>(decimals) + 1 - digits.size(), '0');
        digits.insert(digits.size() - static_cast<std::size_t>(decimals), ".");
    }
    return value < 0 ? "-" + digits : digits;
}

std::string AngleText(double degrees, AngleOut unit, int decimals) {
    if (unit == AngleOut::Degrees) return Fixed(degrees, decimals);
    if (unit == AngleOut::Gons) return Fixed(degrees * 400.0 / 360.0, decimals);
    // ddd.mmss: whole seconds are the 4th place, so rounding happens on the seconds.
    const int second_places = decimals > 4 ? decimals - 4 : 0;
    const double scale = std::pow(10.0, second_places);
    const auto per_second = static_cast<long long>(scale);
    const long long total = std::llround(std::fabs(degrees) * 3600.0 * scale);
    const long long whole = total / (3600 * per_second);
    const long long minutes = total / (60 * per_second) % 60;
    const long long seconds = total % (60 * per_second);
    std::string fraction = std::to_string(minutes * 100 * per_second + seconds);
    fraction.insert(0, static_cast<std::size_t>(2 + 2 + second_places) - fraction.size(), '0');
    return (degrees < 0 && total > 0 ? "-" : "") + std::to_string(whole) + "." + fraction;
}

bool IsEndOfTransmission(unsigned char byte) {
    return byte == 0x03 || byte == 0x04 || byte == 0x1A;
}

bool IsFlowControl(unsigned char byte) {
    return byte == 0x11 || byte == 0x13;
}

namespace {

// The length of the UTF-8 sequence that starts at `at`, or 0 when it is not well formed.
std::size_t Utf8Length(std::string_view bytes, std::size_t at) {
    const auto lead = static_cast<unsigned char>(bytes[at]);
    std::size_t length = 0;
    if (lead < 0x80) return 1;
    if (lead >= 0xC2 && lead <= 0xDF) length = 2;
    if (lead >= 0xE0 && lead <= 0xEF) length = 3;
    if (lead >= 0xF0 && lead <= 0xF4) length = 4;
    if (length == 0 || at + length > bytes.size()) return 0;
    for (std::size_t i = 1; i < length; ++i) {
        if ((static_cast<unsigned char>(bytes[at + i]) & 0xC0) != 0x80) return 0;
    }
    return length;
}

}  // namespace

std::string LineToUtf8(std::string_view bytes) {
    bool valid = true;
    for (std::size_t at = 0; at < bytes.size() && valid;) {
        const std::size_t length = Utf8Length(bytes, at);
        valid = length > 0;
        at += length;
    }
    if (valid) return std::string(bytes);
    std::string out;
    out.reserve(bytes.size() * 2);
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte < 0x80) {
            out += c;
        } else {
            out += static_cast<char>(0xC0 | (byte >> 6));
            out += static_cast<char>(0x80 | (byte & 0x3F));
        }
    }
    return out;
}

std::string Printable(std::string_view bytes, std::size_t limit) {
    std::string out;
    for (std::size_t i = 0; i < bytes.size() && i < limit; ++i) {
        const auto byte = static_cast<unsigned char>(bytes[i]);
        out += byte >= 0x20 && byte < 0x7F ? bytes[i] : '?';
    }
    if (bytes.size() > limit) out += "...";
    return out;
}

}  // namespace sxn

sxn_session::sxn_session(const sxn_host& host, unsigned mode, unsigned flags)
    : host_(host), units_(sxn::OutputUnits::FromMode(mode)), flags_(flags) {}

sxn_session::~sxn_session() = default;

void sxn_session::Record(std::string_view text) const {
    if (text.size() > SXN_RECORD_MAX) {
        std::size_t cut = SXN_RECORD_MAX;
        while (cut > 0 && (static_cast<unsigned char>(text[cut]) & 0xC0) == 0x80) --cut;
        text = text.substr(0, cut);
    }
    const std::string record(text);
    if (host_.record != nullptr) host_.record(host_.context, record.c_str());
}

void sxn_session::Message(const std::string& text) const {
    if (host_.message != nullptr) host_.message(host_.context, text.c_str());
}

void sxn_session::Acknowledge(bool accepted) const {
    if ((flags_ & SXN_DOWNLOAD_ACKNAK) == 0 || host_.send == nullptr) return;
    const unsigned char answer = accepted ? 0x06 : 0x15;
    host_.send(host_.context, &answer, 1);
}

bool sxn_session::Send(std::string_view bytes) const {
    if (host_.send == nullptr) return false;
    while (!bytes.empty()) {
        const long taken = host_.send(
            host_.context, reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
        if (taken <= 0) return false;
        bytes.remove_prefix(std::min(bytes.size(), static_cast<std::size_t>(taken)));
    }
    return true;
}

// The functions that every driver exports alike. A C caller cannot take an exception, so
// none leaves here.

extern "C" {

SXN_DRIVER_EXPORT unsigned sxn_driver_api_version(void) {
    return SXN_DRIVER_API_VERSION;
}

SXN_DRIVER_EXPORT int sxn_driver_translate(sxn_session* session, const unsigned char* bytes,
                                           size_t size) {
    if (session == nullptr) return SXN_END;
    try {
        return session->Translate(bytes, size);
    } catch (...) {
        return SXN_END;
    }
}

SXN_DRIVER_EXPORT int sxn_driver_time_out(sxn_session* session, unsigned idle_ms,
                                          unsigned period_ms) {
    return session == nullptr ? 1 : session->TimeOut(idle_ms, period_ms);
}

SXN_DRIVER_EXPORT void sxn_driver_finish(sxn_session* session) {
    if (session == nullptr) return;
    try {
        session->Finish();
    } catch (...) {
    }
    delete session;
}

SXN_DRIVER_EXPORT void sxn_driver_abort(sxn_session* session) {
    delete session;
}

}  // extern "C"
