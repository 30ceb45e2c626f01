#pragma once
// Turns the coordinate export of a Leica TPS 700 (TCR 705) into neutral records. The export
// has a head of labelled lines, then a block per set-up:
//
//   JOB      SCRAS01                 SETUP SN      1000
//   OPERATOR     MB                  IH     0.000
//   DATE 08/02/05                    Orientation Station        105
//   INS. NO.    656205               - - - - - - - - - - - -
//   INS. TYPE.    TCR705                    100,    999.630,   1002.620,     98.406, WALL01 ----
//
// and "File End." at the end. A point line is the point, East, North and height, and the
// code, comma-separated.
//
// What the lines become: JOB, OPERATOR (NAME), DATE and the instrument's type and number
// (INSTRU) their records; a set-up STN with its instrument height, and BKB with the orientation
// station; a point line PT with the code. Other lines stand as comments; the rows of dashes
// that frame the blocks carry nothing and are left out.
//
// Decisions where the export leaves the reader alone:
// - The first coordinate is East, as the instrument shows coordinates.
// - The export writes 1.00, 1.00, 1.00 for a point it has no coordinates of (a point measured
//   from a set-up it could not place): such a line stands as a comment, so that no point is
//   put at 1, 1 and no real coordinates of the same point are overwritten. The user is told
//   how many there were.
// - The dashes after a code fill its column: they are not part of the code.
// - A line of commas that is not the point, three coordinates and at most a code, or whose
//   coordinates cannot be read, is a line not read.

#include <optional>
#include <string>

#include "LineSession.h"

class Tps700Translator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "TPS700";
    static constexpr const char* kName = "Leica TPS 700 export";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;
    void Finish() override;

  private:
    /// False when the line is none of the head, set-up or point lines.
    bool Labelled(std::string_view line);
    bool PointLine(std::string_view line);
    void PutSetUp();

    std::string setup_;
    std::optional<sxn::Length> instrument_height_;
    long without_coordinates_ = 0;
};
