#pragma once
// One step of the undo history: the row edits of one command, undone last first.
// Successive keystrokes in the record form on one row merge into one step.

#include <QUndoCommand>
#include <vector>

#include "ui/RowEdit.h"

namespace nedit {

class RowEditRecorder;

class RowEditCommand : public QUndoCommand {
  public:
    /// Typing in one row of the form; such steps merge.
    static constexpr int kTypingId = 1;

    /// `edits` have already been done on the recorder's list; the first redo does nothing.
    RowEditCommand(RowEditRecorder& recorder, std::vector<RowEdit> edits, const QString& text,
                   bool typing);

    void undo() override;
    void redo() override;
    int id() const override;
    bool mergeWith(const QUndoCommand* other) override;

  private:
    RowEditRecorder& recorder_;
    std::vector<RowEdit> edits_;
    bool typing_;
    bool done_ = true;
};

}  // namespace nedit
