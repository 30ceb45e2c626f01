#include "ui/UNeditView.h"

#include <QApplication>
#include <QFontDatabase>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>

#include "document/UListCtrl.h"
#include "ui/RecordListModel.h"
#include "ui/RecordRowDelegate.h"
#include "ui/RowEditRecorder.h"

namespace nedit {

namespace {

ListKey KeyOf(int key) {
    switch (key) {
        case Qt::Key_Up:
            return ListKey::Up;
        case Qt::Key_Down:
            return ListKey::Down;
        case Qt::Key_PageUp:
            return ListKey::PageUp;
        case Qt::Key_PageDown:
            return ListKey::PageDown;
        case Qt::Key_Delete:
            return ListKey::Delete;
        case Qt::Key_Return:
        case Qt::Key_Enter:
            return ListKey::Enter;
        default:
            return ListKey::Other;
    }
}

}  // namespace

UNeditView::UNeditView(QWidget* parent) : QTableView(parent), model_(new RecordListModel(this)) {
    setObjectName(QStringLiteral("RecordList"));
    setModel(model_);
    setItemDelegate(new RecordRowDelegate(this));
    setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    setSelectionMode(QAbstractItemView::NoSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setShowGrid(false);
    setWordWrap(false);
    setCornerButtonEnabled(false);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusPolicy(Qt::StrongFocus);
    const int row_height = fontMetrics().height() + 4;
    QHeaderView* rows = verticalHeader();
    rows->setSectionResizeMode(QHeaderView::Fixed);
    rows->setMinimumSectionSize(row_height);
    rows->setDefaultSectionSize(row_height);
    rows->setSectionsClickable(false);
    rows->setDefaultAlignment(Qt::AlignRight | Qt::AlignVCenter);
    QHeaderView* columns = horizontalHeader();
    columns->setStretchLastSection(true);
    columns->setSectionsClickable(false);
    columns->setHighlightSections(false);
    columns->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    connect(model_, &RecordListModel::selectionChanged, this, &UNeditView::Repaint);
    connect(model_, &RecordListModel::ensureVisible, this, &UNeditView::ShowRow);
    connect(model_, &RecordListModel::focusListRequested, this, [this] {
        if (isVisible()) setFocus();
    });
    connect(model_, &RecordListModel::focusFormRequested, this, &UNeditView::focusFormRequested);
    connect(model_, &RecordListModel::editRecordRequested, this, &UNeditView::editRecordData);
}

void UNeditView::SetList(UListCtrl* list) {
    model_->SetList(list);
}

UListCtrl* UNeditView::GetListCtrl() const {
    return model_->List();
}

void UNeditView::OnUpdateProgress(int percent, const QString& text) {
    emit progressUpdated(percent, text);
}

int UNeditView::RowAt(const QPoint& point) const {
    return rowAt(point.y());
}

void UNeditView::ShowRow(int row) {
    if (row >= 0 && row < model_->rowCount()) scrollTo(model_->index(row, 0));
}

void UNeditView::Repaint() {
    viewport()->update();
    verticalHeader()->viewport()->update();
}

void UNeditView::Click(int row, Qt::KeyboardModifiers modifiers) {
    if (UListCtrl* list = GetListCtrl())
        list->OnLButtonDown(row, modifiers & Qt::ControlModifier, modifiers & Qt::ShiftModifier);
}

void UNeditView::mousePressEvent(QMouseEvent* event) {
    setFocus();
    UListCtrl* list = GetListCtrl();
    if (busy_ || list == nullptr || event->button() != Qt::LeftButton) {
        if (list != nullptr && event->button() == Qt::RightButton && !busy_) {
            const int row = RowAt(event->position().toPoint());
            if (row >= 0 && !list->IsSelected(row)) Click(row, Qt::NoModifier);
        }
        return;
    }
    const int row = RowAt(event->position().toPoint());
    pressed_row_ = row;
    press_point_ = event->position().toPoint();
    drag_pending_ = row >= 0 && list->IsSelected(row) &&
                    !(event->modifiers() & (Qt::ShiftModifier | Qt::ControlModifier));
    // A press on a selected row may begin a drag of the selection; it selects on release.
    if (!drag_pending_ || list->GetSelectedCount() == 1) Click(row, event->modifiers());
}

void UNeditView::mouseMoveEvent(QMouseEvent* event) {
    UListCtrl* list = GetListCtrl();
    if (busy_ || list == nullptr || !(event->buttons() & Qt::LeftButton)) return;
    const QPoint point = event->position().toPoint();
    if (!list->IsDragging()) {
        const bool may_drag = pressed_row_ >= 0 && list->IsSelected(pressed_row_);
        if (!may_drag ||
            (point - press_point_).manhattanLength() < QApplication::startDragDistance()) {
            return;
        }
        if (!list->BeginDrag(event->modifiers() & Qt::ControlModifier)) return;
        drag_pending_ = false;
        viewport()->setCursor(list->IsDragCopy() ? Qt::DragCopyCursor : Qt::DragMoveCursor);
    }
    // Near the edges the list scrolls, so a drag can reach any row.
    const int margin = verticalHeader()->defaultSectionSize();
    if (point.y() < margin)
        verticalScrollBar()->triggerAction(QAbstractSlider::SliderSingleStepSub);
    if (point.y() > viewport()->height() - margin)
        verticalScrollBar()->triggerAction(QAbstractSlider::SliderSingleStepAdd);
    list->DragOver(RowAt(point));
    Repaint();
}

void UNeditView::mouseReleaseEvent(QMouseEvent* event) {
    UListCtrl* list = GetListCtrl();
    if (list == nullptr || event->button() != Qt::LeftButton) return;
    const int row = RowAt(event->position().toPoint());
    if (list->IsDragging()) {
        EndDrag(row);
    } else if (drag_pending_ && !busy_) {
        Click(pressed_row_, Qt::NoModifier);
    }
    drag_pending_ = false;
    pressed_row_ = -1;
}

void UNeditView::EndDrag(int row) {
    UListCtrl* list = GetListCtrl();
    viewport()->unsetCursor();
    {
        RowEditStep step(recorder_, list->IsDragCopy() ? tr("Copy Rows") : tr("Move Rows"));
        list->Drop(row);
    }
    Repaint();
}

void UNeditView::mouseDoubleClickEvent(QMouseEvent* event) {
    UListCtrl* list = GetListCtrl();
    if (busy_ || list == nullptr || event->button() != Qt::LeftButton) return;
    list->OnLButtonDblClk(RowAt(event->position().toPoint()));
}

void UNeditView::keyPressEvent(QKeyEvent* event) {
    UListCtrl* list = GetListCtrl();
    if (busy_ || list == nullptr) return;
    const ListKey key = KeyOf(event->key());
    const bool extend = event->modifiers() & Qt::ShiftModifier;
    if (key == ListKey::Delete) {
        RowEditStep step(recorder_, tr("Delete"));
        list->OnKeyDown(key);
    } else if (key != ListKey::Other) {
        list->OnKeyDown(key, extend);
    } else if (event->key() == Qt::Key_Home || event->key() == Qt::Key_End) {
        list->SelectRow(event->key() == Qt::Key_Home ? 0 : list->GetItemCount() - 1);
    } else if (event->matches(QKeySequence::SelectAll)) {
        std::vector<int> all(static_cast<std::size_t>(list->GetItemCount()));
        for (std::size_t row = 0; row < all.size(); ++row) all[row] = static_cast<int>(row);
        list->SetSelection(all);
    } else if (event->key() == Qt::Key_Escape && list->IsDragging()) {
        list->CancelDrag();
        viewport()->unsetCursor();
        Repaint();
    } else {
        QTableView::keyPressEvent(event);
    }
}

void UNeditView::contextMenuEvent(QContextMenuEvent* event) {
    emit contextMenuWanted(event->globalPos());
}

void UNeditView::resizeEvent(QResizeEvent* event) {
    QTableView::resizeEvent(event);
    if (UListCtrl* list = GetListCtrl())
        list->SetVisibleRowCount(viewport()->height() / verticalHeader()->defaultSectionSize());
}

void UNeditView::focusInEvent(QFocusEvent* event) {
    QTableView::focusInEvent(event);
    Repaint();
}

void UNeditView::focusOutEvent(QFocusEvent* event) {
    QTableView::focusOutEvent(event);
    Repaint();
}

}  // namespace nedit
