#include "ui/PlanPainter.h"

#include <QPainter>
#include <cmath>
#include <map>

#include "platform/text/Format.h"
#include "reduction/UNeditDatabase.h"

namespace nedit {

namespace {

constexpr double kMarkSize = 3.5;
// Beyond this many objects in view, smoothing costs more than it shows.
constexpr std::size_t kSmoothLimit = 20000;

/// The feature code of a point's code field: its first word.
std::wstring FeatureCode(const std::wstring& code) {
    const std::size_t start = code.find_first_not_of(L' ');
    if (start == std::wstring::npos) return {};
    return code.substr(start, code.find(L' ', start) - start);
}

QPen Cosmetic(const QColor& colour, double width = 0.0) {
    QPen pen(colour, width);
    pen.setCosmetic(true);
    return pen;
}

}  // namespace

PlanPainter::PlanPainter(const PlanScene& scene, const PlanTransform& transform,
                         const PlanStyle& style)
    : scene_(scene), transform_(transform), style_(style), window_(transform.VisibleWorld()) {
    // Marks and labels reach a little beyond the point they stand for.
    const double reach = transform_.ToWorldLength(64.0);
    window_ = UWRect(window_.GetMinX() - reach, window_.GetMinY() - reach,
                     window_.GetMaxX() + reach, window_.GetMaxY() + reach);
}

QPointF PlanPainter::Screen(const UWPoint& point) const {
    const ScreenPoint at = transform_.ToScreen(point);
    return {at.x, at.y};
}

void PlanPainter::Paint(QPainter& painter) const {
    painter.fillRect(QRectF(0, 0, transform_.ViewWidth(), transform_.ViewHeight()),
                     style_.background);
    PaintScaleBar(painter);
    if (scene_.Database() == nullptr) return;
    PaintLines(painter);
    PaintArcs(painter);
    PaintCircles(painter);
    PaintPoints(painter);
}

double PlanPainter::ScaleBarLength(double scale) {
    const double wanted = 60.0 / scale;
    double step = std::pow(10.0, std::floor(std::log10(wanted)));
    for (const double factor : {1.0, 2.0, 5.0, 10.0}) {
        if (step * factor >= wanted) return step * factor;
    }
    return step * 10.0;
}

void PlanPainter::PaintScaleBar(QPainter& painter) const {
    const double length = ScaleBarLength(transform_.Scale());
    const double pixels = transform_.ToScreenLength(length);
    const QColor ink(0x9a, 0xa4, 0xb0);
    painter.setRenderHint(QPainter::Antialiasing, false);
    painter.setPen(Cosmetic(ink));
    const double left = 14.0;
    const double base = transform_.ViewHeight() - 14.0;
    painter.drawLine(QLineF(left, base, left + pixels, base));
    for (const double x : {left, left + pixels / 2.0, left + pixels})
        painter.drawLine(QLineF(x, base, x, base - (x == left + pixels / 2.0 ? 3.0 : 6.0)));
    painter.drawText(QPointF(left + pixels + 6.0, base + 4.0),
                     QStringLiteral("%1 %2").arg(length, 0, 'g', 6).arg(style_.unit));
    // North, up the screen.
    const double x = transform_.ViewWidth() - 22.0;
    painter.setRenderHint(QPainter::Antialiasing, true);
    const QPointF arrow[3] = {{x, 14.0}, {x - 6.0, 32.0}, {x + 6.0, 32.0}};
    painter.setBrush(ink);
    painter.drawPolygon(arrow, 3);
    painter.setBrush(Qt::NoBrush);
    painter.drawText(QRectF(x - 10.0, 33.0, 20.0, 16.0), Qt::AlignCenter, QStringLiteral("N"));
}

void PlanPainter::PaintLines(QPainter& painter) const {
    std::vector<int> lines;
    scene_.LinesIn(window_, lines);
    painter.setRenderHint(QPainter::Antialiasing, lines.size() < kSmoothLimit);
    const auto& store = scene_.Database()->GetLineList();
    // Runs of one colour go in one call; the store's order is kept across colours.
    std::vector<QLineF> run;
    int run_colour = -1;
    auto flush = [&] {
        if (run.empty()) return;
        painter.setPen(Cosmetic(PlanStyle::Colour(run_colour)));
        painter.drawLines(run.data(), static_cast<int>(run.size()));
        run.clear();
    };
    for (const int index : lines) {
        const UNeditLine& line = store[static_cast<std::size_t>(index)];
        const int colour = line.GetStationLine() ? kStationLineColour : line.GetColor();
        if (colour != run_colour) {
            flush();
            run_colour = colour;
        }
        run.emplace_back(Screen(line.GetStart()), Screen(line.GetEnd()));
    }
    flush();
}

void PlanPainter::PaintArcs(QPainter& painter) const {
    std::vector<int> arcs;
    scene_.ArcsIn(window_, arcs);
    const auto& store = scene_.Database()->GetArcList();
    for (const int index : arcs) {
        painter.setPen(
            Cosmetic(PlanStyle::Colour(store[static_cast<std::size_t>(index)].GetColor())));
        QPolygonF path;
        for (const UWPoint& point : scene_.ArcPath(index)) path << Screen(point);
        painter.drawPolyline(path);
    }
}

void PlanPainter::PaintCircles(QPainter& painter) const {
    std::vector<int> circles;
    scene_.CirclesIn(window_, circles);
    const auto& store = scene_.Database()->GetCircleList();
    painter.setPen(Cosmetic(PlanStyle::Colour(kCircleColour)));
    painter.setBrush(Qt::NoBrush);
    for (const int index : circles) {
        const UWCircle& circle = store[static_cast<std::size_t>(index)];
        const double radius = transform_.ToScreenLength(circle.GetRadius());
        painter.drawEllipse(Screen(circle.GetCentre()), radius, radius);
    }
}

std::wstring PlanPainter::Label(const UNeditPt& point) const {
    std::wstring label;
    auto append = [&label](const std::wstring& part) {
        if (part.empty()) return;
        if (!label.empty()) label += L"-";
        label += part;
    };
    if (style_.pointNumbers) append(point.GetID());
    if (style_.pointCodes) append(FeatureCode(point.GetCode()));
    if (style_.heights && point.HasHeight()) append(Format(L"%.3f", point.z));
    return label;
}

void PlanPainter::PaintPoints(QPainter& painter) const {
    std::vector<int> points;
    scene_.PointsIn(window_, points);
    const auto& store = scene_.Database()->GetPointList();
    painter.setRenderHint(QPainter::Antialiasing, points.size() < kSmoothLimit);
    // Crosses, the usual mark, of one colour go in one call.
    std::map<int, std::vector<QLineF>> crosses;
    for (const int index : points) {
        const UNeditPt& point = store[static_cast<std::size_t>(index)];
        const QPointF at = Screen(point);
        if (point.GetMarker() == 0) {
            std::vector<QLineF>& lines = crosses[point.GetColor()];
            lines.emplace_back(at.x() - kMarkSize, at.y(), at.x() + kMarkSize, at.y());
            lines.emplace_back(at.x(), at.y() - kMarkSize, at.x(), at.y() + kMarkSize);
            continue;
        }
        painter.setPen(Cosmetic(PlanStyle::Colour(point.GetColor())));
        DrawMark(painter, at, point.GetMarker());
    }
    for (const auto& [colour, lines] : crosses) {
        painter.setPen(Cosmetic(PlanStyle::Colour(colour)));
        painter.drawLines(lines.data(), static_cast<int>(lines.size()));
    }
    if (points.size() > static_cast<std::size_t>(style_.labelLimit) ||
        !(style_.pointNumbers || style_.pointCodes || style_.heights)) {
        return;
    }
    QFont font = painter.font();
    font.setPointSize(style_.LabelPointSize());
    painter.setFont(font);
    painter.setPen(style_.label);
    const double ascent = QFontMetricsF(font).ascent();
    for (const int index : points) {
        const UNeditPt& point = store[static_cast<std::size_t>(index)];
        const std::wstring label = Label(point);
        if (label.empty()) continue;
        const QPointF at = Screen(point);
        // The label's top left stands 6 to the right of the point and 8 above it.
        painter.drawText(QPointF(at.x() + 6.0, at.y() - 8.0 + ascent),
                         QString::fromStdWString(label));
    }
}

void PlanPainter::DrawMark(QPainter& painter, const QPointF& at, int mark) {
    const double s = kMarkSize;
    switch (mark) {
        case 1:
            painter.setBrush(painter.pen().color());
            painter.drawEllipse(at, 1.8, 1.8);
            painter.setBrush(Qt::NoBrush);
            break;
        case 2:
            painter.drawEllipse(at, s, s);
            break;
        case 3:
            painter.drawLine(QLineF(at.x() - s, at.y() - s, at.x() + s, at.y() + s));
            painter.drawLine(QLineF(at.x() - s, at.y() + s, at.x() + s, at.y() - s));
            break;
        case 4:
            painter.drawRect(QRectF(at.x() - s, at.y() - s, 2 * s, 2 * s));
            break;
        case 5: {
            const QPointF corners[3] = {
                {at.x(), at.y() - s - 1}, {at.x() - s, at.y() + s}, {at.x() + s, at.y() + s}};
            painter.drawPolygon(corners, 3);
            break;
        }
        default:
            painter.drawLine(QLineF(at.x() - s, at.y(), at.x() + s, at.y()));
            painter.drawLine(QLineF(at.x(), at.y() - s, at.x(), at.y() + s));
            break;
    }
}

void PlanPainter::PaintSelection(QPainter& painter, const PlanPick& selected) const {
    const UNeditDatabase* database = scene_.Database();
    if (database == nullptr || selected.kind == PlanPick::Kind::None) return;
    const auto index = static_cast<std::size_t>(selected.index);
    painter.setRenderHint(QPainter::Antialiasing, true);
    painter.setPen(Cosmetic(style_.highlight, 2.0));
    painter.setBrush(Qt::NoBrush);
    switch (selected.kind) {
        case PlanPick::Kind::Point: {
            const QPointF at = Screen(database->GetPointList()[index]);
            DrawMark(painter, at, database->GetPointList()[index].GetMarker());
            painter.drawEllipse(at, kMarkSize + 3.0, kMarkSize + 3.0);
            break;
        }
        case PlanPick::Kind::Line: {
            const UNeditLine& line = database->GetLineList()[index];
            painter.drawLine(Screen(line.GetStart()), Screen(line.GetEnd()));
            break;
        }
        default: {
            QPolygonF path;
            for (const UWPoint& point : scene_.ArcPath(selected.index)) path << Screen(point);
            painter.drawPolyline(path);
            break;
        }
    }
}

}  // namespace nedit
