#include "platform/text/WideText.h"

#include <locale.h>
#include <wctype.h>

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace nedit {
namespace {

constexpr wchar_t kReplacement = 0xFFFD;

// Length of a UTF-8 sequence from its lead byte, 0 for a byte that cannot lead.
int SequenceLength(unsigned char lead) {
    if (lead < 0x80) return 1;
    if (lead >= 0xC2 && lead <= 0xDF) return 2;
    if (lead >= 0xE0 && lead <= 0xEF) return 3;
    if (lead >= 0xF0 && lead <= 0xF4) return 4;
    return 0;
}

bool IsContinuation(unsigned char byte) {
    return (byte & 0xC0) == 0x80;
}

// Decodes one sequence at text[i]; gives the code point, or -1 if it is malformed.
long DecodeAt(std::string_view text, std::size_t i, int length) {
    if (i + static_cast<std::size_t>(length) > text.size()) return -1;
    const auto lead = static_cast<unsigned char>(text[i]);
    unsigned long code = length == 2   ? (lead & 0x1Fu)
                         : length == 3 ? (lead & 0x0Fu)
                                       : (lead & 0x07u);
    for (int k = 1; k < length; ++k) {
        const auto byte = static_cast<unsigned char>(text[i + static_cast<std::size_t>(k)]);
        if (!IsContinuation(byte)) return -1;
        code = (code << 6) | (byte & 0x3Fu);
    }
    // Overlong forms, surrogates and values past U+10FFFF are not text.
    static const unsigned long kMinimum[] = {0, 0, 0x80, 0x800, 0x10000};
    if (code < kMinimum[length] || (code >= 0xD800 && code <= 0xDFFF) || code > 0x10FFFF) return -1;
    return static_cast<long>(code);
}

void AppendCodePoint(std::string& out, unsigned long code) {
    if (code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF)) code = kReplacement;
    if (code < 0x80) {
        out += static_cast<char>(code);
    } else if (code < 0x800) {
        out += static_cast<char>(0xC0 | (code >> 6));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else if (code < 0x10000) {
        out += static_cast<char>(0xE0 | (code >> 12));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | (code >> 18));
        out += static_cast<char>(0x80 | ((code >> 12) & 0x3F));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    }
}

// The case tables of C.UTF-8 are built into the C library, so they exist on every machine
// and do not follow the user's locale.
locale_t CaseLocale() {
    static const locale_t locale = newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
    return locale;
}

template <typename Map, typename Ascii>
std::wstring MapCase(std::wstring_view text, Map map, Ascii ascii) {
    std::wstring out(text);
    const locale_t locale = CaseLocale();
    for (wchar_t& c : out) {
        if (c < 0x80 || locale == nullptr) {
            c = ascii(c);
        } else {
            c = static_cast<wchar_t>(map(static_cast<wint_t>(c), locale));
        }
    }
    return out;
}

}  // namespace

namespace {

// Decodes UTF-8; a malformed sequence either becomes U+FFFD (one per bad byte) or, when
// `strict`, stops the decoding with false.
bool Decode(std::string_view utf8, std::wstring& out, bool strict) {
    out.clear();
    out.reserve(utf8.size());
    std::size_t i = 0;
    while (i < utf8.size()) {
        const auto lead = static_cast<unsigned char>(utf8[i]);
        if (lead < 0x80) {
            out += static_cast<wchar_t>(lead);
            ++i;
            continue;
        }
        const int length = SequenceLength(lead);
        const long code = length == 0 ? -1 : DecodeAt(utf8, i, length);
        if (code < 0) {
            if (strict) return false;
            out += kReplacement;
            ++i;
        } else {
            out += static_cast<wchar_t>(code);
            i += static_cast<std::size_t>(length);
        }
    }
    return true;
}

}  // namespace

std::wstring FromUtf8(std::string_view utf8) {
    std::wstring out;
    Decode(utf8, out, false);
    return out;
}

void FromUtf8(std::string_view utf8, std::wstring& out) {
    Decode(utf8, out, false);
}

bool IsValidUtf8(std::string_view bytes) {
    for (std::size_t i = 0; i < bytes.size();) {
        const auto lead = static_cast<unsigned char>(bytes[i]);
        if (lead < 0x80) {
            ++i;
            continue;
        }
        const int length = SequenceLength(lead);
        if (length == 0 || DecodeAt(bytes, i, length) < 0) return false;
        i += static_cast<std::size_t>(length);
    }
    return true;
}

std::string_view TextLineAsUtf8(std::string_view bytes, std::string& buffer) {
    if (IsAscii(bytes) || IsValidUtf8(bytes)) return bytes;
    buffer.clear();
    for (const char byte : bytes) AppendCodePoint(buffer, static_cast<unsigned char>(byte));
    return buffer;
}

std::string ToUpperUtf8(std::string_view text) {
    std::string out;
    ToUpperUtf8(text, out);
    return out;
}

void ToUpperUtf8(std::string_view text, std::string& out) {
    if (!IsAscii(text)) {
        out = ToUtf8(ToUpper(FromUtf8(text)));
        return;
    }
    out.assign(text);
    for (char& c : out) c = static_cast<char>(c - (c >= 'a' && c <= 'z' ? 32 : 0));
}

std::wstring DecodeTextLine(std::string_view bytes) {
    std::wstring out;
    if (Decode(bytes, out, true)) return out;
    out.assign(bytes.size(), L' ');
    for (std::size_t i = 0; i < bytes.size(); ++i) out[i] = static_cast<unsigned char>(bytes[i]);
    return out;
}

std::string ToUtf8(std::wstring_view text) {
    std::string out;
    out.reserve(text.size());
    AppendUtf8(out, text);
    return out;
}

void AppendUtf8(std::string& out, std::wstring_view text) {
    for (wchar_t c : text) {
        if (c >= 0 && c < 0x80) {
            out += static_cast<char>(c);
        } else {
            AppendCodePoint(out, static_cast<unsigned long>(c));
        }
    }
}

bool IsAscii(std::string_view bytes) {
    // Eight bytes at a time: ASCII bytes have their top bit clear.
    std::uint64_t high = 0;
    std::size_t i = 0;
    for (; i + 8 <= bytes.size(); i += 8) {
        std::uint64_t word;
        std::memcpy(&word, bytes.data() + i, 8);
        high |= word;
    }
    for (; i < bytes.size(); ++i) high |= static_cast<unsigned char>(bytes[i]);
    return (high & 0x8080808080808080ull) == 0;
}

std::wstring ToUpper(std::wstring_view text) {
    return MapCase(text, towupper_l, [](wchar_t c) {
        return (c >= L'a' && c <= L'z') ? static_cast<wchar_t>(c - 32) : c;
    });
}

std::wstring ToLower(std::wstring_view text) {
    return MapCase(text, towlower_l, [](wchar_t c) {
        return (c >= L'A' && c <= L'Z') ? static_cast<wchar_t>(c + 32) : c;
    });
}

bool EqualsIgnoreCase(std::wstring_view a, std::wstring_view b) {
    if (a.size() != b.size()) return false;
    const locale_t locale = CaseLocale();
    for (std::size_t i = 0; i < a.size(); ++i) {
        if (a[i] == b[i]) continue;
        const wint_t upper_a =
            locale ? towupper_l(static_cast<wint_t>(a[i]), locale) : static_cast<wint_t>(a[i]);
        const wint_t upper_b =
            locale ? towupper_l(static_cast<wint_t>(b[i]), locale) : static_cast<wint_t>(b[i]);
        if (upper_a != upper_b) return false;
    }
    return true;
}

bool IsBlank(wchar_t c) {
    return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n' || c == L'\v' || c == L'\f';
}

std::wstring_view TrimLeftView(std::wstring_view text) {
    std::size_t start = 0;
    while (start < text.size() && IsBlank(text[start])) ++start;
    return text.substr(start);
}

std::wstring_view TrimRightView(std::wstring_view text) {
    std::size_t end = text.size();
    while (end > 0 && IsBlank(text[end - 1])) --end;
    return text.substr(0, end);
}

std::wstring_view TrimView(std::wstring_view text) {
    return TrimRightView(TrimLeftView(text));
}

std::string_view TrimLeftView(std::string_view text) {
    std::size_t start = 0;
    while (start < text.size() && IsBlank(static_cast<unsigned char>(text[start]))) ++start;
    return text.substr(start);
}

std::string_view TrimRightView(std::string_view text) {
    std::size_t end = text.size();
    while (end > 0 && IsBlank(static_cast<unsigned char>(text[end - 1]))) --end;
    return text.substr(0, end);
}

std::string_view TrimView(std::string_view text) {
    return TrimRightView(TrimLeftView(text));
}

std::wstring TrimLeft(std::wstring_view text) {
    return std::wstring(TrimLeftView(text));
}
std::wstring TrimRight(std::wstring_view text) {
    return std::wstring(TrimRightView(text));
}
std::wstring Trim(std::wstring_view text) {
    return std::wstring(TrimView(text));
}

std::wstring TrimChars(std::wstring_view text, std::wstring_view chars) {
    const std::size_t start = text.find_first_not_of(chars);
    if (start == std::wstring_view::npos) return {};
    const std::size_t end = text.find_last_not_of(chars);
    return std::wstring(text.substr(start, end - start + 1));
}

std::wstring Left(std::wstring_view text, std::size_t count) {
    return std::wstring(text.substr(0, std::min(count, text.size())));
}

std::string_view LeftUtf8(std::string_view text, std::size_t count) {
    std::size_t characters = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        // A character starts at every byte that does not continue a sequence.
        if (!IsContinuation(static_cast<unsigned char>(text[i])) && characters++ == count)
            return text.substr(0, i);
    }
    return text;
}

int CountOf(std::wstring_view text, wchar_t c) {
    return static_cast<int>(std::count(text.begin(), text.end(), c));
}

bool StartsWith(std::wstring_view text, std::wstring_view prefix) {
    return text.substr(0, prefix.size()) == prefix;
}

bool EndsWith(std::wstring_view text, std::wstring_view suffix) {
    return text.size() >= suffix.size() && text.substr(text.size() - suffix.size()) == suffix;
}

}  // namespace nedit
