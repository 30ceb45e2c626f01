#include "Tps1200Translator.h"

#include "Text.h"

namespace {

bool IsRule(std::string_view line) {
    return line.find_first_not_of("-+ ") == std::string_view::npos;
}

std::vector<std::string_view> WordsOf(std::string_view line) {
    std::vector<std::string_view> words;
    for (const std::string_view word : sxn::Split(line, ' ')) {
        if (!word.empty()) words.push_back(word);
    }
    return words;
}

std::optional<sxn::Length> Metres(std::string_view text) {
    return sxn::Length::Read(text, sxn::LengthIn::Metres);
}

// The words from `first` up to `last`, not including it, as one field.
std::string Joined(const std::vector<std::string_view>& words, std::size_t first,
                   std::size_t last) {
    std::string text;
    for (std::size_t i = first; i < last && i < words.size(); ++i) {
        text += (text.empty() ? "" : " ") + std::string(words[i]);
    }
    return sxn::FieldText(text);
}

}  // namespace

bool Tps1200Translator::Line(const sxn::RawLine& line) {
    std::string text = sxn::CommentText(line.bytes);
    for (char& c : text) {
        if (c == '\t') c = ' ';
    }
    const std::string_view trimmed = sxn::Trim(text);
    if (trimmed.empty() || IsRule(trimmed)) return true;
    const Section titled = trimmed == "Job"                ? Section::Job
                           : trimmed == "Points"           ? Section::Points
                           : trimmed == "Lines"            ? Section::Lines
                           : trimmed == "TPS Station"      ? Section::Station
                           : trimmed == "TPS Measurements" ? Section::Measurements
                                                           : Section::None;
    if (sxn::StartsWith(trimmed, "System 1200 Data Export")) {
        section_ = Section::None;
        out_.Comment(trimmed);
        return true;
    }
    if (titled != Section::None) {
        section_ = titled;
        head_seen_ = titled == Section::Job;
        out_.Comment(trimmed);
        return true;
    }
    if (!head_seen_ && section_ != Section::None) {
        head_seen_ = true;  // the column names
        return true;
    }
    if (section_ == Section::Job) {
        JobLine(trimmed);
        return true;
    }
    if (section_ == Section::None) {
        out_.Comment(trimmed);
        return true;
    }
    if (!Row(WordsOf(trimmed))) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    out_.Prove();
    return true;
}

void Tps1200Translator::JobLine(std::string_view line) {
    // "Label<tabs>: value"; the label of the date ends in a colon of its own.
    const std::size_t colon = line.rfind(": ");
    const std::string_view label =
        colon == std::string_view::npos ? line : sxn::Trim(line.substr(0, colon));
    std::string value = colon == std::string_view::npos ? "" : std::string(line.substr(colon + 1));
    if (sxn::StartsWith(label, "Date")) {
        for (char& c : value) {
            if (c == ',') c = ' ';  // "02.07.08, 13:54:41"
        }
        out_.Record("DATE " + sxn::FieldText(value));
    } else if (label == "Job") {
        out_.Record("JOB " + sxn::FieldText(value));
    } else if (label == "Creator") {
        out_.Record("NAME " + sxn::FieldText(value));
    } else if (label == "Instrument Type") {
        out_.Record("INSTRU " + sxn::FieldText(value));
    } else {
        out_.Comment(line);
    }
}

bool Tps1200Translator::Row(const Words& words) {
    switch (section_) {
        case Section::Points:
        case Section::Lines:
            return PointRow(words);
        case Section::Station:
            return StationRow(words);
        default:
            return MeasurementRow(words);
    }
}

bool Tps1200Translator::PointRow(const Words& words) {
    if (words.size() < 5) return false;
    const std::string id = sxn::FieldText(words[0]);
    sxn::Coordinates at{Metres(words[1]), Metres(words[2]), Metres(words[3])};
    if (!at.east || !at.north || !at.height) return false;
    const std::string_view point_class = words[4];
    std::string code = Joined(words, 5, words.size());
    if (section_ == Section::Lines) {
        if (words.size() < 7) return false;
        const std::string line_id = sxn::FieldText(words[words.size() - 2]);
        code = sxn::FieldText(words.back());
        if (line_id != line_id_) {
            line_id_ = line_id;
            out_.Comment("TPS1200 LINE " + line_id + " CODE " + code);
        }
        const std::string point_code = Joined(words, 5, words.size() - 2);
        if (!point_code.empty()) out_.Comment("TPS1200 POINT " + id + " CODE " + point_code);
    }
    if (point_class == "REF" || point_class == "CTRL") {
        out_.Xyz(id, at);
        if (!code.empty()) out_.Comment("TPS1200 POINT " + id + " CODE " + code);
    } else {
        out_.Point(id, at, code);
    }
    return true;
}

bool Tps1200Translator::StationRow(const Words& words) {
    if (words.size() < 4) return false;
    const std::string id = sxn::FieldText(words[0]);
    sxn::Coordinates at{Metres(words[1]), Metres(words[2]), Metres(words[3])};
    std::optional<sxn::Length> height;
    if (words.size() > 4 && !(height = Metres(words[4]))) return false;
    if (!at.east || !at.north || !at.height) return false;
    out_.Station(id, height, "");
    out_.Xyz(id, at);
    return true;
}

bool Tps1200Translator::MeasurementRow(const Words& words) {
    if (words.size() < 7) return false;
    const auto horizontal = sxn::Angle::Read(words[1], sxn::AngleIn::Dms);
    const auto zenith = sxn::Angle::Read(words[2], sxn::AngleIn::Dms);
    const auto slope = Metres(words[3]);
    const auto level = Metres(words[4]);
    const auto reflector = Metres(words[6]);
    if (!horizontal || !zenith || !slope || !level || !reflector) return false;
    sxn::Observation observation;
    observation.id = sxn::FieldText(words[0]);
    observation.horizontal = *horizontal;
    observation.zenith = *zenith;
    observation.slope = *slope;
    observation.target_height = reflector;
    observation.horizontal_distance = level;
    out_.Observe(observation);
    return true;
}
