#pragma once
// A store of arcs through or about reduced points, in the order they came.

#include <string>
#include <unordered_map>
#include <vector>

#include "codes/UNeditArc.h"

namespace nedit {

class ArcStore {
  public:
    /// The arc from `first` to `second`, `third` read by `type` (on the arc, or its centre),
    /// written over the arc found by Find with `type` as given, or appended. About a centre
    /// the stored type gains UWArc::kAnticlockwise when the turn from `first` to `second` is
    /// anticlockwise, so two arcs of the same ends and centre are told apart by their sense.
    /// Gives the arc's index.
    int Save(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third, ArcType type);
    /// The index of the arc whose ends are `a` and `b` in either order, whose third point is
    /// `third` and whose stored type is `type`, or -1.
    int Find(const std::wstring& a, const std::wstring& b, const std::wstring& third,
             ArcType type) const;
    void Clear() {
        Arcs.clear();
        Index.clear();
    }

    const std::vector<UNeditArc>& Items() const { return Arcs; }
    /// The arc at an index the store holds, to set its look.
    UNeditArc& At(std::size_t index) { return Arcs[index]; }

  private:
    static std::wstring KeyOf(const std::wstring& a, const std::wstring& b,
                              const std::wstring& third, ArcType type);

    std::vector<UNeditArc> Arcs;
    /// Ends in either order, third point and stored type to the first arc of them, so that a
    /// string of many arcs is saved in linear time.
    std::unordered_map<std::wstring, std::size_t> Index;
};

}  // namespace nedit
