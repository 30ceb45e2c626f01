#include "ui/PlanTransform.h"

#include <algorithm>
#include <cmath>

namespace nedit {

namespace {

double ClampScale(double scale) {
    if (!std::isfinite(scale)) return 1.0;
    return std::clamp(scale, PlanTransform::kMinScale, PlanTransform::kMaxScale);
}

}  // namespace

void PlanTransform::SetViewSize(double width, double height) {
    width_ = std::max(width, 1.0);
    height_ = std::max(height, 1.0);
}

ScreenPoint PlanTransform::ToScreen(double east, double north) const {
    return {width_ / 2.0 + (east - centre_.x) * scale_,
            height_ / 2.0 - (north - centre_.y) * scale_};
}

UWPoint PlanTransform::ToWorld(const ScreenPoint& point) const {
    return {centre_.x + (point.x - width_ / 2.0) / scale_,
            centre_.y - (point.y - height_ / 2.0) / scale_};
}

UWRect PlanTransform::VisibleWorld() const {
    const UWPoint low = ToWorld({0.0, height_});
    const UWPoint high = ToWorld({width_, 0.0});
    return UWRect(low.x, low.y, high.x, high.y);
}

void PlanTransform::SetWindow(const UWPoint& centre, double scale) {
    centre_ = centre;
    scale_ = ClampScale(scale);
}

void PlanTransform::ZoomTo(const UWRect& extents, double margin) {
    if (extents.IsEmpty()) return;
    const UWPoint middle((extents.GetMinX() + extents.GetMaxX()) / 2.0,
                         (extents.GetMinY() + extents.GetMaxY()) / 2.0);
    const double usable = 1.0 - 2.0 * margin;
    double scale = 0.0;
    if (extents.Width() > 0.0 || extents.Height() > 0.0) {
        const double across = extents.Width() > 0.0 ? width_ * usable / extents.Width() : kMaxScale;
        const double down =
            extents.Height() > 0.0 ? height_ * usable / extents.Height() : kMaxScale;
        scale = std::min(across, down);
    } else {
        scale = std::min(width_, height_) * usable / 100.0;
    }
    SetWindow(middle, scale);
}

void PlanTransform::ZoomAbout(const ScreenPoint& fixed, double factor) {
    const UWPoint anchor = ToWorld(fixed);
    scale_ = ClampScale(scale_ * factor);
    // The anchor stays under the same screen point.
    centre_.x = anchor.x - (fixed.x - width_ / 2.0) / scale_;
    centre_.y = anchor.y + (fixed.y - height_ / 2.0) / scale_;
}

void PlanTransform::PanBy(double dx, double dy) {
    centre_.x -= dx / scale_;
    centre_.y += dy / scale_;
}

void PlanTransform::CentreOn(const UWPoint& point) {
    centre_.x = point.x;
    centre_.y = point.y;
}

void PlanTransform::AddZoomHistory() {
    if (past_.size() == kHistoryLimit) past_.erase(past_.begin());
    past_.push_back(Current());
    future_.clear();
}

void PlanTransform::Restore(const Window& window) {
    centre_ = window.centre;
    scale_ = window.scale;
}

void PlanTransform::ZoomPrevious() {
    if (past_.empty()) return;
    future_.push_back(Current());
    Restore(past_.back());
    past_.pop_back();
}

void PlanTransform::ZoomNext() {
    if (future_.empty()) return;
    past_.push_back(Current());
    Restore(future_.back());
    future_.pop_back();
}

}  // namespace nedit
