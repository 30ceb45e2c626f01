#pragma once

// Angles of the geometry library. Turning is positive clockwise, the sense of bearings;
// see the conventions at the top of UWLine.h.

class UWPoint;

/// Degrees to radians; the factor the field programs use.
inline constexpr double kRadiansPerDegree = 0.017453292519943295;
/// Radians to degrees; the factor the field programs use.
inline constexpr double kDegreesPerRadian = 57.29577951308232;

/// An angle held in degrees.
class UAngle {
  public:
    UAngle() = default;
    explicit UAngle(double degrees) : degrees_(degrees) {}

    /// The angle turned at `vertex` from the direction towards `from` to the direction
    /// towards `to`, in degrees in (-180, 180]: positive when that turn is clockwise.
    /// A half turn is +180. Gives 0 when `from` or `to` coincides with `vertex` in plan.
    UAngle(const UWPoint& from, const UWPoint& vertex, const UWPoint& to);

    double Degrees() const { return degrees_; }
    double Radians() const { return degrees_ * kRadiansPerDegree; }

    /// `degrees` brought into one turn, [0, 360): -90 gives 270, 360 gives 0, 725 gives 5.
    /// A NaN or an infinity gives NaN.
    static double ValidateData(double degrees);

  private:
    double degrees_ = 0.0;
};
