#include "Rw5Record.h"

#include <array>

#include "Text.h"

namespace {

// The field codes of the records that are read; a field matches the first code it begins
// with, so two-letter codes stand before the one-letter coordinates.
constexpr std::array<std::string_view, 30> kCodes = {
    "OP", "FP", "BP", "PN", "EL", "AR", "AL", "DR", "DL", "AZ", "ZE", "VA", "CE", "SD", "HD",
    "HI", "HR", "BS", "BC", "NM", "DT", "TM", "AD", "UN", "SF", "EC", "EO", "AU", "N",  "E"};

bool IsCapital(char c) {
    return c >= 'A' && c <= 'Z';
}

}  // namespace

bool Rw5Record::Read(std::string_view line) {
    type_.clear();
    note_.clear();
    fields_.clear();
    const std::size_t note = line.find("--");
    if (note != std::string_view::npos) {
        note_ = std::string(sxn::Trim(line.substr(note + 2)));
        line = line.substr(0, note);
    }
    const std::vector<std::string_view> pieces = sxn::Split(line, ',');
    const std::string_view type = sxn::Trim(pieces.front());
    if (type.size() < 2 || type.size() > 3) return false;
    for (const char c : type) {
        if (!IsCapital(c) && !(c >= '0' && c <= '9')) return false;
    }
    if (!IsCapital(type.front())) return false;
    type_ = std::string(type);
    for (std::size_t i = 1; i < pieces.size(); ++i) {
        const std::string_view piece = sxn::Trim(pieces[i]);
        for (const std::string_view code : kCodes) {
            if (sxn::StartsWith(piece, code)) {
                fields_.push_back(
                    {std::string(code), std::string(sxn::Trim(piece.substr(code.size())))});
                break;
            }
        }
    }
    return true;
}

std::string_view Rw5Record::Value(std::string_view code) const {
    for (const Field& field : fields_) {
        if (field.code == code) return field.value;
    }
    return {};
}

bool Rw5Record::Has(std::string_view code) const {
    for (const Field& field : fields_) {
        if (field.code == code) return true;
    }
    return false;
}
