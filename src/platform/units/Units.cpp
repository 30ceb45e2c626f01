#include "platform/units/Units.h"

#include <cmath>

namespace nedit {

LengthUnit LengthUnitFromLetter(wchar_t letter) {
    switch (letter) {
        case L'F':
        case L'f':
        case L'1':
            return LengthUnit::Feet;
        case L'U':
        case L'u':
        case L'2':
            return LengthUnit::USFeet;
        default:
            return LengthUnit::Metres;
    }
}

AngleUnit AngleUnitFromLetter(wchar_t letter) {
    switch (letter) {
        case L'D':
        case L'd':
        case L'1':
            return AngleUnit::Degrees;
        case L'G':
        case L'g':
        case L'2':
            return AngleUnit::Gons;
        default:
            return AngleUnit::DegMinSec;
    }
}

LengthUnit LengthUnitFromIndex(int index) {
    return index >= 0 && index <= 2 ? static_cast<LengthUnit>(index) : LengthUnit::Metres;
}

AngleUnit AngleUnitFromIndex(int index) {
    return index >= 0 && index <= 2 ? static_cast<AngleUnit>(index) : AngleUnit::DegMinSec;
}

int IndexOf(LengthUnit unit) {
    return static_cast<int>(unit);
}
int IndexOf(AngleUnit unit) {
    return static_cast<int>(unit);
}

wchar_t LetterOf(LengthUnit unit) {
    switch (unit) {
        case LengthUnit::Feet:
            return L'F';
        case LengthUnit::USFeet:
            return L'U';
        default:
            return L'M';
    }
}

wchar_t LetterOf(AngleUnit unit) {
    switch (unit) {
        case AngleUnit::Degrees:
            return L'D';
        case AngleUnit::Gons:
            return L'G';
        default:
            return L'S';
    }
}

double MetresPer(LengthUnit unit) {
    switch (unit) {
        case LengthUnit::Feet:
            return 0.3048;
        case LengthUnit::USFeet:
            return 1200.0 / 3937.0;
        default:
            return 1.0;
    }
}

double ConvertLength(double value, LengthUnit from, LengthUnit to) {
    if (from == to) return value;
    return value * MetresPer(from) / MetresPer(to);
}

double DmsToDegrees(double dms) {
    const double magnitude = std::fabs(dms);
    // A small nudge keeps 123.4530, stored as 123.45299999..., at 45 minutes 30 seconds.
    const double nudged = magnitude + 1e-11;
    const double degrees = std::floor(nudged);
    const double minutes = std::floor((nudged - degrees) * 100.0);
    double seconds = (magnitude - degrees) * 10000.0 - minutes * 100.0;
    if (seconds < 0.0) seconds = 0.0;
    const double result = degrees + minutes / 60.0 + seconds / 3600.0;
    return dms < 0.0 ? -result : result;
}

double DegreesToDms(double degrees) {
    const double magnitude = std::fabs(degrees);
    // Rounding to 1e-7 seconds first carries 59.9999999 seconds into the next minute.
    const double total_seconds = std::round(magnitude * 3600.0 * 1e7) / 1e7;
    const double whole_degrees = std::floor(total_seconds / 3600.0);
    const double rest = total_seconds - whole_degrees * 3600.0;
    const double minutes = std::floor(rest / 60.0);
    const double seconds = rest - minutes * 60.0;
    const double result = whole_degrees + minutes / 100.0 + seconds / 10000.0;
    return degrees < 0.0 ? -result : result;
}

double ToDegrees(double value, AngleUnit unit) {
    switch (unit) {
        case AngleUnit::Degrees:
            return value;
        case AngleUnit::Gons:
            return value * 0.9;
        default:
            return DmsToDegrees(value);
    }
}

double FromDegrees(double degrees, AngleUnit unit) {
    switch (unit) {
        case AngleUnit::Degrees:
            return degrees;
        case AngleUnit::Gons:
            return degrees / 0.9;
        default:
            return DegreesToDms(degrees);
    }
}

}  // namespace nedit
