#include "GsiUpload.h"

#include <string>

#include "GsiWord.h"

namespace {

constexpr double kUsFeetPerFoot = 0.3048 * 3937.0 / 1200.0;

std::string BlockNumber(long block) {
    const std::string digits = std::to_string(block % 10000);
    return std::string(4 - digits.size(), '0') + digits;
}

}  // namespace

GsiUploadSession::GsiUploadSession(const sxn_host& host, unsigned mode, unsigned, bool)
    : UploadSession(host, mode) {}

int GsiUploadSession::Point(const sxn::UploadPoint& point) {
    const std::string name(point.name);
    if (!GsiTextFits(point.name)) {
        Message("Point " + name +
                " was not uploaded: GSI-16 holds names of up to 16 letters, digits and marks "
                "of ASCII without blanks.");
        return 0;
    }
    const bool feet = Units().length != sxn::LengthOut::Metres;
    const double scale = Units().length == sxn::LengthOut::Feet ? kUsFeetPerFoot : 1.0;
    std::string block = "*" + GsiTextWord(11, BlockNumber(block_ + 1), point.name) + ' ';
    const struct {
        int index;
        double value;
        bool present;
    } coordinates[] = {
        {81, point.east, true}, {82, point.north, true}, {83, point.height, point.has_height}};
    for (const auto& coordinate : coordinates) {
        if (!coordinate.present) continue;
        std::string word;
        if (!GsiLengthWord(coordinate.index, coordinate.value * scale, feet, word)) {
            Message("Point " + name + " was not uploaded: its coordinates do not fit in GSI-16.");
            return 0;
        }
        block += word + ' ';
    }
    if (GsiTextFits(point.code)) {
        block += GsiTextWord(71, "....", point.code) + ' ';
    } else if (!point.code.empty()) {
        Message("Point " + name + " was uploaded without its code " + std::string(point.code) +
                ", which GSI-16 cannot hold.");
    }
    if (!Send(block + "\r\n")) return -1;
    ++block_;
    return 1;
}
