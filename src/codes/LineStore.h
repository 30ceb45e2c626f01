#pragma once
// A store of lines between reduced points, in the order they came, with a look-up by their
// two names in either direction. A pair of names has one line.

#include <cstddef>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "codes/UNeditLine.h"

namespace nedit {

class LineStore {
  public:
    /// The line from `from` to `to`, written over the line between the same two names or
    /// appended. An existing line keeps its direction: it runs from whichever of the two it
    /// ran from. `stationLine` marks a line between stations. Gives the line's index.
    std::size_t Save(const UNeditPt& from, const UNeditPt& to, bool stationLine);
    /// The index of the line between `a` and `b`, in either direction, or -1.
    int IndexOf(const std::wstring& a, const std::wstring& b) const;
    /// Some line starts or ends at `name`.
    bool Names(const std::wstring& name) const;
    /// Removes every line made from codes and keeps the lines between stations; gives the
    /// names of the points those lines still join.
    std::unordered_set<std::wstring> KeepStationLines();

    const std::vector<UNeditLine>& Items() const { return Lines; }
    /// The line at an index the store holds, to set its look.
    UNeditLine& At(std::size_t index) { return Lines[index]; }
    std::size_t size() const { return Lines.size(); }

  private:
    static std::wstring KeyOf(const std::wstring& a, const std::wstring& b);
    void RebuildIndex();

    std::vector<UNeditLine> Lines;
    std::unordered_map<std::wstring, std::size_t> Index;
};

}  // namespace nedit
