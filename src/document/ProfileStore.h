#pragma once
// The application profile: what the program remembers between runs apart from NEDIT.INI,
// kept in "sxnedit.ini" in the configuration directory. It holds the pane's window state,
// the width of the record list, the last instrument and the survey code control entry.
//
// Decisions:
// - The profile has a default section for "Instrument" and "Survey Code Control"; an INI
//   file has none, so those entries live in the section "Settings".
// - Reading never fails: a missing file, section or entry gives the default, and a write
//   that fails leaves the older text in place and answers false.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace nedit {

/// The pane's window placement and splitter sizes, the ten values of the window state in
/// their stored order.
struct WindowState {
    int placementFlags = 0;
    int showCommand = 1;
    int left = 165;  // normal rectangle
    int top = -10;
    int right = 1284;
    int bottom = 798;
    int rowHeight = 505;  // splitter row 0
    int rowMinimum = 16;
    int columnWidth = 697;  // splitter column 0
    int columnMinimum = 0;

    /// "%d, %d, ..." of the ten values.
    std::wstring ToText() const;
};

/// Width and minimum width of the pane's first splitter column.
struct SplitterColumn {
    int width = 32;
    int minimum = 32;
    bool operator==(const SplitterColumn& other) const {
        return width == other.width && minimum == other.minimum;
    }
};

/// The values of a window state text, split at ", " and each read as a whole number (a piece
/// that is no number counts 0).
std::vector<int> ParseWindowState(std::wstring_view text);

/// Values 9 and 10 as the column's width and minimum; 32 and 32 with fewer than 10 values.
SplitterColumn ColumnFromWindowState(const std::vector<int>& values);

class ProfileStore {
  public:
    static constexpr const char* kFileName = "sxnedit.ini";
    static constexpr const wchar_t* kWindowSection = L"Settings\\Window State";
    static constexpr const wchar_t* kWindowEntry = L"RawDataEditor";
    static constexpr const wchar_t* kDefaultWindowState =
        L"0, 1, 165, -10, 1284, 798, 505, 16, 697, 0";
    static constexpr const wchar_t* kListSection = L"Settings\\ListCtrl State";
    /// The stand-in for the profile's default section.
    static constexpr const wchar_t* kDefaultSection = L"Settings";
    static constexpr const wchar_t* kInstrumentEntry = L"Instrument";
    static constexpr const wchar_t* kSurveyCodeControlEntry = L"Survey Code Control";
    /// The numbers that name the list width entry: the view's and the list's ids.
    static constexpr long kListViewId = 1000000001;
    static constexpr long kListCtrlId = 2000;

    /// The profile in the configuration directory, as it is at the time of the call.
    ProfileStore();
    /// A profile at `path`, for tests and tools.
    explicit ProfileStore(std::string path);

    const std::string& Path() const { return path_; }

    /// The window state entry, trimmed; the default text when it is missing or blank.
    std::wstring ReadWindowStateText() const;
    /// The column size the stored state gives; nothing for a maximised pane, whose layout
    /// does not come from the stored state.
    std::optional<SplitterColumn> ReadColumnSize(bool maximised) const;
    bool WriteWindowState(const WindowState& state) const;

    /// The name of the list width entry, "%ld-%ld" of the view's and the list's ids.
    static std::wstring ListWidthEntry();
    /// The stored width of the record list; 0 when none is stored. Only a width above 0 is
    /// meant to be applied.
    long ReadListWidth() const;
    bool WriteListWidth(long width) const;

    /// The instrument chosen last for a raw file import; empty when none.
    std::wstring ReadInstrument() const;
    bool WriteInstrument(const std::wstring& instrument) const;
    /// Passed on unread to the driver manager; this program never writes it.
    std::wstring ReadSurveyCodeControl() const;

  private:
    std::string path_;
};

}  // namespace nedit
