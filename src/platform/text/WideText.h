#pragma once
// Wide text as the system holds it: rows and names are std::wstring, because the record
// limits count characters. Files and the database are UTF-8; conversion happens here only.

#include <string>
#include <string_view>

namespace nedit {

/// UTF-8 bytes to wide text. Malformed sequences become U+FFFD, one per bad byte, so that
/// nothing read from a damaged file is silently dropped or crashes the reader.
std::wstring FromUtf8(std::string_view utf8);
/// The same into `out`, whose memory is reused.
void FromUtf8(std::string_view utf8, std::wstring& out);

/// True when every byte belongs to a well-formed UTF-8 sequence.
bool IsValidUtf8(std::string_view bytes);

/// A line of a text file: UTF-8 when it is valid UTF-8, else Latin-1 (one character per
/// byte), so that files written by older programs keep their accented letters.
std::wstring DecodeTextLine(std::string_view bytes);
/// The same line as UTF-8: the bytes themselves when they are valid UTF-8, else their
/// Latin-1 reading, made in `buffer`.
std::string_view TextLineAsUtf8(std::string_view bytes, std::string& buffer);

/// Wide text to UTF-8. Code points outside Unicode become U+FFFD.
std::string ToUtf8(std::wstring_view text);
/// The same, appended to `out`.
void AppendUtf8(std::string& out, std::wstring_view text);

/// True when every byte is ASCII: such UTF-8 text has one character per byte, and upper
/// case, blanks and keys can be handled byte by byte as the wide functions handle them.
bool IsAscii(std::string_view bytes);

/// Upper case by the Unicode rules of the C.UTF-8 locale, never the user's locale;
/// characters without an upper-case form are left as they are.
std::wstring ToUpper(std::wstring_view text);
std::wstring ToLower(std::wstring_view text);
/// ToUpper of UTF-8 text, in UTF-8.
std::string ToUpperUtf8(std::string_view text);
/// The same into `out`, whose memory is reused.
void ToUpperUtf8(std::string_view text, std::string& out);

/// The two texts are equal when both are upper-cased as ToUpper does; nothing is allocated.
bool EqualsIgnoreCase(std::wstring_view a, std::wstring_view b);

/// True for the blanks that trimming removes: space, tab, CR, LF, VT, FF.
bool IsBlank(wchar_t c);

/// The text without blanks at its ends, as a view into `text`.
std::wstring_view TrimView(std::wstring_view text);
std::wstring_view TrimLeftView(std::wstring_view text);
std::wstring_view TrimRightView(std::wstring_view text);
/// The same on UTF-8 text, whose blanks are all ASCII.
std::string_view TrimView(std::string_view text);
std::string_view TrimLeftView(std::string_view text);
std::string_view TrimRightView(std::string_view text);

std::wstring TrimLeft(std::wstring_view text);
std::wstring TrimRight(std::wstring_view text);
std::wstring Trim(std::wstring_view text);
/// Removes the given characters from both ends.
std::wstring TrimChars(std::wstring_view text, std::wstring_view chars);

/// The first `count` characters (all of them when shorter).
std::wstring Left(std::wstring_view text, std::size_t count);
/// The same of UTF-8 text, as a view into it.
std::string_view LeftUtf8(std::string_view text, std::size_t count);

/// How many times `c` occurs in `text`.
int CountOf(std::wstring_view text, wchar_t c);

bool StartsWith(std::wstring_view text, std::wstring_view prefix);
bool EndsWith(std::wstring_view text, std::wstring_view suffix);

}  // namespace nedit
