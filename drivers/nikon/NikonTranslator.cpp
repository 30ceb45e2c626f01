#include "NikonTranslator.h"

#include "Text.h"

namespace {

// The field at `at`, or empty when the record is shorter.
std::string_view At(const std::vector<std::string_view>& fields, std::size_t at) {
    return at < fields.size() ? sxn::Trim(fields[at]) : std::string_view();
}

// The fields from `at` to the end, joined again: a code may hold commas.
std::string_view Rest(std::string_view line, std::size_t at) {
    std::size_t start = 0;
    for (std::size_t i = 0; i < at && start != std::string_view::npos; ++i) {
        start = line.find(',', start);
        if (start != std::string_view::npos) ++start;
    }
    return start == std::string_view::npos ? std::string_view() : line.substr(start);
}

std::string Name(std::string_view number, std::string_view id) {
    return sxn::FieldText(number.empty() ? id : number);
}

}  // namespace

bool NikonTranslator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    const std::string_view record = sxn::Trim(text);
    const Fields fields = sxn::Split(record, ',');
    const std::string_view type = sxn::Trim(fields.front());
    const bool known = type.size() == 2 || (type.size() == 3 && type.front() == '*');
    if (!known || fields.size() < 2 || !Record(fields, record)) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return true;
}

bool NikonTranslator::Record(const Fields& fields, std::string_view line) {
    const std::string_view type = sxn::Trim(fields.front());
    bool read = true;
    bool comment = false;
    if (type.front() == '*') {
        comment = true;
    } else if (type == "CO") {
        Head(Rest(line, 1));
        comment = true;
    } else if (type == "ST") {
        read = Station(fields);
        comment = true;
    } else if (type == "F1" || type == "F2") {
        const std::string id = sxn::FieldText(At(fields, 1));
        read = Shot(fields, 2, id.empty() ? back_point_ : id, true, "");
    } else if (type == "SS") {
        read = Shot(fields, 2, sxn::FieldText(At(fields, 1)), false, Rest(line, 7));
    } else if (type == "CP" || type == "SO") {
        read = Shot(fields, 3, Name(At(fields, 1), At(fields, 2)), false, Rest(line, 8));
        comment = type == "SO";
    } else if (type == "UP" || type == "MP" || type == "RE" || type == "CC") {
        read = Coordinates(fields, type != "CC", Rest(line, 6));
        comment = type != "CC";
    } else {
        out_.Comment(line);  // a record of the format that has no neutral counterpart
        return true;
    }
    if (!read) return false;
    out_.Prove();
    if (comment) out_.Comment(line);
    return true;
}

void NikonTranslator::Head(std::string_view text) {
    const auto colon = text.find(':');
    if (colon == std::string_view::npos) return;
    const std::string_view key = sxn::Trim(text.substr(0, colon));
    const std::string_view value = sxn::Trim(text.substr(colon + 1));
    if (key == "Dist Units") {
        if (value == "Metres" || value == "Meters") length_unit_ = sxn::LengthIn::Metres;
        if (value == "Feet" || value == "Intl Feet") length_unit_ = sxn::LengthIn::Feet;
        if (value == "US Feet") length_unit_ = sxn::LengthIn::UsFeet;
    } else if (key == "Angle Units") {
        if (value == "Gons") angle_unit_ = sxn::AngleIn::Gons;
        if (value == "Degrees") angle_unit_ = sxn::AngleIn::Degrees;
        if (value == "DDDMMSS") angle_unit_ = sxn::AngleIn::Dms;
        if (value == "Mils") angle_unit_ = sxn::AngleIn::Mils;
    } else if (key == "Zero VA") {
        from_horizon_ = value == "Horizontal";
    }
}

bool NikonTranslator::Station(const Fields& fields) {
    const std::string id = Name(At(fields, 1), At(fields, 2));
    back_point_ = Name(At(fields, 3), At(fields, 4));
    std::optional<sxn::Length> height;
    std::optional<sxn::Angle> azimuth;
    std::optional<sxn::Angle> reading;
    const auto read = [](std::string_view text, auto& value, auto parse) {
        if (text.empty()) return true;
        value = parse(text);
        return value.has_value();
    };
    if (id.empty() ||
        !read(At(fields, 5), height,
              [this](std::string_view t) { return sxn::Length::Read(t, length_unit_); }) ||
        !read(At(fields, 6), azimuth,
              [this](std::string_view t) { return sxn::Angle::Read(t, angle_unit_); }) ||
        !read(At(fields, 7), reading,
              [this](std::string_view t) { return sxn::Angle::Read(t, angle_unit_); }))
        return false;
    out_.Station(id, height, "");
    if (!back_point_.empty() || azimuth || reading) out_.BackBearing(back_point_, azimuth, reading);
    return true;
}

bool NikonTranslator::Shot(const Fields& fields, std::size_t first, const std::string& id,
                           bool back_sight, std::string_view code) {
    const std::string_view target = At(fields, first);
    const std::string_view slope = At(fields, first + 1);
    const auto horizontal = sxn::Angle::Read(At(fields, first + 2), angle_unit_);
    const auto vertical = sxn::Angle::Read(At(fields, first + 3), angle_unit_);
    sxn::Observation observation;
    observation.id = id;
    observation.back_sight = back_sight;
    observation.code = sxn::FieldText(code);
    if (!horizontal || !vertical || (!back_sight && id.empty())) return false;
    observation.horizontal = *horizontal;
    observation.zenith =
        from_horizon_ ? sxn::Angle::FromDegrees(90.0 - vertical->Degrees()) : *vertical;
    if (!target.empty() && !(observation.target_height = sxn::Length::Read(target, length_unit_)))
        return false;
    const auto distance = sxn::Length::Read(slope.empty() ? "0.000" : slope, length_unit_);
    if (!distance) return false;
    observation.slope = *distance;
    out_.Observe(observation);
    return true;
}

bool NikonTranslator::Coordinates(const Fields& fields, bool given, std::string_view code) {
    const std::string id = Name(At(fields, 1), At(fields, 2));
    sxn::Coordinates at;
    const std::pair<std::size_t, std::optional<sxn::Length>*> values[] = {
        {3, &at.north}, {4, &at.east}, {5, &at.height}};
    for (const auto& [field, value] : values) {
        if (At(fields, field).empty()) continue;
        *value = sxn::Length::Read(At(fields, field), length_unit_);
        if (!*value) return false;
    }
    if (id.empty()) return false;
    if (given) {
        out_.Xyz(id, at);
    } else {
        out_.Point(id, at, sxn::FieldText(code));
    }
    return true;
}
