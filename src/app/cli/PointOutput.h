#pragma once
// Points as the command line shows and writes them: a table for people, JSON for programs,
// and CSV rows of name,east,north,height,code that `job import-points` reads back.

#include <functional>
#include <string>
#include <vector>

struct PointRow {
    std::wstring name;
    double east = 0.0;
    double north = 0.0;
    bool hasHeight = false;
    double height = 0.0;
    std::wstring code;
};

/// Columns Name, East, North, Height, Code with `decimals` places; "-" for no height.
std::string PointsTable(const std::vector<PointRow>& points, int decimals);
/// The table's head line, and the line of one point.
std::string PointsTableHead();
std::string PointsTableRow(const PointRow& point, int decimals);
/// A JSON array of objects id, e, n, h (null for no height) and code, one per line, the
/// array indented by `indent` blanks.
std::string PointsJson(const std::vector<PointRow>& points, int indent);
/// The object of one point, on one line.
std::string PointJson(const PointRow& point);
/// A header row and one row per point; numbers written so that they read back exactly.
std::string PointsCsv(const std::vector<PointRow>& points);
std::string PointsCsvHead();
std::string PointsCsvRow(const PointRow& point);
/// Writes PointsCsv to a file; false, with a message on standard error, when it cannot.
bool WritePointsCsv(const std::string& path, const std::vector<PointRow>& points);
/// The same for points given one at a time by `each`, which calls its argument for every one.
bool WritePointsCsv(const std::string& path,
                    const std::function<void(const std::function<void(const PointRow&)>&)>& each);
