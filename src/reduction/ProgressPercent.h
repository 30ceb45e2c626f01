#pragma once
// The percent of a pass done, for the progress sink. A pass with nothing to count is done
// whole: no pass may divide by a count of zero.

#include <algorithm>
#include <cstddef>

inline unsigned ProgressPercent(std::size_t done, std::size_t total) {
    return static_cast<unsigned>(100 * done / std::max<std::size_t>(total, 1));
}
