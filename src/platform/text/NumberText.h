#pragma once
// Plain conversions between text and numbers, as field values are read everywhere in the
// system. They never consult the user's locale: the decimal mark is always '.'.

#include <string>
#include <string_view>

namespace nedit {

/// The number at the start of `text`, after leading blanks: an optional sign, digits, an
/// optional fraction and exponent ("12.5m" gives 12.5). Gives 0 when no number starts the
/// text. A value that is not a finite double ("nan", "inf", "1e400") also gives 0, so no
/// field can bring a NaN or an infinity into a computation.
double TextToDouble(std::wstring_view text);
/// The same on UTF-8 text.
double TextToDouble(std::string_view text);

/// The whole number at the start of `text`, after leading blanks, with an optional sign.
/// Gives 0 when none starts the text; a value beyond the range of int is clamped to it.
int TextToInt(std::wstring_view text);

/// The shortest text that reads back as exactly `value` ("35.214", "0.1", "-2").
std::wstring DoubleToText(double value);

}  // namespace nedit
