#include "platform/job/UDBObject.h"

#include <sys/stat.h>

#include "platform/geometry/UWRect.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

UDBObject::UDBObject(USurveyDoc* job, int kind, const char* table)
    : job_(job), kind_(kind), table_(table) {}

UDBObject::~UDBObject() = default;

nedit::JobDatabase& UDBObject::Job() const {
    if (job_ == nullptr) throw nedit::JobError("A job object was used without a job.");
    return job_->Database();
}

bool UDBObject::Guarded(const std::function<void()>& write) {
    Job().RequireWritable();
    // A write that does not last gives no identifier: a new object stays new.
    const long before = id_;
    try {
        UDBSQLiteTransaction transaction(Job());
        write();
        transaction.Commit();
        last_error_.clear();
        return true;
    } catch (const nedit::JobError& error) {
        id_ = before;
        if (!error.IsConstraint()) throw;
        last_error_ = nedit::FromUtf8(error.what());
        return false;
    }
}

bool UDBObject::CanUpdate() {
    auto query = Job().Query(std::string("SELECT flags FROM ") + table_ + " WHERE id = ?");
    query->Bind(1, id_);
    if (!query->Step()) {
        Fail(L"The object is no longer in the job.");
        return false;
    }
    if ((static_cast<unsigned long long>(query->Int(0)) & kLocked) != 0) {
        Fail(L"The object is locked.");
        return false;
    }
    return true;
}

namespace {

// Only the lock bit changes in the stored flags: other bits set in memory wait for Save.
bool StoreLock(nedit::JobDatabase& job, const char* table, long id, bool locked) {
    job.RequireWritable();
    const std::string sql =
        std::string("UPDATE ") + table +
        (locked ? " SET flags = flags | ? WHERE id = ?" : " SET flags = flags & ~? WHERE id = ?");
    auto update = job.Query(sql);
    update->Bind(1, static_cast<long long>(UDBObject::kLocked)).Bind(2, id).Run();
    return job.Changes() > 0;
}

}  // namespace

bool UDBObject::Lock() {
    flags_ |= kLocked;
    return id_ == 0 || StoreLock(Job(), table_, id_, true);
}

bool UDBObject::UnLock() {
    flags_ &= ~kLocked;
    return id_ == 0 || StoreLock(Job(), table_, id_, false);
}

bool UDBObject::AddAttributes(const std::vector<nedit::AttributeRow>& attributes, bool replace) {
    if (id_ == 0) {
        Fail(L"Attributes need a saved object.");
        return false;
    }
    for (const auto& attribute : attributes) {
        if (nedit::Trim(attribute.Name).empty()) {
            Fail(L"An attribute has no name.");
            return false;
        }
    }
    // Nothing to add: at most the old ones go, in one statement.
    if (attributes.empty()) {
        if (replace) {
            Job().RequireWritable();
            Job().Query("DELETE FROM attribute WHERE object_id = ?")->Bind(1, id_).Run();
        }
        last_error_.clear();
        return true;
    }
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        if (replace) job.Query("DELETE FROM attribute WHERE object_id = ?")->Bind(1, id_).Run();
        long long seq = 0;
        {
            auto last =
                job.Query("SELECT coalesce(max(seq), 0) FROM attribute WHERE object_id = ?");
            last->Bind(1, id_);
            if (last->Step()) seq = last->Int(0);
        }
        for (const auto& attribute : attributes) {
            auto insert = job.Query(
                "INSERT INTO attribute (object_id, seq, name, type, value) VALUES (?, ?, ?, ?, ?)");
            insert->Bind(1, id_).Bind(2, ++seq).Bind(3, nedit::Trim(attribute.Name));
            insert->Bind(4, attribute.Type).Bind(5, attribute.Value).Run();
        }
    });
}

std::vector<nedit::AttributeRow> UDBObject::GetAttributes() const {
    std::vector<nedit::AttributeRow> rows;
    if (id_ == 0) return rows;
    auto query =
        Job().Query("SELECT name, type, value FROM attribute WHERE object_id = ? ORDER BY seq");
    query->Bind(1, id_);
    while (query->Step()) rows.push_back({query->Text(0), query->Text(1), query->Text(2)});
    return rows;
}

bool UDBObject::AttachImages(const std::vector<nedit::ImageRow>& images, bool replace,
                             const std::wstring& folder) {
    if (id_ == 0) {
        Fail(L"Images need a saved object.");
        return false;
    }
    std::vector<nedit::ImageRow> resolved = images;
    for (auto& image : resolved) {
        std::wstring file = nedit::Trim(image.FileName);
        if (!file.empty() && file[0] != L'/' && !folder.empty()) {
            file = folder + (folder.back() == L'/' ? L"" : L"/") + file;
        }
        struct stat info {};
        if (file.empty() || stat(nedit::ToUtf8(file).c_str(), &info) != 0) {
            Fail(L"The image file " + file + L" does not exist.");
            return false;
        }
        image.FileName = file;
    }
    return Guarded([&] {
        nedit::JobDatabase& job = Job();
        if (replace) job.Query("DELETE FROM image WHERE object_id = ?")->Bind(1, id_).Run();
        long long seq = 0;
        {
            auto last = job.Query("SELECT coalesce(max(seq), 0) FROM image WHERE object_id = ?");
            last->Bind(1, id_);
            if (last->Step()) seq = last->Int(0);
        }
        for (const auto& image : resolved) {
            auto insert = job.Query(
                "INSERT INTO image (object_id, seq, file, number1, number2) VALUES (?, ?, ?, ?, "
                "?)");
            insert->Bind(1, id_).Bind(2, ++seq).Bind(3, image.FileName);
            insert->Bind(4, image.Number1).Bind(5, image.Number2).Run();
        }
    });
}

std::vector<nedit::ImageRow> UDBObject::GetImages() const {
    std::vector<nedit::ImageRow> rows;
    if (id_ == 0) return rows;
    auto query =
        Job().Query("SELECT file, number1, number2 FROM image WHERE object_id = ? ORDER BY seq");
    query->Bind(1, id_);
    while (query->Step()) rows.push_back({query->Text(0), query->Real(1), query->Real(2)});
    return rows;
}

bool UDBObject::SaveExtendedData(const std::wstring& text, int kind) {
    if (id_ == 0) {
        Fail(L"Extended data needs a saved object.");
        return false;
    }
    return Guarded([&] {
        auto write = Job().Query(
            "INSERT INTO extended_data (object_id, kind, data) VALUES (?, ?, ?) "
            "ON CONFLICT (object_id, kind) DO UPDATE SET data = excluded.data");
        write->Bind(1, id_).Bind(2, kind).Bind(3, text).Run();
    });
}

std::wstring UDBObject::LoadExtendedData(int kind) const {
    if (id_ == 0) return {};
    auto query = Job().Query("SELECT data FROM extended_data WHERE object_id = ? AND kind = ?");
    query->Bind(1, id_).Bind(2, kind);
    return query->Step() ? query->Text(0) : std::wstring();
}

int UDBObject::Enumerate(const UWRect& area, unsigned /*mask*/) {
    walk_.clear();
    walk_next_ = 0;
    const bool all = area.IsEmpty() || (area.GetMinX() == 0.0 && area.GetMaxX() == 0.0 &&
                                        area.GetMinY() == 0.0 && area.GetMaxY() == 0.0);
    if (all) {
        auto query = Job().Query(std::string("SELECT id FROM ") + table_ + " ORDER BY id");
        while (query->Step()) walk_.push_back(static_cast<long>(query->Int(0)));
    } else {
        auto query = Job().Query(AreaQuery());
        query->Bind(1, area.GetMinX()).Bind(2, area.GetMaxX());
        query->Bind(3, area.GetMinY()).Bind(4, area.GetMaxY());
        while (query->Step()) walk_.push_back(static_cast<long>(query->Int(0)));
    }
    return static_cast<int>(walk_.size());
}

long UDBObject::Next() {
    while (walk_next_ < walk_.size()) {
        const long id = walk_[walk_next_++];
        if (Load(id)) return id;  // one deleted meanwhile is passed over
    }
    return 0;
}
