#include "GsiBlockReader.h"

namespace {

// A GSI-16 word with its '*' is 24 characters; anything much longer is not one.
constexpr std::size_t kTokenKept = 40;
constexpr std::size_t kBlockTextKept = 200;

}  // namespace

bool GsiBlockReader::Feed(const unsigned char* bytes, std::size_t size) {
    for (std::size_t i = 0; i < size && !ended_; ++i) {
        const unsigned char byte = bytes[i];
        ++bytes_;
        if (sxn::IsEndOfTransmission(byte) && token_size_ == 0 && text_.empty()) {
            Finish();
            ended_ = true;
        } else if (byte == '\n' && last_cr_) {
            last_cr_ = false;
        } else if (byte == '\n' || byte == '\r') {
            EndToken();
            EndBlock();
            ++line_;
            last_cr_ = byte == '\r';
        } else if (byte == ' ' || byte == '\t') {
            EndToken();
            last_cr_ = false;
        } else if (!sxn::IsFlowControl(byte)) {
            if (token_.size() < kTokenKept) token_ += static_cast<char>(byte);
            ++token_size_;
            last_cr_ = false;
        }
        if (!gsi_ && !ended_ && bytes_ > kProbeBytes) NotGsi();
    }
    return !ended_;
}

void GsiBlockReader::Finish() {
    if (ended_) return;
    EndToken();
    EndBlock();
    if (!gsi_ && !held_.empty()) NotGsi();
    ended_ = true;
}

void GsiBlockReader::EndToken() {
    if (token_size_ == 0) return;
    std::string_view token = token_;
    if (token.front() == '*') token.remove_prefix(1);
    GsiWord word;
    const bool read = token_size_ == token_.size() && ParseGsiWord(token, word);
    if (read && (word.index == 11 || word.index == 41) && !text_.empty()) EndBlock();
    if (text_.empty()) {
        block_line_ = line_;
    } else {
        text_ += ' ';
    }
    if (text_.size() < kBlockTextKept) {
        text_ += token_;
        if (token_size_ > token_.size())
            text_ += "... (" + std::to_string(token_size_) + " CHARACTERS)";
    }
    if (read) {
        words_.push_back(std::move(word));
        if (!gsi_) {
            gsi_ = true;
            for (const auto& [text, line] : held_) handler_.OnUnreadable(text, line);
            held_.clear();
        }
    } else {
        spoilt_ = true;
    }
    token_.clear();
    token_size_ = 0;
}

void GsiBlockReader::EndBlock() {
    if (text_.empty()) return;
    if (spoilt_ && !gsi_) {
        held_.emplace_back(text_, block_line_);
    } else if (spoilt_) {
        handler_.OnUnreadable(text_, block_line_);
    } else {
        handler_.OnBlock(words_, text_, block_line_);
    }
    words_.clear();
    text_.clear();
    spoilt_ = false;
}

void GsiBlockReader::NotGsi() {
    held_.clear();
    words_.clear();
    text_.clear();
    ended_ = true;
    handler_.OnNotGsi();
}
