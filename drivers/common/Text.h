#pragma once
// Small text helpers of the drivers: blanks trimmed, fields split at a separator.

#include <string_view>
#include <vector>

namespace sxn {

/// `text` without blanks and tabs at either end.
std::string_view Trim(std::string_view text);
/// The pieces of `text` between the separators, empty ones included.
std::vector<std::string_view> Split(std::string_view text, char separator);
/// True when `text` begins with `start`.
bool StartsWith(std::string_view text, std::string_view start);

}  // namespace sxn
