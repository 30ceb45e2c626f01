#pragma once
// Keeps the undo history of a record list. It listens to every change of the rows, from
// any source (a command, a key, a drag, the form, a reduction that adds rows), and files
// the changes of one command as one step on the undo stack: between Begin and End, or,
// for changes outside such a bracket, up to the end of the event that made them.
//
// A change that replaces all rows at once (an import) cannot be undone row by row; it
// clears the history, since the user has agreed to overwrite the records.

#include <QObject>
#include <QString>
#include <vector>

#include "document/ListInterfaces.h"
#include "ui/RowEdit.h"

class QUndoStack;
class UListCtrl;

namespace nedit {

class RowEditRecorder : public QObject, public ListEvents {
    Q_OBJECT
  public:
    RowEditRecorder(QUndoStack* stack, QObject* parent = nullptr);

    void SetList(UListCtrl* list);
    UListCtrl* List() const { return list_; }

    /// Changes from now until the matching End are one step, named `text`. Brackets nest;
    /// the outermost names the step. A `typing` step that changes one row merges with the
    /// typing step before it on the same row.
    void Begin(const QString& text, bool typing = false);
    void End();
    /// Files what has been recorded so far as a step.
    void Close();

    /// Undo and redo change the rows without recording them.
    void SetPaused(bool paused) { paused_ = paused; }
    /// The rows of the edits just undone or redone become the selection.
    void SelectRows(const std::vector<RowEdit>& edits);

    void RowsAboutToBeRemoved(int first, int count) override;
    void RowsInserted(int first, int count) override;
    void RowAboutToChange(int row) override;
    void RowChanged(int row) override;
    void RowsAboutToBeCleared() override;

  signals:
    /// The rows changed, by a command, an undo or a redo.
    void rowsChanged();
    /// An undo or a redo selected this row among those it changed: it wants to be seen.
    void rowShown(int row);

  private:
    /// Rows from `first` on, read as they stand now: before a removal, after an insert.
    void RecordRows(RowEdit::Kind kind, int first, int count);
    void Recorded();
    std::wstring Text(int row) const;

    QUndoStack* stack_;
    UListCtrl* list_ = nullptr;
    std::vector<RowEdit> pending_;
    QString text_;
    bool typing_ = false;
    int depth_ = 0;
    bool close_queued_ = false;
    bool paused_ = false;
    bool history_lost_ = false;
    std::wstring before_change_;
};

/// Begin and End of a step of the undo history, for a scope.
class RowEditStep {
  public:
    RowEditStep(RowEditRecorder* recorder, const QString& text, bool typing = false)
        : recorder_(recorder) {
        if (recorder_ != nullptr) recorder_->Begin(text, typing);
    }
    ~RowEditStep() {
        if (recorder_ != nullptr) recorder_->End();
    }
    RowEditStep(const RowEditStep&) = delete;
    RowEditStep& operator=(const RowEditStep&) = delete;

  private:
    RowEditRecorder* recorder_;
};

}  // namespace nedit
