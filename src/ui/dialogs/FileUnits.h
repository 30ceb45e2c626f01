#pragma once
// The units and vertical mode in force at a row of a record list: the job's until a UNIT (or
// UNIT2) record sets the linear and angular unit and an AMODE record the vertical mode, each
// for the rows after it. The record editors read a value in the units of its row and write
// a changed value back in them, so that a row keeps meaning what its file says.

#include <string>
#include <string_view>
#include <vector>

#include "platform/units/Units.h"

class UJobSettings;
class UNeutralFileFormat;

namespace nedit {

struct FileUnits {
    LengthUnit length = LengthUnit::Metres;
    AngleUnit angle = AngleUnit::DegMinSec;
    /// 'Z' zenith, 'N' nadir, 'A' above the horizon.
    wchar_t verticalMode = L'Z';

    /// The job's units (null: metres and ddd.mmss), the zenith mode.
    static FileUnits OfJob(const UJobSettings* job);
    /// The units in force at `row` of `rows`: the job's, as the rows before it change them.
    static FileUnits AtRow(const UNeutralFileFormat& format, const UJobSettings* job,
                           const std::vector<std::wstring>& rows, int row);
    /// Takes what a row of type `type` sets.
    void Take(std::wstring_view row, int type);

    /// A vertical reading in this mode as a zenith angle, and back: the two are the same
    /// turn (180 - v, 90 - v).
    double ToZenith(double reading) const;
    double FromZenith(double zenith) const { return ToZenith(zenith); }
};

/// The value of the field `name` of a record row, or, when no piece is named so, of the bare
/// piece at `position` of its layout (0 the first field); empty when there is neither.
std::wstring FieldValueOf(std::wstring_view row, std::wstring_view name, int position);

}  // namespace nedit
