#include "GtsTranslator.h"

#include "Text.h"

namespace {

constexpr char kStx = 0x02;
constexpr char kEtx = 0x03;
// A block ends with its number and sum, four digits, before the ETX.
constexpr std::size_t kBlockTail = 4;
// No record of the format comes near this; longer ones are noise.
constexpr std::size_t kLongestRecord = 200;

bool AllDigits(std::string_view text) {
    return !text.empty() && text.find_first_not_of("0123456789") == std::string_view::npos;
}

// Digits with an implied point `decimals` places from the right, as a decimal number.
std::string Decimal(std::string_view sign, std::string_view digits, std::size_t decimals) {
    return std::string(sign) + std::string(digits.substr(0, digits.size() - decimals)) + "." +
           std::string(digits.substr(digits.size() - decimals));
}

}  // namespace

bool GtsTranslator::Line(const sxn::RawLine& line) {
    std::string_view data = line.bytes;
    if (!data.empty() && data.front() == kStx) data.remove_prefix(1);
    if (!data.empty() && data.back() == kEtx) {
        data.remove_suffix(1);
        data.remove_suffix(std::min(kBlockTail, data.size()));
    }
    bool read = true;
    for (const char c : data) {
        if (c == '_') {
            read = EndRecord() && read;
            in_record_ = true;
            record_line_ = line.number;
        } else if (in_record_ && record_.size() <= kLongestRecord) {
            record_ += c;
        }
    }
    if (!in_record_ && !sxn::Trim(data).empty()) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return read;
}

void GtsTranslator::Finish() {
    EndRecord();
    PutTarget();
    PutStation();
}

bool GtsTranslator::EndRecord() {
    if (!in_record_) return true;
    // The last block is filled up with blanks.
    const std::string text = record_.substr(0, record_.find_last_not_of(' ') + 1);
    record_.clear();
    in_record_ = false;
    if (text.empty()) return true;
    const char kind = text.front();
    const std::string_view value = std::string_view(text).substr(1);
    bool read = true;
    if (text.size() > kLongestRecord) {
        read = false;
    } else if (kind == '\'') {
        PutTarget();
        PutStation();
        station_ = Station{sxn::FieldText(value), "", std::nullopt};
    } else if (kind == '(' && station_) {
        station_->code = sxn::FieldText(value);
    } else if (kind == ')' && station_) {
        station_->height = sxn::Length::Read(value, lengths_);
        read = station_->height.has_value();
    } else if (kind == '+') {
        PutTarget();
        PutStation();
        target_ = Target{sxn::FieldText(value), "", std::nullopt};
    } else if (kind == ' ' && target_) {
        read = Measurement(value);
    } else if (kind == '*' && target_) {
        target_->code = sxn::FieldText(value);
    } else if (kind == ',') {
        target_height_ = sxn::Length::Read(value, lengths_);
        read = target_height_.has_value();
    } else {
        out_.Comment("GTS _" + text);
    }
    if (!read) {
        out_.Unread(record_line_, "_" + text);
        return false;
    }
    return true;
}

bool GtsTranslator::Measurement(std::string_view text) {
    // ?+00043575m0970930+1317260g+00043530...
    if (text.size() < 36 || text[0] != '?') return false;
    const char length_unit = text[10];
    const char angle_unit = text[26];
    const bool signs = (text[1] == '+' || text[1] == '-') && (text[18] == '+' || text[18] == '-') &&
                       (text[27] == '+' || text[27] == '-');
    if (!signs || !AllDigits(text.substr(2, 8)) || !AllDigits(text.substr(11, 7)) ||
        !AllDigits(text.substr(19, 7)) || !AllDigits(text.substr(28, 8)) ||
        (length_unit != 'm' && length_unit != 'f') || (angle_unit != 'g' && angle_unit != 'd'))
        return false;
    lengths_ = length_unit == 'm' ? sxn::LengthIn::Metres : sxn::LengthIn::Feet;
    const sxn::LengthIn lengths = lengths_;
    const sxn::AngleIn angles = angle_unit == 'g' ? sxn::AngleIn::Gons : sxn::AngleIn::Dms;
    const auto slope = sxn::Length::Read(Decimal(text.substr(1, 1), text.substr(2, 8), 3), lengths);
    const auto zenith = sxn::Angle::Read(Decimal("", text.substr(11, 7), 4), angles);
    const auto horizontal =
        sxn::Angle::Read(Decimal(text.substr(18, 1), text.substr(19, 7), 4), angles);
    const auto level =
        sxn::Length::Read(Decimal(text.substr(27, 1), text.substr(28, 8), 3), lengths);
    if (!slope || !zenith || !horizontal || !level) return false;
    sxn::Observation observation;
    observation.id = target_->id;
    observation.slope = *slope;
    observation.zenith = *zenith;
    observation.horizontal = *horizontal;
    observation.horizontal_distance = level;
    target_->observation = observation;
    out_.Prove();
    return true;
}

void GtsTranslator::PutStation() {
    if (!station_) return;
    out_.Station(station_->id, station_->height, station_->code);
    station_.reset();
}

void GtsTranslator::PutTarget() {
    if (!target_) return;
    if (target_->observation) {
        target_->observation->code = target_->code;
        target_->observation->target_height = target_height_;
        out_.Observe(*target_->observation);
    } else {
        out_.Comment("GTS POINT " + target_->id + " WITHOUT MEASUREMENT");
    }
    target_.reset();
}
