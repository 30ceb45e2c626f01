#include "Tps700Translator.h"

#include "Text.h"

namespace {

// The value after a label at the start of a line, or nothing when the line has another.
std::optional<std::string_view> After(std::string_view line, std::string_view label) {
    if (!sxn::StartsWith(line, label)) return std::nullopt;
    return sxn::Trim(line.substr(label.size()));
}

bool IsFrame(std::string_view line) {
    return line.find_first_not_of("- ") == std::string_view::npos;
}

}  // namespace

bool Tps700Translator::Line(const sxn::RawLine& line) {
    const std::string text = sxn::CommentText(line.bytes);
    const std::string_view trimmed = sxn::Trim(text);
    if (trimmed.empty() || IsFrame(trimmed)) return true;
    if (Labelled(trimmed)) return true;
    if (trimmed.find(',') == std::string_view::npos) {
        out_.Comment(trimmed);
        return true;
    }
    if (!PointLine(trimmed)) {
        out_.Unread(line.number, line.bytes);
        return false;
    }
    return true;
}

bool Tps700Translator::Labelled(std::string_view line) {
    if (const auto value = After(line, "SETUP SN")) {
        PutSetUp();
        setup_ = sxn::FieldText(*value);
        instrument_height_.reset();
        out_.Prove();
    } else if (const auto height = After(line, "IH"); height && !setup_.empty()) {
        instrument_height_ = sxn::Length::Read(*height, sxn::LengthIn::Metres);
        if (!instrument_height_) out_.Comment(line);
    } else if (const auto station = After(line, "Orientation Station");
               station && !setup_.empty()) {
        const std::string back = sxn::FieldText(*station);
        PutSetUp();
        out_.BackBearing(back, std::nullopt, std::nullopt);
    } else if (const auto job = After(line, "JOB")) {
        out_.Record("JOB " + sxn::FieldText(*job));
    } else if (const auto name = After(line, "OPERATOR")) {
        out_.Record("NAME " + sxn::FieldText(*name));
    } else if (const auto date = After(line, "DATE")) {
        out_.Record("DATE " + sxn::FieldText(*date));
    } else if (const auto type = After(line, "INS. TYPE.")) {
        out_.Record("INSTRU " + sxn::FieldText(*type));
    } else {
        return false;
    }
    return true;
}

void Tps700Translator::Finish() {
    PutSetUp();
    if (without_coordinates_ > 0) {
        out_.Message(std::to_string(without_coordinates_) +
                     (without_coordinates_ == 1 ? " point line has" : " point lines have") +
                     " no coordinates (1.00, 1.00, 1.00); they stand as comments.");
    }
}

void Tps700Translator::PutSetUp() {
    if (setup_.empty()) return;
    out_.Station(setup_, instrument_height_, "");
    setup_.clear();
}

bool Tps700Translator::PointLine(std::string_view line) {
    const std::vector<std::string_view> fields = sxn::Split(line, ',');
    if (fields.size() < 4 || fields.size() > 5) return false;
    const std::string id = sxn::FieldText(fields[0]);
    sxn::Coordinates at;
    at.east = sxn::Length::Read(fields[1], sxn::LengthIn::Metres);
    at.north = sxn::Length::Read(fields[2], sxn::LengthIn::Metres);
    at.height = sxn::Length::Read(fields[3], sxn::LengthIn::Metres);
    if (id.empty() || !at.east || !at.north || !at.height) return false;
    PutSetUp();
    out_.Prove();
    if (sxn::Trim(fields[1]) == "1.00" && sxn::Trim(fields[2]) == "1.00" &&
        sxn::Trim(fields[3]) == "1.00") {
        out_.Comment("TPS700 POINT WITHOUT COORDINATES: " + std::string(line));
        ++without_coordinates_;
        return true;
    }
    std::string_view code =
        fields.size() > 4 ? line.substr(static_cast<std::size_t>(fields[4].data() - line.data()))
                          : std::string_view();
    code = sxn::Trim(code.substr(0, code.find_last_not_of("- ") + 1));
    out_.Point(id, at, sxn::FieldText(code));
    return true;
}
