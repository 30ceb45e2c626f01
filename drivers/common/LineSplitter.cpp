#include "LineSplitter.h"

#include "DriverSession.h"

namespace sxn {

bool LineSplitter::Feed(const unsigned char* bytes, std::size_t size) {
    for (std::size_t i = 0; i < size && !ended_; ++i) {
        const unsigned char byte = bytes[i];
        ++bytes_;
        if (IsEndOfTransmission(byte) && length_ == 0) {
            ended_ = true;
        } else if (byte == '\n' && last_cr_) {
            last_cr_ = false;
        } else if (byte == '\n' || byte == '\r') {
            EndLine();
            last_cr_ = byte == '\r';
        } else if (!IsFlowControl(byte)) {
            last_cr_ = false;
            if (line_.size() < kKept) line_ += static_cast<char>(byte);
            ++length_;
        }
    }
    return !ended_;
}

void LineSplitter::Finish() {
    if (!ended_ && length_ > 0) EndLine();
    ended_ = true;
}

void LineSplitter::EndLine() {
    ++number_;
    sink_(RawLine{line_, number_, length_});
    line_.clear();
    length_ = 0;
}

}  // namespace sxn
