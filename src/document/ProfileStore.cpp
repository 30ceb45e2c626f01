#include "document/ProfileStore.h"

#include <utility>

#include "platform/settings/ConfigDirectory.h"
#include "platform/settings/IniFile.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {

std::wstring WindowState::ToText() const {
    return Format(L"%d, %d, %d, %d, %d, %d, %d, %d, %d, %d", placementFlags, showCommand, left, top,
                  right, bottom, rowHeight, rowMinimum, columnWidth, columnMinimum);
}

std::vector<int> ParseWindowState(std::wstring_view text) {
    static constexpr std::wstring_view kSeparator = L", ";
    std::vector<int> values;
    if (text.empty()) return values;
    std::size_t start = 0;
    while (true) {
        const std::size_t stop = text.find(kSeparator, start);
        values.push_back(
            TextToInt(text.substr(start, stop == std::wstring_view::npos ? stop : stop - start)));
        if (stop == std::wstring_view::npos) break;
        start = stop + kSeparator.size();
    }
    return values;
}

SplitterColumn ColumnFromWindowState(const std::vector<int>& values) {
    if (values.size() < 10) return {};
    return {values[8], values[9]};
}

ProfileStore::ProfileStore() : path_(ConfigFile(kFileName)) {}

ProfileStore::ProfileStore(std::string path) : path_(std::move(path)) {}

std::wstring ProfileStore::ReadWindowStateText() const {
    const std::wstring text =
        Trim(IniFile(path_).ReadString(kWindowSection, kWindowEntry, kDefaultWindowState));
    return text.empty() ? kDefaultWindowState : text;
}

std::optional<SplitterColumn> ProfileStore::ReadColumnSize(bool maximised) const {
    if (maximised) return std::nullopt;
    return ColumnFromWindowState(ParseWindowState(ReadWindowStateText()));
}

bool ProfileStore::WriteWindowState(const WindowState& state) const {
    return IniFile(path_).WriteString(kWindowSection, kWindowEntry, state.ToText());
}

std::wstring ProfileStore::ListWidthEntry() {
    return Format(L"%ld-%ld", kListViewId, kListCtrlId);
}

long ProfileStore::ReadListWidth() const {
    return TextToInt(IniFile(path_).ReadString(kListSection, ListWidthEntry()));
}

bool ProfileStore::WriteListWidth(long width) const {
    return IniFile(path_).WriteString(kListSection, ListWidthEntry(), Format(L"%ld", width));
}

std::wstring ProfileStore::ReadInstrument() const {
    return IniFile(path_).ReadString(kDefaultSection, kInstrumentEntry);
}

bool ProfileStore::WriteInstrument(const std::wstring& instrument) const {
    return IniFile(path_).WriteString(kDefaultSection, kInstrumentEntry, instrument);
}

std::wstring ProfileStore::ReadSurveyCodeControl() const {
    return IniFile(path_).ReadString(kDefaultSection, kSurveyCodeControlEntry);
}

}  // namespace nedit
