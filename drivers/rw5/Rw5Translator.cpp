#include "Rw5Translator.h"

#include "Text.h"

Rw5Translator::Rw5Translator(sxn::NeutralWriter& out)
    : LineTranslator(out), length_unit_(sxn::SameLength(out.Units().length)) {}

bool Rw5Translator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    const std::string_view trimmed = sxn::Trim(text);
    Rw5Record record;
    if (sxn::StartsWith(trimmed, "--")) {
        // Collectors write the mode record at the head of a file as a note too; its units hold.
        if (record.Read(trimmed.substr(2)) && record.Type() == "MO") Mode(record);
        out_.Comment(trimmed);
        return true;
    }
    if (!record.Read(trimmed) || !Record(record, trimmed)) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return true;
}

void Rw5Translator::Finish() {
    if (station_) PutStation(instrument_height_);
}

bool Rw5Translator::Record(const Rw5Record& record, std::string_view line) {
    const std::string& type = record.Type();
    if (type != "LS" && station_) PutStation(instrument_height_);
    bool read = true;
    if (type == "MO") {
        read = Mode(record);
    } else if (type == "JB") {
        if (record.Has("NM")) out_.Record("JOB " + sxn::FieldText(record.Value("NM")));
        if (record.Has("DT")) out_.Record("DATE " + sxn::FieldText(record.Value("DT")));
    } else if (type == "OC") {
        read = Occupy(record);
    } else if (type == "LS") {
        read = LineOfSight(record);
    } else if (type == "BK") {
        read = BackSight(record);
    } else if (type == "BD" || type == "BR") {
        read = Observe(record, true);
    } else if (type == "FD" || type == "FR" || type == "SS" || type == "TR") {
        read = Observe(record, false);
    } else if (type == "SP") {
        read = Store(record);
    } else {
        // A record of the format that has no neutral counterpart.
        out_.Comment(line);
        return true;
    }
    if (!read) return false;
    out_.Prove();
    if (type == "MO" || type == "JB" || (type == "SP" && !record.Note().empty()))
        out_.Comment(line);
    return true;
}

bool Rw5Translator::Mode(const Rw5Record& record) {
    const std::string_view lengths = record.Value("UN");
    const std::string_view angles = record.Value("AU");
    double scale = 0.0;
    if ((record.Has("UN") && lengths != "0" && lengths != "1" && lengths != "2") ||
        (record.Has("AU") && angles != "0" && angles != "1") ||
        (record.Has("SF") && !sxn::ReadNumber(record.Value("SF"), scale)))
        return false;
    if (record.Has("UN")) {
        length_unit_ = lengths == "1"   ? sxn::LengthIn::Metres
                       : lengths == "2" ? sxn::LengthIn::UsFeet
                                        : sxn::LengthIn::Feet;
    }
    if (record.Has("AU")) angle_unit_ = angles == "1" ? sxn::AngleIn::Gons : sxn::AngleIn::Dms;
    south_azimuths_ = record.Value("AD") == "1";
    if (record.Has("SF")) out_.Record("SCALE " + std::string(sxn::Trim(record.Value("SF"))));
    return true;
}

bool Rw5Translator::Occupy(const Rw5Record& record) {
    PendingStation station;
    station.id = sxn::FieldText(record.Value("OP"));
    station.code = sxn::FieldText(record.Note());
    station.has_coordinates = record.Has("N") || record.Has("E") || record.Has("EL");
    if (station.id.empty() || !ReadCoordinates(record, station.at)) return false;
    station_ = std::move(station);
    back_azimuth_.reset();
    back_circle_.reset();
    return true;
}

void Rw5Translator::PutStation(const std::optional<sxn::Length>& height) {
    out_.Station(station_->id, height, station_->code);
    if (station_->has_coordinates) out_.Xyz(station_->id, station_->at);
    station_.reset();
    instrument_height_ = height;
}

bool Rw5Translator::LineOfSight(const Rw5Record& record) {
    std::optional<sxn::Length> instrument;
    std::optional<sxn::Length> target;
    if (record.Has("HI") && !(instrument = ReadLength(record.Value("HI")))) return false;
    if (record.Has("HR") && !(target = ReadLength(record.Value("HR")))) return false;
    if (target) target_height_ = target;
    if (!instrument) return true;
    if (station_) {
        PutStation(instrument);
    } else if (!instrument_height_ || instrument_height_->Metres() != instrument->Metres()) {
        out_.InstrumentHeight(*instrument);
        instrument_height_ = instrument;
    }
    return true;
}

bool Rw5Translator::BackSight(const Rw5Record& record) {
    std::optional<sxn::Angle> azimuth;
    std::optional<sxn::Angle> circle;
    if (!record.Value("BS").empty() && !(azimuth = ReadAzimuth(record.Value("BS")))) return false;
    if (!record.Value("BC").empty() && !(circle = ReadAngle(record.Value("BC")))) return false;
    out_.BackBearing(sxn::FieldText(record.Value("BP")), azimuth, circle);
    back_azimuth_ = azimuth;
    back_circle_ = circle;
    return true;
}

bool Rw5Translator::Observe(const Rw5Record& record, bool back_sight) {
    sxn::Observation observation;
    observation.id = sxn::FieldText(record.Value("FP"));
    observation.code = sxn::FieldText(record.Note());
    observation.back_sight = back_sight;
    observation.target_height = target_height_;
    if (observation.id.empty()) return false;

    std::optional<sxn::Angle> horizontal;
    if (record.Has("AR")) {
        horizontal = ReadAngle(record.Value("AR"));
    } else if (const auto left = ReadAngle(record.Value("AL"))) {
        horizontal = sxn::Angle::FromDegrees(sxn::Turn(360.0 - left->Degrees()));
    } else if (const auto right = ReadAngle(record.Value("DR"))) {
        horizontal = sxn::Angle::FromDegrees(sxn::Turn(180.0 + right->Degrees()));
    } else if (const auto deflection = ReadAngle(record.Value("DL"))) {
        horizontal = sxn::Angle::FromDegrees(sxn::Turn(180.0 - deflection->Degrees()));
    } else if (const auto azimuth = ReadAzimuth(record.Value("AZ")); azimuth && back_azimuth_) {
        const double circle = back_circle_ ? back_circle_->Degrees() : 0.0;
        horizontal = sxn::Angle::FromDegrees(
            sxn::Turn(circle + azimuth->Degrees() - back_azimuth_->Degrees()));
    }
    if (!horizontal) return false;
    observation.horizontal = *horizontal;

    std::optional<sxn::Length> slope;
    std::optional<sxn::Length> level;
    std::optional<sxn::Length> rise;
    std::optional<sxn::Angle> zenith;
    if ((record.Has("SD") && !(slope = ReadLength(record.Value("SD")))) ||
        (record.Has("HD") && !(level = ReadLength(record.Value("HD")))) ||
        (record.Has("CE") && !(rise = ReadLength(record.Value("CE")))) ||
        (record.Has("ZE") && !(zenith = ReadAngle(record.Value("ZE")))))
        return false;
    if (!zenith && record.Has("VA")) {
        const auto vertical = ReadAngle(record.Value("VA"));
        if (!vertical) return false;
        zenith = sxn::Angle::FromDegrees(90.0 - vertical->Degrees());
    }
    sxn::CompleteSight(observation, zenith, slope, level, rise);
    out_.Observe(observation);
    return true;
}

bool Rw5Translator::Store(const Rw5Record& record) {
    const std::string id = sxn::FieldText(record.Value("PN"));
    sxn::Coordinates at;
    if (id.empty() || !ReadCoordinates(record, at)) return false;
    out_.Xyz(id, at);
    return true;
}

bool Rw5Translator::ReadCoordinates(const Rw5Record& record, sxn::Coordinates& at) const {
    const std::pair<const char*, std::optional<sxn::Length>*> values[] = {
        {"E", &at.east}, {"N", &at.north}, {"EL", &at.height}};
    for (const auto& [code, value] : values) {
        if (record.Value(code).empty()) continue;
        *value = ReadLength(record.Value(code));
        if (!*value) return false;
    }
    return true;
}

std::optional<sxn::Length> Rw5Translator::ReadLength(std::string_view text) const {
    return sxn::Length::Read(text, length_unit_);
}

std::optional<sxn::Angle> Rw5Translator::ReadAngle(std::string_view text) const {
    if (text.empty()) return std::nullopt;
    return sxn::Angle::Read(text, angle_unit_);
}

std::optional<sxn::Angle> Rw5Translator::ReadAzimuth(std::string_view text) const {
    const auto azimuth = ReadAngle(text);
    if (!azimuth || !south_azimuths_) return azimuth;
    return sxn::Angle::FromDegrees(sxn::Turn(azimuth->Degrees() + 180.0));
}
