#include "platform/job/UDBLayer.h"

#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

UDBLayer::UDBLayer(USurveyDoc* job, const std::wstring& name) : job_(job), name_(name) {
    if (job_ != nullptr) {
        const long id = job_->GetLayerId(name);
        if (id != 0) Load(id);
    }
}

UDBLayer::UDBLayer(USurveyDoc* job, long id) : job_(job) {
    if (job_ != nullptr && id != 0) Load(id);
}

bool UDBLayer::Load(long id) {
    if (job_ == nullptr) return false;
    auto query = job_->Database().Query(
        "SELECT name, colour, point_mark, symbol, line_style, thickness, locked, active "
        "FROM layer WHERE id = ?");
    query->Bind(1, id);
    if (!query->Step()) return false;
    id_ = id;
    name_ = query->Text(0);
    colour_ = static_cast<int>(query->Int(1));
    point_mark_ = static_cast<int>(query->Int(2));
    symbol_ = static_cast<int>(query->Int(3));
    line_style_ = static_cast<int>(query->Int(4));
    thickness_ = static_cast<int>(query->Int(5));
    locked_ = query->Int(6) != 0;
    active_ = query->Int(7) != 0;
    return true;
}

bool UDBLayer::Save(int /*undoFlag*/) {
    if (job_ == nullptr) return false;
    if (nedit::Trim(name_).empty()) {
        last_error_ = L"A layer needs a name.";
        return false;
    }
    nedit::JobDatabase& job = job_->Database();
    job.RequireWritable();
    try {
        UDBSQLiteTransaction transaction(job);
        auto write = job.Query(
            id_ == 0
                ? "INSERT INTO layer (name, colour, point_mark, symbol, line_style, thickness, "
                  "locked, active) VALUES (?, ?, ?, ?, ?, ?, ?, ?)"
                : "UPDATE layer SET name = ?, colour = ?, point_mark = ?, symbol = ?, "
                  "line_style = ?, thickness = ?, locked = ?, active = ? WHERE id = ?");
        write->Bind(1, name_).Bind(2, colour_).Bind(3, point_mark_).Bind(4, symbol_);
        write->Bind(5, line_style_)
            .Bind(6, thickness_)
            .Bind(7, locked_ ? 1 : 0)
            .Bind(8, active_ ? 1 : 0);
        if (id_ != 0) write->Bind(9, id_);
        write->Run();
        const long id = id_ == 0 ? static_cast<long>(job.LastInsertId()) : id_;
        transaction.Commit();
        id_ = id;
        last_error_.clear();
        return true;
    } catch (const nedit::JobError& error) {
        if (!error.IsConstraint()) throw;
        last_error_ = nedit::FromUtf8(error.what());
        return false;
    }
}
