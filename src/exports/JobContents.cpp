#include "exports/JobContents.h"

#include <set>
#include <stdexcept>
#include <unordered_map>

#include "platform/geometry/UWArc.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

std::string Utf8(const Statement& row, int column) {
    return ToUtf8(row.Text(column));
}

// Columns name, east, north, height from `first` on.
JobVertex VertexAt(const Statement& row, int first) {
    return {Utf8(row, first),
            UWPoint(row.Real(first + 1), row.Real(first + 2), row.Height(first + 3))};
}

std::string PointColumns(const char* table) {
    const std::string p = table;
    return p + ".name, " + p + ".east, " + p + ".north, " + p + ".height";
}

// Picks the objects of the layers asked for, and remembers which layers went out.
class LayerFilter {
  public:
    LayerFilter(USurveyDoc& job, const std::vector<std::string>& wanted)
        : wanted_(wanted.begin(), wanted.end()), order_(JobLayerNames(job)) {
        const std::set<std::string> known(order_.begin(), order_.end());
        for (const std::string& name : wanted_) {
            if (known.count(name) == 0) throw std::invalid_argument("the job has no layer " + name);
        }
    }

    bool Takes(const std::string& layer) {
        if (!wanted_.empty() && wanted_.count(layer) == 0) return false;
        if (!layer.empty()) used_.insert(layer);
        return true;
    }

    std::vector<std::string> UsedLayers() const {
        std::vector<std::string> used;
        for (const std::string& name : order_) {
            if (used_.count(name) != 0) used.push_back(name);
        }
        return used;
    }

  private:
    std::set<std::string> wanted_;
    std::set<std::string> used_;
    std::vector<std::string> order_;
};

void ReadPoints(JobDatabase& job, LayerFilter& filter, std::vector<ExportPoint>& points) {
    std::unordered_map<long long, std::size_t> index;
    {
        auto query = job.Query("SELECT p.id, " + PointColumns("p") +
                               ", p.code, coalesce(layer.name, ''), p.note FROM point p "
                               "LEFT JOIN layer ON layer.id = p.layer_id ORDER BY p.id");
        while (query->Step()) {
            std::string layer = Utf8(*query, 6);
            if (!filter.Takes(layer)) continue;
            index.emplace(query->Int(0), points.size());
            points.push_back(
                {VertexAt(*query, 1), Utf8(*query, 5), std::move(layer), Utf8(*query, 7), {}});
        }
    }
    auto query = job.Query(
        "SELECT object_id, name, value FROM attribute WHERE (object_id >> 26) = ? "
        "ORDER BY object_id, seq");
    query->Bind(1, kPointKind);
    while (query->Step()) {
        const auto found = index.find(query->Int(0));
        if (found == index.end()) continue;
        points[found->second].attributes.emplace_back(Utf8(*query, 1), Utf8(*query, 2));
    }
}

void ReadLines(JobDatabase& job, LayerFilter& filter, std::vector<ExportLine>& lines) {
    auto query = job.Query("SELECT " + PointColumns("a") + ", " + PointColumns("b") +
                           ", coalesce(layer.name, '') FROM line JOIN point a ON a.id = "
                           "line.start_id JOIN point b ON b.id = line.end_id LEFT JOIN layer ON "
                           "layer.id = line.layer_id ORDER BY line.id");
    while (query->Step()) {
        std::string layer = Utf8(*query, 8);
        if (filter.Takes(layer))
            lines.push_back({VertexAt(*query, 0), VertexAt(*query, 4), std::move(layer)});
    }
}

void ReadArcs(JobDatabase& job, LayerFilter& filter, std::vector<ExportArc>& arcs) {
    auto query = job.Query("SELECT " + PointColumns("a") + ", " + PointColumns("b") + ", " +
                           PointColumns("c") +
                           ", arc.arc_type, coalesce(layer.name, '') FROM arc JOIN point a ON "
                           "a.id = arc.start_id JOIN point b ON b.id = arc.end_id JOIN point c "
                           "ON c.id = arc.third_id LEFT JOIN layer ON layer.id = arc.layer_id "
                           "ORDER BY arc.id");
    while (query->Step()) {
        std::string layer = Utf8(*query, 13);
        if (!filter.Takes(layer)) continue;
        ExportArc arc;
        arc.start = VertexAt(*query, 0);
        arc.end = VertexAt(*query, 4);
        const UWArc shape(arc.start.at, arc.end.at, VertexAt(*query, 8).at,
                          static_cast<ArcType>(query->Int(12)));
        arc.centre = shape.ComputeCentre();
        arc.radius = shape.ComputeRadius();
        arc.bulge = shape.GetBulgeFactor();
        arc.layer = std::move(layer);
        arcs.push_back(std::move(arc));
    }
}

void ReadCircles(JobDatabase& job, LayerFilter& filter, std::vector<ExportCircle>& circles) {
    auto query = job.Query("SELECT " + PointColumns("p") +
                           ", circle.radius, coalesce(layer.name, '') FROM circle JOIN point p "
                           "ON p.id = circle.centre_id LEFT JOIN layer ON layer.id = "
                           "circle.layer_id ORDER BY circle.id");
    while (query->Step()) {
        std::string layer = Utf8(*query, 5);
        if (filter.Takes(layer))
            circles.push_back({VertexAt(*query, 0), query->Real(4), std::move(layer)});
    }
}

void ReadPolylines(JobDatabase& job, LayerFilter& filter, std::vector<ExportPolyline>& polylines) {
    std::unordered_map<long long, std::size_t> index;
    {
        auto query = job.Query(
            "SELECT polyline.id, polyline.name, coalesce(layer.name, '') FROM polyline "
            "LEFT JOIN layer ON layer.id = polyline.layer_id ORDER BY polyline.id");
        while (query->Step()) {
            std::string layer = Utf8(*query, 2);
            if (!filter.Takes(layer)) continue;
            index.emplace(query->Int(0), polylines.size());
            polylines.push_back({Utf8(*query, 1), std::move(layer), false, {}});
        }
    }
    // One pass over every vertex, so that many polylines stay linear.
    auto query = job.Query("SELECT v.polyline_id, " + PointColumns("p") +
                           ", v.bulge, v.point_id FROM polyline_vertex v JOIN point p ON p.id = "
                           "v.point_id ORDER BY v.polyline_id, v.seq");
    std::vector<long long> first_point(polylines.size(), 0);
    std::vector<long long> last_point(polylines.size(), 0);
    while (query->Step()) {
        const auto found = index.find(query->Int(0));
        if (found == index.end()) continue;
        ExportPolyline& polyline = polylines[found->second];
        if (polyline.vertices.empty()) first_point[found->second] = query->Int(6);
        last_point[found->second] = query->Int(6);
        polyline.vertices.emplace_back(VertexAt(*query, 1), query->Real(5));
    }
    for (std::size_t i = 0; i < polylines.size(); ++i) {
        polylines[i].closed = polylines[i].vertices.size() > 2 && first_point[i] == last_point[i];
    }
}

}  // namespace

std::vector<std::string> JobLayerNames(USurveyDoc& job) {
    std::vector<std::string> names;
    auto query = job.Database().Query("SELECT name FROM layer ORDER BY id");
    while (query->Step()) names.push_back(Utf8(*query, 0));
    return names;
}

JobContents ReadJobContents(USurveyDoc& job, const std::vector<std::string>& layers) {
    JobDatabase& database = job.Database();
    LayerFilter filter(job, layers);
    JobContents contents;
    ReadPoints(database, filter, contents.points);
    ReadLines(database, filter, contents.lines);
    ReadArcs(database, filter, contents.arcs);
    ReadCircles(database, filter, contents.circles);
    ReadPolylines(database, filter, contents.polylines);
    contents.layers = filter.UsedLayers();
    contents.lengthUnit = job.GetSettings().GetLengthUnit();
    return contents;
}

}  // namespace nedit
