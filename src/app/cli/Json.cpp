#include "Json.h"

#include <cmath>
#include <cstdio>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace json {

std::string Quote(const std::wstring& text) {
    const std::string utf8 = nedit::ToUtf8(text);
    std::string out = "\"";
    for (const char c : utf8) {
        switch (c) {
            case '"':
                out += "\\\"";
                break;
            case '\\':
                out += "\\\\";
                break;
            case '\n':
                out += "\\n";
                break;
            case '\r':
                out += "\\r";
                break;
            case '\t':
                out += "\\t";
                break;
            default:
                if (static_cast<unsigned char>(c) < 0x20) {
                    char escaped[8];
                    std::snprintf(escaped, sizeof escaped, "\\u%04x", static_cast<unsigned>(c));
                    out += escaped;
                } else {
                    out += c;
                }
        }
    }
    return out + "\"";
}

std::string Number(double value) {
    if (!std::isfinite(value)) return "null";
    return nedit::ToUtf8(nedit::DoubleToText(value));
}

}  // namespace json
