#include "document/UListCtrl.h"

#include <algorithm>

#include "platform/text/Format.h"
#include "platform/text/TextLines.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"

UListCtrl::UListCtrl(const UNeutralFileFormat* format) : format_(format) {}

// ---- Rows -------------------------------------------------------------------------------

std::wstring UListCtrl::NormaliseRecord(const std::wstring& text) const {
    return NormaliseRow(*format_, text);
}

int UListCtrl::AddRecord(int row, const std::wstring& text) {
    return InsertRecord(row, nedit::ToUtf8(NormaliseRecord(text)));
}

int UListCtrl::AddRecordUtf8(int row, std::string_view text) {
    NormaliseRowUtf8(*format_, text, gate_);
    return InsertRecord(row, gate_);
}

int UListCtrl::InsertRecord(int row, std::string_view normalised) {
    if (normalised.empty()) return -1;
    if (row < 0 || row > GetItemCount()) row = GetItemCount();
    InsertRow(row, normalised);
    // A download adds a row at a time; rebuilding the form for each would only slow it.
    if (form_ != nullptr && !IsAbortProcessOn()) ShowRecord(GetItemText(row), row);
    return row;
}

int UListCtrl::SetRecord(int row, const std::wstring& text) {
    const std::wstring normalised = NormaliseRecord(text);
    if (normalised.empty() || !InRange(row)) return -1;
    ReplaceRow(row, normalised);
    return row;
}

std::wstring UListCtrl::GetItemText(int row) const {
    if (!InRange(row)) return {};
    return nedit::FromUtf8(rows_[static_cast<std::size_t>(row)]);
}

std::string_view UListCtrl::GetRowUtf8(int row) const {
    if (!InRange(row)) return {};
    return rows_[static_cast<std::size_t>(row)];
}

const std::vector<std::wstring>& UListCtrl::GetRows() const {
    if (wide_rows_revision_ != GetRevision()) {
        wide_rows_.clear();
        wide_rows_.reserve(rows_.size());
        for (std::size_t row = 0; row < rows_.size(); ++row)
            wide_rows_.push_back(nedit::FromUtf8(rows_[row]));
        wide_rows_revision_ = GetRevision();
    }
    return wide_rows_;
}

void UListCtrl::DeleteAllItems() {
    const bool had_selection = GetFirstSelected() >= 0 || focus_ >= 0;
    if (events_ != nullptr) events_->RowsAboutToBeCleared();
    rows_.clear();
    RowsChanged();
    selected_.clear();
    focus_ = anchor_ = drop_target_ = -1;
    if (events_ != nullptr) events_->RowsCleared();
    if (had_selection) NotifySelection();
}

void UListCtrl::DeleteItem(int row) {
    if (InRange(row)) RemoveRows(row, 1);
}

void UListCtrl::Reserve(std::size_t rows) {
    rows_.reserve(rows);
    selected_.reserve(rows);
}

bool UListCtrl::RestoreRows(int row, std::vector<std::wstring> texts) {
    if (row < 0 || row > GetItemCount()) return false;
    InsertRows(row, std::move(texts));
    return true;
}

bool UListCtrl::RestoreRowText(int row, std::wstring text) {
    if (!InRange(row)) return false;
    ReplaceRow(row, std::move(text));
    return true;
}

void UListCtrl::InsertRows(int row, std::vector<std::wstring> texts) {
    if (texts.empty()) return;
    std::vector<std::string> lines;
    lines.reserve(texts.size());
    for (const std::wstring& text : texts) lines.push_back(nedit::ToUtf8(text));
    if (events_ != nullptr) events_->RowsAboutToBeInserted(row, static_cast<int>(texts.size()));
    rows_.insert(static_cast<std::size_t>(row), lines);
    RowsAdded(row, static_cast<int>(texts.size()));
}

void UListCtrl::InsertRow(int row, std::string_view text) {
    if (events_ != nullptr) events_->RowsAboutToBeInserted(row, 1);
    rows_.insert(static_cast<std::size_t>(row), text);
    RowsAdded(row, 1);
}

void UListCtrl::RowsAdded(int row, int count) {
    RowsChanged();
    selected_.insert(selected_.begin() + row, static_cast<std::size_t>(count), 0);
    // Focus and anchor stay on the rows they were on, which have moved down.
    if (focus_ >= row) focus_ += count;
    if (anchor_ >= row) anchor_ += count;
    if (events_ != nullptr) events_->RowsInserted(row, count);
}

void UListCtrl::RemoveRows(int row, int count) {
    count = std::min(count, GetItemCount() - row);
    if (row < 0 || count <= 0) return;
    const auto first = selected_.begin() + row;
    const bool lost_selection = std::find(first, first + count, 1) != first + count;
    if (events_ != nullptr) events_->RowsAboutToBeRemoved(row, count);
    rows_.erase(static_cast<std::size_t>(row), static_cast<std::size_t>(count));
    RowsChanged();
    selected_.erase(first, first + count);
    bool lost_focus = false;
    if (focus_ >= row + count) {
        focus_ -= count;
    } else if (focus_ >= row) {
        focus_ = -1;
        lost_focus = true;
    }
    if (anchor_ >= row + count) {
        anchor_ -= count;
    } else if (anchor_ >= row) {
        anchor_ = -1;
    }
    if (events_ != nullptr) events_->RowsRemoved(row, count);
    if (lost_selection || lost_focus) NotifySelection();
}

void UListCtrl::ReplaceRow(int row, const std::wstring& text) {
    if (events_ != nullptr) events_->RowAboutToChange(row);
    rows_.replace(static_cast<std::size_t>(row), nedit::ToUtf8(text));
    RowsChanged();
    if (events_ != nullptr) events_->RowChanged(row);
}

// ---- Selection and focus -------------------------------------------------------------------

int UListCtrl::GetSelectedCount() const {
    return static_cast<int>(std::count(selected_.begin(), selected_.end(), 1));
}

bool UListCtrl::IsSelected(int row) const {
    return InRange(row) && selected_[static_cast<std::size_t>(row)] != 0;
}

int UListCtrl::GetFirstSelected() const {
    return GetNextSelected(-1);
}

int UListCtrl::GetNextSelected(int row) const {
    const auto from = selected_.begin() + std::max(row + 1, 0);
    if (from >= selected_.end()) return -1;
    const auto found = std::find(from, selected_.end(), 1);
    return found == selected_.end() ? -1 : static_cast<int>(found - selected_.begin());
}

std::vector<int> UListCtrl::GetSelectedRows() const {
    std::vector<int> rows;
    for (int row = GetFirstSelected(); row >= 0; row = GetNextSelected(row)) rows.push_back(row);
    return rows;
}

void UListCtrl::SetSelected(int row, bool selected) {
    if (!InRange(row) || IsSelected(row) == selected) return;
    selected_[static_cast<std::size_t>(row)] = selected ? 1 : 0;
    NotifySelection();
}

void UListCtrl::SetSelection(const std::vector<int>& rows) {
    std::vector<char> wanted(selected_.size(), 0);
    for (const int row : rows) {
        if (InRange(row)) wanted[static_cast<std::size_t>(row)] = 1;
    }
    if (wanted == selected_) return;
    selected_ = std::move(wanted);
    NotifySelection();
}

void UListCtrl::ClearSelection() {
    SetSelection({});
}

void UListCtrl::SetFocusRow(int row) {
    if (!InRange(row) || row == focus_) return;
    focus_ = row;
    NotifySelection();
}

void UListCtrl::SelectOnly(int row) {
    std::fill(selected_.begin(), selected_.end(), 0);
    if (InRange(row)) {
        selected_[static_cast<std::size_t>(row)] = 1;
        focus_ = anchor_ = row;
    }
}

void UListCtrl::NotifySelection() {
    if (events_ != nullptr) events_->SelectionChanged();
}

int UListCtrl::RunStart(int row) const {
    while (row > 0 && IsSelected(row - 1)) --row;
    return row;
}

int UListCtrl::RunEnd(int row) const {
    while (IsSelected(row + 1)) ++row;
    return row;
}

// ---- The form and the header ---------------------------------------------------------------

int UListCtrl::ShowRecord(const std::wstring& text, int row) {
    if (text.empty() || form_ == nullptr) return 0;
    const int shown = form_->ShowRecord(text, row);
    // The form takes the focus while it builds its fields; typing goes on in the list.
    if (events_ != nullptr) events_->FocusList();
    return shown;
}

int UListCtrl::UpdateHeader() {
    if (rows_.empty()) return 0;
    const int first = GetFirstSelected();
    if (first < 0) return 1;
    header_ = nedit::Format(L"Rec.No:%d", first);
    if (events_ != nullptr) events_->HeaderChanged(header_);
    return ShowRecord(GetItemText(first), first) == 1 ? 1 : 0;
}

void UListCtrl::MarkFormModified() {
    if (form_ != nullptr) form_->SetModified();
}

// ---- Mouse ---------------------------------------------------------------------------------

void UListCtrl::SelectRow(int row) {
    if (!InRange(row)) return;
    if (events_ != nullptr) events_->EnsureVisible(row);
    OnLButtonDown(row);
}

void UListCtrl::OnLButtonDown(int row, bool ctrl, bool shift) {
    // While a download adds rows the selection must not pull the form along.
    if (IsAbortProcessOn()) return;
    if (!InRange(row)) {
        if (!ctrl) std::fill(selected_.begin(), selected_.end(), 0);
    } else if (shift) {
        const int from = InRange(anchor_) ? anchor_ : row;
        if (!ctrl) std::fill(selected_.begin(), selected_.end(), 0);
        for (int r = std::min(from, row); r <= std::max(from, row); ++r) {
            selected_[static_cast<std::size_t>(r)] = 1;
        }
        focus_ = row;
    } else if (ctrl) {
        char& flag = selected_[static_cast<std::size_t>(row)];
        flag = flag != 0 ? 0 : 1;
        focus_ = anchor_ = row;
    } else {
        SelectOnly(row);
    }
    NotifySelection();
    UpdateHeader();
    HighlightRecordPoint();
}

void UListCtrl::OnLButtonDblClk(int row) {
    if (IsAbortProcessOn()) return;
    if (InRange(row)) {
        SelectOnly(row);
        NotifySelection();
    }
    const int first = GetFirstSelected();
    if (first >= 0 && events_ != nullptr) events_->EditRecordRequested(GetItemText(first), first);
}
