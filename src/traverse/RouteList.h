#pragma once
// The routes found, in the order in which they were finished, with the look-ups that the
// search asks of them after every new set-up: whether two names stand next to each other on
// a route, where a name first stands on each route, and whether a route is held already.
// Each look-up goes by name, so a search over a long file stays linear instead of walking
// every route for every leg. The lists are owned elsewhere and must not change once held.

#include <cstddef>
#include <string>
#include <unordered_map>
#include <vector>

#include "traverse/NameList.h"

namespace nedit {

class RouteList {
  public:
    /// A place on the routes: the route's index and the entry's, both from 0.
    struct Place {
        std::size_t Route;
        std::size_t Entry;
    };

    void Append(const NameList* route);
    void Clear();

    const std::vector<const NameList*>& Routes() const { return Routes_; }
    std::size_t size() const { return Routes_.size(); }
    bool empty() const { return Routes_.empty(); }

    /// `route` itself is held, or a route of the same names in the same order (compared
    /// exactly).
    bool Holds(const NameList& route) const;

    /// `a` and `b` stand next to each other on a route, in either order, names compared
    /// without regard to case; equal names answer true at once. As the route list has always
    /// answered it, the entries are read as one walk over all routes, numbered from 1 within
    /// each route, and the number of the last `a` met is kept from one route to the next:
    /// a `b` numbered one above it on a later route counts as its neighbour too.
    bool IsNeighbour(const std::wstring& a, const std::wstring& b) const;

    /// For each route, in order, that holds `name` (without regard to case): the place of
    /// its first entry of that name.
    std::vector<Place> FirstPlaces(const std::wstring& name) const;

  private:
    const NameEntry& EntryAt(const Place& place) const {
        return (*Routes_[place.Route])[place.Entry];
    }
    /// The walk positions of the entries of `name` (upper-cased), in walk order; null if none.
    const std::vector<std::size_t>* PositionsOf(const std::wstring& name) const;
    static std::size_t HashOf(const NameList& route);

    std::vector<const NameList*> Routes_;
    std::vector<Place> Walk_;  // every entry of every route, in walk order
    std::unordered_map<std::wstring, std::vector<std::size_t>> ByName_;
    std::unordered_map<std::size_t, std::vector<std::size_t>> ByContent_;
};

}  // namespace nedit
