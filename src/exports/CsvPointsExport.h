#pragma once
// Points as CSV for spreadsheets and GIS: a header row naming the columns name, east, north,
// height, code, layer, note and then one column per attribute name, and a row per point.
// Numbers are written so that they read back exactly; a point without a height leaves that
// cell empty. The first five columns are the rows `job import-points` reads.

#include <string>

#include "exports/JobContents.h"

namespace nedit {

std::string PointsCsvText(const JobContents& contents);

}  // namespace nedit
