#pragma once
// The fields of one parsed record: field id to value text. A record has a handful of
// fields, so they are kept in a short array searched in order, and clearing keeps the
// entries' text buffers for the next record: parsing millions of rows allocates almost
// nothing.

#include <string>
#include <utility>
#include <vector>

class FieldMap {
  public:
    using Entry = std::pair<int, std::wstring>;
    using const_iterator = std::vector<Entry>::const_iterator;
    using iterator = std::vector<Entry>::iterator;

    /// Empties the map; the memory of the entries is kept for reuse.
    void clear() { used_ = 0; }
    bool empty() const { return used_ == 0; }
    std::size_t size() const { return used_; }

    const_iterator begin() const { return entries_.begin(); }
    const_iterator end() const { return entries_.begin() + static_cast<std::ptrdiff_t>(used_); }
    iterator begin() { return entries_.begin(); }
    iterator end() { return entries_.begin() + static_cast<std::ptrdiff_t>(used_); }

    const_iterator find(int id) const;
    iterator find(int id);
    std::size_t count(int id) const { return find(id) == end() ? 0 : 1; }
    /// The value of `id`, made empty when the map did not have it.
    std::wstring& operator[](int id);

  private:
    std::vector<Entry> entries_;
    std::size_t used_ = 0;
};
