#pragma once
// Angles and lengths as an instrument file writes them, and what the records make of them.
//
// A value keeps the text it was read from. Written in the unit it was recorded in, it is that
// text again, so that nothing is rounded on the way; in another unit it is converted and
// written with one place more than the recording had (angles with six decimals).
//
// Decisions:
// - ddd.mmss text is read as a decimal number whose first two decimals are minutes and the
//   next two seconds, the rest fractions of a second ("12.3" is 12 degrees 30 minutes).
//   Minutes of 60 or more, or seconds above 60, make the text no angle. Seconds of exactly
//   60, which some instruments write when they round 59.5 seconds up, carry into the minutes;
//   such an angle is written converted, never as recorded.
// - Feet are international feet (0.3048 m) and US survey feet 1200/3937 m.

#include <optional>
#include <string>
#include <string_view>

#include "DriverSession.h"

namespace sxn {

enum class AngleIn { Dms, Degrees, Gons, Mils };
enum class LengthIn { Metres, Feet, UsFeet };

/// The unit in which a length is written as the records want it.
LengthIn SameLength(LengthOut unit);

/// An angle in degrees brought into 0 up to 360.
double Turn(double degrees);

/// A decimal number: blanks around it, an optional sign, digits with at most one point.
/// False for anything else, whatever the user's locale.
bool ReadNumber(std::string_view text, double& value);

class Angle {
  public:
    /// The angle written as `text` in `unit`; nothing when the text is no angle of that unit.
    static std::optional<Angle> Read(std::string_view text, AngleIn unit);
    /// An angle worked out by a driver.
    static Angle FromDegrees(double degrees);

    double Degrees() const { return degrees_; }
    /// The angle in the records' unit.
    std::string Text(AngleOut out) const;

  private:
    double degrees_ = 0.0;
    std::string recorded_;  // the number as written, empty for a worked-out angle
    AngleIn unit_ = AngleIn::Degrees;
};

class Length {
  public:
    /// The length written as `text` in `unit`; nothing when the text is no number.
    static std::optional<Length> Read(std::string_view text, LengthIn unit);
    /// A length worked out by a driver, in metres.
    static Length FromMetres(double metres);

    double Metres() const { return metres_; }
    /// The length in the records' unit.
    double In(LengthOut out) const;
    std::string Text(LengthOut out) const;

  private:
    double metres_ = 0.0;
    std::string recorded_;
    LengthIn unit_ = LengthIn::Metres;
};

/// Reads `source` with `read` into `value`; false when the reader gave nothing.
template <class Value, class Source, class Reader>
bool ReadInto(std::optional<Value>& value, const Source& source, Reader read) {
    value = read(source);
    return value.has_value();
}

}  // namespace sxn
