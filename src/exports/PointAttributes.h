#pragma once
// The attribute names of a set of points as columns: every name that any point carries, in
// the order first met, so that a table of points (CSV, a GIS layer) has one column per name
// and a point without that attribute leaves its cell empty.

#include <string>
#include <vector>

#include "exports/JobContents.h"

namespace nedit {

std::vector<std::string> AttributeColumns(const std::vector<ExportPoint>& points);

/// The value of the attribute `name` of `point`; empty when it has none (the first of that
/// name when it has several).
std::string AttributeValue(const ExportPoint& point, const std::string& name);

}  // namespace nedit
