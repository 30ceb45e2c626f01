#pragma once
// The record form beneath the list: the current record's key and one field per value,
// laid out across the pane. Every keystroke rewrites the row, and successive keystrokes in
// one row are one step of the undo history. A comment or the file's header line has no
// fields and leaves the form empty.
//
// This is the form's plain face: it edits values as text. Checked fields by kind (angles,
// lengths, codes) belong to the record dialogs that come with record editing.

#include <QWidget>
#include <vector>

#include "document/ListInterfaces.h"

class QGridLayout;
class QLabel;
class QLineEdit;
class UListCtrl;

namespace nedit {

class RowEditRecorder;
struct RecordFields;

class UNeditDlgView : public QWidget, public URecordForm {
    Q_OBJECT
  public:
    explicit UNeditDlgView(QWidget* parent = nullptr);

    void SetList(UListCtrl* list) { list_ = list; }
    void SetRecorder(RowEditRecorder* recorder) { recorder_ = recorder; }

    int ShowRecord(const std::wstring& text, int row) override;
    void SetModified() override { modified_ = true; }
    bool GetModifiedFlag() const { return modified_; }
    void ClearModified() { modified_ = false; }
    /// Takes the fields away, as when the list is emptied.
    void ClearFields();

    int Row() const { return row_; }
    /// The edit of field `index` of the current record; null for none.
    QLineEdit* FieldEdit(int index) const;
    QString RecordLabel() const;
    /// The height the form needs for `lines` lines of text.
    int HeightForLines(int lines) const;

  private:
    void FieldEdited();

    UListCtrl* list_ = nullptr;
    RowEditRecorder* recorder_ = nullptr;
    QLabel* label_;
    QGridLayout* grid_;
    std::vector<QLabel*> names_;
    std::vector<QLineEdit*> edits_;
    std::wstring key_;
    std::vector<std::wstring> field_names_;
    int row_ = -1;
    bool modified_ = false;
};

}  // namespace nedit
