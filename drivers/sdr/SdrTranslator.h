#pragma once
// Turns Sokkia SDR33 (and SDR2x) records into neutral records. The format, as its public
// documentation lays it out, has one record a line in fixed columns: the record type (two
// digits) and a derivation code (two letters: KI keyed in, MC measured, F1 and F2 faces, TP,
// NM, ...) in columns 1 to 4, then the fields. SDR33 writes point names in 16 columns,
// numbers in 16; SDR2x writes names in 4 and numbers in 10; the header says which.
//
//   00 header        version (5-20); angle unit (41: 1 degrees, 2 gons, 4 mils), length
//                    unit (42: 1 metres, 2 feet), coordinate order (45: 1 NEZ, 2 ENZ)
//   01 instrument    zero of vertical angles (51: 1 zenith, 2 horizon)
//   02 station       name, north, east, elevation, instrument height, description
//   03 target height target height
//   07 back sight    station, back point, azimuth, circle reading
//   08 coordinates   name, north, east, elevation, description
//   09 observation   station, target, slope distance, vertical angle, horizontal angle,
//                    description
//   10 job, 13 note
//
// What they become: 02 is STN with HI and the description as code, and XYZ; 03 TARGETHT; 07
// BKB; 09 SS, or BS when it observes the back point of the set-up; 08 PT, or XYZ for
// coordinates keyed in or uploaded (KI, UP), which are given rather than worked out; 10 JOB.
// A back sight or observation from another station than the last set-up begins a set-up of
// that station, without instrument height. 00, 01, 10 and 13 records and any other record
// stand as comments, and so do 08 records given as XYZ, for the description they leave out.
//
// Decisions:
// - Angles in degrees are written ddd.mmss, as the instruments that write SDR files show them.
// - A name of digits alone loses the zeros that pad it ("00000031" is 31).
// - A line that is too short for its fields, or whose numbers cannot be read, is a line not
//   read.

#include <string>
#include <string_view>

#include "LineSession.h"

class SdrTranslator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "SDR";
    static constexpr const char* kName = "Sokkia SDR33";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;

  private:
    /// Reads the fields of a record from column 5 on: names `name_width` wide, numbers
    /// `number_width`, descriptions 16.
    class Columns;
    bool Record(std::string_view type, std::string_view line);
    void Header(std::string_view line);
    bool Station(Columns& columns);
    bool BackSight(Columns& columns);
    bool Coordinates(Columns& columns, bool given);
    bool Observation(Columns& columns);
    bool ReadCoordinates(Columns& columns, sxn::Coordinates& at) const;
    /// A back sight or observation of another station than the set-up begins a set-up of it.
    void SetUp(const std::string& station);

    std::size_t name_width_ = 16;
    std::size_t number_width_ = 16;
    sxn::LengthIn length_unit_ = sxn::LengthIn::Metres;
    sxn::AngleIn angle_unit_ = sxn::AngleIn::Dms;
    bool east_first_ = false;
    bool from_horizon_ = false;
    std::string station_;
    std::string back_point_;
};
