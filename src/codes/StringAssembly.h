#pragma once
// Turns the filed strings into lines and arcs. A string needs no opening mark: its first
// point opens it and its last ends it. Three commands are read on its points:
//  * CLS adds a line back to the first point (or to the point of the last CLS);
//  * AS marks the point where an arc begins, AE the point where it ends. An arc whose two
//    marked points follow each other is a tangent arc: it leaves along the leg from the
//    point before, arrives along the leg to the point after, and its centre is a derived
//    point "CENTER" + start + "-" + end. With points between, the arc runs through the first
//    of them. An AS while an arc is open ends that arc and opens the next; an AE that another
//    AE follows before any AS starts the next arc at once.
// An arc left open at the end of its string: with one point after the mark a straight line,
// with more an arc through three points. Strings without a number, or numbered 0, make
// nothing. Two points in a row that defined a circle get no line.
//
// The walk keeps its quirks on purpose (they are what surveyors' files were drawn with): a
// tangent arc whose mark is the first point of a string takes its tangent from the last
// point of the string before; the very first point of the list cannot be the point after an
// arc (the arc becomes a straight line). Where an arc has no geometry to offer (a point not
// reduced, no tangent reference, parallel tangents) it makes a straight line or nothing, and
// the run is told of it.

#include <string>
#include <unordered_set>
#include <vector>

#include "codes/CStrList.h"
#include "codes/CodeGeometryHost.h"
#include "codes/USvyCodeCtrl.h"

namespace nedit {

class StringAssembly {
  public:
    StringAssembly(const USvyCodeCtrl& ctrl, CodeGeometryHost& host);

    /// The walk over every string; `circlePoints` are the points that defined circles.
    void ProcessString(const std::vector<CStrNoList>& strings,
                       const std::unordered_set<int>& circlePoints);
    /// The centre of the arc from `start` to `end` that leaves along the leg from `before`
    /// and arrives along the leg to `after`, projected onto the bisector of the chord so that
    /// it is equally far from both ends. False when the two normals do not meet.
    static bool Calc_Arc_Center(const UWPoint& before, const UWPoint& start, const UWPoint& end,
                                const UWPoint& after, UWPoint& centre);

  private:
    /// The commands of one element that the walk reads.
    enum Command : unsigned { kArcStart = 1, kArcEnd = 2, kClose = 4 };
    unsigned CommandsOf(const CStrList& element) const;
    /// An AE comes at or after `pos` before any AS.
    bool SearchForwArc(const std::vector<unsigned>& commands, std::size_t pos) const;
    /// The arc of ArcPts; `next` the element after it, or -1 for none.
    void ProcessArc(const std::vector<CStrList>& list, std::size_t next);
    void Process2PointArc(int next);
    void Process3PointArc();
    void FinishOpenArc();
    void Line(int from, int to);

    const USvyCodeCtrl& Ctrl;
    CodeGeometryHost& Host;
    std::vector<int> ArcPts;
    bool ArcOpen = false;
    int PrevPt = -1;
    int FirstPt = -1;
    std::wstring PrevName;
    std::wstring CurName;
    std::wstring CurStrCode;
    std::wstring CurStrName;
};

}  // namespace nedit
