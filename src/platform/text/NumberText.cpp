#include "platform/text/NumberText.h"

#include <charconv>
#include <climits>
#include <cmath>

#include "platform/text/WideText.h"

namespace nedit {
namespace {

// The longest prefix of the text, from its first non-blank, made of characters that can
// belong to a number, narrowed to ASCII for the standard parsers.
std::string NumberPrefix(std::wstring_view text) {
    std::size_t i = 0;
    while (i < text.size() && IsBlank(text[i])) ++i;
    std::string out;
    for (; i < text.size() && out.size() < 512; ++i) {
        const wchar_t c = text[i];
        const bool numeric = (c >= L'0' && c <= L'9') || c == L'.' || c == L'+' || c == L'-' ||
                             c == L'e' || c == L'E';
        if (!numeric) break;
        out += static_cast<char>(c);
    }
    // from_chars takes no leading '+'.
    if (!out.empty() && out[0] == '+') out.erase(0, 1);
    return out;
}

}  // namespace

double TextToDouble(std::wstring_view text) {
    const std::string digits = NumberPrefix(text);
    double value = 0.0;
    const auto result = std::from_chars(digits.data(), digits.data() + digits.size(), value,
                                        std::chars_format::general);
    if (result.ec != std::errc() || !std::isfinite(value)) return 0.0;
    return value;
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
