#include "ZeissLine.h"

#include "Text.h"

namespace {

// Rec 500 columns, from 0: the address, the information block, the value blocks.
constexpr std::size_t kRecAddressEnd = 7;
constexpr std::size_t kRecInfo = 8;
constexpr std::size_t kRecCode = 27;
constexpr std::size_t kRecValues = 36;

// The words of a piece of text, split at blanks.
std::vector<std::string_view> Words(std::string_view text) {
    std::vector<std::string_view> words;
    for (const std::string_view word : sxn::Split(text, ' ')) {
        if (!word.empty()) words.push_back(word);
    }
    return words;
}

bool AllDigits(std::string_view text) {
    return !text.empty() && text.find_first_not_of("0123456789") == std::string_view::npos;
}

}  // namespace

bool ZeissLine::Read(std::string_view line) {
    text_ = false;
    name_.clear();
    code_.clear();
    blocks_.clear();
    if (sxn::StartsWith(line, "For R4|")) return ReadBarred(line, 1);
    if (sxn::StartsWith(line, "For R5|")) return ReadBarred(line, 2);
    return ReadRec500(line);
}

bool ZeissLine::ReadBarred(std::string_view line, std::size_t first_block) {
    const std::vector<std::string_view> fields = sxn::Split(line, '|');
    if (fields.size() <= first_block) return false;
    const std::string_view info = fields[first_block];
    const std::string_view type = info.substr(0, 2);
    if (info.size() < 3 || (type != "TR" && type != "KR" && type != "PR")) return false;
    text_ = type == "TR";
    if (text_) {
        name_ = std::string(sxn::Trim(info.substr(3)));
    } else {
        code_ = std::string(sxn::Trim(info.substr(3, 3)));
        if (info.size() > 6) name_ = std::string(sxn::Trim(info.substr(6)));
    }
    for (std::size_t i = first_block + 1; i < fields.size(); ++i) {
        const std::vector<std::string_view> words = Words(fields[i]);
        if (words.empty()) continue;
        if (words.size() > 3) return false;
        blocks_.push_back({std::string(words[0]), words.size() > 1 ? std::string(words[1]) : "",
                           words.size() > 2 ? std::string(words[2]) : ""});
    }
    return true;
}

bool ZeissLine::ReadRec500(std::string_view line) {
    if (line.size() <= kRecAddressEnd || !AllDigits(sxn::Trim(line.substr(0, kRecAddressEnd))) ||
        line[kRecAddressEnd] != ' ')
        return false;
    const std::string_view info = line.substr(kRecInfo, kRecValues - kRecInfo);
    text_ = !info.empty() && info.front() != ' ';
    if (text_) {
        name_ = std::string(sxn::Trim(info));
    } else {
        name_ = std::string(sxn::Trim(info.substr(0, kRecCode - kRecInfo)));
        if (info.size() > kRecCode - kRecInfo)
            code_ = std::string(sxn::Trim(info.substr(kRecCode - kRecInfo)));
    }
    const std::vector<std::string_view> words =
        Words(line.size() > kRecValues ? line.substr(kRecValues) : std::string_view());
    if (words.size() % 2 != 0) return false;
    for (std::size_t i = 0; i < words.size(); i += 2) {
        blocks_.push_back({std::string(words[i]), std::string(words[i + 1]), ""});
    }
    return true;
}
