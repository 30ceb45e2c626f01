#include "platform/text/NameIndex.h"

namespace {

std::size_t HashOf(const std::wstring& name) {
    return std::hash<std::wstring>()(name);
}

// Tables are a power of two in size and kept at most half full.
std::size_t CapacityFor(std::size_t count) {
    std::size_t capacity = 16;
    while (capacity < 2 * count) capacity *= 2;
    return capacity;
}

}  // namespace

std::size_t NameIndex::SlotOf(const std::wstring& name, std::size_t hash) const {
    const std::size_t mask = Slots.size() - 1;
    for (std::size_t i = hash & mask;; i = (i + 1) & mask) {
        const Slot& slot = Slots[i];
        if (slot.Position == npos || (slot.Hash == hash && NameAt_(slot.Position) == name))
            return i;
    }
}

std::size_t NameIndex::Find(const std::wstring& name) const {
    if (Used == 0) return npos;
    return Slots[SlotOf(name, HashOf(name))].Position;
}

void NameIndex::Set(const std::wstring& name, std::size_t position) {
    if (2 * (Used + 1) > Slots.size()) Grow(CapacityFor(Used + 1));
    const std::size_t hash = HashOf(name);
    Slot& slot = Slots[SlotOf(name, hash)];
    if (slot.Position == npos) ++Used;
    slot = {hash, position};
}

void NameIndex::Clear() {
    Slots.clear();
    Used = 0;
}

void NameIndex::Reserve(std::size_t count) {
    if (2 * count > Slots.size()) Grow(CapacityFor(count));
}

void NameIndex::Grow(std::size_t capacity) {
    std::vector<Slot> old = std::move(Slots);
    Slots.assign(capacity, Slot{});
    const std::size_t mask = capacity - 1;
    for (const Slot& slot : old) {
        if (slot.Position == npos) continue;
        std::size_t i = slot.Hash & mask;
        while (Slots[i].Position != npos) i = (i + 1) & mask;
        Slots[i] = slot;
    }
}
