#pragma once
// The job's display and unit settings that the rest of the system reads: working length
// unit, angle unit and the number of decimals shown.

#include "platform/units/Units.h"

class UJobSettings {
public:
    nedit::LengthUnit GetLengthUnit() const { return length_unit_; }
    void SetLengthUnit(nedit::LengthUnit unit) { length_unit_ = unit; }
    nedit::AngleUnit GetAngleUnit() const { return angle_unit_; }
    void SetAngleUnit(nedit::AngleUnit unit) { angle_unit_ = unit; }
    int GetLengthDecimals() const { return length_decimals_; }
    void SetLengthDecimals(int decimals) { length_decimals_ = decimals; }
    int GetAngleDecimals() const { return angle_decimals_; }
    void SetAngleDecimals(int decimals) { angle_decimals_ = decimals; }

private:
    nedit::LengthUnit length_unit_ = nedit::LengthUnit::Metres;
    nedit::AngleUnit angle_unit_ = nedit::AngleUnit::DegMinSec;
    int length_decimals_ = 3;
    int angle_decimals_ = 4;
};
