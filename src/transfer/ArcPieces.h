#pragma once
// Arcs as a polyline takes them: split at their middle point, so that each observed point is
// a vertex, and turned round, so that they run the way the polyline grows.

#include "platform/geometry/UWArc.h"

namespace nedit {

/// Splits `arc` at `at` into two three-point arcs that meet there: `first` from the arc's
/// start to `at`, `second` from `at` to its end, each through its own middle. False, leaving
/// both as they were, when `at` does not lie within the arc's sweep.
bool SplitArcAt(const UWArc& arc, const UWPoint& at, UWArc& first, UWArc& second);

/// The same arc from its end to its start: a three-point arc through its middle.
UWArc ReversedArc(const UWArc& arc);

}  // namespace nedit
