#pragma once
// Turns the output of a Topcon GTS total station (GTS-220 series) into neutral records.
//
// The instrument sends its memory as blocks of 128 characters, each on a line of its own
// between STX and ETX, with a block number (one digit) and a block sum (three digits) before
// the ETX; a record may run on from one block into the next. Each record begins with '_' and
// a character that says what it is:
//
//   _'name    occupied station          _(code   its code        _)1.540  instrument height
//   _+name    target point              _*code   its code        _,1.500  target height
//   _ ?...    measurement of the target point: slope distance (sign, 8 digits in mm) and its
//             unit (m metres, f feet), zenith angle (7 digits, 4 decimals), horizontal angle
//             (sign, 7 digits) and their unit (g gon, d ddd.mmss), horizontal distance (sign,
//             8 digits), then further values
//
// A target's code and height follow its measurement, so an observation goes out when the
// next target or station begins: SS with the target height, its code and the instrument's
// horizontal distance (HD). A station goes out as STN with its height and code when its first
// target begins.
//
// Decisions where the format leaves the reader alone:
// - The block sums are not checked: their rule is not in the documentation we had. A block
//   that is not framed by STX and ETX is read whole as data, so unframed files read too.
// - Heights are read in the length unit of the last measurement, metres before the first.
// - The values after the horizontal distance (marked "t**") are not mapped; the raw file
//   keeps them.
// - A station without a name is written without one: its observations are reduced once the
//   user names it, and the user is told so.
// - A record of another kind stands as a comment; a measurement that cannot be read, or a
//   record of unreasonable length, is a line not read, named by the line it began on.

#include <optional>
#include <string>

#include "LineSession.h"

class GtsTranslator : public sxn::LineTranslator {
  public:
    static constexpr const char* kTag = "GTS";
    static constexpr const char* kName = "Topcon GTS";

    using LineTranslator::LineTranslator;

    bool Line(const sxn::RawLine& line) override;
    void Finish() override;

  private:
    /// The record gathered so far is complete; false when it could not be read.
    bool EndRecord();
    bool Measurement(std::string_view text);
    void PutStation();
    void PutTarget();

    struct Target {
        std::string id;
        std::string code;
        std::optional<sxn::Observation> observation;
    };
    struct Station {
        std::string id;
        std::string code;
        std::optional<sxn::Length> height;
    };

    std::string record_;
    long record_line_ = 0;
    bool in_record_ = false;
    std::optional<Station> station_;
    std::optional<Target> target_;
    std::optional<sxn::Length> target_height_;
    sxn::LengthIn lengths_ = sxn::LengthIn::Metres;
};
