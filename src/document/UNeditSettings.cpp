#include "document/UNeditSettings.h"

#include <sstream>

namespace {
// The kind each value is stored as: flags are kind 1, the text size kind 4.
int KindOf(int id) {
    return id == UNeditSettings::TextSize ? 4 : 1;
}
}  // namespace

std::string UNeditSettings::Write() const {
    std::string out;
    for (int id = ShowPoints; id <= TextSize; ++id) {
        out += std::to_string(id) + "," + std::to_string(KindOf(id)) + "," +
               std::to_string(Values[static_cast<std::size_t>(id - 1)]) + "\n";
    }
    return out;
}

bool UNeditSettings::Read(const std::string& text) {
    std::array<int, 7> read = Values;
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        if (line.empty()) continue;
        std::istringstream fields(line);
        int id = 0, kind = 0, value = 0;
        char comma1 = 0, comma2 = 0;
        if (!(fields >> id >> comma1 >> kind >> comma2 >> value) || comma1 != ',' ||
            comma2 != ',' || id < ShowPoints || id > TextSize) {
            return false;
        }
        read[static_cast<std::size_t>(id - 1)] = value;
    }
    Values = read;
    return true;
}
