#pragma once
// The plan's window on the world: which world point is in the middle of the view and how
// many screen pixels a world unit takes. East runs to the right and North up the screen.
// A history of windows gives Zoom Previous and Zoom Next.

#include <vector>

#include "platform/geometry/UWPoint.h"
#include "platform/geometry/UWRect.h"

namespace nedit {

/// A point on the screen, in logical pixels from the view's top left.
struct ScreenPoint {
    double x = 0.0;
    double y = 0.0;
};

class PlanTransform {
  public:
    /// Scales are kept within these pixels per world unit, so that neither a world of a
    /// thousand kilometres nor one of a millimetre breaks the arithmetic.
    static constexpr double kMinScale = 1e-6;
    static constexpr double kMaxScale = 1e6;

    void SetViewSize(double width, double height);
    double ViewWidth() const { return width_; }
    double ViewHeight() const { return height_; }

    ScreenPoint ToScreen(double east, double north) const;
    ScreenPoint ToScreen(const UWPoint& point) const { return ToScreen(point.x, point.y); }
    UWPoint ToWorld(const ScreenPoint& point) const;
    /// A length on the screen as a world length, and back.
    double ToWorldLength(double pixels) const { return pixels / scale_; }
    double ToScreenLength(double length) const { return length * scale_; }
    /// The world seen in the view.
    UWRect VisibleWorld() const;

    /// Pixels per world unit.
    double Scale() const { return scale_; }
    const UWPoint& Centre() const { return centre_; }
    void SetWindow(const UWPoint& centre, double scale);

    /// Shows `extents` whole with a margin of `margin` of the view on each side. An empty
    /// rectangle, or one without width and height, is shown around its point at 1 pixel a
    /// unit scaled to fit 100 units.
    void ZoomTo(const UWRect& extents, double margin = 0.05);
    /// Scales by `factor` (above 1 zooms in) keeping the world point under `fixed` in place.
    void ZoomAbout(const ScreenPoint& fixed, double factor);
    /// Moves the view by a screen distance: the world follows the mouse.
    void PanBy(double dx, double dy);
    /// Puts `point` in the middle of the view.
    void CentreOn(const UWPoint& point);

    // ---- Zoom history.
    /// Remembers the present window before it changes, forgetting the windows that Zoom
    /// Next would have gone to. The oldest windows go beyond kHistoryLimit.
    void AddZoomHistory();
    bool CanZoomPrevious() const { return !past_.empty(); }
    bool CanZoomNext() const { return !future_.empty(); }
    static constexpr std::size_t kHistoryLimit = 100;
    void ZoomPrevious();
    void ZoomNext();

  private:
    struct Window {
        UWPoint centre;
        double scale;
    };
    Window Current() const { return {centre_, scale_}; }
    void Restore(const Window& window);

    double width_ = 1.0;
    double height_ = 1.0;
    UWPoint centre_{50.0, 50.0};
    double scale_ = 1.0;
    std::vector<Window> past_;
    std::vector<Window> future_;
};

}  // namespace nedit
