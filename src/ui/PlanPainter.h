#pragma once
// Draws a plan scene through a window: lines in the order of their store (a later line
// covers an earlier one; station lines red), arcs, circles, then the points on top with
// their marks and labels, and on request the selected object in the highlight colour.
// Only what lies in the window is drawn, found through the scene's index.

#include "ui/PlanScene.h"
#include "ui/PlanStyle.h"
#include "ui/PlanTransform.h"

class QPainter;
class QPointF;
class UNeditPt;

namespace nedit {

class PlanPainter {
  public:
    /// The colour number of a station line, whatever its code says.
    static constexpr int kStationLineColour = 12;
    /// The colour number of circles.
    static constexpr int kCircleColour = 15;

    PlanPainter(const PlanScene& scene, const PlanTransform& transform, const PlanStyle& style);

    /// The background and every object in the window, with a scale bar and a north arrow.
    void Paint(QPainter& painter) const;
    /// The length of the scale bar: 1, 2 or 5 times a power of ten, drawn 60 to 150 pixels
    /// long at `scale` pixels per unit.
    static double ScaleBarLength(double scale);
    /// The picked object drawn again in the highlight colour, a little heavier.
    void PaintSelection(QPainter& painter, const PlanPick& selected) const;

    /// A point's label: its name, feature code and height as the style asks, joined by "-".
    std::wstring Label(const UNeditPt& point) const;
    /// The mark of a point at `at`: 0 a cross, 1 a dot, 2 a circle, 3 a diagonal cross,
    /// 4 a square, 5 a triangle; other numbers a cross.
    static void DrawMark(QPainter& painter, const QPointF& at, int mark);

  private:
    void PaintLines(QPainter& painter) const;
    void PaintArcs(QPainter& painter) const;
    void PaintCircles(QPainter& painter) const;
    void PaintPoints(QPainter& painter) const;
    void PaintScaleBar(QPainter& painter) const;
    QPointF Screen(const UWPoint& point) const;

    const PlanScene& scene_;
    const PlanTransform& transform_;
    const PlanStyle& style_;
    UWRect window_;
};

}  // namespace nedit
