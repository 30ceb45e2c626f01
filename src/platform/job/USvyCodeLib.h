#pragma once
// A survey code library: the definitions of feature codes, found by code without regard to
// case ("fnc" finds "FNC"). A library has a home that Load and Save use: the job (its own
// library, table survey_code) or a file (the shared library of the office, and the default
// library that a new job starts from).
//
// Library file: CSV text (see Csv.h), UTF-8. Lines that begin with '#' and empty lines are
// skipped. The first other line names the columns: "code" is required, and any of
// description, layer, point_mark, symbol, point_colour, line_type, line_colour, thickness,
// is_string, use_in_surface, line_use_in_surface, point_flag1 .. point_flag4 may follow in any
// order. Unknown columns are ignored, so a newer file still loads. A later row of the same
// code replaces the earlier one.

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "platform/job/USvyCode.h"

namespace nedit {
class JobDatabase;
}

class USvyCodeLib {
  public:
    USvyCodeLib() = default;

    /// Non-zero when the library defines `code` (null or empty text: 0).
    int FindSvyCode(const wchar_t* code) const;
    /// The definition of `code`, or null.
    const USvyCode* GetSvyCode(std::wstring_view code) const;
    /// Adds the definition, or replaces the one of the same code; marks the library modified.
    /// A definition with an empty code is refused (false).
    bool SetSvyCode(const USvyCode& code);
    bool RemoveSvyCode(std::wstring_view code);
    /// In the order they were added.
    const std::vector<USvyCode>& GetCodes() const { return codes_; }
    int GetCount() const { return static_cast<int>(codes_.size()); }

    bool IsModified() const { return modified_; }
    void SetModified(bool modified) { modified_ = modified; }

    /// Replaces the contents with the file's and makes the file the library's home. False,
    /// with a message naming the file and line, when it cannot be read; the library is then
    /// unchanged.
    bool LoadFile(const std::string& path, std::wstring& error);
    /// Writes the library to `path` through a temporary file, so a failed write leaves the
    /// old file whole.
    bool SaveFile(const std::string& path, std::wstring& error) const;
    /// Replaces the contents with the job's own library and makes the job the home.
    void LoadJob(nedit::JobDatabase& job);
    /// Replaces the job's own library by this one, in one transaction.
    void SaveJob(nedit::JobDatabase& job) const;

    /// Writes the library to its home. `always` false writes only when the library holds
    /// changes; `quiet` is accepted for callers of the suite and changes nothing here (the
    /// library never shows messages). 1 on success; 0 with no home or when a file cannot be
    /// written (LastError tells why). A database failure throws nedit::JobError.
    int Save(bool always = false, bool quiet = true);
    /// Reads the library again from its home; 0 with no home or on failure.
    int Load();
    const std::wstring& LastError() const { return last_error_; }

  private:
    static std::wstring Key(std::wstring_view code);
    void Clear();

    std::vector<USvyCode> codes_;
    std::map<std::wstring, std::size_t> index_;  // upper-case code to position in codes_
    bool modified_ = false;
    std::string file_;
    nedit::JobDatabase* job_ = nullptr;
    std::wstring last_error_;
};
