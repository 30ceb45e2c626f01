#include "platform/text/NameTable.h"

#include <algorithm>
#include <functional>

namespace nedit {
namespace {

std::uint32_t HashOf(std::wstring_view name) {
    const std::size_t hash = std::hash<std::wstring_view>()(name);
    return static_cast<std::uint32_t>(hash ^ (hash >> 32));
}

}  // namespace

NameTable::Id NameTable::Find(std::wstring_view name) const {
    if (Slots.empty()) return kNone;
    const std::uint32_t hash = HashOf(name);
    const std::size_t mask = Slots.size() - 1;
    for (std::size_t i = hash & mask;; i = (i + 1) & mask) {
        const Slot& slot = Slots[i];
        if (slot.Name == kNone) return kNone;
        if (slot.Hash == hash && Name(slot.Name).view() == name) return slot.Name;
    }
}

NameTable::Id NameTable::Intern(std::wstring_view name) {
    if (4 * (Names.size() + 1) > 3 * Slots.size()) Grow();
    const std::uint32_t hash = HashOf(name);
    const std::size_t mask = Slots.size() - 1;
    std::size_t i = hash & mask;
    for (; Slots[i].Name != kNone; i = (i + 1) & mask) {
        const Slot& slot = Slots[i];
        if (slot.Hash == hash && Name(slot.Name).view() == name) return slot.Name;
    }
    const Id id = static_cast<Id>(Names.size());
    Names.push_back(Store(name));
    Slots[i] = {hash, id};
    return id;
}

const wchar_t* NameTable::Store(std::wstring_view name) {
    // The length, then the characters.
    const std::size_t needed = name.size() + 1;
    if (needed > BlockSize - BlockUsed) {
        // A name longer than a block gets a block of its own.
        BlockSize = std::max(kBlockCharacters, needed);
        Blocks.push_back(std::make_unique<wchar_t[]>(BlockSize));
        BlockUsed = 0;
    }
    wchar_t* at = Blocks.back().get() + BlockUsed;
    at[0] = static_cast<wchar_t>(name.size());
    std::copy(name.begin(), name.end(), at + 1);
    BlockUsed += needed;
    return at + 1;
}

void NameTable::Grow() {
    std::vector<Slot> old = std::move(Slots);
    Slots.assign(std::max<std::size_t>(64, 2 * old.size()), Slot());
    const std::size_t mask = Slots.size() - 1;
    for (const Slot& slot : old) {
        if (slot.Name == kNone) continue;
        std::size_t i = slot.Hash & mask;
        while (Slots[i].Name != kNone) i = (i + 1) & mask;
        Slots[i] = slot;
    }
}

}  // namespace nedit
