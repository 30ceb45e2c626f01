#pragma once
// Turns GSI blocks into neutral records.
//
// What a block becomes:
// - a code block (first word 41): its code is the code (CO) of the next point, station or
//   observation; its information words 42-49 stand in a comment row;
// - a station block (station coordinates 84-86, no angle or distance): STN with the
//   instrument height 88, and XYZ with the station's coordinates;
// - an observation (any of 21, 22, 31, 32, 33): SS with the horizontal circle, the zenith
//   angle, the slope distance, the reflector height 87 and the code; the instrument's own
//   horizontal distance 32 and height difference 33 follow as HD and VD fields, which the
//   reduction does not read, so that they can be compared. Before it: INSHT when the
//   instrument height 88 differs from the station's, and PT with the instrument's own
//   coordinates 81-83 of the point when the block has them (an observed point outranks
//   them in the reduction);
// - coordinates 81-83 alone: PT.
// The remark 71 is the code when no code block gave one. Serial number, instrument type,
// time and the atmospheric and prism corrections (12, 13, 19, 51, 58, 59), which the
// recorded distances already carry, are left out; any other word stands in a comment row
// after its block, so nothing recorded is lost silently.
//
// Decisions where the format leaves the reader alone:
// - An observation needs its horizontal circle reading; a block without one is not read.
// - Without a zenith angle the sight is taken from the horizontal distance and height
//   difference when they are there, else as horizontal. Without a slope distance it is
//   worked out from the horizontal one (and the height difference); with neither it is 0.
//   A field left out of a neutral record would take the value of the record before it.
// - A point or station without height is written with the height -10000, which means no
//   height.
// - A block that cannot be read becomes the comment "# GSI LINE n NOT READ: <text>" and is
//   counted; the user is told the count at the end. Observations before any station block
//   cannot be reduced: the user is told once.

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "GsiWord.h"

class GsiTranslator {
  public:
    using Sink = std::function<void(std::string_view)>;

    /// Records go to `record`, messages for the user to `message`.
    GsiTranslator(sxn::OutputUnits units, Sink record, Sink message);

    /// False when the words do not make a block that can be read; it is then written as a
    /// comment, as Unreadable does.
    bool Block(const std::vector<GsiWord>& words, std::string_view text, long line);
    void Unreadable(std::string_view text, long line);
    /// The data have ended: the count of blocks not read goes to the user.
    void Finish();
    /// The data were not GSI.
    void NotGsi();

  private:
    struct Values;
    bool Read(const std::vector<GsiWord>& words, Values& values) const;
    void CodeBlock(const std::vector<GsiWord>& words);
    void Station(const Values& values);
    void Observation(const Values& values, const std::string& code);
    void Point(const Values& values, const std::string& code);
    void Start();
    std::string TakeCode(const Values& values);
    /// The coordinate of word `index`, or -10000 (no value) when the block has none.
    std::string CoordinateText(const Values& values, int index) const;

    sxn::OutputUnits units_;
    Sink record_;
    Sink message_;
    bool started_ = false;
    bool station_seen_ = false;
    bool told_no_station_ = false;
    std::string instrument_height_;  // as last written, empty before any
    std::string pending_code_;
    long unread_ = 0;
};
