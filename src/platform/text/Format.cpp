#include "platform/text/Format.h"

#include <locale.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

#include "platform/text/NumberText.h"

namespace nedit {
namespace {

// Number formatting runs under the C locale of this thread for the length of one call.
class CNumericLocale {
  public:
    CNumericLocale() {
        static const locale_t c_locale = newlocale(LC_ALL_MASK, "C", nullptr);
        previous_ = uselocale(c_locale);
    }
    ~CNumericLocale() { uselocale(previous_); }
    CNumericLocale(const CNumericLocale&) = delete;
    CNumericLocale& operator=(const CNumericLocale&) = delete;

  private:
    locale_t previous_;
};

struct Spec {
    std::string flags;
    int width = -1;
    int precision = -1;
    wchar_t conversion = 0;
};

bool IsFlag(wchar_t c) {
    return c == L'-' || c == L'+' || c == L' ' || c == L'0' || c == L'#';
}
bool IsLengthModifier(wchar_t c) {
    return c == L'h' || c == L'l' || c == L'L' || c == L'z' || c == L'j' || c == L't' ||
           c == L'q' || c == L'I';
}

class Formatter {
  public:
    Formatter(std::wstring_view format, std::initializer_list<FormatArg> args)
        : format_(format), args_(args) {}

    std::wstring Run() {
        CNumericLocale c_locale;
        std::wstring out;
        out.reserve(format_.size() + 16);
        while (pos_ < format_.size()) {
            const wchar_t c = format_[pos_++];
            if (c != L'%') {
                out += c;
            } else if (pos_ < format_.size() && format_[pos_] == L'%') {
                out += L'%';
                ++pos_;
            } else {
                out += Convert(ParseSpec());
            }
        }
        return out;
    }

  private:
    const FormatArg* NextArg() {
        if (next_ >= args_.size()) return nullptr;
        return args_.begin() + next_++;
    }

    int ParseNumber() {
        int value = 0;
        while (pos_ < format_.size() && format_[pos_] >= L'0' && format_[pos_] <= L'9') {
            if (value < 100000) value = value * 10 + (format_[pos_] - L'0');
            ++pos_;
        }
        return value;
    }

    int StarArgument() {
        ++pos_;
        const FormatArg* arg = NextArg();
        return arg ? static_cast<int>(arg->AsInteger()) : 0;
    }

    Spec ParseSpec() {
        Spec spec;
        while (pos_ < format_.size() && IsFlag(format_[pos_])) {
            spec.flags += static_cast<char>(format_[pos_++]);
        }
        if (pos_ < format_.size() && format_[pos_] == L'*') {
            spec.width = StarArgument();
            if (spec.width < 0) {
                spec.flags += '-';
                spec.width = -spec.width;
            }
        } else if (pos_ < format_.size() && format_[pos_] >= L'0' && format_[pos_] <= L'9') {
            spec.width = ParseNumber();
        }
        if (pos_ < format_.size() && format_[pos_] == L'.') {
            ++pos_;
            spec.precision =
                (pos_ < format_.size() && format_[pos_] == L'*') ? StarArgument() : ParseNumber();
        }
        while (pos_ < format_.size() && IsLengthModifier(format_[pos_])) ++pos_;
        if (pos_ < format_.size()) spec.conversion = format_[pos_++];
        return spec;
    }

    static std::wstring Pad(std::wstring text, const Spec& spec) {
        if (spec.width < 0 || text.size() >= static_cast<std::size_t>(spec.width)) return text;
        const std::size_t fill = static_cast<std::size_t>(spec.width) - text.size();
        if (spec.flags.find('-') != std::string::npos) return text.append(fill, L' ');
        return std::wstring(fill, L' ') + text;
    }

    static std::wstring PrintNumber(const Spec& spec, const char* length, char conversion,
                                    long long integer, double real, bool is_real) {
        std::string narrow = "%" + spec.flags;
        if (spec.width >= 0) narrow += std::to_string(spec.width);
        if (spec.precision >= 0) narrow += "." + std::to_string(spec.precision);
        narrow += length;
        narrow += conversion;
        std::vector<char> buffer(64 + static_cast<std::size_t>(std::max(spec.width, 0)) +
                                 static_cast<std::size_t>(std::max(spec.precision, 0)) + 320);
        const int written =
            is_real ? std::snprintf(buffer.data(), buffer.size(), narrow.c_str(), real)
                    : std::snprintf(buffer.data(), buffer.size(), narrow.c_str(), integer);
        if (written < 0) return {};
        return std::wstring(buffer.data(),
                            buffer.data() + std::min<std::size_t>(static_cast<std::size_t>(written),
                                                                  buffer.size() - 1));
    }

    std::wstring Convert(const Spec& spec) {
        const FormatArg* arg = NextArg();
        switch (spec.conversion) {
            case L's': {
                std::wstring text = arg ? arg->AsText() : std::wstring();
                if (spec.precision >= 0 && text.size() > static_cast<std::size_t>(spec.precision)) {
                    text.resize(static_cast<std::size_t>(spec.precision));
                }
                return Pad(std::move(text), spec);
            }
            case L'c':
                return Pad(std::wstring(1, arg ? static_cast<wchar_t>(arg->AsInteger()) : L' '),
                           spec);
            case L'd':
            case L'i':
            case L'u':
            case L'x':
            case L'X':
            case L'o': {
                const char conversion =
                    spec.conversion == L'i' ? 'd' : static_cast<char>(spec.conversion);
                return PrintNumber(spec, "ll", conversion, arg ? arg->AsInteger() : 0, 0.0, false);
            }
            case L'f':
            case L'F':
            case L'e':
            case L'E':
            case L'g':
            case L'G':
                return PrintNumber(spec, "", static_cast<char>(spec.conversion), 0,
                                   arg ? arg->AsReal() : 0.0, true);
            default:
                return {};  // An unknown conversion writes nothing rather than garbage.
        }
    }

    std::wstring_view format_;
    std::initializer_list<FormatArg> args_;
    std::size_t pos_ = 0;
    std::size_t next_ = 0;
};

}  // namespace

long long FormatArg::AsInteger() const {
    switch (kind_) {
        case Kind::Real:
            // Truncation as printf would see it, kept inside the range of the type.
            if (!std::isfinite(real_)) return 0;
            return static_cast<long long>(std::clamp(real_, -9.2e18, 9.2e18));
        case Kind::Text:
            return TextToInt(text_);
        default:
            return integer_;
    }
}

double FormatArg::AsReal() const {
    switch (kind_) {
        case Kind::Real:
            return real_;
        case Kind::Text:
            return TextToDouble(text_);
        default:
            return static_cast<double>(integer_);
    }
}

std::wstring FormatArg::AsText() const {
    switch (kind_) {
        case Kind::Text:
            return std::wstring(text_);
        case Kind::Character:
            return std::wstring(1, static_cast<wchar_t>(integer_));
        case Kind::Real:
            return DoubleToText(real_);
        default:
            return std::to_wstring(integer_);
    }
}

std::wstring FormatList(std::wstring_view format, std::initializer_list<FormatArg> args) {
    return Formatter(format, args).Run();
}

}  // namespace nedit
