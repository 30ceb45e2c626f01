#pragma once
// Lines of text held in one block: the UTF-8 bytes of every line one after another, and a
// table of where each line starts and how long it is. A line costs its bytes and eight more,
// where a string of its own would cost a heap block and a header besides, so a list of
// millions of rows or report lines stays close to the size of its text.
//
// A line's view is good until the lines next change. Replacing or removing a line leaves its
// old bytes behind until they are more than the live text; the block is then compacted.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace nedit {

class TextLines {
  public:
    /// A longer line keeps its first this many bytes.
    static constexpr std::size_t kMaxLineBytes = (std::size_t{1} << 24) - 1;

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
    /// Room for `lines` lines of `bytes` bytes in all without growing.
    void reserve(std::size_t lines, std::size_t bytes);

  private:
    /// Appends the bytes and gives the line's reference: offset in the high 40 bits, length
    /// in the low 24.
    std::uint64_t Store(std::string_view line);
    void Forget(std::uint64_t ref);
    void CompactWhenWasteful();

    std::string Text;
    std::vector<std::uint64_t> Refs;
    std::size_t Garbage = 0;  // bytes of Text that no line refers to any more
};

}  // namespace nedit
