#include "records/RecordText.h"

#include <algorithm>

#include "platform/text/WideText.h"
#include "records/RecordLayout.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

std::wstring GetDelimToken(std::wstring_view text, int n, std::wstring_view delimiters) {
    if (n < 0) return {};
    std::size_t start = 0;
    for (int index = 0; index < n; ++index) {
        const std::size_t separator = text.find_first_of(delimiters, start);
        if (separator == std::wstring_view::npos) return {};
        start = separator + 1;
    }
    const std::size_t end = text.find_first_of(delimiters, start);
    const std::size_t length =
        end == std::wstring_view::npos ? std::wstring_view::npos : end - start;
    return nedit::ToUpper(nedit::Trim(text.substr(start, length)));
}

std::wstring GetToken(std::wstring_view text, int n) {
    return GetDelimToken(text, n, L" ,");
}

std::wstring ReplaceToken(std::wstring_view record, int n, std::wstring_view value) {
    if (n < 0) return std::wstring(record);
    std::wstring out;
    std::size_t start = 0;
    int index = 0;
    for (; index < n; ++index) {
        const std::size_t comma = record.find(L',', start);
        if (comma == std::wstring_view::npos) break;
        start = comma + 1;
    }
    if (index < n) {
        // Fewer tokens than asked for: pad with empty ones so the value lands at position n.
        out.assign(record);
        out.append(static_cast<std::size_t>(n - index), L',');
        return out.append(value);
    }
    out.assign(record.substr(0, start));
    if (n == 0) {
        // The key and the blanks that pad it stay; the first field is what is replaced.
        const std::size_t blank = record.find(L' ');
        const std::size_t comma = record.find(L',');
        if (blank != std::wstring_view::npos &&
            (comma == std::wstring_view::npos || blank < comma)) {
            const std::size_t field = record.find_first_not_of(L' ', blank);
            out.assign(record.substr(0, field == std::wstring_view::npos ? record.size() : field));
        }
    }
    out.append(value);
    const std::size_t next = record.find(L',', start);
    if (next != std::wstring_view::npos) out.append(record.substr(next));
    return out;
}

namespace {

template <typename Char>
std::basic_string_view<Char> IdText(std::basic_string_view<Char> record) {
    using View = std::basic_string_view<Char>;
    const std::size_t comma = record.find(Char(','));
    if (comma == View::npos) {
        const std::size_t blank = record.find(Char(' '));
        // A formatted row pads its key with blanks; the text meant is the field after them.
        return blank == View::npos ? View() : nedit::TrimLeftView(record.substr(blank + 1));
    }
    const std::size_t blank = record.rfind(Char(' '), comma);
    const std::size_t start = blank == View::npos ? 0 : blank + 1;
    return record.substr(start, comma - start);
}

}  // namespace

std::wstring GetIdText(std::wstring_view record) {
    return std::wstring(IdText(record));
}

std::string_view GetIdTextUtf8(std::string_view record) {
    return IdText(record);
}

int GetAngleType(std::wstring_view row) {
    const std::size_t found = row.find(L"UA=");
    if (found == std::wstring_view::npos) return 0;
    std::size_t i = found + 3;
    while (i < row.size() && row[i] == L' ') ++i;
    if (i >= row.size()) return 0;
    switch (row[i]) {
        case L'1':
        case L'D':
        case L'd':
            return 1;
        case L'2':
        case L'G':
        case L'g':
            return 2;
        default:
            return 0;
    }
}

std::wstring NormaliseRow(const UNeutralFileFormat& format, const std::wstring& text) {
    // Blanks around a row carry nothing, and a leading one would hide the record's key.
    std::wstring row = format.MakeUpperCaseString(std::wstring(nedit::TrimView(text)));
    if (!row.empty() && row[0] != L'#') {
        int type = rec::None;
        if (format.FindRecordKey(row.substr(0, row.find_first_of(L" ,")), type)) {
            row = format.FormatRecord(type, row);
        } else {
            row.insert(0, L"# ");
        }
    }
    if (row.size() > static_cast<std::size_t>(kMaxRowLength)) row.resize(kMaxRowLength);
    return row;
}

void NormaliseRowUtf8(const UNeutralFileFormat& format, std::string_view text, std::string& out) {
    if (!nedit::IsAscii(text)) {
        out = nedit::ToUtf8(NormaliseRow(format, nedit::FromUtf8(text)));
        return;
    }
    // ASCII rows are upper-cased as they are laid out, in one pass.
    const auto upper = [](char c) {
        return static_cast<char>(c - (c >= 'a' && c <= 'z' ? 32 : 0));
    };
    const std::string_view row = nedit::layout::Trim(text);
    out.clear();
    if (!row.empty() && row[0] != '#') {
        const std::string_view key = row.substr(0, nedit::layout::KeyEnd(row));
        char upper_key[64];
        std::size_t length = std::min(key.size(), sizeof upper_key);
        for (std::size_t i = 0; i < length; ++i) upper_key[i] = upper(key[i]);
        // A key longer than the buffer is longer than any key of a definition.
        int type = rec::None;
        if (key.size() <= sizeof upper_key && format.FindRecordKeyUtf8({upper_key, length}, type)) {
            nedit::layout::LayOut(row, out, upper);
        } else {
            out = "# ";
            nedit::layout::Append(out, row, upper);
        }
    } else {
        nedit::layout::Append(out, row, upper);
    }
    if (out.size() > static_cast<std::size_t>(kMaxRowLength)) out.resize(kMaxRowLength);
}

std::string_view RowAsRead(std::string_view row, std::string& buffer) {
    const bool ready =
        row.size() <= static_cast<std::size_t>(kMaxRowLength) && nedit::IsAscii(row) &&
        (row.empty() || (!nedit::IsBlank(row.front()) && !nedit::IsBlank(row.back()))) &&
        std::none_of(row.begin(), row.end(), [](char c) { return c >= 'a' && c <= 'z'; });
    if (ready) return row;
    buffer = nedit::ToUtf8(nedit::ToUpper(
        nedit::TrimView(std::wstring_view(nedit::FromUtf8(row)).substr(0, kMaxRowLength))));
    return buffer;
}
