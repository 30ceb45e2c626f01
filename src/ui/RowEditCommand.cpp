#include "ui/RowEditCommand.h"

#include "ui/RowEditRecorder.h"

namespace nedit {

RowEditCommand::RowEditCommand(RowEditRecorder& recorder, std::vector<RowEdit> edits,
                               const QString& text, bool typing)
    : QUndoCommand(text), recorder_(recorder), edits_(std::move(edits)), typing_(typing) {}

void RowEditCommand::undo() {
    UListCtrl* list = recorder_.List();
    if (list == nullptr) return;
    recorder_.SetPaused(true);
    for (auto edit = edits_.rbegin(); edit != edits_.rend(); ++edit) edit->Revert(*list);
    recorder_.SetPaused(false);
    recorder_.SelectRows(edits_);
    done_ = false;
}

void RowEditCommand::redo() {
    UListCtrl* list = recorder_.List();
    if (done_ || list == nullptr) return;
    recorder_.SetPaused(true);
    for (const RowEdit& edit : edits_) edit.Apply(*list);
    recorder_.SetPaused(false);
    recorder_.SelectRows(edits_);
    done_ = true;
}

int RowEditCommand::id() const {
    return typing_ ? kTypingId : -1;
}

bool RowEditCommand::mergeWith(const QUndoCommand* other) {
    const auto* next = static_cast<const RowEditCommand*>(other);
    if (next->edits_.front().row != edits_.front().row) return false;
    edits_.front().texts.back() = next->edits_.front().texts.back();
    return true;
}

}  // namespace nedit
