#pragma once
// What a reduction gives, as the command line prints it.

#include <string>
#include <vector>

#include "PointOutput.h"

class UNeditDatabase;

/// The reduced points of a run, in the order of the point store.
std::vector<PointRow> ReducedPoints(const UNeditDatabase& engine);
/// One JSON object: points, lines, arcs, circles, the engine's error code and the messages.
void PrintJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages);
