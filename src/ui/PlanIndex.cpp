#include "ui/PlanIndex.h"

#include <algorithm>
#include <cmath>

namespace nedit {

namespace {

// An object covering more cells than this is tested on every query instead.
constexpr long long kLargeCells = 64;

bool IsFinite(const PlanIndex::Box& box) {
    return std::isfinite(box.minX) && std::isfinite(box.minY) && std::isfinite(box.maxX) &&
           std::isfinite(box.maxY);
}

bool Meets(const PlanIndex::Box& box, const UWRect& area) {
    return box.maxX >= area.GetMinX() && box.minX <= area.GetMaxX() && box.maxY >= area.GetMinY() &&
           box.minY <= area.GetMaxY();
}

}  // namespace

int PlanIndex::CellColumn(double x) const {
    const double cell = std::floor((x - min_x_) / cell_);
    return static_cast<int>(std::clamp(cell, 0.0, static_cast<double>(columns_ - 1)));
}

int PlanIndex::CellRow(double y) const {
    const double cell = std::floor((y - min_y_) / cell_);
    return static_cast<int>(std::clamp(cell, 0.0, static_cast<double>(rows_ - 1)));
}

void PlanIndex::Build(std::vector<Box> boxes) {
    boxes_ = std::move(boxes);
    seen_.assign(boxes_.size(), 0);
    pass_ = 0;
    cell_items_.clear();
    large_.clear();
    UWRect bounds;
    for (const Box& box : boxes_) {
        if (!IsFinite(box)) continue;
        bounds.Extend({box.minX, box.minY});
        bounds.Extend({box.maxX, box.maxY});
    }
    if (bounds.IsEmpty()) {
        columns_ = rows_ = 0;
        cell_start_.assign(1, 0);
        return;
    }
    // About one cell per object, square cells over the extents.
    const double count = static_cast<double>(std::max<std::size_t>(boxes_.size(), 1));
    const double area = std::max(bounds.Width(), 1e-9) * std::max(bounds.Height(), 1e-9);
    cell_ = std::max(std::sqrt(area / count), 1e-9);
    min_x_ = bounds.GetMinX();
    min_y_ = bounds.GetMinY();
    columns_ = std::clamp(static_cast<int>(std::ceil(bounds.Width() / cell_)), 1, 4096);
    rows_ = std::clamp(static_cast<int>(std::ceil(bounds.Height() / cell_)), 1, 4096);
    cell_ = std::max(bounds.Width() / columns_, bounds.Height() / rows_) * (1.0 + 1e-9);
    if (cell_ <= 0.0) cell_ = 1.0;

    // Counting pass, then filling pass, into one flat array.
    const std::size_t cells = static_cast<std::size_t>(columns_) * static_cast<std::size_t>(rows_);
    std::vector<int> counts(cells + 1, 0);
    auto for_cells = [this](const Box& box, auto visit) {
        for (int row = CellRow(box.minY); row <= CellRow(box.maxY); ++row) {
            for (int column = CellColumn(box.minX); column <= CellColumn(box.maxX); ++column)
                visit(static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_) +
                      static_cast<std::size_t>(column));
        }
    };
    std::vector<char> is_large(boxes_.size(), 0);
    for (std::size_t item = 0; item < boxes_.size(); ++item) {
        const Box& box = boxes_[item];
        if (!IsFinite(box)) continue;
        const long long covered =
            static_cast<long long>(CellRow(box.maxY) - CellRow(box.minY) + 1) *
            (CellColumn(box.maxX) - CellColumn(box.minX) + 1);
        if (covered > kLargeCells) {
            is_large[item] = 1;
            large_.push_back(static_cast<int>(item));
            continue;
        }
        for_cells(box, [&counts](std::size_t cell) { ++counts[cell + 1]; });
    }
    for (std::size_t cell = 0; cell < cells; ++cell) counts[cell + 1] += counts[cell];
    cell_start_ = counts;
    cell_items_.resize(static_cast<std::size_t>(counts.back()));
    std::vector<int> next(counts.begin(), counts.end() - 1);
    for (std::size_t item = 0; item < boxes_.size(); ++item) {
        if (is_large[item] || !IsFinite(boxes_[item])) continue;
        for_cells(boxes_[item], [&](std::size_t cell) {
            cell_items_[static_cast<std::size_t>(next[cell]++)] = static_cast<int>(item);
        });
    }
}

void PlanIndex::Query(const UWRect& area, std::vector<int>& out) const {
    out.clear();
    if (columns_ == 0 || area.IsEmpty()) return;
    // The whole survey in view (zoomed to all): every object, without visiting cells.
    if (area.GetMinX() <= min_x_ && area.GetMinY() <= min_y_ &&
        area.GetMaxX() >= min_x_ + cell_ * columns_ && area.GetMaxY() >= min_y_ + cell_ * rows_) {
        for (std::size_t item = 0; item < boxes_.size(); ++item) {
            if (IsFinite(boxes_[item])) out.push_back(static_cast<int>(item));
        }
        return;
    }
    if (++pass_ == 0) {  // the pass counter wrapped: forget every mark
        std::fill(seen_.begin(), seen_.end(), 0);
        pass_ = 1;
    }
    const bool outside = area.GetMaxX() < min_x_ || area.GetMaxY() < min_y_ ||
                         area.GetMinX() > min_x_ + cell_ * columns_ ||
                         area.GetMinY() > min_y_ + cell_ * rows_;
    if (!outside) {
        for (int row = CellRow(area.GetMinY()); row <= CellRow(area.GetMaxY()); ++row) {
            const std::size_t first =
                static_cast<std::size_t>(row) * static_cast<std::size_t>(columns_);
            for (int column = CellColumn(area.GetMinX()); column <= CellColumn(area.GetMaxX());
                 ++column) {
                const std::size_t cell = first + static_cast<std::size_t>(column);
                for (int at = cell_start_[cell]; at < cell_start_[cell + 1]; ++at) {
                    const int item = cell_items_[static_cast<std::size_t>(at)];
                    unsigned& mark = seen_[static_cast<std::size_t>(item)];
                    if (mark == pass_) continue;
                    mark = pass_;
                    if (Meets(boxes_[static_cast<std::size_t>(item)], area)) out.push_back(item);
                }
            }
        }
    }
    for (const int item : large_) {
        if (Meets(boxes_[static_cast<std::size_t>(item)], area)) out.push_back(item);
    }
    std::sort(out.begin(), out.end());
}

}  // namespace nedit
