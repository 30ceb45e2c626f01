#pragma once
// Turns the records of a Carlson RW5 raw file into neutral records.
//
// What a record becomes:
// - OC (occupy): STN with the instrument height of the LS record that follows it (else the
//   last one), its note as the code, and XYZ with the coordinates it carries. The data
//   collector writes there the coordinates it knew at the set-up; the reduction positions a
//   station from an earlier observation when it has one, so they serve only the first
//   station and stations that nothing observed.
// - LS (line of sight): HI is the instrument height, HR the target height (HT) of the
//   observations after it. An instrument height that changes within a set-up gives INSHT.
// - BK (back sight): BKB with the back point, the back azimuth BS (when the file gives one)
//   as bearing and the back circle BC as reading.
// - BD and BR (back sight of an angle set, face 1 and 2): BS. FD, FR (foresight of an angle
//   set), SS (side shot) and TR (traverse shot): SS. The face is the zenith angle's own
//   (above 180 degrees on face 2), so the records keep it as read. The horizontal reading
//   comes from AR (angle right), AL (angle left, 360 - AL), DR and DL (deflection, 180 + DR,
//   180 - DL) or AZ (azimuth, turned into a circle reading by the back azimuth and back
//   circle of the set-up); the zenith from ZE, VA (vertical angle, 90 - VA) or the height
//   difference CE with the horizontal or slope distance. The slope distance is SD, else
//   worked out from HD; an angle-only shot has 0. The note is the code.
// - SP (stored point): XYZ, so that a control point can orient and position stations.
// - MO (mode): the units of what follows (UN 0 feet, 1 metres, 2 US feet; AU 0 degrees as
//   ddd.mmss, 1 gons; AD 1 azimuths from South) and SCALE with its scale factor SF.
// - JB (job): JOB and DATE.
// Notes ("--" lines, such as the collector's own computations) and records that have no
// neutral counterpart (GPS records and the like) stand as comments; so do MO, JB and SP
// records with a note, whole, for what their mapped fields leave out. A record whose values
// cannot be read, a line that is no record (no type of two or three capitals before its first
// comma), and an observation without a horizontal reading (an AZ at a set-up without a back
// azimuth among them) are lines not read.
//
// Decisions where the format leaves the reader alone:
// - An MO record that stands as a note ("--MO,..."), as some collectors write the head of a
//   file, sets the units all the same. Before any MO record angles are ddd.mmss, the
//   format's first angle unit, and lengths are taken in the unit of the records, unconverted:
//   the file has not said which it uses.
// - Names and codes keep their case; the record list upper-cases them.
// - The OP field of an observation is not compared with the set-up: the observations belong
//   to the last OC record, as they do in the data collector.

#include <optional>
#include <string>

#include "LineSession.h"
#include "Rw5Record.h"

class Rw5Translator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "RW5";
    static constexpr const char* kName = "Carlson RW5";

    explicit Rw5Translator(sxn::NeutralWriter& out);

    bool Line(const sxn::RawLine& line) override;
    void Finish() override;

  private:
    /// False when the record is of a known type but could not be read.
    bool Record(const Rw5Record& record, std::string_view line);
    bool Mode(const Rw5Record& record);
    bool Occupy(const Rw5Record& record);
    bool LineOfSight(const Rw5Record& record);
    bool BackSight(const Rw5Record& record);
    bool Observe(const Rw5Record& record, bool back_sight);
    bool Store(const Rw5Record& record);
    /// The station waiting for its instrument height goes out.
    void PutStation(const std::optional<sxn::Length>& height);
    bool ReadCoordinates(const Rw5Record& record, sxn::Coordinates& at) const;
    std::optional<sxn::Length> ReadLength(std::string_view text) const;
    std::optional<sxn::Angle> ReadAngle(std::string_view text) const;
    std::optional<sxn::Angle> ReadAzimuth(std::string_view text) const;

    struct PendingStation {
        std::string id;
        std::string code;
        sxn::Coordinates at;
        bool has_coordinates = false;
    };

    sxn::LengthIn length_unit_;
    sxn::AngleIn angle_unit_ = sxn::AngleIn::Dms;
    bool south_azimuths_ = false;
    std::optional<PendingStation> station_;
    std::optional<sxn::Length> instrument_height_;
    std::optional<sxn::Length> target_height_;
    std::optional<sxn::Angle> back_azimuth_;
    std::optional<sxn::Angle> back_circle_;
};
