#pragma once
// What the plan draws of one reduction: the engine's point, line, arc and circle stores,
// each behind a spatial index, and every arc as the short chords it is drawn with. It is
// made again after every run, since the stores are; it reads the stores and keeps no copy
// of them.
//
// Picking follows the order in which a surveyor's click has always been read: the nearest
// point when it lies within the aperture; else the nearest line whose ends are both no
// further from the click than the line is long, when it lies within the aperture, and no
// arc is tried while any such line exists; else the nearest arc within the aperture when
// the click lies in the arc's sector. Ties go to the object stored first.

#include <vector>

#include "platform/geometry/UWPoint.h"
#include "platform/geometry/UWRect.h"
#include "ui/PlanIndex.h"

class UNeditDatabase;
class UWArc;

namespace nedit {

struct PlanPick {
    enum class Kind { None, Point, Line, Arc };
    Kind kind = Kind::None;
    int index = -1;
};

class PlanScene {
  public:
    /// Distances from a pick at or beyond this count as no object, as the stores have always
    /// been searched.
    static constexpr double kFarAway = 1e6;

    /// Indexes the stores of `database` (null: an empty plan).
    void Build(const UNeditDatabase* database);
    const UNeditDatabase* Database() const { return database_; }

    /// The extents of the run's points; (0, 0)-(100, 100) when there are none.
    UWRect Extents() const;

    void PointsIn(const UWRect& area, std::vector<int>& out) const { points_.Query(area, out); }
    void LinesIn(const UWRect& area, std::vector<int>& out) const { lines_.Query(area, out); }
    void ArcsIn(const UWRect& area, std::vector<int>& out) const { arcs_.Query(area, out); }
    void CirclesIn(const UWRect& area, std::vector<int>& out) const { circles_.Query(area, out); }
    /// The arc as drawn: points along it from its start to its end.
    const std::vector<UWPoint>& ArcPath(int arc) const {
        return arc_paths_[static_cast<std::size_t>(arc)];
    }

    /// The object a click at `at` picks with an aperture of `aperture` world units.
    PlanPick Pick(const UWPoint& at, double aperture) const;
    /// The point nearest to `at` within `radius`; -1 for none.
    int NearestPoint(const UWPoint& at, double radius) const;

    /// Points along `arc` from its start to its end, at most every two degrees; a straight
    /// arc is its chord.
    static std::vector<UWPoint> SampleArc(const UWArc& arc);
    /// True when the bearing from the arc's centre to `at` lies within the arc's sweep.
    static bool InSector(const UWArc& arc, const UWPoint& at);

  private:
    int NearestLine(const UWPoint& at, double radius) const;
    bool AnyLineCounts(const UWPoint& at) const;

    const UNeditDatabase* database_ = nullptr;
    PlanIndex points_;
    PlanIndex lines_;
    PlanIndex arcs_;
    PlanIndex circles_;
    std::vector<std::vector<UWPoint>> arc_paths_;
    mutable std::vector<int> found_;
};

}  // namespace nedit
