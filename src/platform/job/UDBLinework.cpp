// Lines, arcs and circles: objects that hang on points of the job, and the style columns that
// they and the polylines share.
#include <iterator>
#include <string>

#include "platform/job/JobDatabase.h"
#include "platform/job/UDBArc.h"
#include "platform/job/UDBCircle.h"
#include "platform/job/UDBLine.h"
#include "platform/job/USurveyDoc.h"

// ---- UDBLinework -----------------------------------------------------------------------

namespace {

// The style columns in their order.
constexpr const char* kStyleColumns[] = {"layer_id", "colour", "line_style", "thickness", "flags"};
constexpr int kStyleCount = static_cast<int>(std::size(kStyleColumns));

// The kind's own columns, then the style columns, each as `item` writes it, with ", " between.
template <class Item>
std::string EveryColumn(std::initializer_list<const char*> own, Item item) {
    std::string text;
    auto add = [&text](const std::string& piece) { text += (text.empty() ? "" : ", ") + piece; };
    for (const char* column : own) add(item(column));
    for (const char* column : kStyleColumns) add(item(column));
    return text;
}

}  // namespace

bool UDBLinework::LoadRow(long id, std::initializer_list<const char*> columns,
                          const ReadColumns& read) {
    if (id == 0 || nedit::ObjectKindOf(id) != kind_) return false;
    // A row without a layer reads as layer 0.
    const std::string selected = EveryColumn(columns, [](const std::string& column) {
        return column == "layer_id" ? "coalesce(layer_id, 0)" : column;
    });
    auto query = Job().Query("SELECT " + selected + " FROM " + table_ + " WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    read(*query);
    const int first = static_cast<int>(columns.size());
    layer_ = static_cast<long>(query->Int(first));
    colour_ = static_cast<int>(query->Int(first + 1));
    line_style_ = static_cast<int>(query->Int(first + 2));
    thickness_ = static_cast<int>(query->Int(first + 3));
    flags_ = static_cast<unsigned>(query->Int(first + 4));
    return true;
}

void UDBLinework::SaveRow(std::initializer_list<const char*> columns, const BindColumns& bind) {
    const std::string table = table_;
    std::string sql;
    if (id_ == 0) {
        const std::string names =
            EveryColumn(columns, [](const std::string& name) { return name; });
        const std::string marks =
            EveryColumn(columns, [](const std::string&) { return std::string("?"); });
        sql = "INSERT INTO " + table + " (" + names + ") VALUES (" + marks + ")";
    } else {
        const std::string assignments =
            EveryColumn(columns, [](const std::string& name) { return name + " = ?"; });
        sql = "UPDATE " + table + " SET " + assignments + " WHERE id = ?";
    }
    nedit::JobDatabase& job = Job();
    auto write = job.Query(sql);
    bind(*write);
    const int first = static_cast<int>(columns.size()) + 1;
    write->BindOptionalId(first, layer_);
    write->Bind(first + 1, colour_).Bind(first + 2, line_style_).Bind(first + 3, thickness_);
    write->Bind(first + 4, static_cast<long long>(flags_));
    if (id_ != 0) write->Bind(first + kStyleCount, id_);
    write->Run();
    if (id_ == 0) id_ = static_cast<long>(job.LastInsertId());
}

// ---- UDBLine ---------------------------------------------------------------------------

UDBLine::UDBLine(USurveyDoc* job, long id) : UDBLinework(job, nedit::kLineKind, "line") {
    if (id != 0) Load(id);
}

bool UDBLine::Load(long id) {
    return LoadRow(id, {"start_id", "end_id"}, [this](const nedit::Statement& row) {
        start_ = static_cast<long>(row.Int(0));
        end_ = static_cast<long>(row.Int(1));
    });
}

bool UDBLine::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        SaveRow({"start_id", "end_id"},
                [this](nedit::Statement& write) { write.Bind(1, start_).Bind(2, end_); });
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
    return LoadRow(id, {"start_id", "end_id", "third_id", "arc_type"},
                   [this](const nedit::Statement& row) {
                       start_ = static_cast<long>(row.Int(0));
                       end_ = static_cast<long>(row.Int(1));
                       third_ = static_cast<long>(row.Int(2));
                       arc_type_ = static_cast<int>(row.Int(3));
                   });
}

bool UDBArc::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        SaveRow({"start_id", "end_id", "third_id", "arc_type"}, [this](nedit::Statement& write) {
            write.Bind(1, start_).Bind(2, end_).Bind(3, third_).Bind(4, arc_type_);
        });
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
    return LoadRow(id, {"centre_id", "radius"}, [this](const nedit::Statement& row) {
        centre_ = static_cast<long>(row.Int(0));
        radius_ = row.Real(1);
    });
}

bool UDBCircle::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        SaveRow({"centre_id", "radius"},
                [this](nedit::Statement& write) { write.Bind(1, centre_).Bind(2, radius_); });
    });
}

const char* UDBCircle::AreaQuery() const {
    return "WITH inside AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 "
           "AND ?4) "
           "SELECT id FROM circle WHERE centre_id IN inside ORDER BY id";
}
