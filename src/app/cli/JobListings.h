#pragma once
// sxnedit job polylines|lines|arcs|circles|transfers: what the job holds besides its points,
// and the transfers into it, as a table for people or as JSON for programs. A point is its
// name, East, North and height (null in JSON, "-" in a table, when it has none).

#include <string>

/// Each prints the job's objects of its kind, in the order they were stored, and gives the
/// exit status.
int ListPolylines(const std::string& path, bool json);
int ListLines(const std::string& path, bool json);
int ListArcs(const std::string& path, bool json);
int ListCircles(const std::string& path, bool json);
/// Every transfer into the job, oldest first, with what it left out.
int ListTransfers(const std::string& path, bool json);
