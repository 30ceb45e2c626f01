#include "ui/SXTView.h"

#include <QPainter>
#include <algorithm>

#include "reduction/UNeditDatabase.h"

namespace nedit {

namespace {

constexpr double kExtent = 32000.0;
constexpr double kOrigin = -1000.0;
constexpr double kReach = 30000.0;
constexpr double kWidePen = 300.0;
constexpr double kRing = 150.0;
constexpr double kTextGap = 200.0;
constexpr double kTextLimit = 31000.0;

}  // namespace

SXTView::SXTView(const UWRect& extents, QWidget* parent) : QWidget(parent), Extents(extents) {
    setObjectName(QStringLiteral("RoutePreview"));
    setMinimumSize(160, 160);
    setAutoFillBackground(true);
    QPalette colours = palette();
    colours.setColor(QPalette::Window, Qt::white);
    setPalette(colours);
}

void SXTView::SetAllRoutes(std::vector<Route> routes) {
    AllRoutes = std::move(routes);
    update();
}

void SXTView::SetRoute(Route route, const std::wstring& start, const std::wstring& end) {
    Routes = std::move(route);
    StartName = start;
    EndName = end;
    update();
}

double SXTView::DrawScale() const {
    const double width = std::max(Extents.Width(), 1.0);
    const double height = std::max(Extents.Height(), 1.0);
    return kReach / std::max(width, height);
}

bool SXTView::Plot(const std::wstring& name, QPointF& at) const {
    double e = 0.0;
    double n = 0.0;
    double z = 0.0;
    std::wstring code;
    if (Database == nullptr || !Database->GetPointFromPtList(name, e, n, z, code, 1)) return false;
    at = QPointF((e - Extents.GetMinX()) * DrawScale(), (n - Extents.GetMinY()) * DrawScale());
    return true;
}

std::vector<std::size_t> SXTView::ChosenPart() const {
    if (StartName.empty() || EndName.empty() || Routes.size() < 2) return {};
    // Two finds: entries of either name, or, for a closed route, the first two of the one.
    std::vector<std::size_t> finds;
    for (std::size_t i = 0; i < Routes.size() && finds.size() < 2; ++i) {
        if (Routes[i] == StartName || Routes[i] == EndName) finds.push_back(i);
    }
    if (finds.size() < 2 || (StartName != EndName && Routes[finds[0]] != StartName)) return {};
    std::vector<std::size_t> part;
    for (std::size_t i = finds[0]; i <= finds[1]; ++i) part.push_back(i);
    return part;
}

void SXTView::paintEvent(QPaintEvent* /*event*/) {
    if (Database == nullptr) return;
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    // The logical square, its smaller side centred, North up.
    const double side = std::min(width(), height());
    painter.translate((width() - side) / 2.0, (height() + side) / 2.0);
    painter.scale(side / kExtent, -side / kExtent);
    painter.translate(-kOrigin, -kOrigin);

    auto draw_route = [&](const Route& route, const std::vector<std::size_t>& entries) {
        QPolygonF line;
        for (const std::size_t entry : entries) {
            QPointF at;
            if (!Plot(route[entry], at)) break;  // a point without coordinates ends the route
            line << at;
        }
        if (line.size() >= 2) painter.drawPolyline(line);
    };
    painter.setPen(QPen(Qt::black, 0));
    for (const Route& route : AllRoutes) {
        std::vector<std::size_t> entries(route.size());
        for (std::size_t i = 0; i < entries.size(); ++i) entries[i] = i;
        draw_route(route, entries);
    }
    painter.setPen(QPen(Qt::red, kWidePen, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    draw_route(Routes, ChosenPart());
    if (StartName.empty() || EndName.empty()) return;
    painter.setPen(QPen(Qt::blue, kWidePen));
    for (const std::wstring& name : {StartName, EndName}) {
        QPointF at;
        if (!Plot(name, at)) continue;
        painter.drawEllipse(at, kRing, kRing);
        // Names are written upright, pulled back from the edge so that they stay inside.
        painter.save();
        painter.translate(std::min(at.x() + kTextGap, kTextLimit), std::min(at.y(), kTextLimit));
        painter.scale(1.0, -1.0);
        QFont font = painter.font();
        font.setPixelSize(900);
        painter.setFont(font);
        painter.drawText(QPointF(0, QFontMetricsF(font).height() / 4.0),
                         QString::fromStdWString(name));
        painter.restore();
    }
}

}  // namespace nedit
