#include "platform/job/UDBPoint.h"

#include <cmath>

#include "platform/job/JobDatabase.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"

UDBPoint::UDBPoint(USurveyDoc* job, long id) : UDBObject(job, nedit::kPointKind, "point") {
    if (id != 0) Load(id);
}

UDBPoint::UDBPoint(USurveyDoc* job, const UWPoint& at)
    : UDBObject(job, nedit::kPointKind, "point"), east_(at.x), north_(at.y) {
    SetHeight(at.z);
}

bool UDBPoint::Load(long id) {
    if (id == 0 || nedit::ObjectKindOf(id) != nedit::kPointKind) return false;
    auto query = Job().Query(
        "SELECT name, east, north, height, code, coalesce(layer_id, 0), colour, point_mark, "
        "symbol, symbol_value1, symbol_value2, symbol_value3, flags, status, note "
        "FROM point WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    name_ = query->Text(0);
    east_ = query->Real(1);
    north_ = query->Real(2);
    height_ = query->Height(3);
    code_ = query->Text(4);
    layer_ = static_cast<long>(query->Int(5));
    colour_ = static_cast<int>(query->Int(6));
    point_mark_ = static_cast<int>(query->Int(7));
    symbol_ = static_cast<int>(query->Int(8));
    for (int i = 0; i < 3; ++i) symbol_values_[i] = query->Real(9 + i);
    flags_ = static_cast<unsigned>(query->Int(12));
    status_ = static_cast<unsigned>(query->Int(13));
    note_ = query->Text(14);
    return true;
}

void UDBPoint::ReInit() {
    UDBPoint fresh(job_);
    *this = fresh;
}

bool UDBPoint::Save(int /*undoFlag*/, bool /*redraw*/, bool /*select*/) {
    if (nedit::Trim(name_).empty()) {
        Fail(L"A point needs a name.");
        return false;
    }
    // An overflow must not put "inf" into a job, nor a NaN that the file would hold as NULL,
    // read back as "no height".
    if (!std::isfinite(east_) || !std::isfinite(north_) || !std::isfinite(height_)) {
        Fail(nedit::Translate(L"The coordinates of point {1} are not finite numbers.", {name_}));
        return false;
    }
    if (id_ != 0 && !CanUpdate()) return false;
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        auto write = job.Query(
            id_ == 0 ? "INSERT INTO point (name, east, north, height, code, layer_id, colour, "
                       "point_mark, symbol, symbol_value1, symbol_value2, symbol_value3, flags, "
                       "status, note) VALUES (?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?)"
                     : "UPDATE point SET name = ?, east = ?, north = ?, height = ?, code = ?, "
                       "layer_id = ?, colour = ?, point_mark = ?, symbol = ?, symbol_value1 = ?, "
                       "symbol_value2 = ?, symbol_value3 = ?, flags = ?, status = ?, note = ? "
                       "WHERE id = ?");
        write->Bind(1, name_).Bind(2, east_).Bind(3, north_).BindHeight(4, height_).Bind(5, code_);
        write->BindOptionalId(6, layer_);
        write->Bind(7, colour_).Bind(8, point_mark_).Bind(9, symbol_);
        write->Bind(10, symbol_values_[0]).Bind(11, symbol_values_[1]).Bind(12, symbol_values_[2]);
        write->Bind(13, static_cast<long long>(flags_)).Bind(14, status_).Bind(15, note_);
        if (id_ != 0) write->Bind(16, id_);
        write->Run();
        if (id_ == 0) id_ = static_cast<long>(job.LastInsertId());
    });
}

double UDBPoint::GetSymbolValue(int which) const {
    return which >= 1 && which <= 3 ? symbol_values_[which - 1] : 0.0;
}

void UDBPoint::SetSymbolValues(double scale, double value2, double value3) {
    symbol_values_[0] = scale;
    symbol_values_[1] = value2;
    symbol_values_[2] = value3;
}

bool UDBPoint::SaveExtraSymbols(const std::vector<UExtraSymbol>& symbols) {
    if (id_ == 0) {
        Fail(L"Extra symbols need a saved point.");
        return false;
    }
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        job.Query("DELETE FROM extra_symbol WHERE point_id = ?")->Bind(1, id_).Run();
        int seq = 0;
        for (const UExtraSymbol& symbol : symbols) {
            auto insert = job.Query(
                "INSERT INTO extra_symbol (point_id, seq, symbol, scale_x, scale_y, rotation) "
                "VALUES (?, ?, ?, ?, ?, ?)");
            insert->Bind(1, id_).Bind(2, ++seq).Bind(3, symbol.Symbol).Bind(4, symbol.ScaleX);
            insert->Bind(5, symbol.ScaleY).Bind(6, symbol.Rotation).Run();
        }
    });
}

std::vector<UExtraSymbol> UDBPoint::GetExtraSymbols() const {
    std::vector<UExtraSymbol> symbols;
    if (id_ == 0) return symbols;
    auto query = Job().Query(
        "SELECT symbol, scale_x, scale_y, rotation FROM extra_symbol WHERE point_id = ? ORDER BY "
        "seq");
    query->Bind(1, id_);
    while (query->Step()) {
        symbols.push_back(
            {static_cast<int>(query->Int(0)), query->Real(1), query->Real(2), query->Real(3)});
    }
    return symbols;
}

const char* UDBPoint::AreaQuery() const {
    return "SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 AND ?4 ORDER BY "
           "id";
}
