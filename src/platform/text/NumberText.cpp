#include "platform/text/NumberText.h"

#include <charconv>
#include <climits>
#include <cmath>

#include "platform/text/WideText.h"

namespace nedit {
namespace {

constexpr std::size_t kMaxNumberLength = 512;

template <typename Char>
bool IsNumberCharacter(Char c) {
    return (c >= '0' && c <= '9') || c == '.' || c == '+' || c == '-' || c == 'e' || c == 'E';
}

// Where the number of a text starts, after its leading blanks, and where the characters that
// can belong to a number end.
template <typename Char>
std::pair<std::size_t, std::size_t> NumberSpan(std::basic_string_view<Char> text) {
    std::size_t start = 0;
    while (start < text.size() && IsBlank(static_cast<wchar_t>(text[start]))) ++start;
    std::size_t end = start;
    while (end < text.size() && end - start < kMaxNumberLength && IsNumberCharacter(text[end]))
        ++end;
    return {start, end};
}

// The characters of the number, narrowed to ASCII for the standard parsers, which take no
// leading '+'.
std::string NumberPrefix(std::wstring_view text) {
    const auto [start, end] = NumberSpan(text);
    std::string out;
    out.reserve(end - start);
    for (std::size_t i = start; i < end; ++i) out += static_cast<char>(text[i]);
    if (!out.empty() && out[0] == '+') out.erase(0, 1);
    return out;
}

double DigitsToDouble(const char* first, const char* last) {
    double value = 0.0;
    const auto result = std::from_chars(first, last, value, std::chars_format::general);
    if (result.ec != std::errc() || !std::isfinite(value)) return 0.0;
    return value;
}

}  // namespace

double TextToDouble(std::wstring_view text) {
    const std::string digits = NumberPrefix(text);
    return DigitsToDouble(digits.data(), digits.data() + digits.size());
}

double TextToDouble(std::string_view text) {
    auto [start, end] = NumberSpan(text);
    if (start < end && text[start] == '+') ++start;
    return DigitsToDouble(text.data() + start, text.data() + end);
}

int TextToInt(std::wstring_view text) {
    const std::string digits = NumberPrefix(text);
    long long value = 0;
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), value);
    if (result.ec == std::errc::result_out_of_range) {
        return !digits.empty() && digits[0] == '-' ? INT_MIN : INT_MAX;
    }
    if (result.ec != std::errc()) return 0;
    if (value > INT_MAX) return INT_MAX;
    if (value < INT_MIN) return INT_MIN;
    return static_cast<int>(value);
}

std::wstring DoubleToText(double value) {
    char buffer[64];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    return std::wstring(buffer, result.ptr);
}

}  // namespace nedit
