#include "ui/PlanScene.h"

#include <algorithm>
#include <cmath>

#include "platform/geometry/UWArc.h"
#include "platform/geometry/UWLine.h"
#include "reduction/UNeditDatabase.h"

namespace nedit {

namespace {

constexpr double kDegreesPerChord = 2.0;

PlanIndex::Box BoxOf(const std::vector<UWPoint>& points) {
    PlanIndex::Box box{points.front().x, points.front().y, points.front().x, points.front().y};
    for (const UWPoint& point : points) {
        box.minX = std::min(box.minX, point.x);
        box.minY = std::min(box.minY, point.y);
        box.maxX = std::max(box.maxX, point.x);
        box.maxY = std::max(box.maxY, point.y);
    }
    return box;
}

UWRect Around(const UWPoint& at, double radius) {
    return UWRect(at.x - radius, at.y - radius, at.x + radius, at.y + radius);
}

/// A line counts for a pick when neither end is further from the click than its length:
/// the pick stays on the segment and off its extensions.
bool LineCounts(const UWLine& line, const UWPoint& at) {
    const double length = line.Length();
    return at.DistanceTo(line.GetStart()) <= length && at.DistanceTo(line.GetEnd()) <= length;
}

/// The item of `items` (ascending) nearest by `distance`, not beyond `limit`; the first of
/// equals wins. A negative distance leaves the item out. -1 for none.
template <typename Distance>
int NearestOf(const std::vector<int>& items, double limit, Distance distance) {
    int best = -1;
    double best_distance = std::min(limit, PlanScene::kFarAway);
    for (const int item : items) {
        const double d = distance(static_cast<std::size_t>(item));
        if (d < 0.0) continue;
        if (d < best_distance || (best < 0 && d == best_distance)) {
            best = item;
            best_distance = d;
        }
    }
    return best;
}

}  // namespace

std::vector<UWPoint> PlanScene::SampleArc(const UWArc& arc) {
    if (!arc.IsValid()) return {arc.GetStart(), arc.GetEnd()};
    const UWPoint centre = arc.ComputeCentre();
    const double radius = arc.ComputeRadius();
    const double sweep = arc.ComputeAngle() * (arc.IsClockwise() ? 1.0 : -1.0);
    const double start = centre.BearingTo(arc.GetStart());
    const int chords =
        std::max(1, static_cast<int>(std::ceil(std::fabs(sweep) / kDegreesPerChord)));
    std::vector<UWPoint> points;
    points.reserve(static_cast<std::size_t>(chords) + 1);
    for (int i = 0; i <= chords; ++i) {
        const double bearing = (start + sweep * i / chords) * M_PI / 180.0;
        points.emplace_back(centre.x + radius * std::sin(bearing),
                            centre.y + radius * std::cos(bearing));
    }
    return points;
}

bool PlanScene::InSector(const UWArc& arc, const UWPoint& at) {
    const UWPoint centre = arc.ComputeCentre();
    double bearing = centre.BearingTo(at);
    double from = centre.BearingTo(arc.GetStart());
    double to = centre.BearingTo(arc.GetEnd());
    if (!arc.IsClockwise()) std::swap(from, to);
    if (from > to) to += 360.0;
    if (from > bearing) bearing += 360.0;
    return from <= bearing && bearing <= to;
}

void PlanScene::Build(const UNeditDatabase* database) {
    database_ = database;
    arc_paths_.clear();
    std::vector<PlanIndex::Box> points;
    std::vector<PlanIndex::Box> lines;
    std::vector<PlanIndex::Box> arcs;
    std::vector<PlanIndex::Box> circles;
    if (database != nullptr) {
        points.reserve(database->GetPointList().size());
        for (const UNeditPt& point : database->GetPointList())
            points.push_back({point.x, point.y, point.x, point.y});
        lines.reserve(database->GetLineList().size());
        for (const UNeditLine& line : database->GetLineList())
            lines.push_back(BoxOf({line.GetStart(), line.GetEnd()}));
        for (const UNeditArc& arc : database->GetArcList()) {
            arc_paths_.push_back(SampleArc(arc));
            arcs.push_back(BoxOf(arc_paths_.back()));
        }
        for (const UWCircle& circle : database->GetCircleList()) {
            const UWPoint& c = circle.GetCentre();
            const double r = circle.GetRadius();
            circles.push_back({c.x - r, c.y - r, c.x + r, c.y + r});
        }
    }
    points_.Build(std::move(points));
    lines_.Build(std::move(lines));
    arcs_.Build(std::move(arcs));
    circles_.Build(std::move(circles));
}

UWRect PlanScene::Extents() const {
    if (database_ == nullptr) return UWRect(0, 0, 100, 100);
    const UWRect extents = database_->GetDocExtents();
    return extents.IsEmpty() ? UWRect(0, 0, 100, 100) : extents;
}

int PlanScene::NearestPoint(const UWPoint& at, double radius) const {
    if (database_ == nullptr) return -1;
    points_.Query(Around(at, radius), found_);
    const auto& points = database_->GetPointList();
    return NearestOf(found_, radius, [&](std::size_t item) { return at.DistanceTo(points[item]); });
}

int PlanScene::NearestLine(const UWPoint& at, double radius) const {
    lines_.Query(Around(at, radius), found_);
    const auto& lines = database_->GetLineList();
    return NearestOf(found_, radius, [&](std::size_t item) {
        const UNeditLine& line = lines[item];
        return LineCounts(line, at) ? std::fabs(at.DistanceTo(static_cast<const UWLine&>(line)))
                                    : -1.0;
    });
}

bool PlanScene::AnyLineCounts(const UWPoint& at) const {
    // Only asked when no line is near the click; a pass over the lines is then acceptable.
    const auto& lines = database_->GetLineList();
    return std::any_of(lines.begin(), lines.end(), [&at](const UNeditLine& line) {
        return LineCounts(line, at) &&
               std::fabs(at.DistanceTo(static_cast<const UWLine&>(line))) < kFarAway;
    });
}

PlanPick PlanScene::Pick(const UWPoint& at, double aperture) const {
    if (database_ == nullptr || database_->GetPointList().empty()) return {};
    const int point = NearestPoint(at, aperture);
    if (point >= 0) return {PlanPick::Kind::Point, point};
    const int line = NearestLine(at, aperture);
    if (line >= 0) return {PlanPick::Kind::Line, line};
    if (AnyLineCounts(at)) return {};
    arcs_.Query(Around(at, aperture), found_);
    const auto& arcs = database_->GetArcList();
    const int best =
        NearestOf(found_, aperture, [&](std::size_t item) { return at.DistanceTo(arcs[item]); });
    if (best >= 0 && InSector(database_->GetArcList()[static_cast<std::size_t>(best)], at))
        return {PlanPick::Kind::Arc, best};
    return {};
}

}  // namespace nedit
