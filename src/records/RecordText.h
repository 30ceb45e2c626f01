#pragma once
// Free functions on the text of a record row.

#include <string>
#include <string_view>

class UNeutralFileFormat;

/// The n-th token of `text`, tokens being separated by single blanks or commas, each
/// separator counting (two blanks in a row make an empty token); trimmed and upper-cased.
/// Token 0 of a record is its key. Empty when there is no n-th token.
std::wstring GetToken(std::wstring_view text, int n);

/// The same with the given set of delimiter characters.
std::wstring GetDelimToken(std::wstring_view text, int n, std::wstring_view delimiters);

/// The record with comma token `n` replaced by `value`; missing tokens are added empty.
/// Token 0 holds the key and the first field, and its key stays in front of the new value.
std::wstring ReplaceToken(std::wstring_view record, int n, std::wstring_view value);

/// The text between the last blank before the first comma and that comma: for
/// "STN       ID=P1,HI=1.500" it is "ID=P1". Without a comma the text after the first
/// blank; without either, empty.
std::wstring GetIdText(std::wstring_view record);
/// The same in UTF-8, as a view into `record`.
std::string_view GetIdTextUtf8(std::string_view record);

/// The angular unit that a row sets with "UA=": 1 for "1" or "D", 2 for "2" or "G", else 0
/// (also when the row has no "UA="). Blanks after "=" are skipped.
int GetAngleType(std::wstring_view row);

/// The gate of every row that enters a document's rows: trimmed and upper-cased; an empty
/// text or a comment as it is; a known key laid out by `format`; an unknown key made a
/// comment with "# " in front, so that nothing is lost. The result is cut to the row limit of
/// 255 characters.
std::wstring NormaliseRow(const UNeutralFileFormat& format, const std::wstring& text);
/// A row as the reduction reads it: at most 255 characters, trimmed, in upper case. A row
/// that came through the gate is so already and is given back itself; another is made in
/// `buffer`.
std::string_view RowAsRead(std::string_view row, std::string& buffer);

/// The same gate for UTF-8 text, into `out`; a row of ASCII text passes it without being
/// widened, and gives the same row as NormaliseRow.
void NormaliseRowUtf8(const UNeutralFileFormat& format, std::string_view text, std::string& out);
