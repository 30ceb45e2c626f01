#include "ZeissTranslator.h"

#include "Text.h"

struct ZeissTranslator::Values {
    sxn::Coordinates at;
    std::optional<sxn::Angle> horizontal;
    std::optional<sxn::Angle> zenith;
    std::optional<sxn::Length> slope;
    std::optional<sxn::Length> level;
    std::optional<sxn::Length> rise;
    std::optional<sxn::Length> target_height;
    std::optional<sxn::Length> instrument_height;
    std::string scale;
    std::optional<sxn::Angle> orientation;
};

namespace {

std::optional<sxn::Length> ReadLength(const ZeissBlock& block) {
    if (block.unit.empty() || block.unit == "m")
        return sxn::Length::Read(block.value, sxn::LengthIn::Metres);
    if (block.unit == "ft") return sxn::Length::Read(block.value, sxn::LengthIn::Feet);
    return std::nullopt;
}

std::optional<sxn::Angle> ReadAngle(const ZeissBlock& block) {
    if (block.unit.empty() || block.unit == "grd" || block.unit == "gon")
        return sxn::Angle::Read(block.value, sxn::AngleIn::Gons);
    if (block.unit == "deg") return sxn::Angle::Read(block.value, sxn::AngleIn::Degrees);
    return std::nullopt;
}

}  // namespace

bool ZeissTranslator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    const std::string_view trimmed = sxn::Trim(text);
    if (trimmed == "END") {
        out_.Comment(trimmed);
        return true;
    }
    ZeissLine zeiss;
    Values values;
    bool mapped = true;
    // Values of no point (a point line without a number) other than the set-up's own.
    const auto pointless = [&] {
        return !zeiss.IsText() && zeiss.Name().empty() &&
               (values.at.north || values.at.east || values.at.height || values.horizontal ||
                values.slope || values.level);
    };
    if (!zeiss.Read(text) || !Read(zeiss, values, mapped) || pointless() ||
        (!zeiss.IsText() && !zeiss.Name().empty() && !Point(zeiss, values))) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    out_.Prove();
    Settings(values);
    const bool station_height_alone =
        zeiss.Code() == "S" && !values.at.north && !values.at.east && values.at.height;
    if (zeiss.IsText() || !mapped || station_height_alone) out_.Comment(trimmed);
    return true;
}

bool ZeissTranslator::Read(const ZeissLine& line, Values& values, bool& mapped) const {
    for (const ZeissBlock& block : line.Blocks()) {
        const std::string& id = block.identifier;
        bool read = true;
        if (id == "X") {
            read = sxn::ReadInto(values.at.north, block, ReadLength);
        } else if (id == "Y") {
            read = sxn::ReadInto(values.at.east, block, ReadLength);
        } else if (id == "Z") {
            read = sxn::ReadInto(values.at.height, block, ReadLength);
        } else if (id == "Hz") {
            read = sxn::ReadInto(values.horizontal, block, ReadAngle);
        } else if (id == "V1") {
            read = sxn::ReadInto(values.zenith, block, ReadAngle);
        } else if (id == "V2") {
            read = sxn::ReadInto(values.zenith, block, ReadAngle);
            if (read) values.zenith = sxn::Angle::FromDegrees(90.0 - values.zenith->Degrees());
        } else if (id == "SD") {
            read = sxn::ReadInto(values.slope, block, ReadLength);
        } else if (id == "HD") {
            read = sxn::ReadInto(values.level, block, ReadLength);
        } else if (id == "h") {
            read = sxn::ReadInto(values.rise, block, ReadLength);
        } else if (id == "th") {
            read = sxn::ReadInto(values.target_height, block, ReadLength);
        } else if (id == "ih") {
            read = sxn::ReadInto(values.instrument_height, block, ReadLength);
        } else if (id == "m") {
            double scale = 0.0;
            read = sxn::ReadNumber(block.value, scale);
            values.scale = block.value;
        } else if (id == "Om") {
            read = sxn::ReadInto(values.orientation, block, ReadAngle);
        } else {
            mapped = false;
        }
        if (!read) return false;
    }
    return true;
}

void ZeissTranslator::Settings(const Values& values) {
    if (values.target_height) out_.TargetHeight(*values.target_height);
    if (values.instrument_height) out_.InstrumentHeight(*values.instrument_height);
    if (!values.scale.empty()) pending_scale_ = values.scale;
    if (values.orientation) pending_orientation_ = values.orientation;
    if (station_open_) PutSetUp();
}

bool ZeissTranslator::Point(const ZeissLine& line, const Values& values) {
    const std::string id = sxn::FieldText(line.Name());
    const std::string code = sxn::FieldText(line.Code());
    const bool placed = values.at.north || values.at.east;
    if (code == "S") {
        out_.Station(id, std::nullopt, "");
        if (placed) out_.Xyz(id, values.at);
        station_open_ = true;
        PutSetUp();
        return true;
    }
    if (code == "A") {
        out_.Xyz(id, values.at);
        return true;
    }
    if (placed) out_.Point(id, values.at, code);
    if (!values.horizontal) return placed || values.at.height;
    PutSetUp();
    station_open_ = false;
    sxn::Observation observation;
    observation.id = id;
    observation.code = code;
    observation.horizontal = *values.horizontal;
    observation.horizontal_distance = values.level;
    observation.height_difference = values.rise;
    sxn::CompleteSight(observation, values.zenith, values.slope, values.level, values.rise);
    out_.Observe(observation);
    return true;
}

void ZeissTranslator::PutSetUp() {
    if (!pending_scale_.empty()) out_.Record("SCALE " + pending_scale_);
    if (pending_orientation_)
        out_.Record("SWING " + pending_orientation_->Text(out_.Units().angle));
    pending_scale_.clear();
    pending_orientation_.reset();
}
