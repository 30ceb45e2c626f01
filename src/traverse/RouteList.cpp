#include "traverse/RouteList.h"

#include <algorithm>
#include <functional>

#include "platform/text/WideText.h"

namespace nedit {

std::size_t RouteList::HashOf(const NameList& route) {
    std::size_t hash = route.size();
    for (const NameEntry& entry : route)
        hash = hash * 1000003u ^ std::hash<std::wstring>()(entry.Key);
    return hash;
}

void RouteList::Append(const NameList* route) {
    const std::size_t index = Routes_.size();
    Routes_.push_back(route);
    ByContent_[HashOf(*route)].push_back(index);
    for (std::size_t entry = 0; entry < route->size(); ++entry) {
        ByName_[ToUpper((*route)[entry].Key)].push_back(Walk_.size());
        Walk_.push_back({index, entry});
    }
}

void RouteList::Clear() {
    Routes_.clear();
    Walk_.clear();
    ByName_.clear();
    ByContent_.clear();
}

bool RouteList::Holds(const NameList& route) const {
    const auto found = ByContent_.find(HashOf(route));
    if (found == ByContent_.end()) return false;
    for (const std::size_t index : found->second) {
        const NameList& held = *Routes_[index];
        if (&held == &route) return true;
        if (held.size() == route.size() &&
            std::equal(held.begin(), held.end(), route.begin(),
                       [](const NameEntry& x, const NameEntry& y) { return x.Key == y.Key; })) {
            return true;
        }
    }
    return false;
}

const std::vector<std::size_t>* RouteList::PositionsOf(const std::wstring& name) const {
    const auto found = ByName_.find(ToUpper(name));
    return found == ByName_.end() ? nullptr : &found->second;
}

bool RouteList::IsNeighbour(const std::wstring& a, const std::wstring& b) const {
    if (EqualsIgnoreCase(a, b)) return true;
    const std::vector<std::size_t>* of_a = PositionsOf(a);
    if (of_a == nullptr) return false;
    // `b` right before an `a` of the same route.
    for (const std::size_t position : *of_a) {
        const Place& place = Walk_[position];
        if (place.Entry > 0 && EqualsIgnoreCase(EntryAt({place.Route, place.Entry - 1}).Key, b))
            return true;
    }
    // `b` numbered one above the last `a` met before it, on its route or an earlier one.
    const std::vector<std::size_t>* of_b = PositionsOf(b);
    if (of_b == nullptr) return false;
    for (const std::size_t position : *of_b) {
        const auto after = std::lower_bound(of_a->begin(), of_a->end(), position);
        if (after == of_a->begin()) continue;
        if (Walk_[*(after - 1)].Entry + 1 == Walk_[position].Entry) return true;
    }
    return false;
}

std::vector<RouteList::Place> RouteList::FirstPlaces(const std::wstring& name) const {
    std::vector<Place> places;
    const std::vector<std::size_t>* positions = PositionsOf(name);
    if (positions == nullptr) return places;
    for (const std::size_t position : *positions) {
        const Place& place = Walk_[position];
        if (places.empty() || places.back().Route != place.Route) places.push_back(place);
    }
    return places;
}

}  // namespace nedit
