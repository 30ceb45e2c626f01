#pragma once
// Turns the data export of a Leica System 1200 total station (TCR 1205 and the like) into
// neutral records. The export is made of sections, each a title, a rule of dashes, a head line
// naming its columns, and rows of values separated by blanks:
//
//   Job               "Label : value" lines: Date/Time, Job, Creator, Instrument Type, ...
//   Points            Point ID, E, N, H, Class, Point Code
//   Lines             Point ID, E, N, H, Class, Point Code, Line ID, Line Code
//   TPS Station       Station ID, E, N, H, hi
//   TPS Measurements  Point ID, Hz, V, SD, HD, dH, hr, Add. Const, atm/geom ppm
//
// What the rows become: a station STN with its instrument height, and XYZ; a measurement SS
// with the reflector height and the instrument's horizontal distance (HD), after the last
// station; a point of class REF or CTRL (control, given) XYZ, any other (MEAS, measured) PT
// with its code; a point of a line PT with the line's code, and a comment names each line
// and its code as it begins. Date, job, creator and instrument give DATE, JOB, NAME and
// INSTRU. Other lines stand as comments; rules of dashes or pluses carry nothing and are
// left out.
//
// Decisions where the export leaves the reader alone:
// - Hz and V are ddd.mmss and lengths metres, as the export writes them by default. The
//   horizontal circle reads bearings (the set-up was oriented on the instrument), so no back
//   bearing record is needed.
// - The additive constant and ppm were applied to the distances by the instrument; dH is its
//   height difference with the instrument and reflector heights in it. None is mapped; the
//   raw file keeps them.
// - A point or line row without a point code has one word less: the code is what stands
//   between the class and the line's columns.
// - A row of a section whose numbers cannot be read is a line not read.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "LineSession.h"

class Tps1200Translator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "TPS1200";
    static constexpr const char* kName = "Leica TPS 1200 export";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;

  private:
    enum class Section { None, Job, Points, Lines, Station, Measurements };
    using Words = std::vector<std::string_view>;

    bool Row(const Words& words);
    void JobLine(std::string_view line);
    bool PointRow(const Words& words);
    bool StationRow(const Words& words);
    bool MeasurementRow(const Words& words);

    Section section_ = Section::None;
    bool head_seen_ = false;  // the head line of the section has gone by
    std::string line_id_;
};
