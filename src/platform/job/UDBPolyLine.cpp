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
    if (id == 0 || nedit::ObjectKindOf(id) != nedit::kPolylineKind) return false;
    nedit::JobDatabase& job = Job();
    {
        auto query = job.Query(
            "SELECT name, coalesce(layer_id, 0), colour, line_style, thickness, flags "
            "FROM polyline WHERE id = ?");
        query->Bind(1, id);
        if (!query->Step()) return false;
        id_ = id;
        name_ = query->Text(0);
        layer_ = static_cast<long>(query->Int(1));
        colour_ = static_cast<int>(query->Int(2));
        line_style_ = static_cast<int>(query->Int(3));
        thickness_ = static_cast<int>(query->Int(4));
        flags_ = static_cast<unsigned>(query->Int(5));
    }
    vertices_.clear();
    auto query =
        job.Query("SELECT point_id, bulge FROM polyline_vertex WHERE polyline_id = ? ORDER BY seq");
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
        auto write = job.Query(
            id_ == 0
                ? "INSERT INTO polyline (name, layer_id, colour, line_style, thickness, flags) "
                  "VALUES (?, ?, ?, ?, ?, ?)"
                : "UPDATE polyline SET name = ?, layer_id = ?, colour = ?, line_style = ?, "
                  "thickness = ?, flags = ? WHERE id = ?");
        write->Bind(1, name_).BindOptionalId(2, layer_).Bind(3, colour_).Bind(4, line_style_);
        write->Bind(5, thickness_).Bind(6, static_cast<long long>(flags_));
        if (id_ != 0) write->Bind(7, id_);
        write->Run();
        if (id_ == 0) {
            id_ = static_cast<long>(job.LastInsertId());
        } else {
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
