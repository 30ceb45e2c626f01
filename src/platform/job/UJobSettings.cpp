#include "platform/job/UJobSettings.h"

#include <algorithm>
#include <cmath>
#include <numeric>

#include "platform/format/UFormatAngle.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"

bool UJobSettings::operator==(const UJobSettings& other) const {
    return length_unit_ == other.length_unit_ && angle_unit_ == other.angle_unit_ &&
           length_decimals_ == other.length_decimals_ && angle_decimals_ == other.angle_decimals_ &&
           coordinate_order_ == other.coordinate_order_ && pick_aperture_ == other.pick_aperture_ &&
           show_height_ == other.show_height_ && angle_format_ == other.angle_format_ &&
           foot_format_ == other.foot_format_ && foot_inch_precision_ == other.foot_inch_precision_;
}

namespace {

// Past this, counting in inch fractions would overflow; no survey length comes near it.
constexpr double kMaxFractionCount = 9e18;

bool IsFoot(nedit::LengthUnit unit) {
    return unit == nedit::LengthUnit::Feet || unit == nedit::LengthUnit::USFeet;
}

const wchar_t* UnitMark(nedit::LengthUnit unit) {
    switch (unit) {
        case nedit::LengthUnit::Feet:
            return L" ft";
        case nedit::LengthUnit::USFeet:
            return L" usft";
        default:
            return L" m";
    }
}

// The sign before the digits of `value`: none when they show zero, so that a misclose of
// -0.0001 does not read as a direction.
const wchar_t* SignFor(double value, bool shows_as_zero, bool plus_sign) {
    if (shows_as_zero) return L"";
    if (value < 0.0) return L"-";
    return plus_sign ? L"+" : L"";
}

std::wstring Decimal(double value, bool plus_sign, int decimals) {
    const std::wstring digits = nedit::Format(L"%.*f", decimals, std::fabs(value));
    const bool zero = digits.find_first_not_of(L"0.") == std::wstring::npos;
    return SignFor(value, zero, plus_sign) + digits;
}

// Feet and inches counted in whole fractions of an inch, so 11 15.9/16" carries into the foot.
std::wstring FeetAndInches(double feet, bool plus_sign, long long denominator) {
    const long long per_foot = 12 * denominator;
    const long long count = std::llround(std::fabs(feet) * static_cast<double>(per_foot));
    const long long whole_inches = count % per_foot / denominator;
    const long long numerator = count % denominator;
    std::wstring text = nedit::Format(L"%s%lld' %lld", SignFor(feet, count == 0, plus_sign),
                                      count / per_foot, whole_inches);
    if (numerator != 0) {
        const long long common = std::gcd(numerator, denominator);
        text += nedit::Format(L" %lld/%lld", numerator / common, denominator / common);
    }
    return text + L"\"";
}

}  // namespace

std::wstring UJobSettings::LengthToString(double value, bool with_unit, bool plus_sign,
                                          int decimals, int inch_fraction, bool /*coordinate*/,
                                          bool /*reserved*/) const {
    long long denominator = inch_fraction >= 1 ? inch_fraction : foot_inch_precision_;
    if (denominator < 1) denominator = 16;
    if (IsFoot(length_unit_) && foot_format_ == kFeetAndInches &&
        std::fabs(value) * 12.0 * static_cast<double>(denominator) < kMaxFractionCount) {
        return FeetAndInches(value, plus_sign, denominator);
    }
    std::wstring text = Decimal(value, plus_sign, decimals >= 0 ? decimals : length_decimals_);
    if (with_unit) text += UnitMark(length_unit_);
    return text;
}

std::wstring UJobSettings::UnitLengthToString(double value, bool with_unit, bool plus_sign,
                                              int decimals, int inch_fraction,
                                              bool reserved) const {
    return LengthToString(value, with_unit, plus_sign, decimals, inch_fraction, false, reserved);
}

std::wstring UJobSettings::DistanceToString(double value, bool with_unit, bool plus_sign,
                                            int decimals, int inch_fraction, bool reserved1,
                                            bool reserved2) const {
    return LengthToString(value, with_unit, plus_sign, decimals, inch_fraction, reserved1,
                          reserved2);
}

double UJobSettings::ConvertLength(nedit::LengthUnit from, double value) const {
    return nedit::ConvertLength(value, from, length_unit_);
}

void ConvertAngleToDisplay(const UJobSettings& job, double degrees, std::wstring& text, int mode) {
    const bool marked = job.GetAngleFormat() == UJobSettings::kAngleMarked;
    int decimals = job.GetAngleDecimals();
    int type = 0;
    if (job.GetAngleUnit() == nedit::AngleUnit::Degrees) type = 1;
    if (job.GetAngleUnit() == nedit::AngleUnit::Gons) type = 2;
    // Marks need the seconds field, so a marked sexagesimal angle shows at least whole seconds.
    if (marked && type == 0) decimals = std::max(decimals, 4);
    text = UFormatAngle(type, decimals, mode).ConvertToDisplayString(nedit::DoubleToText(degrees));
    if (!marked) return;
    if (type == 1) {
        text += L"\u00B0";
    } else if (type == 2) {
        text += L"g";
    } else {
        const std::size_t point = text.find(L'.');
        if (point == std::wstring::npos) return;  // a huge angle written as a plain number
        std::wstring marked_text = text.substr(0, point) + L"\u00B0" + text.substr(point + 1, 2) +
                                   L"'" + text.substr(point + 3, 2);
        if (text.size() > point + 5) marked_text += L"." + text.substr(point + 5);
        text = marked_text + L"\"";
    }
}

double ConvertAreaToDisplay(const UJobSettings& job, double square_metres) {
    const double metres = nedit::MetresPer(job.GetLengthUnit());
    return square_metres / (metres * metres);
}
