#pragma once
// Comma-separated text as spreadsheets write it: fields that hold a comma, a quote or blanks
// at an end are quoted, and a quote inside is doubled. Used for point files and for survey
// code library files. Works on UTF-8 bytes; commas and quotes never occur inside a UTF-8
// sequence of another character.

#include <string>
#include <string_view>
#include <vector>

namespace nedit {

/// Splits one line into fields. False, with `error` set, for a quote that does not close or
/// text after a closing quote; a field cannot span lines.
bool SplitCsvLine(std::string_view line, std::vector<std::string>& fields, std::string& error);

/// The field as it must be written: quoted when it needs to be.
std::string CsvField(std::string_view text);

/// A number written in full, with nothing after it but blanks: "12.5" but not "12.5m", "",
/// "nan" or "1e999". Never depends on the user's locale.
bool ParseCsvNumber(std::string_view text, double& value);

}  // namespace nedit
