#include "ui/RecordListModel.h"

#include "document/UListCtrl.h"

namespace nedit {

RecordListModel::RecordListModel(QObject* parent) : QAbstractTableModel(parent) {}

void RecordListModel::SetList(UListCtrl* list) {
    beginResetModel();
    list_ = list;
    endResetModel();
}

void RecordListModel::BeginBulkChange() {
    if (bulk_++ > 0) return;
    frozen_count_ = Count();
    beginResetModel();
}

void RecordListModel::EndBulkChange() {
    if (--bulk_ > 0) return;
    endResetModel();
}

int RecordListModel::Count() const {
    return list_ != nullptr ? list_->GetItemCount() : 0;
}

int RecordListModel::rowCount(const QModelIndex& parent) const {
    if (parent.isValid()) return 0;
    return bulk_ > 0 ? frozen_count_ : Count();
}

int RecordListModel::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : 1;
}

QVariant RecordListModel::data(const QModelIndex& index, int role) const {
    // A view may paint while a bulk change has the rows in flux: rows that are gone are blank.
    if (list_ == nullptr || !index.isValid() || index.row() >= Count()) return {};
    const int row = index.row();
    switch (role) {
        case Qt::DisplayRole:
        case Qt::EditRole:
            return QString::fromStdWString(list_->GetItemText(row));
        case SelectedRole:
            return list_->IsSelected(row);
        case FocusRole:
            return list_->GetFocusRow() == row;
        case DropTargetRole:
            return list_->IsDragging() && list_->GetDropTarget() == row;
        default:
            return {};
    }
}

QVariant RecordListModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (role != Qt::DisplayRole) return {};
    if (orientation == Qt::Vertical) return section;
    return list_ != nullptr ? QString::fromStdWString(list_->GetHeaderText())
                            : QString::fromWCharArray(UListCtrl::kInitialHeader);
}

Qt::ItemFlags RecordListModel::flags(const QModelIndex& index) const {
    // The list keeps its own selection; Qt's would be a second copy of it.
    return index.isValid() ? Qt::ItemIsEnabled : Qt::NoItemFlags;
}

void RecordListModel::RowsAboutToBeInserted(int first, int count) {
    if (bulk_ == 0) beginInsertRows({}, first, first + count - 1);
}

void RecordListModel::RowsInserted(int /*first*/, int /*count*/) {
    if (bulk_ == 0) endInsertRows();
}

void RecordListModel::RowsAboutToBeRemoved(int first, int count) {
    if (bulk_ == 0) beginRemoveRows({}, first, first + count - 1);
}

void RecordListModel::RowsRemoved(int /*first*/, int /*count*/) {
    if (bulk_ == 0) endRemoveRows();
}

void RecordListModel::RowChanged(int row) {
    if (bulk_ == 0) emit dataChanged(index(row, 0), index(row, 0));
}

void RecordListModel::RowsAboutToBeCleared() {
    if (bulk_ == 0) beginResetModel();
}

void RecordListModel::RowsCleared() {
    if (bulk_ == 0) endResetModel();
}

void RecordListModel::SelectionChanged() {
    if (bulk_ == 0) emit selectionChanged();
}

void RecordListModel::HeaderChanged(const std::wstring& /*text*/) {
    if (bulk_ == 0) emit headerDataChanged(Qt::Horizontal, 0, 0);
}

void RecordListModel::EnsureVisible(int row) {
    if (bulk_ == 0) emit ensureVisible(row);
}

void RecordListModel::FocusList() {
    emit focusListRequested();
}

void RecordListModel::FocusForm() {
    emit focusFormRequested();
}

void RecordListModel::EditRecordRequested(const std::wstring& text, int row) {
    emit editRecordRequested(QString::fromStdWString(text), row);
}

}  // namespace nedit
