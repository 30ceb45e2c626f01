#include "platform/text/TextLines.h"

namespace nedit {
namespace {

constexpr unsigned kLengthBits = 24;
constexpr std::uint64_t kLengthMask = (std::uint64_t{1} << kLengthBits) - 1;

std::size_t OffsetOf(std::uint64_t ref) {
    return static_cast<std::size_t>(ref >> kLengthBits);
}

std::size_t LengthOf(std::uint64_t ref) {
    return static_cast<std::size_t>(ref & kLengthMask);
}

}  // namespace

std::string_view TextLines::operator[](std::size_t line) const {
    const std::uint64_t ref = Refs[line];
    return std::string_view(Text).substr(OffsetOf(ref), LengthOf(ref));
}

std::uint64_t TextLines::Store(std::string_view line) {
    if (line.size() > kMaxLineBytes) line = line.substr(0, kMaxLineBytes);
    const std::uint64_t offset = Text.size();
    // `line` may lie in Text itself; append copies it before the old block goes.
    Text.append(line.data(), line.size());
    return offset << kLengthBits | line.size();
}

void TextLines::Forget(std::uint64_t ref) {
    Garbage += LengthOf(ref);
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
    Forget(Refs[at]);
    Refs[at] = ref;
    CompactWhenWasteful();
}

void TextLines::erase(std::size_t at, std::size_t count) {
    const auto first = Refs.begin() + static_cast<std::ptrdiff_t>(at);
    for (auto ref = first; ref != first + static_cast<std::ptrdiff_t>(count); ++ref) Forget(*ref);
    Refs.erase(first, first + static_cast<std::ptrdiff_t>(count));
    CompactWhenWasteful();
}

void TextLines::clear() {
    Text.clear();
    Refs.clear();
    Garbage = 0;
}

void TextLines::reserve(std::size_t lines, std::size_t bytes) {
    Refs.reserve(lines);
    Text.reserve(bytes);
}

void TextLines::CompactWhenWasteful() {
    // A little waste is cheaper than copying; more than the live text is not.
    if (Garbage < 4096 || Garbage <= Text.size() - Garbage) return;
    std::string compact;
    compact.reserve(Text.size() - Garbage);
    for (std::uint64_t& ref : Refs) {
        const std::size_t length = LengthOf(ref);
        const std::uint64_t offset = compact.size();
        compact.append(Text, OffsetOf(ref), length);
        ref = offset << kLengthBits | length;
    }
    Text = std::move(compact);
    Garbage = 0;
}

}  // namespace nedit
