#include "platform/storage/UStorage.h"

#include <algorithm>

#include "platform/job/JobDatabase.h"
#include "platform/job/UDBSQLiteTransaction.h"

UStorage::~UStorage() {
    Release();
}

void UStorage::Bind(nedit::JobDatabase& job, long long id, const std::wstring& name,
                    unsigned mode) {
    Release();
    job_ = &job;
    id_ = id;
    name_ = name;
    transacted_ = (mode & nedit::stgm::Transacted) != 0;
    writable_ = (mode & (nedit::stgm::Write | nedit::stgm::ReadWrite)) != 0 && !job.IsReadOnly();
}

int UStorage::OpenRoot(nedit::JobDatabase& job, unsigned mode) {
    Bind(job, 1, L"", mode);
    return 1;
}

long long UStorage::FindChild(const std::wstring& name) const {
    auto query = job_->Query("SELECT id FROM storage WHERE parent_id = ? AND name = ?");
    query->Bind(1, id_).Bind(2, name);
    return query->Step() ? query->Int(0) : 0;
}

bool UStorage::HasStoredStream(const std::wstring& name) const {
    auto query = job_->Query("SELECT 1 FROM stream WHERE storage_id = ? AND name = ?");
    query->Bind(1, id_).Bind(2, name);
    return query->Step();
}

int UStorage::Create(UStorage& parent, const std::wstring& name, unsigned mode) {
    if (!parent.IsOpen() || !parent.CanWrite() || name.empty()) return 0;
    nedit::JobDatabase& job = *parent.job_;
    UDBSQLiteTransaction transaction(job);
    const long long existing = parent.FindChild(name);
    if (existing != 0) {
        if ((mode & nedit::stgm::Create) == 0) return 0;
        auto remove = job.Query("DELETE FROM storage WHERE id = ?");
        remove->Bind(1, existing).Run();
    }
    auto insert = job.Query("INSERT INTO storage (parent_id, name) VALUES (?, ?)");
    insert->Bind(1, parent.id_).Bind(2, name).Run();
    const long long id = job.LastInsertId();
    transaction.Commit();
    Bind(job, id, name, mode | nedit::stgm::Write);
    return 1;
}

int UStorage::Open(UStorage& parent, const std::wstring& name, unsigned mode) {
    if (!parent.IsOpen() || name.empty()) return 0;
    const long long id = parent.FindChild(name);
    if (id == 0) return 0;
    Bind(*parent.job_, id, name, mode);
    return 1;
}

int UStorage::Commit(unsigned /*flags*/) {
    if (!IsOpen()) return 0;
    if (pending_.empty()) return 1;
    {
        UDBSQLiteTransaction transaction(*job_);
        for (const auto& [name, bytes] : pending_) {
            if (bytes) {
                auto write = job_->Query(
                    "INSERT INTO stream (storage_id, name, data) VALUES (?, ?, ?) "
                    "ON CONFLICT (storage_id, name) DO UPDATE SET data = excluded.data");
                write->Bind(1, id_).Bind(2, name).BindBlob(3, *bytes).Run();
            } else {
                auto remove = job_->Query("DELETE FROM stream WHERE storage_id = ? AND name = ?");
                remove->Bind(1, id_).Bind(2, name).Run();
            }
        }
        transaction.Commit();
    }
    pending_.clear();
    return 1;
}

void UStorage::Release() {
    pending_.clear();
    job_ = nullptr;
    id_ = 0;
    name_.clear();
}

std::vector<UStorageElement> UStorage::EnumElements() const {
    std::vector<UStorageElement> elements;
    if (!IsOpen()) return elements;
    {
        auto query = job_->Query("SELECT name FROM storage WHERE parent_id = ? ORDER BY name");
        query->Bind(1, id_);
        while (query->Step()) elements.push_back({query->Text(0), UStorageElement::kStorage});
    }
    std::map<std::wstring, bool> streams;
    {
        auto query = job_->Query("SELECT name FROM stream WHERE storage_id = ?");
        query->Bind(1, id_);
        while (query->Step()) streams[query->Text(0)] = true;
    }
    for (const auto& [name, bytes] : pending_) streams[name] = bytes.has_value();
    for (const auto& [name, present] : streams) {
        if (present) elements.push_back({name, UStorageElement::kStream});
    }
    return elements;
}

int UStorage::DestroyElement(const std::wstring& name) {
    if (!IsOpen() || !CanWrite()) return 0;
    const long long child = FindChild(name);
    if (child != 0) {
        auto remove = job_->Query("DELETE FROM storage WHERE id = ?");
        remove->Bind(1, child).Run();
        return 1;
    }
    std::string bytes;
    if (!ReadStream(name, bytes)) return 0;
    if (transacted_) {
        pending_[name] = std::nullopt;
    } else {
        auto remove = job_->Query("DELETE FROM stream WHERE storage_id = ? AND name = ?");
        remove->Bind(1, id_).Bind(2, name).Run();
    }
    return 1;
}

int UStorage::RenameElement(const std::wstring& from, const std::wstring& to) {
    if (!IsOpen() || !CanWrite() || to.empty()) return 0;
    std::string bytes;
    if (FindChild(to) != 0 || ReadStream(to, bytes)) return 0;
    const long long child = FindChild(from);
    if (child != 0) {
        auto rename = job_->Query("UPDATE storage SET name = ? WHERE id = ?");
        rename->Bind(1, to).Bind(2, child).Run();
        return 1;
    }
    if (!ReadStream(from, bytes)) return 0;
    if (transacted_) {
        pending_[to] = bytes;
        pending_[from] = std::nullopt;
    } else {
        auto rename = job_->Query("UPDATE stream SET name = ? WHERE storage_id = ? AND name = ?");
        rename->Bind(1, to).Bind(2, id_).Bind(3, from).Run();
    }
    return 1;
}

bool UStorage::ReadStream(const std::wstring& name, std::string& bytes) const {
    return ReadStream(name, [&bytes](std::string_view stored) { bytes.assign(stored); });
}

bool UStorage::ReadStream(const std::wstring& name,
                          const std::function<void(std::string_view)>& read) const {
    if (!IsOpen()) return false;
    const auto held = pending_.find(name);
    if (held != pending_.end()) {
        if (!held->second) return false;
        read(*held->second);
        return true;
    }
    auto query = job_->Query("SELECT data FROM stream WHERE storage_id = ? AND name = ?");
    query->Bind(1, id_).Bind(2, name);
    if (!query->Step()) return false;
    read(query->BytesView(0));
    return true;
}

void UStorage::WriteStream(const std::wstring& name, std::string bytes) {
    job_->RequireWritable();
    if (transacted_) {
        pending_[name] = std::move(bytes);
        return;
    }
    auto write = job_->Query(
        "INSERT INTO stream (storage_id, name, data) VALUES (?, ?, ?) "
        "ON CONFLICT (storage_id, name) DO UPDATE SET data = excluded.data");
    write->Bind(1, id_).Bind(2, name).BindBlob(3, bytes).Run();
}

bool UStorage::CanWrite() const {
    return IsOpen() && writable_ && !job_->IsReadOnly();
}
