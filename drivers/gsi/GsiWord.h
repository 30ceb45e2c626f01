#pragma once
// One word of a Leica GSI block, as the format's public documentation lays it out:
//
//   positions 1-2   word index (11 point number, 21 horizontal circle, 31 slope distance, ...)
//   positions 3-6   additional information; position 6 is the unit of the value
//   position  7     sign, '+' or '-'
//   positions 8-15  the value, 8 characters (GSI-8), or 8-23, 16 characters (GSI-16)
//
// A GSI-16 block starts with '*'; the words are separated by one blank. Numbers carry no
// decimal point: the unit says where it stands.
//
// Units (position 6): lengths 0 metres to the mm, 1 feet to 1/1000, 6 metres to 1/10 mm,
// 7 feet to 1/10000, 8 metres to 1/100 mm; angles 2 gon, 3 decimal degrees, 4 sexagesimal
// DDD.MMSSS (tenths of seconds), all with five implied decimals, and 5 mil with four.
//
// Decision: the format's feet are US survey feet (1200/3937 m), as the instruments that
// record GSI in feet have always meant them.

#include <string>
#include <string_view>

#include "DriverSession.h"

struct GsiWord {
    int index = 0;          // word index, 1 to 99
    char unit = '.';        // position 6
    bool negative = false;  // position 7
    std::string data;       // the value's characters, zeros of the padding included
};

/// Reads one blank-separated token (without a leading '*'). False when it is no GSI word:
/// too short or too long, a word index or information that is not digits or dots, no sign.
bool ParseGsiWord(std::string_view token, GsiWord& word);

/// A point number, code or remark: the value without the zeros that pad it on the left ("0"
/// for zeros alone). Commas and '=' would end a neutral field early, so they become '_'.
std::string GsiText(const GsiWord& word);

/// An angle as recorded: the whole number of the value and its unit.
struct GsiAngle {
    long long value = 0;
    char unit = '2';
    /// The angle in degrees.
    double Degrees() const;
    /// The angle in the records' unit: the recorded digits when the units agree, so that
    /// nothing is rounded, else converted with one place more than a recording has.
    std::string Text(sxn::AngleOut out) const;
};

/// A length as recorded.
struct GsiLength {
    long long value = 0;
    char unit = '0';
    /// The length in the records' unit.
    double In(sxn::LengthOut out) const;
    /// As Text of an angle: recorded digits when the units agree, else one place more.
    std::string Text(sxn::LengthOut out) const;
};

/// A GSI-16 word of text (point number, code) with its four places of information: the
/// text right-aligned in 16 characters and padded with zeros, as instruments write it. The
/// text must be 1 to 16 printable ASCII characters without blanks (GsiTextFits).
std::string GsiTextWord(int index, std::string_view information, std::string_view text);
/// True when `text` can stand in a GSI-16 text word.
bool GsiTextFits(std::string_view text);
/// A GSI-16 word of a length: `value` in metres (unit 6) or US feet (unit 7), 1/10,000 of
/// either. False when it does not fit in 16 digits.
bool GsiLengthWord(int index, double value, bool usFeet, std::string& word);

/// False, with the value untouched, for a word whose unit is not an angle's or whose value
/// is not a whole number (sexagesimal minutes and seconds below 60).
bool ReadGsiAngle(const GsiWord& word, GsiAngle& angle);
/// False for a word whose unit is not a length's or whose value is not a whole number.
bool ReadGsiLength(const GsiWord& word, GsiLength& length);
