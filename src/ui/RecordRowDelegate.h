#pragma once
// Paints a row of the record list: the selection and a drag's drop target across the
// whole width in the highlight colour, the focus frame, and the record's text in a colour
// by its kind (stations stand out, coordinates and back sights are tinted, comments grey),
// cut with "..." when it is wider than the column.

#include <QStyledItemDelegate>

namespace nedit {

class RecordRowDelegate : public QStyledItemDelegate {
    Q_OBJECT
  public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;

    /// `text` cut to `width` pixels of `metrics`, ending in "..." when it had to be cut.
    static QString Elided(const QString& text, const QFontMetrics& metrics, int width);
};

}  // namespace nedit
