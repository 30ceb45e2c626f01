#include "JobListings.h"

#include <cstdio>
#include <memory>
#include <vector>

#include "Commands.h"
#include "JsonLayout.h"
#include "platform/geometry/UWArc.h"
#include "platform/job/JobTransfers.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"

namespace {

/// A point of the job as a listing shows it.
struct JobVertex {
    std::wstring name;
    UWPoint at;
};

std::unique_ptr<USurveyDoc> OpenForReading(const std::string& path) {
    nedit::JobOpenOptions options;
    options.access = nedit::JobAccess::ReadOnly;
    return USurveyDoc::OpenJob(path, options);
}

// Columns name, e, n, h from `first` on.
JobVertex VertexAt(const nedit::Statement& row, int first) {
    return {row.Text(first),
            UWPoint(row.Real(first + 1), row.Real(first + 2), row.Height(first + 3))};
}

json::Value PointJson(const JobVertex& point) {
    json::Value value = {{"id", json::Text(point.name)}, {"e", point.at.x}, {"n", point.at.y}};
    value["h"] = point.at.HasHeight() ? json::Value(point.at.z) : json::Value(nullptr);
    return value;
}

std::wstring PointText(const JobVertex& point, int decimals) {
    const std::wstring height =
        point.at.HasHeight() ? nedit::Format(L"%.*f", decimals, point.at.z) : L"-";
    return nedit::Format(L"%-12s %14.*f %14.*f %10s", point.name, decimals, point.at.x, decimals,
                         point.at.y, height);
}

int Print(const std::wstring& text) {
    const std::string out = nedit::ToUtf8(text);
    std::fwrite(out.data(), 1, out.size(), stdout);
    return std::fflush(stdout) == 0 ? exit_status::Ok : exit_status::Failed;
}

int PrintJson(const std::vector<json::Value>& rows) {
    return Print(nedit::FromUtf8(json::Rows(rows, 0) + "\n"));
}

// The columns of a point, joined from the table `p<index>` of a query.
std::string PointColumns(int index) {
    const std::string p = "p" + std::to_string(index);
    return p + ".name, " + p + ".east, " + p + ".north, " + p + ".height";
}

}  // namespace

int ListPolylines(const std::string& path, bool json) {
    auto job = OpenForReading(path);
    const int decimals = job->GetSettings().GetLengthDecimals();
    struct Polyline {
        long id;
        std::wstring name;
        std::wstring layer;
        std::vector<std::pair<JobVertex, double>> vertices;
        std::vector<long> points;
    };
    std::vector<Polyline> polylines;
    {
        auto query = job->Database().Query(
            "SELECT polyline.id, polyline.name, coalesce(layer.name, '') FROM polyline "
            "LEFT JOIN layer ON layer.id = polyline.layer_id ORDER BY polyline.id");
        while (query->Step()) {
            polylines.push_back(
                {static_cast<long>(query->Int(0)), query->Text(1), query->Text(2), {}, {}});
        }
    }
    for (Polyline& polyline : polylines) {
        auto query = job->Database().Query("SELECT " + PointColumns(1) +
                                           ", v.bulge, v.point_id FROM polyline_vertex v JOIN "
                                           "point p1 ON p1.id = v.point_id WHERE "
                                           "v.polyline_id = ? ORDER BY v.seq");
        query->Bind(1, polyline.id);
        while (query->Step()) {
            polyline.vertices.emplace_back(VertexAt(*query, 0), query->Real(4));
            polyline.points.push_back(static_cast<long>(query->Int(5)));
        }
    }
    std::vector<json::Value> rows;
    std::wstring text;
    for (const Polyline& polyline : polylines) {
        const bool closed =
            polyline.points.size() > 2 && polyline.points.front() == polyline.points.back();
        if (json) {
            json::Value vertices = json::Value::array();
            for (const auto& [point, bulge] : polyline.vertices) {
                json::Value vertex = PointJson(point);
                vertex["bulge"] = bulge;
                vertices.push_back(vertex);
            }
            rows.push_back({{"name", json::Text(polyline.name)},
                            {"layer", json::Text(polyline.layer)},
                            {"closed", closed},
                            {"vertices", vertices}});
            continue;
        }
        text +=
            nedit::Format(L"%s (layer %s, %s, %d vertices)\n", polyline.name, polyline.layer,
                          closed ? L"closed" : L"open", static_cast<int>(polyline.vertices.size()));
        for (const auto& [point, bulge] : polyline.vertices)
            text += L"  " + PointText(point, decimals) + nedit::Format(L" %12.6f\n", bulge);
    }
    return json ? PrintJson(rows) : Print(text);
}

int ListLines(const std::string& path, bool json) {
    auto job = OpenForReading(path);
    const int decimals = job->GetSettings().GetLengthDecimals();
    auto query = job->Database().Query(
        "SELECT " + PointColumns(1) + ", " + PointColumns(2) +
        ", coalesce(layer.name, '') FROM line JOIN point p1 ON p1.id = line.start_id "
        "JOIN point p2 ON p2.id = line.end_id LEFT JOIN layer ON layer.id = line.layer_id "
        "ORDER BY line.id");
    std::vector<json::Value> rows;
    std::wstring text;
    while (query->Step()) {
        const JobVertex from = VertexAt(*query, 0);
        const JobVertex to = VertexAt(*query, 4);
        if (json) {
            rows.push_back({{"from", PointJson(from)},
                            {"to", PointJson(to)},
                            {"layer", json::Text(query->Text(8))}});
        } else {
            text += PointText(from, decimals) + L"  " + PointText(to, decimals) + L"  " +
                    query->Text(8) + L"\n";
        }
    }
    return json ? PrintJson(rows) : Print(text);
}

int ListArcs(const std::string& path, bool json) {
    auto job = OpenForReading(path);
    const int decimals = job->GetSettings().GetLengthDecimals();
    auto query = job->Database().Query(
        "SELECT " + PointColumns(1) + ", " + PointColumns(2) + ", " + PointColumns(3) +
        ", arc.arc_type, coalesce(layer.name, '') FROM arc JOIN point p1 ON p1.id = "
        "arc.start_id JOIN point p2 ON p2.id = arc.end_id JOIN point p3 ON p3.id = "
        "arc.third_id LEFT JOIN layer ON layer.id = arc.layer_id ORDER BY arc.id");
    std::vector<json::Value> rows;
    std::wstring text;
    while (query->Step()) {
        const JobVertex start = VertexAt(*query, 0);
        const JobVertex end = VertexAt(*query, 4);
        const JobVertex third = VertexAt(*query, 8);
        const UWArc arc(start.at, end.at, third.at, static_cast<ArcType>(query->Int(12)));
        const UWPoint centre = arc.ComputeCentre();
        const wchar_t* sense = arc.IsClockwise() ? L"clockwise" : L"anticlockwise";
        if (json) {
            rows.push_back({{"start", PointJson(start)},
                            {"end", PointJson(end)},
                            {"centre", {{"e", centre.x}, {"n", centre.y}}},
                            {"radius", arc.ComputeRadius()},
                            {"sense", json::Text(sense)},
                            {"layer", json::Text(query->Text(13))}});
        } else {
            text += PointText(start, decimals) + L"  " + PointText(end, decimals) +
                    nedit::Format(L"  centre %.*f %.*f radius %.*f %s  %s\n", decimals, centre.x,
                                  decimals, centre.y, decimals, arc.ComputeRadius(), sense,
                                  query->Text(13));
        }
    }
    return json ? PrintJson(rows) : Print(text);
}

int ListCircles(const std::string& path, bool json) {
    auto job = OpenForReading(path);
    const int decimals = job->GetSettings().GetLengthDecimals();
    auto query = job->Database().Query(
        "SELECT " + PointColumns(1) +
        ", circle.radius, coalesce(layer.name, '') FROM circle JOIN point p1 ON p1.id = "
        "circle.centre_id LEFT JOIN layer ON layer.id = circle.layer_id ORDER BY circle.id");
    std::vector<json::Value> rows;
    std::wstring text;
    while (query->Step()) {
        const JobVertex centre = VertexAt(*query, 0);
        if (json) {
            rows.push_back({{"centre", PointJson(centre)},
                            {"radius", query->Real(4)},
                            {"layer", json::Text(query->Text(5))}});
        } else {
            text += PointText(centre, decimals) +
                    nedit::Format(L"  radius %.*f  %s\n", decimals, query->Real(4), query->Text(5));
        }
    }
    return json ? PrintJson(rows) : Print(text);
}

int ListTransfers(const std::string& path, bool json) {
    auto job = OpenForReading(path);
    std::vector<json::Value> rows;
    std::wstring text;
    for (const nedit::TransferRecord& record : nedit::ReadTransfers(job->Database())) {
        if (json) {
            json::Value left = json::Value::array();
            for (const nedit::NotWritten& object : record.Left) {
                left.push_back({{"kind", json::Text(object.Kind)},
                                {"name", json::Text(object.Name)},
                                {"reason", json::Text(object.Reason)}});
            }
            rows.push_back({{"made_at", json::Text(record.MadeAt)},
                            {"source", json::Text(record.Source)},
                            {"complete", record.Complete},
                            {"written",
                             {{"points", record.Points},
                              {"lines", record.Lines},
                              {"arcs", record.Arcs},
                              {"circles", record.Circles},
                              {"polylines", record.Polylines}}},
                            {"not_written", left}});
            continue;
        }
        text += nedit::Format(
            L"%s %s%s: points %d, lines %d, arcs %d, circles %d, polylines %d, %d left out\n",
            record.MadeAt, record.Source, record.Complete ? L"" : L" (stopped by a failure)",
            record.Points, record.Lines, record.Arcs, record.Circles, record.Polylines,
            static_cast<int>(record.Left.size()));
        for (const nedit::NotWritten& object : record.Left)
            text += L"  " + object.Kind + L" " + object.Name + L": " + object.Reason + L"\n";
    }
    return json ? PrintJson(rows) : Print(text);
}
