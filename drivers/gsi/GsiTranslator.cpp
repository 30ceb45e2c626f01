#include "GsiTranslator.h"

#include <array>
#include <cmath>
#include <utility>

namespace {

constexpr const char* kHeader = "#VERSION-1.0 NEUTRAL FILE";
constexpr double kNoHeight = -10000.0;
constexpr double kPi = 3.14159265358979323846;

bool IsAngleWord(int index) {
    return index == 21 || index == 22;
}

bool IsLengthWord(int index) {
    return (index >= 31 && index <= 33) || (index >= 81 && index <= 88);
}

bool IsTextWord(int index) {
    return index == 11 || (index >= 41 && index <= 49) || (index >= 71 && index <= 79);
}

// Words that the records have no place for and that say nothing the reduction needs.
bool IsLeftOut(int index) {
    return index == 12 || index == 13 || index == 17 || index == 18 || index == 19 || index == 51 ||
           index == 58 || index == 59;
}

std::string Field(const char* key, const std::string& value) {
    return std::string(",") + key + "=" + value;
}

}  // namespace

struct GsiTranslator::Values {
    std::array<const GsiWord*, 100> words{};
    std::array<GsiAngle, 100> angles{};
    std::array<GsiLength, 100> lengths{};
    std::vector<const GsiWord*> unused;

    bool Has(int index) const { return words[static_cast<std::size_t>(index)] != nullptr; }
    const GsiWord& Word(int index) const { return *words[static_cast<std::size_t>(index)]; }
    const GsiAngle& Angle(int index) const { return angles[static_cast<std::size_t>(index)]; }
    const GsiLength& Length(int index) const { return lengths[static_cast<std::size_t>(index)]; }
    bool HasAny(std::initializer_list<int> indexes) const {
        for (const int index : indexes) {
            if (Has(index)) return true;
        }
        return false;
    }
};

GsiTranslator::GsiTranslator(sxn::OutputUnits units, Sink record, Sink message)
    : units_(units), record_(std::move(record)), message_(std::move(message)) {}

bool GsiTranslator::Read(const std::vector<GsiWord>& words, Values& values) const {
    for (const GsiWord& word : words) {
        const auto slot = static_cast<std::size_t>(word.index);
        if (values.words[slot] != nullptr ||
            !(IsAngleWord(word.index) || IsLengthWord(word.index) || IsTextWord(word.index) ||
              IsLeftOut(word.index))) {
            values.unused.push_back(&word);
            continue;
        }
        values.words[slot] = &word;
        if (IsAngleWord(word.index) && !ReadGsiAngle(word, values.angles[slot])) return false;
        if (IsLengthWord(word.index) && !ReadGsiLength(word, values.lengths[slot])) return false;
    }
    return true;
}

bool GsiTranslator::Block(const std::vector<GsiWord>& words, std::string_view text, long line) {
    Values values;
    const bool code_block = words.front().index == 41;
    const bool read = Read(words, values);
    const bool has_observation = values.HasAny({21, 22, 31, 32, 33});
    if (!read || (!code_block && !values.Has(11)) || (has_observation && !values.Has(21))) {
        Unreadable(text, line);
        return false;
    }
    Start();
    if (code_block) {
        CodeBlock(words);
        return true;
    }
    if (!has_observation && values.HasAny({84, 85, 86})) {
        Station(values);
    } else {
        if (values.Has(88) && values.Length(88).Text(units_.length) != instrument_height_) {
            instrument_height_ = values.Length(88).Text(units_.length);
            record_("INSHT " + instrument_height_);
        }
        const std::string code = TakeCode(values);
        if (values.HasAny({81, 82, 83})) Point(values, code);
        if (has_observation) {
            Observation(values, code);
        } else if (values.Has(87)) {
            record_("TARGETHT " + values.Length(87).Text(units_.length));
        }
    }
    std::string unused;
    for (const GsiWord* word : values.unused) {
        unused +=
            " " + std::to_string(word->index) + ":" + (word->negative ? "-" : "+") + word->data;
    }
    if (!unused.empty())
        record_("# GSI LINE " + std::to_string(line) + " WORDS NOT READ:" + unused);
    return true;
}

void GsiTranslator::CodeBlock(const std::vector<GsiWord>& words) {
    pending_code_ = GsiText(words.front());
    std::string information;
    for (std::size_t i = 1; i < words.size(); ++i) information += " " + GsiText(words[i]);
    if (!information.empty()) record_("# CODE " + pending_code_ + " INFORMATION:" + information);
}

void GsiTranslator::Station(const Values& values) {
    const std::string id = GsiText(values.Word(11));
    std::string station = "STN ID=" + id;
    if (values.Has(88)) {
        instrument_height_ = values.Length(88).Text(units_.length);
        station += Field("HI", instrument_height_);
    }
    record_(station + Field("CO", TakeCode(values)));
    station_seen_ = true;
    if (values.Has(84) || values.Has(85)) {
        record_("XYZ ID=" + id + Field("E", CoordinateText(values, 84)) +
                Field("N", CoordinateText(values, 85)) + Field("H", CoordinateText(values, 86)));
    }
}

void GsiTranslator::Point(const Values& values, const std::string& code) {
    record_("PT ID=" + GsiText(values.Word(11)) + Field("E", CoordinateText(values, 81)) +
            Field("N", CoordinateText(values, 82)) + Field("H", CoordinateText(values, 83)) +
            Field("CO", code));
}

void GsiTranslator::Observation(const Values& values, const std::string& code) {
    if (!station_seen_ && !told_no_station_) {
        told_no_station_ = true;
        message_(
            "The data hold observations before any station block; they are reduced only once a "
            "STN record stands before them.");
    }
    const sxn::LengthOut unit = units_.length;
    const double horizontal = values.Has(32) ? values.Length(32).In(unit) : 0.0;
    const double height = values.Has(33) ? values.Length(33).In(unit) : 0.0;
    double zenith = 90.0;  // degrees
    std::string zenith_text;
    if (values.Has(22)) {
        zenith = values.Angle(22).Degrees();
        zenith_text = values.Angle(22).Text(units_.angle);
    } else {
        if (values.Has(32)) zenith = std::atan2(horizontal, height) * 180.0 / kPi;
        zenith_text = sxn::AngleText(zenith, units_.angle, 6);
    }
    std::string slope_text;
    if (values.Has(31)) {
        slope_text = values.Length(31).Text(unit);
    } else if (values.Has(32) && values.Has(22)) {
        slope_text = sxn::Fixed(horizontal / std::sin(zenith * kPi / 180.0), 4);
    } else if (values.Has(32)) {
        slope_text = sxn::Fixed(std::hypot(horizontal, height), 4);
    } else {
        slope_text = sxn::Fixed(0.0, 3);
    }
    std::string record = "SS ID=" + GsiText(values.Word(11)) +
                         Field("HA", values.Angle(21).Text(units_.angle)) +
                         Field("VA", zenith_text) + Field("SD", slope_text);
    if (values.Has(87)) record += Field("HT", values.Length(87).Text(unit));
    record += Field("CO", code);
    if (values.Has(32)) record += Field("HD", values.Length(32).Text(unit));
    if (values.Has(33)) record += Field("VD", values.Length(33).Text(unit));
    record_(record);
}

std::string GsiTranslator::TakeCode(const Values& values) {
    std::string code = std::move(pending_code_);
    pending_code_.clear();
    if (code.empty() && values.Has(71)) code = GsiText(values.Word(71));
    return code;
}

std::string GsiTranslator::CoordinateText(const Values& values, int index) const {
    if (values.Has(index)) return values.Length(index).Text(units_.length);
    return sxn::Fixed(kNoHeight, 3);
}

void GsiTranslator::Unreadable(std::string_view text, long line) {
    ++unread_;
    Start();
    record_("# GSI LINE " + std::to_string(line) + " NOT READ: " + sxn::Printable(text, 180));
}

void GsiTranslator::Finish() {
    if (unread_ == 0) return;
    message_(std::to_string(unread_) + (unread_ == 1 ? " block" : " blocks") +
             " of the GSI data could not be read; they stand as comments that name their lines.");
}

void GsiTranslator::NotGsi() {
    message_("The data are not Leica GSI: no GSI word was found in them.");
}

void GsiTranslator::Start() {
    if (started_) return;
    started_ = true;
    record_(kHeader);
    record_(units_.UnitRecord());
}
