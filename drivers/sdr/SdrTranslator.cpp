#include "SdrTranslator.h"

#include "Text.h"

namespace {

constexpr std::size_t kDescriptionWidth = 16;

// A point name: trimmed, and without the zeros that pad a name of digits.
std::string PointName(std::string_view text) {
    text = sxn::Trim(text);
    if (!text.empty() && text.find_first_not_of("0123456789") == std::string_view::npos) {
        const std::size_t first = text.find_first_not_of('0');
        text = first == std::string_view::npos ? "0" : text.substr(first);
    }
    return sxn::FieldText(text);
}

}  // namespace

class SdrTranslator::Columns {
  public:
    Columns(std::string_view line, std::size_t name_width, std::size_t number_width)
        : line_(line), name_width_(name_width), number_width_(number_width) {}

    std::string Name() { return PointName(Take(name_width_)); }
    std::string_view Number() { return sxn::Trim(Take(number_width_)); }
    std::string Description() { return sxn::FieldText(Take(kDescriptionWidth)); }
    std::string Text() { return sxn::FieldText(Take(kDescriptionWidth)); }
    /// False once a field was asked for that the line is too short to hold.
    bool Whole() const { return whole_; }

  private:
    std::string_view Take(std::size_t width) {
        if (at_ >= line_.size()) {
            whole_ = false;
            return {};
        }
        const std::string_view field = line_.substr(at_, width);
        at_ += width;
        return field;
    }

    std::string_view line_;
    std::size_t name_width_;
    std::size_t number_width_;
    std::size_t at_ = 4;
    bool whole_ = true;
};

bool SdrTranslator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    if (sxn::Trim(text).empty()) return true;  // the STX that opens a transfer
    const std::string_view type = std::string_view(text).substr(0, 2);
    const bool digits =
        text.size() >= 4 && type.find_first_not_of("0123456789") == std::string_view::npos;
    if (!digits || !Record(type, text)) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return true;
}

bool SdrTranslator::Record(std::string_view type, std::string_view line) {
    Columns columns(line, name_width_, number_width_);
    bool read = true;
    bool comment = true;
    if (type == "00") {
        Header(line);
    } else if (type == "01") {
        from_horizon_ = line.size() > 50 && line[50] == '2';
    } else if (type == "02") {
        read = Station(columns);
        comment = false;
    } else if (type == "03") {
        const auto height = sxn::Length::Read(columns.Number(), length_unit_);
        read = height.has_value();
        if (read) out_.TargetHeight(*height);
        comment = false;
    } else if (type == "07") {
        read = BackSight(columns);
        comment = false;
    } else if (type == "08") {
        const std::string_view derivation = line.substr(2, 2);
        const bool given = derivation == "KI" || derivation == "UP";
        read = Coordinates(columns, given);
        comment = given;
    } else if (type == "09") {
        read = Observation(columns);
        comment = false;
    } else if (type == "10") {
        out_.Record("JOB " + columns.Text());
    }
    if (!read) return false;
    if (type == "00" || type == "02" || type == "08" || type == "09") out_.Prove();
    if (comment) out_.Comment(line);
    return true;
}

void SdrTranslator::Header(std::string_view line) {
    if (sxn::StartsWith(line.substr(4), "SDR2")) {
        name_width_ = 4;
        number_width_ = 10;
    }
    if (line.size() < 45) return;
    if (line[40] == '2') angle_unit_ = sxn::AngleIn::Gons;
    if (line[40] == '4') angle_unit_ = sxn::AngleIn::Mils;
    if (line[41] == '2') length_unit_ = sxn::LengthIn::Feet;
    east_first_ = line[44] == '2';
}

bool SdrTranslator::ReadCoordinates(Columns& columns, sxn::Coordinates& at) const {
    std::optional<sxn::Length>* order[] = {&at.north, &at.east, &at.height};
    if (east_first_) std::swap(order[0], order[1]);
    for (std::optional<sxn::Length>* value : order) {
        const std::string_view text = columns.Number();
        if (text.empty()) continue;
        *value = sxn::Length::Read(text, length_unit_);
        if (!*value) return false;
    }
    return columns.Whole();
}

bool SdrTranslator::Station(Columns& columns) {
    station_ = columns.Name();
    back_point_.clear();
    sxn::Coordinates at;
    if (station_.empty() || !ReadCoordinates(columns, at)) return false;
    const std::string_view height_text = columns.Number();
    const std::string code = columns.Description();
    std::optional<sxn::Length> height;
    if (!height_text.empty() && !(height = sxn::Length::Read(height_text, length_unit_)))
        return false;
    out_.Station(station_, height, code);
    if (at.east || at.north || at.height) out_.Xyz(station_, at);
    return true;
}

bool SdrTranslator::BackSight(Columns& columns) {
    const std::string station = columns.Name();
    const std::string back = columns.Name();
    const std::string_view azimuth_text = columns.Number();
    const std::string_view reading_text = columns.Number();
    std::optional<sxn::Angle> azimuth;
    std::optional<sxn::Angle> reading;
    if (!azimuth_text.empty() && !(azimuth = sxn::Angle::Read(azimuth_text, angle_unit_)))
        return false;
    if (!reading_text.empty() && !(reading = sxn::Angle::Read(reading_text, angle_unit_)))
        return false;
    SetUp(station);
    back_point_ = back;
    out_.BackBearing(back_point_, azimuth, reading);
    return true;
}

void SdrTranslator::SetUp(const std::string& station) {
    if (station == station_) return;
    station_ = station;
    back_point_.clear();
    out_.Station(station_, std::nullopt, "");
}

bool SdrTranslator::Coordinates(Columns& columns, bool given) {
    const std::string id = columns.Name();
    sxn::Coordinates at;
    if (id.empty() || !ReadCoordinates(columns, at)) return false;
    if (given) {
        out_.Xyz(id, at);
    } else {
        out_.Point(id, at, columns.Description());
    }
    return true;
}

bool SdrTranslator::Observation(Columns& columns) {
    const std::string station = columns.Name();
    sxn::Observation observation;
    observation.id = columns.Name();
    const auto slope = sxn::Length::Read(columns.Number(), length_unit_);
    const auto vertical = sxn::Angle::Read(columns.Number(), angle_unit_);
    const auto horizontal = sxn::Angle::Read(columns.Number(), angle_unit_);
    observation.code = columns.Description();
    if (station.empty() || observation.id.empty() || !slope || !vertical || !horizontal)
        return false;
    SetUp(station);
    observation.slope = *slope;
    observation.zenith =
        from_horizon_ ? sxn::Angle::FromDegrees(90.0 - vertical->Degrees()) : *vertical;
    observation.horizontal = *horizontal;
    observation.back_sight = !back_point_.empty() && observation.id == back_point_;
    out_.Observe(observation);
    return true;
}
