#include "PointOutput.h"

#include <cstdio>

#include "JsonLayout.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/Csv.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

std::string PointsTableHead() {
    return nedit::ToUtf8(nedit::Format(L"%-12s %14s %14s %10s  %s\n", L"Name", L"East", L"North",
                                       L"Height", L"Code"));
}

std::string PointsTableRow(const PointRow& point, int decimals) {
    const std::wstring height =
        point.hasHeight ? nedit::Format(L"%.*f", decimals, point.height) : L"-";
    return nedit::ToUtf8(nedit::TrimRight(nedit::Format(L"%-12s %14.*f %14.*f %10s  %s", point.name,
                                                        decimals, point.east, decimals, point.north,
                                                        height, point.code))) +
           '\n';
}

std::string PointsTable(const std::vector<PointRow>& points, int decimals) {
    std::string out = PointsTableHead();
    for (const PointRow& point : points) out += PointsTableRow(point, decimals);
    return out;
}

std::string PointJson(const PointRow& point) {
    // The members in the order a JSON object of them is written: id, e, n, h, code.
    return "{\"id\": " + json::String(point.name) + ", \"e\": " + json::Number(point.east) +
           ", \"n\": " + json::Number(point.north) +
           ", \"h\": " + (point.hasHeight ? json::Number(point.height) : "null") +
           ", \"code\": " + json::String(point.code) + "}";
}

std::string PointsJson(const std::vector<PointRow>& points, int indent) {
    std::string out;
    json::RowWriter writer(out, indent);
    for (const PointRow& point : points) writer.Row(PointJson(point));
    writer.End();
    return out;
}

std::string PointsCsvHead() {
    return "name,east,north,height,code\n";
}

std::string PointsCsvRow(const PointRow& point) {
    return nedit::CsvField(nedit::ToUtf8(point.name)) + "," +
           nedit::ToUtf8(nedit::DoubleToText(point.east)) + "," +
           nedit::ToUtf8(nedit::DoubleToText(point.north)) + "," +
           (point.hasHeight ? nedit::ToUtf8(nedit::DoubleToText(point.height)) : "") + "," +
           nedit::CsvField(nedit::ToUtf8(point.code)) + "\n";
}

std::string PointsCsv(const std::vector<PointRow>& points) {
    std::string out = PointsCsvHead();
    for (const PointRow& point : points) out += PointsCsvRow(point);
    return out;
}

bool WritePointsCsv(const std::string& path, const std::vector<PointRow>& points) {
    return WritePointsCsv(path, [&points](const std::function<void(const PointRow&)>& take) {
        for (const PointRow& point : points) take(point);
    });
}

bool WritePointsCsv(const std::string& path,
                    const std::function<void(const std::function<void(const PointRow&)>&)>& each) {
    const bool written = nedit::ReplaceFile(path, [&each](const nedit::ByteSink& write) {
        bool ok = write(PointsCsvHead());
        each([&](const PointRow& point) { ok = ok && write(PointsCsvRow(point)); });
        return ok;
    });
    if (written) return true;
    std::fprintf(stderr, "sxnedit: cannot write %s\n", path.c_str());
    return false;
}
