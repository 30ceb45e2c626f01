#pragma once
// Name lists: point names, each with the row of the record list that holds it. A route as
// the search finds it is a name list: its first entry holds the row of the starting set-up's
// STN record, every later entry the row of the observation that led to that name.

#include <string>
#include <vector>

/// A key and the value filed under it.
template <class K, class V>
struct SortStruct {
    K Key;
    V Value;
};

namespace nedit {

/// A point name and its 0-based row.
using NameEntry = SortStruct<std::wstring, int>;
using NameList = std::vector<NameEntry>;

/// The text of a route as the route list shows it: each name followed by a comma
/// ("A,B,C,D,").
std::wstring RouteText(const NameList& route);

}  // namespace nedit
