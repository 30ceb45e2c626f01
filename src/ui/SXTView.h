#pragma once
// The small plan of the route selection: every route of the run in black, the chosen part
// of the route in hand in red from its start to its end, and the start and end points
// ringed in blue with their names. It draws in a square of 32000 units over the extents of
// the survey, so its picture does not depend on the window's size.

#include <QWidget>
#include <string>
#include <vector>

#include "platform/geometry/UWRect.h"

class UNeditDatabase;

namespace nedit {

class SXTView : public QWidget {
    Q_OBJECT
  public:
    /// A route: the names of its points in order.
    using Route = std::vector<std::wstring>;

    /// The view over `extents` (the document's extents when it is made).
    SXTView(const UWRect& extents, QWidget* parent = nullptr);

    void SetDatabase(const UNeditDatabase* database) { Database = database; }
    /// All routes the run found, drawn in black.
    void SetAllRoutes(std::vector<Route> routes);
    /// The route being chosen, and the names of its start and end.
    void SetRoute(Route route, const std::wstring& start, const std::wstring& end);

    /// Logical units per world unit: 30000 over the larger side of the extents (a side of 1
    /// or less counts as 1).
    double DrawScale() const;
    /// The entries of Routes from the start to the end, as drawn in red; empty when the
    /// start is not found before the end.
    std::vector<std::size_t> ChosenPart() const;

  protected:
    void paintEvent(QPaintEvent* event) override;

  private:
    /// The point's place in the view's units; false for a point without coordinates.
    bool Plot(const std::wstring& name, QPointF& at) const;

    const UNeditDatabase* Database = nullptr;
    UWRect Extents;
    std::vector<Route> AllRoutes;
    Route Routes;
    std::wstring StartName;
    std::wstring EndName;
};

}  // namespace nedit
