#pragma once
// Names given numbers: each distinct name is stored once, in large blocks of wide text, and
// has an id from 0 up that stays its own for the life of the table. Whatever is kept per
// name (a station, a point, a coordinate record) can then live in an array indexed by the id,
// and a name read from a row is looked up once instead of at every use.
//
// A name's view stays good for the life of the table: blocks are never moved or freed before
// the table is.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace nedit {

class NameTable {
  public:
    using Id = std::uint32_t;
    static constexpr Id kNone = ~Id{0};

    /// The id of `name`, which is added when it is new.
    Id Intern(std::wstring_view name);
    /// The id of `name`, or kNone.
    Id Find(std::wstring_view name) const;
    std::wstring_view Name(Id id) const { return Names[id]; }
    std::size_t size() const { return Names.size(); }

  private:
    std::wstring_view Store(std::wstring_view name);
    void Grow();

    static constexpr std::size_t kBlockCharacters = 1 << 16;
    std::vector<std::unique_ptr<wchar_t[]>> Blocks;
    std::size_t BlockSize = 0;  // characters of the last block
    std::size_t BlockUsed = 0;
    /// A place of the open-addressed table: an id with its name's hash, so that a probe reads
    /// a name only when the hashes agree.
    struct Slot {
        std::uint32_t Hash = 0;
        Id Name = kNone;
    };
    std::vector<std::wstring_view> Names;
    std::vector<Slot> Slots;  // a power of two in size, at most half full
};

}  // namespace nedit
