#pragma once
// The record form beneath the list: the current record's key and one field per value, each
// captioned above, side by side across the pane. Every keystroke rewrites the row, and
// successive keystrokes in one row are one step of the undo history. Enter goes back to the
// list; Escape puts the field's text back as it was shown, and the row with it. Angle fields
// show the file's angular unit beside their value, and a value that is no number of its
// field turns red. The logic is URecordDlg's; this view makes and fills the fields.
//
// A record of the same key and fields as the one before keeps its fields and only takes
// the new values, so walking the list with the arrow keys costs no rebuilding.

#include <QWidget>
#include <memory>
#include <vector>

#include "document/ListInterfaces.h"
#include "ui/dialogs/URecordDlg.h"

class QGridLayout;
class QLabel;
class QLineEdit;
class UListCtrl;
class UNeditDoc;

namespace nedit {

class RowEditRecorder;
class UEdit;

class UNeditDlgView : public QWidget, public URecordForm {
    Q_OBJECT
  public:
    explicit UNeditDlgView(QWidget* parent = nullptr);
    ~UNeditDlgView() override;

    /// The document whose records the form reads and marks modified; the form shows nothing
    /// before it has one.
    void SetDoc(UNeditDoc* doc);
    void SetList(UListCtrl* list);
    void SetRecorder(RowEditRecorder* recorder) { recorder_ = recorder; }
    /// The file's angular unit: 0 ddd.mmss, 1 decimal degrees, 2 gons.
    void SetAngType(int type);

    int ShowRecord(const std::wstring& text, int row) override;
    void SetModified() override;
    bool GetModifiedFlag() const;
    void ClearModified();
    /// Takes the fields away, as when the list is emptied.
    void ClearFields();

    int Row() const;
    /// The edit of field `index` of the current record; null for none.
    QLineEdit* FieldEdit(int index) const;
    /// The caption above field `index`; empty for none.
    QString FieldCaption(int index) const;
    int FieldCount() const { return static_cast<int>(edits_.size()); }
    QString RecordLabel() const;
    URecordDlg* Dialog() const { return dialog_.get(); }
    /// The height the form needs for `lines` lines of text.
    int HeightForLines(int lines) const;

  signals:
    /// Enter in a field: the list should take the focus back.
    void listFocusWanted();

  protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    /// Makes the fields of the current record, or only fills them when they are the same.
    void ShowFields();
    void FieldEdited(int index);
    void RemoveFields();

    std::unique_ptr<URecordDlg> dialog_;
    UListCtrl* list_ = nullptr;
    RowEditRecorder* recorder_ = nullptr;
    QLabel* label_;
    QGridLayout* grid_;
    std::vector<QLabel*> captions_;
    std::vector<UEdit*> edits_;
    /// What the fields were made for: the label, and each field's caption and kind.
    std::wstring layout_;
};

}  // namespace nedit
