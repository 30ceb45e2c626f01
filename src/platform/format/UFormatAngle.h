#pragma once
// Writing an angle for display in one of the three angle types: sexagesimal degrees as
// ddd.mmss, decimal degrees, or gons.

#include <string>

class UFormatAngle {
  public:
    /// `type`: 0 sexagesimal (ddd.mmss), 1 decimal degrees, 2 gons. `decimals`: places after
    /// the point (4 for ddd.mmss is whole seconds). `mode` is kept for the callers of the
    /// suite and has no effect. Any other type is sexagesimal; decimals are kept within 0..9.
    /// In ddd.mmss fewer than 4 decimals round to the places shown (2: whole minutes).
    UFormatAngle(int type, int decimals, int mode);

    /// `text` holds an angle in decimal degrees (as "%f" writes it); gives it in this type
    /// with this many decimals, without unit marks: "123.4530" for 123.758333 in type 0,
    /// "123.7583" in type 1, "137.5093" in type 2. Sexagesimal values are rounded to the last
    /// place shown with carries at 60 seconds and 60 minutes, never showing 60. Angles keep
    /// their sign; an angle is not brought into one turn, so 359.999999 shows as "360.0000"
    /// (turning it into "0.0000" would hide that it was read as a full turn). A value that
    /// rounds to zero at the places shown has no sign. Text that holds no number gives the
    /// formatting of 0; a sexagesimal angle of a billion degrees or more is written as a
    /// decimal number.
    std::wstring ConvertToDisplayString(const std::wstring& text) const;

  private:
    int type_;
    int decimals_;
};
