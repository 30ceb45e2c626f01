#pragma once
// A settings file of [SECTION] heads and KEY=value lines, read and written as profile
// files have always been: sections and keys match without regard to case, a missing file,
// section or key gives the default, and writing keeps every other line of the file as it
// was (comments, blank lines, other sections and keys, their order).

#include <string>

namespace nedit {

class IniFile {
  public:
    /// Values are read into a buffer of this many characters; longer values are cut.
    static constexpr std::size_t kValueLimit = 255;

    /// A file at `path` (UTF-8). Nothing is read or made until it is used.
    explicit IniFile(std::string path);

    const std::string& Path() const { return path_; }

    /// The value of `key` in `section`, cut to kValueLimit characters; `fallback` when the
    /// file, the section or the key is missing. The value is the text after the first '='
    /// with blanks at its ends kept as written except the line end (CR, LF). The file is read
    /// afresh on every call, so a value written by another program is seen at once.
    std::wstring ReadString(const std::wstring& section, const std::wstring& key,
                            const std::wstring& fallback = L"") const;

    /// Sets `key` in `section` to `value`, adding the section or key when missing and making
    /// the file and its directory when they do not exist. The file is replaced whole through
    /// a temporary file, so a failed write leaves the older text in place. False when the
    /// file cannot be written.
    bool WriteString(const std::wstring& section, const std::wstring& key,
                     const std::wstring& value) const;

  private:
    std::string path_;
};

}  // namespace nedit
