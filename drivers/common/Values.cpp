#include "Values.h"

#include <charconv>
#include <cmath>

#include "Text.h"

namespace sxn {

namespace {

constexpr double kMetresPerFoot = 0.3048;
constexpr double kMetresPerUsFoot = 1200.0 / 3937.0;

// The number as the records write it: no '+', no zeros in front of the whole part, and no
// sign on a value that is all zeros.
std::string Normal(std::string_view text) {
    bool negative = false;
    if (!text.empty() && (text.front() == '+' || text.front() == '-')) {
        negative = text.front() == '-';
        text.remove_prefix(1);
    }
    while (text.size() > 1 && text.front() == '0' && text[1] != '.') text.remove_prefix(1);
    std::string out = text.front() == '.' ? "0" + std::string(text) : std::string(text);
    if (negative && out.find_first_not_of("0.") != std::string::npos) out.insert(0, "-");
    return out;
}

int Decimals(std::string_view text) {
    const std::size_t point = text.find('.');
    return point == std::string_view::npos ? 0 : static_cast<int>(text.size() - point - 1);
}

// ddd.mmss to degrees; false when the minutes are 60 or more, or the seconds more than 60.
// Seconds of exactly 60, an instrument's rounding, carry into the minutes: `carried` says so.
bool DmsDegrees(std::string_view text, double& degrees, bool& carried) {
    const bool negative = text.front() == '-';
    if (negative) text.remove_prefix(1);
    const std::size_t point = text.find('.');
    std::string fraction(point == std::string_view::npos ? "" : text.substr(point + 1));
    if (fraction.size() < 4) fraction.resize(4, '0');
    double whole = 0.0;
    double minutes = 0.0;
    double seconds = 0.0;
    if (!ReadNumber(text.substr(0, point), whole) || !ReadNumber(fraction.substr(0, 2), minutes) ||
        !ReadNumber(fraction.substr(2, 2) + "." + fraction.substr(4) + "0", seconds) ||
        minutes >= 60.0 || seconds > 60.0)
        return false;
    carried = seconds == 60.0;
    const double magnitude = whole + minutes / 60.0 + seconds / 3600.0;
    degrees = negative ? -magnitude : magnitude;
    return true;
}

}  // namespace

LengthIn SameLength(LengthOut unit) {
    switch (unit) {
        case LengthOut::Feet:
            return LengthIn::Feet;
        case LengthOut::UsFeet:
            return LengthIn::UsFeet;
        default:
            return LengthIn::Metres;
    }
}

double Turn(double degrees) {
    const double turned = std::fmod(degrees, 360.0);
    return turned < 0.0 ? turned + 360.0 : turned;
}

bool ReadNumber(std::string_view text, double& value) {
    text = Trim(text);
    if (!text.empty() && text.front() == '+') text.remove_prefix(1);
    if (text.empty() || text.front() == '+') return false;
    const std::size_t digits = text.find_first_of("0123456789");
    if (digits == std::string_view::npos) return false;
    const auto result =
        std::from_chars(text.data(), text.data() + text.size(), value, std::chars_format::fixed);
    return result.ec == std::errc() && result.ptr == text.data() + text.size();
}

std::optional<Angle> Angle::Read(std::string_view text, AngleIn unit) {
    text = Trim(text);
    double value = 0.0;
    if (!ReadNumber(text, value)) return std::nullopt;
    Angle angle;
    angle.recorded_ = Normal(text);
    angle.unit_ = unit;
    switch (unit) {
        case AngleIn::Dms: {
            bool carried = false;
            if (!DmsDegrees(angle.recorded_, angle.degrees_, carried)) return std::nullopt;
            if (carried) angle.recorded_.clear();  // written converted, as a proper angle
            break;
        }
        case AngleIn::Gons:
            angle.degrees_ = value * 0.9;
            break;
        case AngleIn::Mils:
            angle.degrees_ = value * 360.0 / 6400.0;
            break;
        default:
            angle.degrees_ = value;
            break;
    }
    return angle;
}

Angle Angle::FromDegrees(double degrees) {
    Angle angle;
    angle.degrees_ = degrees;
    return angle;
}

std::string Angle::Text(AngleOut out) const {
    const bool same =
        !recorded_.empty() && ((unit_ == AngleIn::Dms && out == AngleOut::Dms) ||
                               (unit_ == AngleIn::Degrees && out == AngleOut::Degrees) ||
                               (unit_ == AngleIn::Gons && out == AngleOut::Gons));
    return same ? recorded_ : AngleText(degrees_, out, 6);
}

std::optional<Length> Length::Read(std::string_view text, LengthIn unit) {
    text = Trim(text);
    double value = 0.0;
    if (!ReadNumber(text, value)) return std::nullopt;
    Length length;
    length.recorded_ = Normal(text);
    length.unit_ = unit;
    length.metres_ = unit == LengthIn::Feet     ? value * kMetresPerFoot
                     : unit == LengthIn::UsFeet ? value * kMetresPerUsFoot
                                                : value;
    return length;
}

Length Length::FromMetres(double metres) {
    Length length;
    length.metres_ = metres;
    return length;
}

double Length::In(LengthOut out) const {
    switch (out) {
        case LengthOut::Feet:
            return metres_ / kMetresPerFoot;
        case LengthOut::UsFeet:
            return metres_ / kMetresPerUsFoot;
        default:
            return metres_;
    }
}

std::string Length::Text(LengthOut out) const {
    const bool same =
        !recorded_.empty() && ((unit_ == LengthIn::Metres && out == LengthOut::Metres) ||
                               (unit_ == LengthIn::Feet && out == LengthOut::Feet) ||
                               (unit_ == LengthIn::UsFeet && out == LengthOut::UsFeet));
    if (same) return recorded_;
    const int decimals = recorded_.empty() ? 4 : std::max(Decimals(recorded_), 3) + 1;
    return Fixed(In(out), decimals);
}

}  // namespace sxn
