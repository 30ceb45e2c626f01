#pragma once
// The job's display and unit settings that the rest of the system reads: working length
// unit, angle unit, the numbers of decimals shown, the coordinate order, the plan's pick
// aperture and height display, and how angles and feet are written. A job keeps them in
// its "job" settings section (see JobSettingsStore.h); a default-made object holds the
// defaults of a new job.

#include "platform/units/Units.h"

class UJobSettings {
  public:
    /// Coordinate order: East before North in forms and columns, or North first.
    static constexpr int kEastNorth = 0;
    static constexpr int kNorthEast = 1;
    /// Pick aperture of the plan: 8, 16 or 32 screen units.
    static constexpr int kApertureSmall = 0;
    static constexpr int kApertureNormal = 1;
    static constexpr int kApertureLarge = 2;
    /// Angle display: the bare number in the angle unit ("123.4530"), or with unit marks
    /// (123°45'30" in sexagesimal, "123.4567°", "137.1852g").
    static constexpr int kAnglePlain = 0;
    static constexpr int kAngleMarked = 1;
    /// Lengths in feet: decimal feet, or feet and inches with the inch fraction of
    /// 1/FootInchPrecision (2, 4, 8, 16, 32 or 64).
    static constexpr int kDecimalFeet = 0;
    static constexpr int kFeetAndInches = 1;

    nedit::LengthUnit GetLengthUnit() const { return length_unit_; }
    void SetLengthUnit(nedit::LengthUnit unit) { length_unit_ = unit; }
    nedit::AngleUnit GetAngleUnit() const { return angle_unit_; }
    void SetAngleUnit(nedit::AngleUnit unit) { angle_unit_ = unit; }
    int GetLengthDecimals() const { return length_decimals_; }
    void SetLengthDecimals(int decimals) { length_decimals_ = decimals; }
    int GetAngleDecimals() const { return angle_decimals_; }
    void SetAngleDecimals(int decimals) { angle_decimals_ = decimals; }

    int GetCoordinateOrder() const { return coordinate_order_; }
    void SetCoordinateOrder(int order) {
        coordinate_order_ = order == kNorthEast ? kNorthEast : kEastNorth;
    }
    int GetPickAperture() const { return pick_aperture_; }
    void SetPickAperture(int aperture) { pick_aperture_ = aperture; }
    bool GetShowHeight() const { return show_height_; }
    void SetShowHeight(bool show) { show_height_ = show; }
    int GetAngleFormat() const { return angle_format_; }
    void SetAngleFormat(int format) { angle_format_ = format; }
    int GetFootFormat() const { return foot_format_; }
    void SetFootFormat(int format) { foot_format_ = format; }
    int GetFootInchPrecision() const { return foot_inch_precision_; }
    void SetFootInchPrecision(int denominator) { foot_inch_precision_ = denominator; }

    bool operator==(const UJobSettings& other) const;
    bool operator!=(const UJobSettings& other) const { return !(*this == other); }

  private:
    nedit::LengthUnit length_unit_ = nedit::LengthUnit::Metres;
    nedit::AngleUnit angle_unit_ = nedit::AngleUnit::DegMinSec;
    int length_decimals_ = 3;
    int angle_decimals_ = 4;
    int coordinate_order_ = kEastNorth;
    int pick_aperture_ = kApertureNormal;
    bool show_height_ = false;
    int angle_format_ = kAnglePlain;
    int foot_format_ = kDecimalFeet;
    int foot_inch_precision_ = 16;
};
