#include "AreTranslator.h"

#include <charconv>

#include "Text.h"

namespace {

// The labels that are read.
enum Label {
    kInformation = 0,
    kStation = 2,
    kInstrumentHeight = 3,
    kCode = 4,
    kPoint = 5,
    kTargetHeight = 6,
    kHorizontal = 7,
    kZenith = 8,
    kSlope = 9,
    kRise = 10,
    kLevel = 11,
    kBackBearing = 21,
    kNorth = 37,
    kEast = 38,
    kElevation = 39,
    kBackPoint = 62,
};

std::optional<sxn::Length> ReadLength(std::string_view text) {
    return sxn::Length::Read(text, sxn::LengthIn::Metres);
}

std::optional<sxn::Angle> ReadAngle(std::string_view text) {
    return sxn::Angle::Read(text, sxn::AngleIn::Gons);
}

}  // namespace

bool AreTranslator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    const std::string_view trimmed = sxn::Trim(text);
    const std::size_t equals = trimmed.find('=');
    int label = -1;
    const bool labelled = equals != std::string_view::npos && equals > 0 &&
                          std::from_chars(trimmed.data(), trimmed.data() + equals, label).ptr ==
                              trimmed.data() + equals;
    if (!labelled || !Label(label, sxn::Trim(trimmed.substr(equals + 1)))) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return true;
}

std::optional<sxn::Length>* AreTranslator::CoordinateOf(int label) {
    sxn::Coordinates& at = group_->in_back_point ? group_->back_at : group_->at;
    return label == kNorth ? &at.north : label == kEast ? &at.east : &at.height;
}

bool AreTranslator::Label(int label, std::string_view value) {
    const bool station = group_ && group_->station;
    const bool point = group_ && !group_->station;
    switch (label) {
        case kInformation:
            PutGroup();
            out_.Comment("ARE 0=" + std::string(value));
            return true;
        case kStation:
        case kPoint:
            PutGroup();
            group_ = Group();
            group_->station = label == kStation;
            group_->id = sxn::FieldText(value);
            out_.Prove();
            return !group_->id.empty();
        case kTargetHeight:
            return sxn::ReadInto(target_height_, value, ReadLength);
        case kInstrumentHeight:
            if (station) return sxn::ReadInto(group_->instrument_height, value, ReadLength);
            if (const auto height = ReadLength(value)) {
                out_.InstrumentHeight(*height);
                return true;
            }
            return false;
        case kNorth:
        case kEast:
        case kElevation:
            if (group_) return sxn::ReadInto(*CoordinateOf(label), value, ReadLength);
            break;
        case kBackPoint:
            if (station) {
                group_->back_point = sxn::FieldText(value);
                group_->in_back_point = true;
                return true;
            }
            break;
        case kBackBearing:
            if (station) return sxn::ReadInto(group_->back_bearing, value, ReadAngle);
            break;
        case kCode:
            if (point) {
                group_->code = sxn::FieldText(value);
                return true;
            }
            break;
        case kHorizontal:
            if (point) return sxn::ReadInto(group_->horizontal, value, ReadAngle);
            break;
        case kZenith:
            if (point) return sxn::ReadInto(group_->zenith, value, ReadAngle);
            break;
        case kSlope:
            if (point) return sxn::ReadInto(group_->slope, value, ReadLength);
            break;
        case kRise:
            if (point) return sxn::ReadInto(group_->rise, value, ReadLength);
            break;
        case kLevel:
            if (point) return sxn::ReadInto(group_->level, value, ReadLength);
            break;
        default:
            break;
    }
    const std::string unmapped = " " + std::to_string(label) + "=" + std::string(value);
    if (group_) {
        group_->unmapped += unmapped;
    } else {
        out_.Comment("ARE" + unmapped);
    }
    return true;
}

void AreTranslator::PutGroup() {
    if (!group_) return;
    const Group& group = *group_;
    const auto any = [](const sxn::Coordinates& at) { return at.east || at.north || at.height; };
    if (group.station) {
        out_.Station(group.id, group.instrument_height, "");
        if (any(group.at)) out_.Xyz(group.id, group.at);
        if (!group.back_point.empty() && any(group.back_at))
            out_.Xyz(group.back_point, group.back_at);
        if (!group.back_point.empty() || group.back_bearing)
            out_.BackBearing(group.back_point, group.back_bearing, group.back_bearing);
    } else if (group.horizontal) {
        if (any(group.at)) out_.Point(group.id, group.at, group.code);
        sxn::Observation observation;
        observation.id = group.id;
        observation.code = group.code;
        observation.horizontal = *group.horizontal;
        observation.target_height = target_height_;
        observation.horizontal_distance = group.level;
        observation.height_difference = group.rise;
        sxn::CompleteSight(observation, group.zenith, group.slope, group.level, group.rise);
        out_.Observe(observation);
    } else {
        out_.Xyz(group.id, group.at);
        if (!group.code.empty()) out_.Comment("ARE " + group.id + " CODE " + group.code);
    }
    if (!group.unmapped.empty()) out_.Comment("ARE " + group.id + ":" + group.unmapped);
    group_.reset();
}
