#include "NeutralWriter.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace sxn {

namespace {

constexpr const char* kHeader = "#VERSION-1.0 NEUTRAL FILE";
constexpr double kNoValue = -10000.0;
constexpr std::size_t kShown = 200;
// The lines not read that the message names; the comments name them all.
constexpr long kLinesNamed = 10;
constexpr double kDegrees = 180.0 / 3.14159265358979323846;

std::string Field(const char* key, const std::string& value) {
    return std::string(",") + key + "=" + value;
}

}  // namespace

void CompleteSight(Observation& sight, const std::optional<Angle>& zenith,
                   const std::optional<Length>& slope, const std::optional<Length>& level,
                   const std::optional<Length>& rise) {
    double degrees = 90.0;
    if (zenith) {
        degrees = zenith->Degrees();
    } else if (rise && (level || slope)) {
        const double across = level ? level->Metres()
                                    : std::sqrt(std::max(0.0, slope->Metres() * slope->Metres() -
                                                                  rise->Metres() * rise->Metres()));
        degrees = std::atan2(across, rise->Metres()) * kDegrees;
    }
    sight.zenith = zenith ? *zenith : Angle::FromDegrees(degrees);
    if (slope) {
        sight.slope = *slope;
    } else if (level && rise) {
        sight.slope = Length::FromMetres(std::hypot(level->Metres(), rise->Metres()));
    } else if (level) {
        sight.slope = Length::FromMetres(level->Metres() / std::sin(degrees / kDegrees));
    } else {
        sight.slope = *Length::Read("0.000", LengthIn::Metres);
    }
}

std::string FieldText(std::string_view text) {
    std::string out = CommentText(text);
    for (char& c : out) {
        if (c == ',' || c == '=') c = '_';
    }
    const std::size_t first = out.find_first_not_of(' ');
    if (first == std::string::npos) return {};
    return out.substr(first, out.find_last_not_of(' ') - first + 1);
}

std::string CommentText(std::string_view bytes) {
    std::string out = LineToUtf8(bytes);
    for (char& c : out) {
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7F) c = ' ';
    }
    return out;
}

NeutralWriter::NeutralWriter(OutputUnits units, std::string tag, std::string name, Sink record,
                             Sink message)
    : units_(units),
      tag_(std::move(tag)),
      name_(std::move(name)),
      record_(std::move(record)),
      message_(std::move(message)) {}

void NeutralWriter::Prove() {
    if (proven_ || refused_) return;
    proven_ = true;
    for (const std::string& text : held_) Out(text);
    held_.clear();
}

void NeutralWriter::Record(std::string text) {
    if (refused_) return;
    if (proven_) {
        Out(text);
    } else {
        held_.push_back(std::move(text));
    }
}

void NeutralWriter::Out(const std::string& text) {
    if (!started_) {
        started_ = true;
        record_(kHeader);
        record_(units_.UnitRecord());
    }
    record_(text);
}

void NeutralWriter::Comment(std::string_view text) {
    std::string comment = CommentText(text);
    comment.erase(comment.find_last_not_of(' ') + 1);
    Record("# " + comment.substr(std::min(comment.size(), comment.find_first_not_of(' '))));
}

void NeutralWriter::Unread(long line, std::string_view bytes) {
    if (refused_) return;
    if (++unread_ <= kLinesNamed)
        unread_lines_ += (unread_ == 1 ? "" : ", ") + std::to_string(line);
    std::string text = CommentText(bytes);
    text.erase(text.find_last_not_of(' ') + 1);
    Record("# " + tag_ + " LINE " + std::to_string(line) + " NOT READ: " + Printable(text, kShown));
}

std::string NeutralWriter::LengthText(const std::optional<Length>& length) const {
    return length ? length->Text(units_.length) : Fixed(kNoValue, 3);
}

void NeutralWriter::Station(const std::string& id, const std::optional<Length>& height,
                            const std::string& code) {
    if (!id.empty()) station_seen_ = true;
    std::string record = "STN ID=" + id;
    if (height) record += Field("HI", height->Text(units_.length));
    Record(record + Field("CO", code));
}

void NeutralWriter::Xyz(const std::string& id, const Coordinates& at) {
    Record("XYZ ID=" + id + Field("E", LengthText(at.east)) + Field("N", LengthText(at.north)) +
           Field("H", LengthText(at.height)));
}

void NeutralWriter::Point(const std::string& id, const Coordinates& at, const std::string& code) {
    Record("PT ID=" + id + Field("E", LengthText(at.east)) + Field("N", LengthText(at.north)) +
           Field("H", LengthText(at.height)) + Field("CO", code));
}

void NeutralWriter::Observe(const Observation& observation) {
    if (!station_seen_) observed_before_station_ = true;
    std::string record = (observation.back_sight ? "BS ID=" : "SS ID=") + observation.id +
                         Field("HA", observation.horizontal.Text(units_.angle)) +
                         Field("VA", observation.zenith.Text(units_.angle)) +
                         Field("SD", observation.slope.Text(units_.length));
    if (observation.target_height) record += Field("HT", LengthText(observation.target_height));
    record += Field("CO", observation.code);
    if (observation.horizontal_distance)
        record += Field("HD", LengthText(observation.horizontal_distance));
    if (observation.height_difference)
        record += Field("VD", LengthText(observation.height_difference));
    Record(record);
}

void NeutralWriter::BackBearing(const std::string& id, const std::optional<Angle>& bearing,
                                const std::optional<Angle>& reading) {
    std::string record = "BKB ID=" + id;
    if (bearing) record += Field("BRG", bearing->Text(units_.angle));
    if (reading) record += Field("HA", reading->Text(units_.angle));
    Record(record);
}

void NeutralWriter::InstrumentHeight(const Length& height) {
    Record("INSHT " + height.Text(units_.length));
}

void NeutralWriter::TargetHeight(const Length& height) {
    Record("TARGETHT " + height.Text(units_.length));
}

void NeutralWriter::Message(const std::string& text) {
    if (proven_) message_(text);
}

void NeutralWriter::NotFormat() {
    if (refused_) return;
    refused_ = true;
    held_.clear();
    unread_ = 0;
    unread_lines_.clear();
    message_("The data are not " + name_ + ": no " + tag_ + " record was found in them.");
}

void NeutralWriter::Finish() {
    if (!proven_ && !held_.empty()) NotFormat();
    if (observed_before_station_ && !refused_) {
        message_(
            "The data hold observations before any station with a name; they are reduced only "
            "once a STN record with a name stands before them.");
    }
    if (unread_ > 0) {
        message_(std::to_string(unread_) + (unread_ == 1 ? " line" : " lines") + " of the " + tag_ +
                 " data could not be read (" + (unread_ == 1 ? "line " : "lines ") + unread_lines_ +
                 (unread_ > kLinesNamed ? ", ..." : "") +
                 "); they stand as comments that name their lines.");
    }
}

}  // namespace sxn
