#include "platform/job/UDBPolyLine.h"

#include <algorithm>

#include "platform/job/JobDatabase.h"
#include "platform/job/USurveyDoc.h"

UDBPolyLine::UDBPolyLine(USurveyDoc* job, long id)
    : UDBLinework(job, nedit::kPolylineKind, "polyline") {
    if (id != 0) Load(id);
}

void UDBPolyLine::AddVertexAt(int index, const UVertex& vertex) {
    const auto at = index < 0 ? std::size_t{0} : static_cast<std::size_t>(index);
    vertices_.insert(
        vertices_.begin() + static_cast<std::ptrdiff_t>(std::min(at, vertices_.size())), vertex);
}

bool UDBPolyLine::SetAt(int index, const UVertex& vertex) {
    if (index < 0 || index >= GetCount()) return false;
    vertices_[static_cast<std::size_t>(index)] = vertex;
    return true;
}

long UDBPolyLine::GetIdAt(int index) const {
    return index >= 0 && index < GetCount() ? vertices_[static_cast<std::size_t>(index)].PointId
                                            : 0;
}

bool UDBPolyLine::Load(long id) {
    if (!LoadRow(id, {"name"}, [this](const nedit::Statement& row) { name_ = row.Text(0); }))
        return false;
    vertices_.clear();
    auto query = Job().Query(
        "SELECT point_id, bulge FROM polyline_vertex WHERE polyline_id = ? ORDER BY seq");
    query->Bind(1, id);
    while (query->Step()) vertices_.push_back({query->Real(1), static_cast<long>(query->Int(0))});
    return true;
}

bool UDBPolyLine::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (vertices_.size() < 2) {
        Fail(L"A polyline needs at least 2 vertices.");
        return false;
    }
    if (id_ != 0 && !CanUpdate()) return false;
    const bool saved = Guarded([&] {
        nedit::JobDatabase& job = Job();
        const bool updating = id_ != 0;
        SaveRow({"name"}, [this](nedit::Statement& write) { write.Bind(1, name_); });
        if (updating) {
            job.Query("DELETE FROM polyline_vertex WHERE polyline_id = ?")->Bind(1, id_).Run();
        }
        int seq = 0;
        for (std::size_t i = 0; i < vertices_.size(); ++i) {
            // The last vertex ends the line: no segment leaves it, so it has no bulge.
            const double bulge = i + 1 == vertices_.size() ? 0.0 : vertices_[i].Bulge;
            auto insert = job.Query(
                "INSERT INTO polyline_vertex (polyline_id, seq, point_id, bulge) VALUES (?, ?, ?, "
                "?)");
            insert->Bind(1, id_).Bind(2, ++seq).Bind(3, vertices_[i].PointId).Bind(4, bulge).Run();
        }
    });
    if (saved) vertices_.back().Bulge = 0.0;
    return saved;
}

const char* UDBPolyLine::AreaQuery() const {
    return "SELECT DISTINCT v.polyline_id FROM polyline_vertex v JOIN point p ON p.id = v.point_id "
           "WHERE p.east BETWEEN ?1 AND ?2 AND p.north BETWEEN ?3 AND ?4 ORDER BY 1";
}
