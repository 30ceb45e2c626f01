#pragma once
// An index from names to positions, for stores that already hold the names: the index
// keeps only (hash, position) pairs in one open-addressed table, so a store of millions
// of points or stations costs no node or copy of a name per entry.

#include <cstddef>
#include <functional>
#include <string>
#include <vector>

class NameIndex {
  public:
    static constexpr std::size_t npos = static_cast<std::size_t>(-1);
    /// Gives the name held at a position of the store.
    using NameAt = std::function<const std::wstring&(std::size_t)>;

    explicit NameIndex(NameAt nameAt) : NameAt_(std::move(nameAt)) {}

    /// The position stored under `name`, or npos.
    std::size_t Find(const std::wstring& name) const;
    /// Stores `position` under `name`, replacing the position stored there before.
    void Set(const std::wstring& name, std::size_t position);
    void Clear();
    /// Room for `count` names without growing.
    void Reserve(std::size_t count);
    std::size_t Size() const { return Used; }

  private:
    struct Slot {
        std::size_t Hash = 0;
        std::size_t Position = npos;
    };
    std::size_t SlotOf(const std::wstring& name, std::size_t hash) const;
    void Grow(std::size_t capacity);

    NameAt NameAt_;
    std::vector<Slot> Slots;
    std::size_t Used = 0;
};
