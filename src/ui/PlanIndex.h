#pragma once
// A spatial index of the plan's objects: a uniform grid over their extents, each cell
// listing the objects whose bounding box meets it. Finding what lies in the view or near a
// click then costs the objects found, not all objects. Objects that would cover very many
// cells (a long line across the whole survey) are kept apart and tested every time.

#include <vector>

#include "platform/geometry/UWRect.h"

namespace nedit {

class PlanIndex {
  public:
    struct Box {
        double minX;
        double minY;
        double maxX;
        double maxY;
    };

    /// Indexes objects 0 to boxes.size() - 1 by their boxes. Boxes with a coordinate that
    /// is not a finite number are left out: such an object cannot be seen or picked.
    void Build(std::vector<Box> boxes);
    int Size() const { return static_cast<int>(boxes_.size()); }
    const Box& BoxOf(int item) const { return boxes_[static_cast<std::size_t>(item)]; }

    /// The objects whose box meets `area`, each once, in ascending order, into `out`.
    void Query(const UWRect& area, std::vector<int>& out) const;

  private:
    int CellColumn(double x) const;
    int CellRow(double y) const;

    std::vector<Box> boxes_;
    double min_x_ = 0.0;
    double min_y_ = 0.0;
    double cell_ = 1.0;
    int columns_ = 0;
    int rows_ = 0;
    std::vector<int> cell_start_;  // cells in row order, and one past the last
    std::vector<int> cell_items_;
    std::vector<int> large_;
    mutable std::vector<unsigned> seen_;
    mutable unsigned pass_ = 0;
};

}  // namespace nedit
