#include "ui/ToolIcons.h"

#include <QIconEngine>
#include <QPainter>
#include <QPainterPath>

#include "ui/CommandIds.h"

namespace nedit {

namespace {

const QColor kInk(0x37, 0x47, 0x4f);
const QColor kAccent(0x1e, 0x88, 0xe5);
const QColor kPaper(0xff, 0xff, 0xff);
const QColor kGreen(0x2e, 0x7d, 0x32);

// Every glyph is drawn on a 24 by 24 grid.
void Page(QPainter& p, const QRectF& r) {
    QPainterPath path;
    path.moveTo(r.left(), r.top());
    path.lineTo(r.right() - 5, r.top());
    path.lineTo(r.right(), r.top() + 5);
    path.lineTo(r.right(), r.bottom());
    path.lineTo(r.left(), r.bottom());
    path.closeSubpath();
    p.setBrush(kPaper);
    p.drawPath(path);
    p.drawLine(QPointF(r.right() - 5, r.top()), QPointF(r.right() - 5, r.top() + 5));
    p.drawLine(QPointF(r.right() - 5, r.top() + 5), QPointF(r.right(), r.top() + 5));
}

void Magnifier(QPainter& p, const QPointF& centre, double radius) {
    p.setBrush(kPaper);
    p.drawEllipse(centre, radius, radius);
    QPen pen = p.pen();
    pen.setWidthF(3.0);
    p.setPen(pen);
    const double reach = radius * 0.72;
    p.drawLine(centre + QPointF(reach, reach), centre + QPointF(radius + 6.5, radius + 6.5));
    pen.setWidthF(1.6);
    p.setPen(pen);
}

void Arrow(QPainter& p, const QPointF& from, const QPointF& to) {
    p.drawLine(from, to);
    const QLineF line(to, from);
    QLineF left = line;
    left.setLength(4.0);
    left.setAngle(line.angle() + 35);
    QLineF right = line;
    right.setLength(4.0);
    right.setAngle(line.angle() - 35);
    p.drawLine(left);
    p.drawLine(right);
}

void CircularArrow(QPainter& p, const QRectF& r) {
    p.setBrush(Qt::NoBrush);
    p.drawArc(r, 60 * 16, 280 * 16);
    const QPointF tip(r.center().x() + r.width() / 2 * 0.5, r.top() + r.height() * 0.07);
    p.drawLine(tip, tip + QPointF(-4.5, -1.0));
    p.drawLine(tip, tip + QPointF(-0.5, 4.5));
}

void DrawGlyph(QPainter& p, int id) {
    using namespace cmd;
    switch (id) {
        case FileNew:
            Page(p, QRectF(5, 2.5, 14, 19));
            p.setPen(QPen(kGreen, 2.2));
            p.drawLine(QPointF(12, 10), QPointF(12, 18));
            p.drawLine(QPointF(8, 14), QPointF(16, 14));
            break;
        case FileOpen: {
            QPainterPath folder;
            folder.moveTo(2.5, 6);
            folder.lineTo(9, 6);
            folder.lineTo(11, 8);
            folder.lineTo(20, 8);
            folder.lineTo(20, 19.5);
            folder.lineTo(2.5, 19.5);
            folder.closeSubpath();
            p.setBrush(QColor(0xff, 0xd5, 0x4f));
            p.drawPath(folder);
            p.setBrush(QColor(0xff, 0xe0, 0x82));
            p.drawPolygon(QPolygonF({{5, 11}, {22, 11}, {19.5, 19.5}, {2.5, 19.5}}));
            break;
        }
        case FileSave:
        case SaveDocument:
            p.setBrush(kAccent);
            p.drawRoundedRect(QRectF(3, 3, 18, 18), 2, 2);
            p.setBrush(kPaper);
            p.drawRect(QRectF(6.5, 3, 11, 6.5));
            p.drawRect(QRectF(6, 13, 12, 8));
            break;
        case FilePrint:
            p.setBrush(kPaper);
            p.drawRect(QRectF(7, 3, 10, 6));
            p.setBrush(QColor(0xb0, 0xbe, 0xc5));
            p.drawRoundedRect(QRectF(3, 9, 18, 8), 1.5, 1.5);
            p.setBrush(kPaper);
            p.drawRect(QRectF(7, 14, 10, 7));
            break;
        case EditCut:
            p.setBrush(Qt::NoBrush);
            p.drawEllipse(QPointF(7.5, 18), 3, 3);
            p.drawEllipse(QPointF(16.5, 18), 3, 3);
            p.drawLine(QPointF(9.5, 15.5), QPointF(17, 3));
            p.drawLine(QPointF(14.5, 15.5), QPointF(7, 3));
            break;
        case EditCopy:
            Page(p, QRectF(3, 2.5, 12, 15));
            Page(p, QRectF(9, 7.5, 12, 14));
            break;
        case EditPaste:
            p.setBrush(QColor(0xbc, 0xaa, 0xa4));
            p.drawRoundedRect(QRectF(4, 4, 14, 17), 1.5, 1.5);
            p.setBrush(kInk);
            p.drawRect(QRectF(8, 2.5, 6, 3));
            Page(p, QRectF(10, 9, 11, 13));
            break;
        case ZoomAll:
            Magnifier(p, QPointF(10, 10), 6.5);
            p.drawRect(QRectF(7, 7, 6, 6));
            break;
        case ZoomIn:
        case ZoomOut:
            Magnifier(p, QPointF(10, 10), 6.5);
            p.drawLine(QPointF(7, 10), QPointF(13, 10));
            if (id == ZoomIn) p.drawLine(QPointF(10, 7), QPointF(10, 13));
            break;
        case ZoomWindow: {
            QPen dashed = p.pen();
            dashed.setStyle(Qt::DashLine);
            dashed.setWidthF(1.3);
            p.setPen(dashed);
            p.setBrush(Qt::NoBrush);
            p.drawRect(QRectF(2.5, 2.5, 15, 12));
            p.setPen(QPen(kInk, 1.6));
            Magnifier(p, QPointF(15, 15), 4.5);
            break;
        }
        case ZoomPrevious:
        case ZoomNext:
            Magnifier(p, QPointF(10, 10), 6.5);
            Arrow(p, QPointF(id == ZoomPrevious ? 13 : 7, 10),
                  QPointF(id == ZoomPrevious ? 7 : 13, 10));
            break;
        case Pan:
            Arrow(p, QPointF(12, 12), QPointF(12, 2.5));
            Arrow(p, QPointF(12, 12), QPointF(12, 21.5));
            Arrow(p, QPointF(12, 12), QPointF(2.5, 12));
            Arrow(p, QPointF(12, 12), QPointF(21.5, 12));
            break;
        case ZoomPoint:
            p.setBrush(Qt::NoBrush);
            p.drawEllipse(QPointF(12, 12), 7, 7);
            p.drawLine(QPointF(12, 2), QPointF(12, 8));
            p.drawLine(QPointF(12, 16), QPointF(12, 22));
            p.drawLine(QPointF(2, 12), QPointF(8, 12));
            p.drawLine(QPointF(16, 12), QPointF(22, 12));
            p.setBrush(kAccent);
            p.drawEllipse(QPointF(12, 12), 1.8, 1.8);
            break;
        case Redraw:
            CircularArrow(p, QRectF(4, 4, 16, 16));
            break;
        case Regenerate:
            p.setPen(QPen(kAccent, 1.6));
            p.setBrush(Qt::NoBrush);
            p.drawPolyline(QPolygonF({{3, 19}, {9, 8}, {16, 14}, {21, 4}}));
            p.setPen(QPen(kInk, 1.6));
            p.setBrush(kInk);
            for (const QPointF& station :
                 {QPointF(3, 19), QPointF(9, 8), QPointF(16, 14), QPointF(21, 4)})
                p.drawEllipse(station, 1.6, 1.6);
            break;
        case Download:
            p.setBrush(Qt::NoBrush);
            p.drawPolyline(QPolygonF({{3, 15}, {3, 20.5}, {21, 20.5}, {21, 15}}));
            Arrow(p, QPointF(12, 3), QPointF(12, 16));
            break;
        case Transfer: {
            p.setBrush(QColor(0xcf, 0xd8, 0xdc));
            p.drawRect(QRectF(9, 8, 12, 12));
            p.drawEllipse(QRectF(9, 5.5, 12, 5));
            p.drawArc(QRectF(9, 17.5, 12, 5), 180 * 16, 180 * 16);
            p.setPen(QPen(kGreen, 2.0));
            Arrow(p, QPointF(2, 14), QPointF(10, 14));
            break;
        }
        case Traverse:
            p.setBrush(Qt::NoBrush);
            p.drawPolygon(QPolygonF({{4, 18}, {8, 5}, {19, 7}, {20, 19}}));
            p.setBrush(kAccent);
            for (const QPointF& station :
                 {QPointF(4, 18), QPointF(8, 5), QPointF(19, 7), QPointF(20, 19)})
                p.drawPolygon(QPolygonF({station + QPointF(0, -2.6), station + QPointF(-2.4, 1.6),
                                         station + QPointF(2.4, 1.6)}));
            break;
        case GlobalEdit:
            for (double y : {5.0, 10.0, 15.0}) p.drawLine(QPointF(3, y), QPointF(12, y));
            p.setBrush(QColor(0xff, 0xb3, 0x00));
            p.drawPolygon(QPolygonF({{11, 20}, {12, 16}, {19.5, 8.5}, {22, 11}, {14.5, 18.5}}));
            break;
        case CommentRecord: {
            QFont font = p.font();
            font.setPixelSize(19);
            font.setBold(true);
            p.setFont(font);
            p.drawText(QRectF(0, 0, 24, 24), Qt::AlignCenter, QStringLiteral("#"));
            break;
        }
        case PreRecord:
        case NextRecord: {
            const bool up = id == PreRecord;
            p.drawLine(QPointF(5, up ? 4 : 20), QPointF(19, up ? 4 : 20));
            p.setPen(QPen(kAccent, 2.2));
            Arrow(p, QPointF(12, up ? 20 : 4), QPointF(12, up ? 7 : 17));
            break;
        }
        default:
            break;
    }
}

class GlyphEngine : public QIconEngine {
  public:
    explicit GlyphEngine(int id) : id_(id) {}

    void paint(QPainter* painter, const QRect& rect, QIcon::Mode mode, QIcon::State) override {
        painter->save();
        painter->setRenderHint(QPainter::Antialiasing);
        painter->translate(rect.topLeft());
        painter->scale(rect.width() / 24.0, rect.height() / 24.0);
        if (mode == QIcon::Disabled) painter->setOpacity(0.35);
        painter->setPen(QPen(kInk, 1.6, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        DrawGlyph(*painter, id_);
        painter->restore();
    }

    QPixmap pixmap(const QSize& size, QIcon::Mode mode, QIcon::State state) override {
        return scaledPixmap(size, mode, state, 1.0);
    }

    QPixmap scaledPixmap(const QSize& size, QIcon::Mode mode, QIcon::State state,
                         qreal scale) override {
        QPixmap pixmap(size * scale);
        pixmap.setDevicePixelRatio(scale);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        paint(&painter, QRect(QPoint(0, 0), size), mode, state);
        return pixmap;
    }

    QIconEngine* clone() const override { return new GlyphEngine(id_); }

  private:
    int id_;
};

}  // namespace

bool ToolIcons::HasIcon(int id) {
    using namespace cmd;
    switch (id) {
        case FileNew:
        case FileOpen:
        case FileSave:
        case SaveDocument:
        case FilePrint:
        case EditCut:
        case EditCopy:
        case EditPaste:
        case ZoomAll:
        case ZoomIn:
        case ZoomOut:
        case ZoomWindow:
        case ZoomPrevious:
        case ZoomNext:
        case Pan:
        case ZoomPoint:
        case Redraw:
        case Regenerate:
        case Download:
        case Transfer:
        case Traverse:
        case GlobalEdit:
        case CommentRecord:
        case PreRecord:
        case NextRecord:
            return true;
        default:
            return false;
    }
}

QIcon ToolIcons::Icon(int id) {
    return HasIcon(id) ? QIcon(new GlyphEngine(id)) : QIcon();
}

}  // namespace nedit
