#include "ui/RecordRowDelegate.h"

#include <QApplication>
#include <QPainter>
#include <QStyle>

#include "ui/RecordListModel.h"

namespace nedit {

namespace {

constexpr int kTextIndent = 6;

struct RowLook {
    QColor text;
    QColor background;  // invalid: the window colour
    bool bold = false;
    bool italic = false;
};

// The look of a row by its key: the structure of a survey (set-ups, back sights, known
// coordinates) shows at a glance while scrolling.
RowLook LookOf(const QString& row, const QPalette& palette) {
    RowLook look{palette.color(QPalette::Text), {}};
    if (row.startsWith(QLatin1String("#VERSION"))) {
        look.text = QColor(0x70, 0x70, 0x70);
        look.bold = true;
    } else if (row.startsWith(QLatin1Char('#'))) {
        look.text = QColor(0x80, 0x80, 0x80);
        look.italic = true;
    } else if (row.startsWith(QLatin1String("STN "))) {
        look.text = QColor(0x15, 0x47, 0x8f);
        look.background = QColor(0xe8, 0xef, 0xfa);
        look.bold = true;
    } else if (row.startsWith(QLatin1String("BKB ")) || row.startsWith(QLatin1String("BS "))) {
        look.text = QColor(0x16, 0x6d, 0x6d);
    } else if (row.startsWith(QLatin1String("XYZ ")) || row.startsWith(QLatin1String("PT ")) ||
               row.startsWith(QLatin1String("YXZ ")) || row.startsWith(QLatin1String("PSX ")) ||
               row.startsWith(QLatin1String("PSN "))) {
        look.text = QColor(0x25, 0x6e, 0x2a);
    } else if (!row.startsWith(QLatin1String("SS"))) {
        look.text = QColor(0x7a, 0x52, 0x00);
    }
    return look;
}

}  // namespace

QString RecordRowDelegate::Elided(const QString& text, const QFontMetrics& metrics, int width) {
    if (metrics.horizontalAdvance(text) <= width) return text;
    const QString dots = QStringLiteral("...");
    int low = 0;
    int high = static_cast<int>(text.size());
    while (low < high) {
        const int mid = (low + high + 1) / 2;
        if (metrics.horizontalAdvance(text.left(mid) + dots) <= width) {
            low = mid;
        } else {
            high = mid - 1;
        }
    }
    return text.left(low) + dots;
}

void RecordRowDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                              const QModelIndex& index) const {
    const QString text = index.data(Qt::DisplayRole).toString();
    const bool selected = index.data(RecordListModel::SelectedRole).toBool();
    const bool drop_target = index.data(RecordListModel::DropTargetRole).toBool();
    const bool has_focus = option.widget != nullptr && option.widget->hasFocus();
    const QPalette& palette = option.palette;
    const QPalette::ColorGroup group = has_focus ? QPalette::Active : QPalette::Inactive;
    const RowLook look = LookOf(text, palette);

    painter->save();
    QColor text_colour = look.text;
    if (selected || drop_target) {
        painter->fillRect(option.rect, palette.color(group, QPalette::Highlight));
        text_colour = palette.color(group, QPalette::HighlightedText);
    } else if (look.background.isValid()) {
        painter->fillRect(option.rect, look.background);
    }
    QFont font = option.font;
    font.setBold(look.bold);
    font.setItalic(look.italic);
    painter->setFont(font);
    painter->setPen(text_colour);
    const QRect text_rect = option.rect.adjusted(kTextIndent, 0, -2, 0);
    painter->drawText(text_rect, Qt::AlignVCenter | Qt::AlignLeft,
                      Elided(text, QFontMetrics(font), text_rect.width()));
    if (has_focus && index.data(RecordListModel::FocusRole).toBool()) {
        QStyleOptionFocusRect frame;
        frame.rect = option.rect.adjusted(1, 0, -1, -1);
        frame.palette = palette;
        frame.backgroundColor = palette.color(QPalette::Highlight);
        QApplication::style()->drawPrimitive(QStyle::PE_FrameFocusRect, &frame, painter);
    }
    painter->restore();
}

}  // namespace nedit
