#pragma once
// Length and angle units as the files name them by letter. Inside the system angles are
// decimal degrees and lengths are in the job's unit; these are the conversions at the edges.

namespace nedit {

/// The order of the units is the one option lists count them in: 0, 1, 2.
enum class LengthUnit { Metres, Feet, USFeet };
enum class AngleUnit { DegMinSec, Degrees, Gons };

/// The unit at an index of the option lists; anything outside 0 to 2 gives the first.
LengthUnit LengthUnitFromIndex(int index);
AngleUnit AngleUnitFromIndex(int index);
int IndexOf(LengthUnit unit);
int IndexOf(AngleUnit unit);

/// "M" metres, "F" or "1" feet, "U" or "2" US survey feet; anything else is metres.
LengthUnit LengthUnitFromLetter(wchar_t letter);
/// "S" sexagesimal, "D" or "1" decimal degrees, "G" or "2" gons; anything else is sexagesimal.
AngleUnit AngleUnitFromLetter(wchar_t letter);
wchar_t LetterOf(LengthUnit unit);  // 'M', 'F', 'U'
wchar_t LetterOf(AngleUnit unit);   // 'S', 'D', 'G'

/// Metres in one unit: the international foot is 0.3048 m, the US survey foot 1200/3937 m.
double MetresPer(LengthUnit unit);
/// A length in `from` units expressed in `to` units.
double ConvertLength(double value, LengthUnit from, LengthUnit to);

/// ddd.mmss (123.4530 is 123°45'30") to decimal degrees. The sign applies to the whole angle.
double DmsToDegrees(double dms);
/// Decimal degrees to ddd.mmss, rounded so that 59.99999 seconds do not show as 60.
double DegreesToDms(double degrees);
/// An angle in `unit` to decimal degrees, and back.
double ToDegrees(double value, AngleUnit unit);
double FromDegrees(double degrees, AngleUnit unit);

}  // namespace nedit
