#include "platform/text/TextLines.h"

#include <algorithm>
#include <cstring>

namespace nedit {
namespace {

constexpr unsigned kLengthBits = 21;
constexpr unsigned kOffsetBits = 21;
constexpr std::uint64_t kLengthMask = (std::uint64_t{1} << kLengthBits) - 1;
constexpr std::uint64_t kOffsetMask = (std::uint64_t{1} << kOffsetBits) - 1;

std::size_t BlockOf(std::uint64_t ref) {
    return static_cast<std::size_t>(ref >> (kLengthBits + kOffsetBits));
}

std::size_t OffsetOf(std::uint64_t ref) {
    return static_cast<std::size_t>((ref >> kLengthBits) & kOffsetMask);
}

std::size_t LengthOf(std::uint64_t ref) {
    return static_cast<std::size_t>(ref & kLengthMask);
}

}  // namespace

std::string_view TextLines::operator[](std::size_t line) const {
    const std::uint64_t ref = Refs[line];
    return std::string_view(Blocks[BlockOf(ref)].get() + OffsetOf(ref), LengthOf(ref));
}

std::uint64_t TextLines::Store(std::string_view line) {
    if (line.size() > kMaxLineBytes) line = line.substr(0, kMaxLineBytes);
    if (Blocks.empty() || line.size() > kBlockBytes - BlockUsed) {
        // `line` may lie in a block; blocks stay where they are, so it stays good.
        Blocks.push_back(std::shared_ptr<char[]>(new char[kBlockBytes]));
        BlockUsed = 0;
    }
    const std::uint64_t block = Blocks.size() - 1;
    const std::uint64_t offset = BlockUsed;
    if (!line.empty()) std::memcpy(Blocks.back().get() + BlockUsed, line.data(), line.size());
    BlockUsed += line.size();
    Live += line.size();
    return block << (kLengthBits + kOffsetBits) | offset << kLengthBits | line.size();
}

TextLines TextLines::SharingBlocksOf(const TextLines& other) {
    TextLines lines;
    lines.Blocks = other.Blocks;
    // The last of them is another's to fill: lines of this one's own go to a new block.
    lines.BlockUsed = kBlockBytes;
    return lines;
}

void TextLines::PushShared(const TextLines& other, std::size_t line) {
    Refs.push_back(other.Refs[line]);
    Live += LengthOf(other.Refs[line]);
}

void TextLines::push_back(std::string_view line) {
    Refs.push_back(Store(line));
}

void TextLines::insert(std::size_t at, std::string_view line) {
    const std::uint64_t ref = Store(line);
    Refs.insert(Refs.begin() + static_cast<std::ptrdiff_t>(at), ref);
}

void TextLines::insert(std::size_t at, const std::vector<std::string>& lines) {
    std::vector<std::uint64_t> refs;
    refs.reserve(lines.size());
    for (const std::string& line : lines) refs.push_back(Store(line));
    Refs.insert(Refs.begin() + static_cast<std::ptrdiff_t>(at), refs.begin(), refs.end());
}

void TextLines::replace(std::size_t at, std::string_view line) {
    const std::uint64_t ref = Store(line);
    Live -= LengthOf(Refs[at]);
    Garbage += LengthOf(Refs[at]);
    Refs[at] = ref;
    CompactWhenWasteful();
}

void TextLines::erase(std::size_t at, std::size_t count) {
    const auto first = Refs.begin() + static_cast<std::ptrdiff_t>(at);
    const auto last = first + static_cast<std::ptrdiff_t>(count);
    for (auto ref = first; ref != last; ++ref) {
        Live -= LengthOf(*ref);
        Garbage += LengthOf(*ref);
    }
    Refs.erase(first, last);
    CompactWhenWasteful();
}

void TextLines::clear() {
    Blocks.clear();
    BlockUsed = kBlockBytes;
    Refs.clear();
    Live = Garbage = 0;
}

void TextLines::CompactWhenWasteful() {
    // A little waste is cheaper than copying; more than the live text is not.
    if (Garbage < kBlockBytes || Garbage <= Live) return;
    TextLines compact;
    compact.Refs.reserve(Refs.size());
    for (std::size_t line = 0; line < Refs.size(); ++line) compact.push_back((*this)[line]);
    *this = std::move(compact);
}

}  // namespace nedit
