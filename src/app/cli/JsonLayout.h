#pragma once
// JSON as the command line writes it. Values are built as nlohmann::ordered_json, so that
// strings are escaped and checked as JSON wants; they are laid out the way this program has
// always printed them: an object of a listing on one line, `{"id": "P1", "e": 1.5}`, and
// numbers in their shortest exact form (300, not 300.0).

#include <nlohmann/json.hpp>
#include <string>
#include <utility>
#include <vector>

namespace json {

using Value = nlohmann::ordered_json;

/// The text (UTF-8 inside) as a JSON string value.
Value Text(const std::wstring& text);
/// The same value written out: Inline(Text(text)).
std::string String(const std::wstring& text);
/// A number in its shortest exact form, as Inline writes it. Throws std::domain_error for a
/// number that is not finite.
std::string Number(double number);
/// The value on one line. Throws std::domain_error for a number that is not finite: JSON has
/// none, and writing null would be read as "no value".
std::string Inline(const Value& value);
/// An array of values, one per line indented by `indent` + 2 blanks, its closing bracket on a
/// line of its own indented by `indent`.
std::string Rows(const std::vector<Value>& rows, int indent);

/// The same array written out a row at a time, so that a large one is never held whole:
/// Row takes each row already laid out on one line, and the destructor-free End closes it.
class RowWriter {
  public:
    RowWriter(std::string& out, int indent)
        : Out(out), Margin(static_cast<std::size_t>(indent), ' ') {
        Out += '[';
    }
    void Row(const std::string& inlineRow);
    void End();

  private:
    std::string& Out;
    std::string Margin;
    const char* Separator = "\n";
};
/// An object whose members are already laid out, one per line: `{\n  "name": text,\n ...}`.
std::string Members(const std::vector<std::pair<const char*, std::string>>& members);

}  // namespace json
