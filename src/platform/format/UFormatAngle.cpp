#include "platform/format/UFormatAngle.h"

#include <algorithm>
#include <cmath>

#include "platform/text/Format.h"
#include "platform/text/NumberText.h"

namespace {

// Beyond this many places a sexagesimal angle no longer fits the whole-number arithmetic
// below, and no instrument reads finer anyway.
constexpr int kMaxDecimals = 9;
// Counted in steps of 1e-5 seconds, larger angles would overflow; they are no bearings.
constexpr double kMaxSexagesimal = 1e9;

// printf's rounding, except that a value shown as all zeros carries no sign.
std::wstring Decimal(double value, int decimals) {
    std::wstring text = nedit::Format(L"%.*f", decimals, value);
    if (text[0] == L'-' && text.find_first_not_of(L"-0.") == std::wstring::npos) text.erase(0, 1);
    return text;
}

// Sexagesimal text with carries done in whole steps of the last place shown: the angle is
// counted in those steps, so 59.6 seconds at whole seconds become the next minute and a
// 60 never appears.
std::wstring Sexagesimal(double degrees, int decimals) {
    if (!(std::fabs(degrees) < kMaxSexagesimal)) return Decimal(degrees, decimals);
    const int fraction_places = std::max(decimals - 4, 0);
    long long ticks_per_second = 1;
    for (int i = 0; i < fraction_places; ++i) ticks_per_second *= 10;
    // The last place shown: a degree, ten minutes, a minute, ten seconds, a second or less.
    static const long long kStepSeconds[] = {3600, 600, 60, 10};
    const long long step = decimals < 4 ? kStepSeconds[decimals] : 1;
    const double steps =
        std::round(std::fabs(degrees) * 3600.0 * static_cast<double>(ticks_per_second) /
                   static_cast<double>(step));
    const long long ticks = static_cast<long long>(steps) * step;
    const long long per_minute = 60 * ticks_per_second;
    const long long per_degree = 60 * per_minute;
    const long long whole_degrees = ticks / per_degree;
    const long long minutes = ticks % per_degree / per_minute;
    const long long seconds = ticks % per_minute / ticks_per_second;
    std::wstring digits = nedit::Format(L"%02lld%02lld", minutes, seconds);
    if (fraction_places > 0) {
        digits += nedit::Format(L"%0*lld", fraction_places, ticks % ticks_per_second);
    }
    digits.resize(static_cast<std::size_t>(decimals));
    const bool negative = degrees < 0.0 && ticks != 0;
    std::wstring text = nedit::Format(L"%s%lld", negative ? L"-" : L"", whole_degrees);
    if (decimals > 0) text += L"." + digits;
    return text;
}

}  // namespace

UFormatAngle::UFormatAngle(int type, int decimals, int /*mode*/)
    : type_(type), decimals_(std::clamp(decimals, 0, kMaxDecimals)) {}

std::wstring UFormatAngle::ConvertToDisplayString(const std::wstring& text) const {
    const double degrees = nedit::TextToDouble(text);
    switch (type_) {
        case 1:
            return Decimal(degrees, decimals_);
        case 2:
            return Decimal(degrees * 400.0 / 360.0, decimals_);
        default:
            return Sexagesimal(degrees, decimals_);
    }
}
