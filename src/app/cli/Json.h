#pragma once
// Just enough JSON writing for the command line's machine-readable output.

#include <string>

namespace json {

/// The text as a JSON string, quoted and escaped.
std::string Quote(const std::wstring& text);
/// A finite number in its shortest exact form; anything else as null.
std::string Number(double value);

}  // namespace json
