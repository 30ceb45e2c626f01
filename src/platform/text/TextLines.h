#pragma once
// Lines of text held in blocks: the UTF-8 bytes of the lines one after another in blocks of
// 2 MiB, and a table of where each line lies. A line costs its bytes and eight more, where a
// string of its own would cost a heap block and a header besides, so a list of millions of
// rows or report lines stays close to the size of its text; and the text grows block by block,
// never copied to a larger place.
//
// A line's view is good until the lines next change. Replacing or removing a line leaves its
// old bytes behind until they outweigh the live text; the blocks are then written anew.
//
// Bytes once written to a block never change, so lines can share blocks: a copy of some of the
// lines of another TextLines (SharingBlocksOf, PushShared) costs eight bytes a line and keeps
// the blocks it needs alive.

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace nedit {

class TextLines {
  public:
    /// A longer line keeps its first this many bytes.
    static constexpr std::size_t kMaxLineBytes = (std::size_t{1} << 21) - 1;

    std::size_t size() const { return Refs.size(); }
    bool empty() const { return Refs.empty(); }
    std::string_view operator[](std::size_t line) const;
    std::string_view back() const { return (*this)[Refs.size() - 1]; }

    void push_back(std::string_view line);
    /// Puts `line` before line `at` (at the end for `at` equal to size()).
    void insert(std::size_t at, std::string_view line);
    /// Puts `lines` before line `at`, in their order.
    void insert(std::size_t at, const std::vector<std::string>& lines);
    void replace(std::size_t at, std::string_view line);
    void erase(std::size_t at, std::size_t count = 1);
    void clear();
    /// Room for `lines` lines without growing the table.
    void reserve(std::size_t lines) { Refs.reserve(lines); }

    /// No lines yet, but the blocks of `other`, so that its lines can be taken over without
    /// their bytes being copied. Lines added otherwise go to blocks of its own.
    static TextLines SharingBlocksOf(const TextLines& other);
    /// Appends line `line` of `other`, whose blocks this was made sharing, without a copy.
    void PushShared(const TextLines& other, std::size_t line);

  private:
    /// Copies the bytes into the blocks and gives the line's reference: the block in the high
    /// 22 bits, the offset in it in the next 21, the length in the low 21.
    std::uint64_t Store(std::string_view line);
    void CompactWhenWasteful();

    static constexpr std::size_t kBlockBytes = std::size_t{1} << 21;
    std::vector<std::shared_ptr<char[]>> Blocks;
    std::size_t BlockUsed = kBlockBytes;  // bytes used in the last block; full when none yet
    std::vector<std::uint64_t> Refs;
    std::size_t Live = 0;     // bytes of the lines
    std::size_t Garbage = 0;  // bytes in the blocks that no line refers to any more
};

}  // namespace nedit
