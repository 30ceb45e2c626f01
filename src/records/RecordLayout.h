#pragma once
// The standard layout of a record, for wide text and UTF-8 alike: the key padded to nine
// places and a blank ("%-9s %s"), then the fields separated by commas, with the blanks around
// "=" and "," removed. Values are copied through `map`, which the gate uses to upper-case a
// row as it lays it out. The key is padded by its length, so UTF-8 text must have an ASCII key.

#include <algorithm>
#include <string>
#include <string_view>

namespace nedit::layout {

template <typename Char>
bool IsBlank(Char c) {
    return c == ' ' || c == '\t' || c == '\r' || c == '\n' || c == '\v' || c == '\f';
}

template <typename Char>
std::basic_string_view<Char> TrimLeft(std::basic_string_view<Char> text) {
    std::size_t start = 0;
    while (start < text.size() && IsBlank(text[start])) ++start;
    return text.substr(start);
}

template <typename Char>
std::basic_string_view<Char> TrimRight(std::basic_string_view<Char> text) {
    std::size_t end = text.size();
    while (end > 0 && IsBlank(text[end - 1])) --end;
    return text.substr(0, end);
}

template <typename Char>
std::basic_string_view<Char> Trim(std::basic_string_view<Char> text) {
    return TrimRight(TrimLeft(text));
}

/// Where the key of a record ends: at its first blank or comma, or at its end.
template <typename Char>
std::size_t KeyEnd(std::basic_string_view<Char> text) {
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == ' ' || text[i] == ',') return i;
    }
    return text.size();
}

template <typename Char, typename Map>
void Append(std::basic_string<Char>& out, std::basic_string_view<Char> text, Map map) {
    const std::size_t at = out.size();
    out.append(text);
    for (std::size_t i = at; i < out.size(); ++i) out[i] = map(out[i]);
}

/// Appends `line` laid out to `out`; a comment or an empty text goes as it is.
///
/// The fields are copied in one pass: each comma-separated field loses the blanks at its
/// ends and those around its first "="; other blanks stay. Blanks are held back until a
/// character that keeps them comes, and dropped when a comma, the first "=" or the end comes.
template <typename Char, typename Map>
void LayOut(std::basic_string_view<Char> line, std::basic_string<Char>& out, Map map) {
    using View = std::basic_string_view<Char>;
    const View text = Trim(line);
    if (text.empty() || text[0] == '#') {
        Append(out, text, map);
        return;
    }
    const std::size_t key_end = KeyEnd(text);
    const View key = text.substr(0, key_end);
    const View body = Trim(text.substr(key_end));
    // The laid-out record is never longer than this; it is written in place, then cut.
    const std::size_t start = out.size();
    out.resize(start + std::max<std::size_t>(key.size(), 9) + 1 + body.size());
    Char* write = &out[start];
    for (const Char c : key) *write++ = map(c);
    for (std::size_t pad = key.size(); pad < 9; ++pad) *write++ = ' ';
    *write++ = ' ';
    std::size_t held = 0;      // blanks held back, which end just before the character in hand
    bool field_start = true;   // blanks here are dropped
    bool equals_seen = false;  // the field's first "=" has come
    for (std::size_t i = 0; i < body.size();) {
        const Char c = body[i];
        if (IsBlank(c)) {
            if (!field_start) ++held;
            ++i;
        } else if (c == ',' || (c == '=' && !equals_seen)) {
            *write++ = c;
            held = 0;
            field_start = true;
            equals_seen = c == '=';
            ++i;
        } else {
            for (std::size_t blank = i - held; blank < i; ++blank) *write++ = body[blank];
            held = 0;
            field_start = false;
            // The run of characters that no rule touches is copied at once.
            for (; i < body.size() && !IsBlank(body[i]) && body[i] != ',' &&
                   (body[i] != '=' || equals_seen);
                 ++i) {
                *write++ = map(body[i]);
            }
        }
    }
    // With no fields the key stands alone, without its padding.
    if (body.empty()) write = &out[start] + key.size();
    out.resize(static_cast<std::size_t>(write - &out[0]));
}

}  // namespace nedit::layout
