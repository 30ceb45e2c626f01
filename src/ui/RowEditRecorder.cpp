#include "ui/RowEditRecorder.h"

#include <QTimer>
#include <QUndoStack>

#include "document/UListCtrl.h"
#include "ui/RowEditCommand.h"

namespace nedit {

namespace {
const char* const kDefaultStep = "Edit Records";
}  // namespace

RowEditRecorder::RowEditRecorder(QUndoStack* stack, QObject* parent)
    : QObject(parent), stack_(stack) {}

void RowEditRecorder::SetList(UListCtrl* list) {
    Close();
    list_ = list;
    stack_->clear();
}

void RowEditRecorder::Begin(const QString& text, bool typing) {
    if (depth_++ == 0) {
        Close();
        text_ = text;
        typing_ = typing;
    }
}

void RowEditRecorder::End() {
    if (depth_ > 0 && --depth_ == 0) Close();
}

void RowEditRecorder::Close() {
    close_queued_ = false;
    if (history_lost_) {
        history_lost_ = false;
        pending_.clear();
        stack_->clear();
        return;
    }
    if (pending_.empty()) return;
    const bool typing =
        typing_ && pending_.size() == 1 && pending_.front().kind == RowEdit::Kind::Change;
    const QString text = text_.isEmpty() ? QString::fromLatin1(kDefaultStep) : text_;
    stack_->push(new RowEditCommand(*this, std::move(pending_), text, typing));
    pending_.clear();
    text_.clear();
    typing_ = false;
}

void RowEditRecorder::Recorded() {
    emit rowsChanged();
    if (depth_ > 0 || close_queued_) return;
    // A change outside a bracket (a key, a drag) is one step with the others of its event.
    close_queued_ = true;
    QTimer::singleShot(0, this, [this] {
        if (close_queued_ && depth_ == 0) Close();
    });
}

std::wstring RowEditRecorder::Text(int row) const {
    return list_->GetItemText(row);
}

void RowEditRecorder::RecordRows(RowEdit::Kind kind, int first, int count) {
    if (list_ == nullptr) return;
    if (paused_) {
        emit rowsChanged();
        return;
    }
    RowEdit edit{kind, first, {}};
    edit.texts.reserve(static_cast<std::size_t>(count));
    for (int row = first; row < first + count; ++row) edit.texts.push_back(Text(row));
    pending_.push_back(std::move(edit));
    Recorded();
}

void RowEditRecorder::RowsAboutToBeRemoved(int first, int count) {
    RecordRows(RowEdit::Kind::Remove, first, count);
}

void RowEditRecorder::RowsInserted(int first, int count) {
    RecordRows(RowEdit::Kind::Insert, first, count);
}

void RowEditRecorder::RowAboutToChange(int row) {
    if (list_ != nullptr && !paused_) before_change_ = Text(row);
}

void RowEditRecorder::RowChanged(int row) {
    if (list_ == nullptr) return;
    if (paused_) {
        emit rowsChanged();
        return;
    }
    pending_.push_back({RowEdit::Kind::Change, row, {std::move(before_change_), Text(row)}});
    Recorded();
}

void RowEditRecorder::RowsAboutToBeCleared() {
    if (list_ == nullptr || paused_) return;
    history_lost_ = true;
    Recorded();
}

void RowEditRecorder::SelectRows(const std::vector<RowEdit>& edits) {
    std::vector<int> rows;
    for (const RowEdit& edit : edits) {
        const int count =
            edit.kind == RowEdit::Kind::Change ? 1 : static_cast<int>(edit.texts.size());
        if (edit.kind == RowEdit::Kind::Remove) {
            rows.push_back(edit.row);
            continue;
        }
        for (int row = edit.row; row < edit.row + count; ++row) rows.push_back(row);
    }
    list_->SetSelection(rows);
    if (rows.empty()) return;
    list_->SetFocusRow(rows.front());
    list_->UpdateHeader();
    emit rowShown(rows.front());
}

}  // namespace nedit
