#include "document/UListCtrl.h"

#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

UListCtrl::UListCtrl(const UNeutralFileFormat* format) : format_(format) {}

std::wstring UListCtrl::NormaliseRecord(const std::wstring& text) const {
    // Blanks around a row carry nothing, and a leading one would hide the record's key.
    std::wstring row = format_->MakeUpperCaseString(std::wstring(nedit::TrimView(text)));
    if (!row.empty() && row[0] != L'#') {
        int type = rec::None;
        if (format_->FindRecordKey(row.substr(0, row.find_first_of(L" ,")), type)) {
            row = format_->FormatRecord(type, row);
        } else {
            row.insert(0, L"# ");
        }
    }
    if (row.size() > static_cast<std::size_t>(kMaxRowLength)) row.resize(kMaxRowLength);
    return row;
}

int UListCtrl::AddRecord(int row, const std::wstring& text) {
    std::wstring normalised = NormaliseRecord(text);
    if (normalised.empty()) return -1;
    if (row < 0 || row > GetItemCount()) row = GetItemCount();
    rows_.insert(rows_.begin() + row, std::move(normalised));
    return row;
}

int UListCtrl::SetRecord(int row, const std::wstring& text) {
    std::wstring normalised = NormaliseRecord(text);
    if (normalised.empty() || row < 0 || row >= GetItemCount()) return -1;
    rows_[static_cast<std::size_t>(row)] = std::move(normalised);
    return row;
}

std::wstring UListCtrl::GetItemText(int row) const {
    if (row < 0 || row >= GetItemCount()) return {};
    return rows_[static_cast<std::size_t>(row)];
}

void UListCtrl::DeleteItem(int row) {
    if (row >= 0 && row < GetItemCount()) rows_.erase(rows_.begin() + row);
}
