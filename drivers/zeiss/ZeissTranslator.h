#pragma once
// Turns Zeiss (Trimble) Elta data in the R4, R5 or Rec 500 layout (ZeissLine.h) into
// neutral records. The layout is recognised line by line, so a file may mix them.
//
// What the value blocks mean, by their type identifier: X north, Y east, Z height (the
// geodetic order of the Elta instruments); Hz horizontal direction, V1 zenith angle, V2
// vertical angle above the horizon, SD slope distance, HD horizontal distance, h height
// difference; th target height, ih instrument height; m scale and Om orientation of the set-up.
//
// What a line becomes:
// - a point coded S (the station): STN, and XYZ with its coordinates when it has X and Y;
// - a point coded A (the known point the set-up was oriented on): XYZ;
// - any other point: PT with its coordinates, SS with its readings, or both, its code as CO;
// - th and ih: TARGETHT and INSHT; m: SCALE, Om: SWING (the circle reading plus Om is the
//   bearing). The formats write m and Om before or after the station they belong to: they
//   go out at once while a station has been written and nothing observed from it, else after
//   the next station's STN (or before the next observation, or at the end);
// - a text line (a program name, INPUT, END) stands as a comment, and so does every line
//   with a value that no record holds (a station's height alone, an identifier not listed).
//
// Decisions where the formats leave the reader alone:
// - Values without a unit (Rec 500) are metres and gons. Units "m", "ft", "grd" and "gon",
//   and "deg" (decimal degrees) are read; any other makes the line one not read.
// - A line of none of the three layouts, whose values cannot be read, or that gives
//   coordinates or readings without a point number, is a line not read.

#include <optional>
#include <string>

#include "LineSession.h"
#include "ZeissLine.h"

class ZeissTranslator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "ZEISS";
    static constexpr const char* kName = "Zeiss R4/R5/Rec 500";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;
    void Finish() override { PutSetUp(); }

  private:
    struct Values;
    /// False when a value cannot be read; `mapped` turns false for a value no record holds.
    bool Read(const ZeissLine& line, Values& values, bool& mapped) const;
    void Settings(const Values& values);
    bool Point(const ZeissLine& line, const Values& values);
    void PutSetUp();

    std::string pending_scale_;
    std::optional<sxn::Angle> pending_orientation_;
    bool station_open_ = false;  // a station has been written and nothing observed from it
};
