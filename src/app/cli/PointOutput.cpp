#include "PointOutput.h"

#include <cstdio>

#include "JsonLayout.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/Csv.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

std::string PointsTable(const std::vector<PointRow>& points, int decimals) {
    std::string out = nedit::ToUtf8(nedit::Format(L"%-12s %14s %14s %10s  %s\n", L"Name", L"East",
                                                  L"North", L"Height", L"Code"));
    for (const PointRow& point : points) {
        const std::wstring height =
            point.hasHeight ? nedit::Format(L"%.*f", decimals, point.height) : L"-";
        out += nedit::ToUtf8(
            nedit::TrimRight(nedit::Format(L"%-12s %14.*f %14.*f %10s  %s", point.name, decimals,
                                           point.east, decimals, point.north, height, point.code)));
        out += '\n';
    }
    return out;
}

std::string PointsJson(const std::vector<PointRow>& points, int indent) {
    std::vector<json::Value> rows;
    rows.reserve(points.size());
    for (const PointRow& point : points) {
        rows.push_back({{"id", json::Text(point.name)},
                        {"e", point.east},
                        {"n", point.north},
                        {"h", point.hasHeight ? json::Value(point.height) : json::Value()},
                        {"code", json::Text(point.code)}});
    }
    return json::Rows(rows, indent);
}

std::string PointsCsv(const std::vector<PointRow>& points) {
    std::string out = "name,east,north,height,code\n";
    for (const PointRow& point : points) {
        out += nedit::CsvField(nedit::ToUtf8(point.name)) + "," +
               nedit::ToUtf8(nedit::DoubleToText(point.east)) + "," +
               nedit::ToUtf8(nedit::DoubleToText(point.north)) + "," +
               (point.hasHeight ? nedit::ToUtf8(nedit::DoubleToText(point.height)) : "") + "," +
               nedit::CsvField(nedit::ToUtf8(point.code)) + "\n";
    }
    return out;
}

bool WritePointsCsv(const std::string& path, const std::vector<PointRow>& points) {
    if (nedit::ReplaceFile(path, PointsCsv(points))) return true;
    std::fprintf(stderr, "sxnedit: cannot write %s\n", path.c_str());
    return false;
}
