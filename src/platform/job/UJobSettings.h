#pragma once
// The job's display and unit settings that the rest of the system reads: working length
// unit, angle unit, the numbers of decimals shown, the coordinate order, the plan's pick
// aperture and height display, and how angles and feet are written. A job keeps them in
// its "job" settings section (see JobSettingsStore.h); a default-made object holds the
// defaults of a new job.
//
// It also writes lengths, angles and areas as the job displays them. Lengths are held in the
// job's length unit everywhere in the system, so the length services take a value in that
// unit and convert nothing; a value that rounds to zero at the places shown carries no sign.

#include <string>

#include "platform/units/Units.h"

/// Names for the arguments of the length writers of UJobSettings (LengthToString,
/// UnitLengthToString, DistanceToString), so that a call says what it asks for.
namespace nedit::length {
constexpr bool kWithUnit = true;
constexpr bool kNoUnit = false;
constexpr bool kPlusSign = true;
constexpr bool kNoSign = false;
/// Decimals and inch fraction of the job's own settings.
constexpr int kJobDecimals = -1;
constexpr int kJobInchFraction = -1;
/// A coordinate difference, or a length; the two are written alike.
constexpr bool kCoordinate = true;
constexpr bool kLength = false;
/// The last arguments, taken as the suite's callers pass them and without effect.
constexpr bool kUnused = false;
}  // namespace nedit::length

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

    /// A length in the job's unit as the job displays it: `decimals` places after the point
    /// ("%.*f", so -1.23456 with 3 is "-1.235"), or, when the unit is feet or US feet and the
    /// foot format is kFeetAndInches, feet and inches to the nearest 1/`inch_fraction` inch
    /// in lowest terms: 10.5 gives 10' 6", 3.2604 gives 3' 3 1/8" at sixteenths. Whole
    /// inches are always shown (10' 0"), and decimals play no part there.
    /// - `with_unit`: append " m", " ft" or " usft" to a decimal length (feet and inches carry
    ///   their own marks).
    /// - `plus_sign`: write '+' before a value above zero, as differences are often shown.
    /// - `decimals`: below 0, the job's length decimals.
    /// - `inch_fraction`: denominator of the inch fraction; below 1 (the suite's callers pass
    ///   -1), the job's FootInchPrecision.
    /// - `coordinate`, `reserved`: accepted as the suite's callers pass them (true for a
    ///   coordinate difference) and without effect: a coordinate and a length display alike.
    /// So (false, false, 3, -1, ...) gives three decimals and the job's unit and foot format.
    std::wstring LengthToString(double value, bool with_unit, bool plus_sign, int decimals,
                                int inch_fraction, bool coordinate, bool reserved) const;
    /// A value already in the job's unit, such as ConvertLength gives; the arguments as for
    /// LengthToString. As stored lengths are in the job's unit too, the two write alike.
    std::wstring UnitLengthToString(double value, bool with_unit, bool plus_sign, int decimals,
                                    int inch_fraction, bool reserved) const;
    /// A distance between points; the arguments as for LengthToString, the last two accepted
    /// and without effect.
    std::wstring DistanceToString(double value, bool with_unit, bool plus_sign, int decimals,
                                  int inch_fraction, bool reserved1, bool reserved2) const;
    /// `value`, a length in `from` units, expressed in the job's length unit.
    double ConvertLength(nedit::LengthUnit from, double value) const;

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

/// Writes into `text` the angle `degrees` (decimal degrees) as the job displays angles: its
/// angle unit and angle decimals, through UFormatAngle (the angle keeps its sign and is not
/// brought into one turn). With kAngleMarked the marks are added: 123°45'30" (at least whole
/// seconds are shown, finer with more than 4 decimals), "123.7583°", "137.5093g". `mode` is
/// kept for the suite's callers and has no effect. The text has no leading blanks.
void ConvertAngleToDisplay(const UJobSettings& job, double degrees, std::wstring& text, int mode);

/// An area in square metres expressed in the square of the job's length unit
/// (1 m² is 10.7639104 ft²).
double ConvertAreaToDisplay(const UJobSettings& job, double square_metres);
