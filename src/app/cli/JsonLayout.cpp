#include "JsonLayout.h"

#include <charconv>
#include <cmath>
#include <stdexcept>

#include "platform/text/WideText.h"

namespace json {

namespace {

std::string Dump(const Value& value) {
    return value.dump(-1, ' ', false, nlohmann::detail::error_handler_t::replace);
}

}  // namespace

std::string Number(double number) {
    if (!std::isfinite(number)) throw std::domain_error("a number that is not finite has no JSON");
    char buffer[64];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, number);
    return std::string(buffer, result.ptr);
}

Value Text(const std::wstring& text) {
    return nedit::ToUtf8(text);
}

std::string String(const std::wstring& text) {
    return Dump(Text(text));
}

std::string Inline(const Value& value) {
    std::string out;
    const char* separator = "";
    switch (value.type()) {
        case Value::value_t::object:
            out = "{";
            for (auto member = value.begin(); member != value.end(); ++member) {
                out += separator + Dump(member.key()) + ": " + Inline(member.value());
                separator = ", ";
            }
            return out + "}";
        case Value::value_t::array:
            out = "[";
            for (const Value& element : value) {
                out += separator + Inline(element);
                separator = ", ";
            }
            return out + "]";
        case Value::value_t::number_float:
            return Number(value.get<double>());
        default:
            return Dump(value);
    }
}

std::string Rows(const std::vector<Value>& rows, int indent) {
    std::string out;
    RowWriter writer(out, indent);
    for (const Value& row : rows) writer.Row(Inline(row));
    writer.End();
    return out;
}

void RowWriter::Row(const std::string& inlineRow) {
    Out += Separator;
    Out += Margin;
    Out += "  ";
    Out += inlineRow;
    Separator = ",\n";
}

void RowWriter::End() {
    Out += '\n';
    Out += Margin;
    Out += ']';
}

std::string Members(const std::vector<std::pair<const char*, std::string>>& members) {
    std::string out = "{";
    const char* separator = "\n  ";
    for (const auto& [name, text] : members) {
        out += separator + Dump(name) + ": " + text;
        separator = ",\n  ";
    }
    return out + "\n}";
}

}  // namespace json
