#pragma once
// printf-style formatting of wide text. The system's formats ("%-10s ID=%s", "%.3f") are kept
// as formats instead of being rebuilt by hand. Unlike swprintf, "%s" takes wide text, widths
// count characters, and numbers are always written with a '.' whatever the user's locale.

#include <initializer_list>
#include <string>
#include <string_view>

namespace nedit {

/// One argument of Format: a whole number, a real number, a character or text.
class FormatArg {
  public:
    enum class Kind { Integer, Real, Character, Text };

    FormatArg(int value) : kind_(Kind::Integer), integer_(value) {}
    FormatArg(long value) : kind_(Kind::Integer), integer_(value) {}
    FormatArg(long long value) : kind_(Kind::Integer), integer_(value) {}
    FormatArg(unsigned value) : kind_(Kind::Integer), integer_(value) {}
    FormatArg(std::size_t value) : kind_(Kind::Integer), integer_(static_cast<long long>(value)) {}
    FormatArg(double value) : kind_(Kind::Real), real_(value) {}
    FormatArg(wchar_t value) : kind_(Kind::Character), integer_(value) {}
    FormatArg(const wchar_t* text) : kind_(Kind::Text), text_(text) {}
    FormatArg(std::wstring_view text) : kind_(Kind::Text), text_(text) {}
    FormatArg(const std::wstring& text) : kind_(Kind::Text), text_(text) {}

    Kind kind() const { return kind_; }
    long long AsInteger() const;
    double AsReal() const;
    /// Numbers as the shortest text that reads back the same; a character as itself.
    std::wstring AsText() const;

  private:
    Kind kind_;
    long long integer_ = 0;
    double real_ = 0.0;
    std::wstring_view text_;
};

/// Formats `args` by `format`. Conversions: d i u x X o c s f F e E g G and %%, with flags,
/// width and precision (also as '*'); length modifiers (l, ll, h, z) are accepted and ignored.
/// An argument of the wrong kind is converted (a real for "%d" is truncated, a number for
/// "%s" is written as text); a missing argument counts as 0 or empty text.
std::wstring FormatList(std::wstring_view format, std::initializer_list<FormatArg> args);

template <typename... Args>
std::wstring Format(std::wstring_view format, const Args&... args) {
    return FormatList(format, {FormatArg(args)...});
}

}  // namespace nedit
