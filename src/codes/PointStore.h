#pragma once
// A store of reduced points in the order they came, each name once, with a look-up by exact
// name that stays constant in time, so that a run remains linear in its records. An index
// into the store is stable until the store is thinned or cleared.
//
// The look-up by name is made at its first use: a caller that knows where each name stands
// (the engine keeps its points by name id) saves by index and never pays for it.

#include <cstddef>
#include <string>
#include <vector>

#include "codes/UNeditPt.h"
#include "platform/text/NameIndex.h"

namespace nedit {

class PointStore {
  public:
    PointStore() = default;
    // The index reads the names of this very store.
    PointStore(const PointStore&) = delete;
    PointStore& operator=(const PointStore&) = delete;

    /// Writes `point` over the entry of its name, or appends it; gives its index.
    unsigned Put(UNeditPt point);
    /// The code a point of `name` takes: `code` trimmed, or, when that is empty, the code of
    /// the entry of that name.
    std::wstring CodeFor(const std::wstring& name, std::wstring code) const;
    /// A point of a reduction, by the precedence of the point list: a new name is appended,
    /// an existing one overwritten, except that a point from a PT record overwrites only
    /// another PT point; an observed point is not replaced by a PT record of its name, and the
    /// new values are dropped. Gives the index of the name, stored or dropped.
    unsigned Save(UNeditPt point);
    /// The same where the caller knows the index of the point's name: -1 for a name that the
    /// store does not hold.
    unsigned SaveAt(int existing, UNeditPt point);

    /// The index of the point of that name, or -1.
    int IndexOf(const std::wstring& name) const;
    /// The point of that name, or null; good until the store changes.
    UNeditPt* Find(const std::wstring& name);
    /// Keeps only the points for which `keep` holds, in their order.
    template <class Keep>
    void KeepIf(Keep keep);
    void Clear();
    /// Room for `count` points without growing.
    void Reserve(std::size_t count);

    const std::vector<UNeditPt>& Items() const { return Points; }
    std::size_t size() const { return Points.size(); }
    bool empty() const { return Points.empty(); }
    UNeditPt& operator[](std::size_t index) { return Points[index]; }
    const UNeditPt& operator[](std::size_t index) const { return Points[index]; }
    std::vector<UNeditPt>::const_iterator begin() const { return Points.begin(); }
    std::vector<UNeditPt>::const_iterator end() const { return Points.end(); }

  private:
    /// The look-up by name, made when it is first needed and kept true after.
    const NameIndex& Index() const;
    void Append(UNeditPt point);
    void RebuildIndex();

    std::vector<UNeditPt> Points;
    mutable NameIndex Names{
        [this](std::size_t i) -> const std::wstring& { return Points[i].GetID(); }};
    mutable bool Indexed = false;
};

template <class Keep>
void PointStore::KeepIf(Keep keep) {
    std::vector<UNeditPt> kept;
    for (UNeditPt& point : Points) {
        if (keep(static_cast<const UNeditPt&>(point))) kept.push_back(std::move(point));
    }
    Points = std::move(kept);
    RebuildIndex();
}

}  // namespace nedit
