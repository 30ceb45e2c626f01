// The record list's commands: clipboard, delete, comments, stepping by type, find, the
// point highlight, dragging and the keys.

#include <algorithm>

#include "document/UListCtrl.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

namespace {

// The clipboard's text as rows. Other programs here end lines with LF alone, so every line
// end counts; the gate never lets an empty row in, so a paste does not either.
std::vector<std::wstring> SplitClipboardRows(const std::wstring& text) {
    std::vector<std::wstring> rows;
    std::size_t start = 0;
    while (start <= text.size()) {
        std::size_t stop = text.find_first_of(L"\r\n", start);
        if (stop == std::wstring::npos) stop = text.size();
        std::wstring row = text.substr(start, stop - start);
        if (!row.empty()) {
            if (row.size() > static_cast<std::size_t>(kMaxRowLength)) row.resize(kMaxRowLength);
            rows.push_back(std::move(row));
        }
        if (stop < text.size() && text[stop] == L'\r' && stop + 1 < text.size() &&
            text[stop + 1] == L'\n') {
            ++stop;
        }
        start = stop + 1;
    }
    return rows;
}

bool IsWordBoundary(const std::wstring& row, std::size_t index) {
    return index >= row.size() ||
           std::wstring_view(L" ,=").find(row[index]) != std::wstring_view::npos;
}

}  // namespace

// ---- Clipboard -----------------------------------------------------------------------------

int UListCtrl::CopyRows() {
    if (clipboard_ == nullptr) return 0;
    const int first = GetFirstSelected();
    if (first < 0) return 0;
    const int start = RunStart(first);
    const int end = RunEnd(first);
    std::wstring text;
    for (int row = end; row >= start; --row) {
        text += GetItemText(row);
        text += L"\r\n";
    }
    if (!clipboard_->SetText(text)) return 0;
    copy_from_ = start;
    return end - start + 1;
}

int UListCtrl::PasteAt(int row) {
    std::wstring text;
    if (clipboard_ == nullptr || !clipboard_->GetText(text)) return 0;
    std::vector<std::wstring> pieces = SplitClipboardRows(text);
    if (pieces.empty()) return 0;
    // Each piece goes in at the same row and pushes the one before it down, so the rows end
    // up in the reverse of the clipboard's order.
    std::reverse(pieces.begin(), pieces.end());
    const int count = static_cast<int>(pieces.size());
    InsertRows(row, std::move(pieces));
    std::fill(selected_.begin() + row, selected_.begin() + row + count, 1);
    focus_ = anchor_ = row;
    NotifySelection();
    UpdateHeader();
    MarkFormModified();
    return count;
}

int UListCtrl::PasteRows() {
    const int first = GetFirstSelected();
    // Only rows copied from a list may come back in; text from elsewhere is no record.
    if (first < 0 || copy_from_ < 0) return 0;
    return PasteAt(first);
}

int UListCtrl::DeleteRows() {
    const std::vector<int> doomed = GetSelectedRows();
    if (doomed.empty()) return 0;
    if (nedit::AppMessageBox(host_, nedit::Translate(L"Confirm Delete Record"),
                             nedit::mb::OkCancel | nedit::mb::IconQuestion) != nedit::mb::IdOk) {
        return 0;
    }
    // Whole runs at a time, from the bottom, so the indices above stay valid.
    for (std::size_t end = doomed.size(); end > 0;) {
        std::size_t begin = end - 1;
        while (begin > 0 && doomed[begin - 1] + 1 == doomed[begin]) --begin;
        RemoveRows(doomed[begin], static_cast<int>(end - begin));
        end = begin;
    }
    const int count = static_cast<int>(doomed.size());
    // The row that now stands where the last deleted row stood.
    const int next = std::min(doomed.back() - (count - 1), GetItemCount() - 1);
    if (next >= 0) {
        SelectOnly(next);
        NotifySelection();
        if (events_ != nullptr) events_->EnsureVisible(next);
    }
    MarkFormModified();
    return count;
}

// ---- Comments ------------------------------------------------------------------------------

void UListCtrl::CommentRow() {
    const int row = GetFirstSelected();
    if (row < 0) return;
    const std::wstring text = GetItemText(row);
    if (nedit::StartsWith(nedit::TrimLeftView(text), L"#")) return;
    if (SetRecord(row, L"#" + text) < 0) return;
    ShowRecord(GetItemText(row), row);
}

void UListCtrl::UncommentRow() {
    const int row = GetFirstSelected();
    if (row < 0) return;
    const std::wstring old_text = GetItemText(row);
    const std::wstring_view trimmed = nedit::TrimLeftView(old_text);
    if (!nedit::StartsWith(trimmed, L"#")) return;
    if (SetRecord(row, nedit::TrimLeft(trimmed.substr(1))) < 0) return;
    // A text that the form cannot show is no record the user meant to make.
    if (form_ != nullptr && ShowRecord(GetItemText(row), row) == 0) ReplaceRow(row, old_text);
}

// ---- Stepping by record type ---------------------------------------------------------------

int UListCtrl::RowType(int row) const {
    const std::wstring text = GetItemText(row);
    if (nedit::StartsWith(nedit::TrimLeftView(text), L"#")) return 0;
    return format_->GetRecordType(text);
}

void UListCtrl::StepTo(int from, int to) {
    selected_[static_cast<std::size_t>(from)] = 0;
    NotifySelection();
    ShowRecord(GetItemText(to), to);
    selected_[static_cast<std::size_t>(to)] = 1;
    focus_ = anchor_ = to;
    NotifySelection();
    if (events_ != nullptr) events_->EnsureVisible(to);
    HighlightRecordPoint();
}

int UListCtrl::NextOfType() {
    const int current = GetFirstSelected();
    if (current < 0 || current == GetItemCount() - 1) return 0;
    const int type = RowType(current);
    for (int row = current + 1; row < GetItemCount(); ++row) {
        if (RowType(row) == type) {
            StepTo(current, row);
            break;
        }
    }
    return 1;
}

int UListCtrl::PreviousOfType() {
    const int current = GetFirstSelected();
    if (current <= 0) return 0;
    const int type = RowType(current);
    for (int row = current - 1; row >= 0; --row) {
        if (RowType(row) == type) {
            StepTo(current, row);
            break;
        }
    }
    return 1;
}

// ---- Find ----------------------------------------------------------------------------------

int UListCtrl::FindText(const std::wstring& text, bool down, bool matchCase, bool wholeWord) {
    const int count = GetItemCount();
    if (count == 0 || text.empty()) return 0;
    const std::wstring needle = matchCase ? text : nedit::ToLower(text);
    auto matches = [&](int row) {
        const std::wstring raw = GetItemText(row);
        const std::wstring hay = matchCase ? raw : nedit::ToLower(raw);
        const std::size_t at = hay.find(needle);
        if (at == std::wstring::npos) return false;
        if (!wholeWord) return true;
        return (at == 0 || IsWordBoundary(hay, at - 1)) && IsWordBoundary(hay, at + needle.size());
    };

    const int selected = GetFirstSelected();
    int found = -1;
    if (down) {
        const int start = selected < 0 ? 0 : (selected + 1 < count ? selected + 1 : 0);
        for (int row = start; row < count && found < 0; ++row) {
            if (matches(row)) found = row;
        }
        for (int row = 0; selected >= 0 && row <= selected && found < 0; ++row) {
            if (matches(row)) found = row;
        }
    } else {
        const int start = selected < 0 ? 0 : (selected > 0 ? selected - 1 : count - 1);
        for (int row = start; row >= 0 && found < 0; --row) {
            if (matches(row)) found = row;
        }
        for (int row = selected + 1; selected >= 0 && row < count && found < 0; ++row) {
            if (matches(row)) found = row;
        }
    }
    if (found >= 0) {
        SelectRow(found);
        return 1;
    }
    nedit::AppMessageBox(host_, nedit::Translate(L"{1} not found.", {text}),
                         nedit::mb::Ok | nedit::mb::IconInformation);
    return 0;
}

// ---- The point of a record -----------------------------------------------------------------

void UListCtrl::HighlightRecordPoint() {
    if (graphic_ == nullptr) return;
    const int row = GetFirstSelected();
    if (row < 0) return;
    const std::wstring text = GetItemText(row);
    const std::size_t id = text.find(L"ID=");
    if (id == std::wstring::npos) return;
    const std::size_t comma = text.find(L',', id + 3);
    if (comma == std::wstring::npos) return;
    const std::wstring name = nedit::Trim(std::wstring_view(text).substr(id + 3, comma - id - 3));
    if (name.empty()) return;
    if (graphic_->SetSelectedPoint(name)) graphic_->ViewSelectedPoint();
}

// ---- Dragging ------------------------------------------------------------------------------

bool UListCtrl::BeginDrag(bool copy) {
    const int first = GetFirstSelected();
    if (first < 0) return false;
    drag_copy_ = copy;
    drag_move_ = !copy;
    copy_from_ = RunStart(first);
    return true;
}

void UListCtrl::DragOver(int row) {
    if (!IsDragging() || !InRange(row) || row == drop_target_) return;
    drop_target_ = focus_ = row;
    NotifySelection();
}

void UListCtrl::CancelDrag() {
    const bool had_target = drop_target_ >= 0;
    drag_copy_ = drag_move_ = false;
    drop_target_ = -1;
    if (had_target) NotifySelection();
}

int UListCtrl::Drop(int row) {
    const bool copy = drag_copy_;
    const bool dragging = IsDragging();
    CancelDrag();
    // On a selected row the run would land inside itself.
    if (!dragging || !InRange(row) || IsSelected(row)) return 0;
    const int first = GetFirstSelected();
    if (first < 0) return 0;
    const int start = RunStart(first);
    const int run = RunEnd(first) - start + 1;
    if (CopyRows() != run) return 0;
    // Where the original run stands once the copy is in.
    const int original = row <= start ? start + run : start;
    const int pasted = PasteAt(row);
    if (copy) {
        SetFocusRow(row);
    } else if (pasted == run) {
        RemoveRows(original, run);
    }
    MarkFormModified();
    return pasted;
}

// ---- Keys ----------------------------------------------------------------------------------

void UListCtrl::MoveByKey(int delta, bool extend) {
    const int count = GetItemCount();
    if (count == 0) return;
    const int from = focus_ >= 0 ? focus_ : GetFirstSelected();
    const int to = from < 0 ? 0 : std::clamp(from + delta, 0, count - 1);
    if (extend) {
        const int anchor = InRange(anchor_) ? anchor_ : (from < 0 ? to : from);
        std::fill(selected_.begin(), selected_.end(), 0);
        std::fill(selected_.begin() + std::min(anchor, to),
                  selected_.begin() + std::max(anchor, to) + 1, 1);
        anchor_ = anchor;
        focus_ = to;
    } else {
        SelectOnly(to);
    }
    NotifySelection();
    if (events_ != nullptr) events_->EnsureVisible(to);
}

void UListCtrl::OnKeyDown(nedit::ListKey key, bool extend) {
    using nedit::ListKey;
    switch (key) {
        case ListKey::Control:
            ctrl_down_ = true;
            return;
        case ListKey::Shift:
            shift_down_ = true;
            return;
        case ListKey::Delete:
            DeleteRows();
            return;
        case ListKey::Enter:
            if (events_ != nullptr) events_->FocusForm();
            return;
        case ListKey::Up:
            MoveByKey(-1, extend);
            break;
        case ListKey::Down:
            MoveByKey(1, extend);
            break;
        case ListKey::PageUp:
            MoveByKey(-visible_rows_, extend);
            break;
        case ListKey::PageDown:
            MoveByKey(visible_rows_, extend);
            break;
        default:
            return;
    }
    UpdateHeader();
    if (GetSelectedCount() == 1) HighlightRecordPoint();
}

void UListCtrl::OnKeyUp(nedit::ListKey key) {
    using nedit::ListKey;
    if (ctrl_down_) {
        if (key == ListKey::Insert || key == ListKey::C) {
            CopyRows();
        } else if (key == ListKey::V) {
            PasteRows();
        } else if (key == ListKey::X) {
            if (CopyRows() > 0) DeleteRows();
        }
    } else if (shift_down_ && key == ListKey::Insert) {
        PasteRows();
    }
    ctrl_down_ = shift_down_ = false;
}
