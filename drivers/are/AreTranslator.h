#pragma once
// Turns a Trimble (Geodimeter) area file, .are, into neutral records. The file holds one
// value a line, "label=value", the label a number:
//
//   0 information text   2 station       3 instrument height   4 point code
//   5 point number       6 target height 7 horizontal angle    8 zenith angle
//   9 slope distance     10 height difference                  11 horizontal distance
//   21 reference (back) bearing          37 north  38 east  39 elevation
//   62 reference object (back point)
//
// Labels come in groups: a station (2) with its coordinates, its reference object (62) with
// its coordinates, the reference bearing (21) and the instrument height (3); a point (5) with
// its code, target height, readings and the coordinates the instrument worked out. A group
// ends where the next begins (2, 5) or information text (0) stands.
//
// What a group becomes: a station gives STN with its height, XYZ for it and its reference
// object, and BKB with the reference object, the reference bearing as bearing and, since the
// instrument's circle reads that bearing on the object, as reading too. A point with readings
// gives SS with its target height and code, after PT with the instrument's coordinates of it
// (an observed point outranks them in the reduction). A point with coordinates alone is a
// known point or a station's own position: XYZ. Information text stands as a comment, and so
// do labels that have no place in a record, after their group.
//
// Decisions where the format leaves the reader alone:
// - Angles are gons and lengths metres: the file does not say, and those are the units of
//   the instruments that write it. The unit label (23) is kept as a comment unread.
// - The target height runs on from point to point until a group gives another.
// - A line that is no label and value, or a reading or coordinate that is no number, is a line
//   not read.

#include <optional>
#include <string>

#include "LineSession.h"

class AreTranslator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "ARE";
    static constexpr const char* kName = "Trimble ARE";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;
    void Finish() override { PutGroup(); }

  private:
    /// False when the value of a label that is read cannot be.
    bool Label(int label, std::string_view value);
    void PutGroup();
    std::optional<sxn::Length>* CoordinateOf(int label);

    struct Group {
        bool station = false;
        std::string id;
        std::string code;
        sxn::Coordinates at;
        std::optional<sxn::Length> instrument_height;
        std::string back_point;
        sxn::Coordinates back_at;
        bool in_back_point = false;
        std::optional<sxn::Angle> back_bearing;
        std::optional<sxn::Angle> horizontal;
        std::optional<sxn::Angle> zenith;
        std::optional<sxn::Length> slope;
        std::optional<sxn::Length> level;
        std::optional<sxn::Length> rise;
        std::string unmapped;
    };

    std::optional<Group> group_;
    std::optional<sxn::Length> target_height_;
};
