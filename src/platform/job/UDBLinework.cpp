// Lines, arcs and circles: objects that hang on points of the job.
#include "platform/job/JobDatabase.h"
#include "platform/job/UDBArc.h"
#include "platform/job/UDBCircle.h"
#include "platform/job/UDBLine.h"
#include "platform/job/USurveyDoc.h"

// ---- UDBLine ---------------------------------------------------------------------------

UDBLine::UDBLine(USurveyDoc* job, long id) : UDBLinework(job, nedit::kLineKind, "line") {
    if (id != 0) Load(id);
}

bool UDBLine::Load(long id) {
    if (id == 0 || nedit::ObjectKindOf(id) != nedit::kLineKind) return false;
    auto query = Job().Query(
        "SELECT start_id, end_id, coalesce(layer_id, 0), colour, line_style, thickness, flags "
        "FROM line WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    start_ = static_cast<long>(query->Int(0));
    end_ = static_cast<long>(query->Int(1));
    layer_ = static_cast<long>(query->Int(2));
    colour_ = static_cast<int>(query->Int(3));
    line_style_ = static_cast<int>(query->Int(4));
    thickness_ = static_cast<int>(query->Int(5));
    flags_ = static_cast<unsigned>(query->Int(6));
    return true;
}

bool UDBLine::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        auto write = job.Query(
            id_ == 0
                ? "INSERT INTO line (start_id, end_id, layer_id, colour, line_style, thickness, "
                  "flags) VALUES (?, ?, ?, ?, ?, ?, ?)"
                : "UPDATE line SET start_id = ?, end_id = ?, layer_id = ?, colour = ?, "
                  "line_style = ?, thickness = ?, flags = ? WHERE id = ?");
        write->Bind(1, start_).Bind(2, end_);
        write->BindOptionalId(3, layer_);
        write->Bind(4, colour_).Bind(5, line_style_).Bind(6, thickness_);
        write->Bind(7, static_cast<long long>(flags_));
        if (id_ != 0) write->Bind(8, id_);
        write->Run();
        if (id_ == 0) id_ = static_cast<long>(job.LastInsertId());
    });
}

const char* UDBLine::AreaQuery() const {
    return "WITH inside AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 "
           "AND ?4) "
           "SELECT id FROM line WHERE start_id IN inside OR end_id IN inside ORDER BY id";
}

// ---- UDBArc ----------------------------------------------------------------------------

UDBArc::UDBArc(USurveyDoc* job, long id) : UDBLinework(job, nedit::kArcKind, "arc") {
    if (id != 0) Load(id);
}

bool UDBArc::Load(long id) {
    if (id == 0 || nedit::ObjectKindOf(id) != nedit::kArcKind) return false;
    auto query = Job().Query(
        "SELECT start_id, end_id, third_id, arc_type, coalesce(layer_id, 0), colour, line_style, "
        "thickness, flags FROM arc WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    start_ = static_cast<long>(query->Int(0));
    end_ = static_cast<long>(query->Int(1));
    third_ = static_cast<long>(query->Int(2));
    arc_type_ = static_cast<int>(query->Int(3));
    layer_ = static_cast<long>(query->Int(4));
    colour_ = static_cast<int>(query->Int(5));
    line_style_ = static_cast<int>(query->Int(6));
    thickness_ = static_cast<int>(query->Int(7));
    flags_ = static_cast<unsigned>(query->Int(8));
    return true;
}

bool UDBArc::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        auto write = job.Query(
            id_ == 0 ? "INSERT INTO arc (start_id, end_id, third_id, arc_type, layer_id, colour, "
                       "line_style, thickness, flags) VALUES (?, ?, ?, ?, ?, ?, ?, ?, ?)"
                     : "UPDATE arc SET start_id = ?, end_id = ?, third_id = ?, arc_type = ?, "
                       "layer_id = ?, colour = ?, line_style = ?, thickness = ?, flags = ? "
                       "WHERE id = ?");
        write->Bind(1, start_).Bind(2, end_).Bind(3, third_).Bind(4, arc_type_);
        write->BindOptionalId(5, layer_);
        write->Bind(6, colour_).Bind(7, line_style_).Bind(8, thickness_);
        write->Bind(9, static_cast<long long>(flags_));
        if (id_ != 0) write->Bind(10, id_);
        write->Run();
        if (id_ == 0) id_ = static_cast<long>(job.LastInsertId());
    });
}

const char* UDBArc::AreaQuery() const {
    return "WITH inside AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 "
           "AND ?4) "
           "SELECT id FROM arc WHERE start_id IN inside OR end_id IN inside OR third_id IN inside "
           "ORDER BY id";
}

// ---- UDBCircle -------------------------------------------------------------------------

UDBCircle::UDBCircle(USurveyDoc* job, long id) : UDBLinework(job, nedit::kCircleKind, "circle") {
    if (id != 0) Load(id);
}

bool UDBCircle::Load(long id) {
    if (id == 0 || nedit::ObjectKindOf(id) != nedit::kCircleKind) return false;
    auto query = Job().Query(
        "SELECT centre_id, radius, coalesce(layer_id, 0), colour, line_style, thickness, flags "
        "FROM circle WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    centre_ = static_cast<long>(query->Int(0));
    radius_ = query->Real(1);
    layer_ = static_cast<long>(query->Int(2));
    colour_ = static_cast<int>(query->Int(3));
    line_style_ = static_cast<int>(query->Int(4));
    thickness_ = static_cast<int>(query->Int(5));
    flags_ = static_cast<unsigned>(query->Int(6));
    return true;
}

bool UDBCircle::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        auto write = job.Query(
            id_ == 0 ? "INSERT INTO circle (centre_id, radius, layer_id, colour, line_style, "
                       "thickness, flags) VALUES (?, ?, ?, ?, ?, ?, ?)"
                     : "UPDATE circle SET centre_id = ?, radius = ?, layer_id = ?, colour = ?, "
                       "line_style = ?, thickness = ?, flags = ? WHERE id = ?");
        write->Bind(1, centre_).Bind(2, radius_);
        write->BindOptionalId(3, layer_);
        write->Bind(4, colour_).Bind(5, line_style_).Bind(6, thickness_);
        write->Bind(7, static_cast<long long>(flags_));
        if (id_ != 0) write->Bind(8, id_);
        write->Run();
        if (id_ == 0) id_ = static_cast<long>(job.LastInsertId());
    });
}

const char* UDBCircle::AreaQuery() const {
    return "WITH inside AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 "
           "AND ?4) "
           "SELECT id FROM circle WHERE centre_id IN inside ORDER BY id";
}
