#pragma once
// The record list view: the rows of the document's UListCtrl in one column under the
// header "Neutral File Records" (then "Rec.No:%d"), with the row numbers beside them. The
// list is the master of the rows, the selection and the focused row; this view paints
// them and passes the mouse and the keys on to the list, which carries out clicks, Shift
// and Ctrl selection, keyboard moves, Delete, Enter, double clicks and dragging rows.
//
// The application messages of the view are its members and signals: the list is
// GetListCtrl (0x807B), IsNeditView answers 0x807C, editRecordData is 0x80AF,
// displaySettingsRequested 0x8096 and OnUpdateProgress 0x8064.
//
// Clipboard keys are the window's shortcuts (so that each runs once, as a command); the
// view leaves Ctrl+C, Ctrl+V, Ctrl+X and Shift/Ctrl+Insert to them.

#include <QPoint>
#include <QTableView>

class UListCtrl;

namespace nedit {

class RecordListModel;
class RowEditRecorder;

class UNeditView : public QTableView {
    Q_OBJECT
  public:
    explicit UNeditView(QWidget* parent = nullptr);

    void SetList(UListCtrl* list);
    UListCtrl* GetListCtrl() const;
    bool IsNeditView() const { return true; }
    RecordListModel* Model() const { return model_; }
    /// Where changes made by keys and drags are filed for undo.
    void SetRecorder(RowEditRecorder* recorder) { recorder_ = recorder; }
    /// While long work runs the view ignores the mouse and the keys.
    void SetBusy(bool busy) { busy_ = busy; }
    /// The row at a point of the viewport; -1 for none.
    int RowAt(const QPoint& point) const;
    /// Scrolls so that `row` can be seen.
    void ShowRow(int row);

  public slots:
    void OnUpdateProgress(int percent, const QString& text);

  signals:
    void editRecordData(const QString& text, int row);
    void displaySettingsRequested();
    void progressUpdated(int percent, const QString& text);
    void contextMenuWanted(const QPoint& global);
    void focusFormRequested();

  protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

  private:
    void Click(int row, Qt::KeyboardModifiers modifiers);
    void Repaint();
    void EndDrag(int row);

    RecordListModel* model_;
    RowEditRecorder* recorder_ = nullptr;
    bool busy_ = false;
    // A press on a selected row may start a drag; without one it selects on release.
    int pressed_row_ = -1;
    QPoint press_point_;
    bool drag_pending_ = false;
};

}  // namespace nedit
