#pragma once
// Writes neutral records for a driver: the file header and unit record before the first, the
// records of set-ups, observations and coordinates in one layout for every format, comments
// for what has no record, and the messages about lines that could not be read.
//
// Decisions:
// - Records are held back until the data have shown that they are of the driver's format
//   (Prove). Data that never do (the driver's session gives up after kProbeBytes, or they end
//   first) give no records at all, only the message "The data are not <format>: ...".
// - Observations before any station cannot be reduced: the user is told so at the end.
// - A line that cannot be read becomes the comment "# <TAG> LINE n NOT READ: <text>" and is
//   counted; at the end the user is told the count and the numbers of the first ten.
// - A coordinate without a value (no height) is written as -10000, which means none; an
//   empty field of a neutral record would take the value of the record before it.
// - Names and codes may not hold the characters that separate neutral fields: commas and '='
//   become '_', control characters blanks.

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Values.h"

namespace sxn {

/// East, North and Height of a coordinate record; a value left out is none.
struct Coordinates {
    std::optional<Length> east;
    std::optional<Length> north;
    std::optional<Length> height;
};

/// One observation: the target, its readings and what the driver knows of its target.
struct Observation {
    std::string id;
    Angle horizontal;
    Angle zenith;
    Length slope;
    std::optional<Length> target_height;
    std::string code;
    bool back_sight = false;
    // The instrument's own reductions, kept as HD and VD fields that the reduction does not
    // read, so that they can be compared.
    std::optional<Length> horizontal_distance;
    std::optional<Length> height_difference;
};

/// Sets the zenith angle and slope distance of `sight` from what a record gave. Without a
/// zenith angle the sight is worked out from the height difference and the horizontal or
/// slope distance when there are both, else taken as horizontal; without a slope distance it
/// comes from the horizontal distance (and the height difference), else it is 0. A value left
/// out of a record would otherwise take the value of the record before it.
void CompleteSight(Observation& sight, const std::optional<Angle>& zenith,
                   const std::optional<Length>& slope, const std::optional<Length>& level,
                   const std::optional<Length>& rise);

/// A name or code as a field of a neutral record: trimmed, UTF-8, without separators.
std::string FieldText(std::string_view text);
/// Bytes as printable UTF-8 text for a comment, control characters as blanks.
std::string CommentText(std::string_view bytes);

class NeutralWriter {
  public:
    using Sink = std::function<void(std::string_view)>;
    static constexpr std::size_t kProbeBytes = 4096;

    /// `tag` names the format in comments ("RW5"), `name` in messages ("Carlson RW5").
    NeutralWriter(OutputUnits units, std::string tag, std::string name, Sink record, Sink message);

    const OutputUnits& Units() const { return units_; }

    /// The data have shown themselves to be of this format.
    void Prove();
    bool Proven() const { return proven_; }

    /// A record, as written.
    void Record(std::string text);
    /// "# text": something of the data that has no record of its own.
    void Comment(std::string_view text);
    /// A line that could not be read.
    void Unread(long line, std::string_view bytes);

    void Station(const std::string& id, const std::optional<Length>& height,
                 const std::string& code);
    void Xyz(const std::string& id, const Coordinates& at);
    void Point(const std::string& id, const Coordinates& at, const std::string& code);
    void Observe(const Observation& observation);
    /// The back station, the bearing to it and the circle reading on it, as far as known.
    void BackBearing(const std::string& id, const std::optional<Angle>& bearing,
                     const std::optional<Angle>& reading);
    void InstrumentHeight(const Length& height);
    void TargetHeight(const Length& height);

    /// A message for the user about the data, once they have shown their format.
    void Message(const std::string& text);

    /// The data gave up their format: nothing held back goes out, and the user is told.
    void NotFormat();
    /// The data have ended: what is held back goes out or is refused, and the count of lines
    /// not read goes to the user.
    void Finish();

  private:
    void Out(const std::string& text);
    std::string LengthText(const std::optional<Length>& length) const;

    OutputUnits units_;
    std::string tag_;
    std::string name_;
    Sink record_;
    Sink message_;
    bool proven_ = false;
    bool refused_ = false;
    bool started_ = false;
    std::vector<std::string> held_;
    bool station_seen_ = false;
    bool observed_before_station_ = false;
    long unread_ = 0;
    std::string unread_lines_;  // the numbers of the first lines not read
};

}  // namespace sxn
