#include "GsiWord.h"

#include <cmath>

namespace {

constexpr double kMetresPerUsFoot = 1200.0 / 3937.0;
constexpr double kMetresPerFoot = 0.3048;

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

bool WholeNumber(const GsiWord& word, long long& value) {
    if (word.data.empty()) return false;
    long long number = 0;
    for (const char c : word.data) {
        if (!IsDigit(c)) return false;
        number = number * 10 + (c - '0');
    }
    value = word.negative ? -number : number;
    return true;
}

int AngleDecimals(char unit) {
    return unit == '5' ? 4 : 5;
}

int LengthDecimals(char unit) {
    switch (unit) {
        case '6':
        case '7':
            return 4;
        case '8':
            return 5;
        default:
            return 3;
    }
}

bool InFeet(char unit) {
    return unit == '1' || unit == '7';
}

constexpr int kGsi16Digits = 16;

std::string TwoDigits(int index) {
    return {static_cast<char>('0' + index / 10 % 10), static_cast<char>('0' + index % 10)};
}

}  // namespace

std::string GsiTextWord(int index, std::string_view information, std::string_view text) {
    return TwoDigits(index) + std::string(information) + '+' +
           std::string(kGsi16Digits - text.size(), '0') + std::string(text);
}

bool GsiTextFits(std::string_view text) {
    if (text.empty() || text.size() > kGsi16Digits) return false;
    for (const char c : text) {
        if (c <= ' ' || c >= 0x7F) return false;
    }
    return true;
}

bool GsiLengthWord(int index, double value, bool usFeet, std::string& word) {
    const double scaled = std::round(std::fabs(value) * 1e4);
    if (!(scaled < 1e16)) return false;
    const std::string digits = std::to_string(static_cast<long long>(scaled));
    word = TwoDigits(index) + (usFeet ? "...7" : "...6") + (value < 0 && scaled > 0 ? '-' : '+') +
           std::string(kGsi16Digits - digits.size(), '0') + digits;
    return true;
}

bool ParseGsiWord(std::string_view token, GsiWord& word) {
    if (token.size() != 15 && token.size() != 23) return false;
    if (!IsDigit(token[0]) || !IsDigit(token[1])) return false;
    for (std::size_t i = 2; i < 6; ++i) {
        if (!IsDigit(token[i]) && token[i] != '.') return false;
    }
    if (token[6] != '+' && token[6] != '-') return false;
    word.index = (token[0] - '0') * 10 + (token[1] - '0');
    word.unit = token[5];
    word.negative = token[6] == '-';
    word.data = std::string(token.substr(7));
    return true;
}

std::string GsiText(const GsiWord& word) {
    const std::size_t first = word.data.find_first_not_of('0');
    std::string text = first == std::string::npos ? "0" : word.data.substr(first);
    for (char& c : text) {
        if (c == ',' || c == '=') c = '_';
    }
    return text;
}

double GsiAngle::Degrees() const {
    const double scale = std::pow(10.0, AngleDecimals(unit));
    switch (unit) {
        case '2':
            return static_cast<double>(value) / scale * 0.9;
        case '3':
            return static_cast<double>(value) / scale;
        case '4': {
            const long long magnitude = std::llabs(value);
            const double degrees = static_cast<double>(magnitude / 100000) +
                                   static_cast<double>(magnitude / 1000 % 100) / 60.0 +
                                   static_cast<double>(magnitude % 1000) / 10.0 / 3600.0;
            return value < 0 ? -degrees : degrees;
        }
        default:
            return static_cast<double>(value) / scale * 360.0 / 6400.0;
    }
}

std::string GsiAngle::Text(sxn::AngleOut out) const {
    const bool same = (unit == '2' && out == sxn::AngleOut::Gons) ||
                      (unit == '3' && out == sxn::AngleOut::Degrees) ||
                      (unit == '4' && out == sxn::AngleOut::Dms);
    if (same) return sxn::ScaledInteger(value, AngleDecimals(unit));
    return sxn::AngleText(Degrees(), out, 6);
}

double GsiLength::In(sxn::LengthOut out) const {
    const double recorded = static_cast<double>(value) / std::pow(10.0, LengthDecimals(unit));
    const double metres = InFeet(unit) ? recorded * kMetresPerUsFoot : recorded;
    switch (out) {
        case sxn::LengthOut::Feet:
            return metres / kMetresPerFoot;
        case sxn::LengthOut::UsFeet:
            return metres / kMetresPerUsFoot;
        default:
            return metres;
    }
}

std::string GsiLength::Text(sxn::LengthOut out) const {
    const bool same = InFeet(unit) ? out == sxn::LengthOut::UsFeet : out == sxn::LengthOut::Metres;
    if (same) return sxn::ScaledInteger(value, LengthDecimals(unit));
    return sxn::Fixed(In(out), LengthDecimals(unit) + 1);
}

bool ReadGsiAngle(const GsiWord& word, GsiAngle& angle) {
    long long value = 0;
    if (word.unit < '2' || word.unit > '5' || !WholeNumber(word, value)) return false;
    if (word.unit == '4' &&
        (std::llabs(value) / 1000 % 100 >= 60 || std::llabs(value) % 1000 >= 600))
        return false;
    angle.value = value;
    angle.unit = word.unit;
    return true;
}

bool ReadGsiLength(const GsiWord& word, GsiLength& length) {
    long long value = 0;
    const bool length_unit =
        word.unit == '0' || word.unit == '1' || (word.unit >= '6' && word.unit <= '8');
    if (!length_unit || !WholeNumber(word, value)) return false;
    length.value = value;
    length.unit = word.unit;
    return true;
}
