#pragma once
// Names given numbers: each distinct name is stored once, in large blocks of wide text, and
// has an id from 0 up that stays its own for the life of the table. Whatever is kept per
// name (a station, a point, a coordinate record) can then live in an array indexed by the id,
// and a name read from a row is looked up once instead of at every use.
//
// A name is held as a NameText, one pointer into the table's blocks (its length stands before
// its characters); it stays good for the life of the table: blocks are never moved or freed
// before the table is.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace nedit {

/// A name of a NameTable, as small as a pointer; it reads as a std::wstring_view.
class NameText {
  public:
    NameText() = default;

    std::wstring_view view() const {
        return Chars == nullptr ? std::wstring_view()
                                : std::wstring_view(Chars, static_cast<std::size_t>(Chars[-1]));
    }
    operator std::wstring_view() const { return view(); }
    bool empty() const { return Chars == nullptr || Chars[-1] == 0; }
    std::size_t size() const { return view().size(); }

    friend bool operator==(NameText a, NameText b) { return a.view() == b.view(); }
    friend bool operator==(NameText a, std::wstring_view b) { return a.view() == b; }
    friend bool operator==(std::wstring_view a, NameText b) { return a == b.view(); }
    friend bool operator==(NameText a, const std::wstring& b) { return a.view() == b; }
    friend bool operator==(const std::wstring& a, NameText b) { return a == b.view(); }
    friend bool operator==(NameText a, const wchar_t* b) { return a.view() == b; }
    friend bool operator==(const wchar_t* a, NameText b) { return a == b.view(); }
    template <typename Other>
    friend bool operator!=(NameText a, const Other& b) {
        return !(a == b);
    }

  private:
    friend class NameTable;
    explicit NameText(const wchar_t* chars) : Chars(chars) {}

    const wchar_t* Chars = nullptr;
};

class NameTable {
  public:
    using Id = std::uint32_t;
    static constexpr Id kNone = ~Id{0};

    /// The id of `name`, which is added when it is new.
    Id Intern(std::wstring_view name);
    /// The id of `name`, or kNone.
    Id Find(std::wstring_view name) const;
    NameText Name(Id id) const { return NameText(Names[id]); }
    std::size_t size() const { return Names.size(); }

  private:
    /// A place of the open-addressed table: an id with its name's hash, so that a probe reads
    /// a name only when the hashes agree.
    struct Slot {
        std::uint32_t Hash = 0;
        Id Name = kNone;
    };
    const wchar_t* Store(std::wstring_view name);
    void Grow();

    static constexpr std::size_t kBlockCharacters = 1 << 16;
    std::vector<std::unique_ptr<wchar_t[]>> Blocks;
    std::size_t BlockSize = 0;  // characters of the last block
    std::size_t BlockUsed = 0;
    std::vector<const wchar_t*> Names;
    std::vector<Slot> Slots;  // a power of two in size, at most three quarters full
};

}  // namespace nedit
