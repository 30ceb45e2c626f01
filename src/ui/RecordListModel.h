#pragma once
// The record list as a Qt table of one column: every call reads the list's own rows, so a
// million rows cost the view nothing beyond the rows on screen. The list keeps the
// selection and the focused row; the model hands them to the painting through roles and
// passes the list's events on as Qt's model signals and as signals of its own.
//
// During a bulk change (an import that replaces every row) the model stands still: it
// answers with the row count it had when the change began and ignores the list's events,
// and catches up at once at the end.

#include <QAbstractTableModel>

#include "document/ListInterfaces.h"

class UListCtrl;

namespace nedit {

class RecordListModel : public QAbstractTableModel, public ListEvents {
    Q_OBJECT
  public:
    enum Role { SelectedRole = Qt::UserRole + 1, FocusRole, DropTargetRole };

    explicit RecordListModel(QObject* parent = nullptr);

    /// The list shown; null for none.
    void SetList(UListCtrl* list);
    UListCtrl* List() const { return list_; }

    void BeginBulkChange();
    void EndBulkChange();

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;

    void RowsAboutToBeInserted(int first, int count) override;
    void RowsInserted(int first, int count) override;
    void RowsAboutToBeRemoved(int first, int count) override;
    void RowsRemoved(int first, int count) override;
    void RowChanged(int row) override;
    void RowsAboutToBeCleared() override;
    void RowsCleared() override;
    void SelectionChanged() override;
    void HeaderChanged(const std::wstring& text) override;
    void EnsureVisible(int row) override;
    void FocusList() override;
    void FocusForm() override;
    void EditRecordRequested(const std::wstring& text, int row) override;

  signals:
    void selectionChanged();
    void ensureVisible(int row);
    void focusListRequested();
    void focusFormRequested();
    void editRecordRequested(const QString& text, int row);

  private:
    int Count() const;

    UListCtrl* list_ = nullptr;
    int bulk_ = 0;
    int frozen_count_ = 0;
};

}  // namespace nedit
