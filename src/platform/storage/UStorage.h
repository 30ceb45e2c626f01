#pragma once
// Structured storage inside the job file: storages nest like folders, and each holds named
// streams of bytes. A raw-data document keeps its records and settings as streams of one
// child storage, so everything of a job travels in its one file.
//
// A storage opened or created with stgm::Transacted keeps the streams written into it to
// itself until Commit, which writes them all in one database transaction; Release without
// Commit forgets them. Without that flag a stream is written when it is closed. Child
// storages are made and deleted at once in either mode.
//
// Refusals that callers expect (no such element, a name already taken, a storage that is
// not open) give 0. Failures of the database throw nedit::JobError.

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace nedit {
class JobDatabase;

/// Mode bits, with the values that structured storage has always used, so that modes such
/// as 18 (exclusive read-write), 4113 (create, exclusive, write) and 69650 (transacted
/// create) mean here what they always meant. Sharing bits are accepted: the job's
/// transactions already keep writers apart.
namespace stgm {
constexpr unsigned Read = 0x0;
constexpr unsigned Write = 0x1;
constexpr unsigned ReadWrite = 0x2;
constexpr unsigned ShareExclusive = 0x10;
constexpr unsigned Create = 0x1000;
constexpr unsigned Transacted = 0x10000;
}  // namespace stgm

/// Commit flags, with the values structured storage has always used. The job's commits
/// accept them and behave alike under each: a commit is one database transaction.
namespace stgc {
constexpr unsigned Default = 0x0;
constexpr unsigned OnlyIfCurrent = 0x2;
}  // namespace stgc
}  // namespace nedit

/// One element of a storage, as EnumElements lists it.
struct UStorageElement {
    static constexpr int kStorage = 1;
    static constexpr int kStream = 2;
    std::wstring Name;
    int Type = kStream;
};

class UStorage {
  public:
    UStorage() = default;
    ~UStorage();
    UStorage(const UStorage&) = delete;
    UStorage& operator=(const UStorage&) = delete;

    /// Opens the root storage of a job.
    int OpenRoot(nedit::JobDatabase& job, unsigned mode = nedit::stgm::ReadWrite);
    /// Makes a child storage `name` of `parent` and opens it. An element of that name is
    /// replaced when `mode` has stgm::Create, else the result is 0.
    int Create(UStorage& parent, const std::wstring& name, unsigned mode);
    /// Opens the child storage `name` of `parent`; 0 when there is none.
    int Open(UStorage& parent, const std::wstring& name, unsigned mode);
    /// Writes the streams held back by a transacted storage, all in one transaction.
    /// 1 when done (also when there was nothing to write), 0 when the storage is not open.
    int Commit(unsigned flags = 0);
    /// Closes the storage, forgetting what was not committed.
    void Release();

    /// Child storages and streams, storages first, each group by name.
    std::vector<UStorageElement> EnumElements() const;
    /// Deletes a child storage with everything in it, or a stream; 0 when there is none.
    int DestroyElement(const std::wstring& name);
    /// Renames a child storage or a stream; 0 when `from` does not exist or `to` is taken.
    int RenameElement(const std::wstring& from, const std::wstring& to);

    bool IsOpen() const { return job_ != nullptr; }
    bool IsTransacted() const { return transacted_; }
    const std::wstring& GetName() const { return name_; }
    nedit::JobDatabase* GetJob() const { return job_; }

    // Used by UStreamFile.
    /// The stream's bytes as this storage sees them (held-back writes included); false when
    /// there is no such stream.
    bool ReadStream(const std::wstring& name, std::string& bytes) const;
    /// The same bytes, handed to `read` where they lie, without a copy (a large stream is
    /// read this way); good only during the call. False when there is no such stream.
    bool ReadStream(const std::wstring& name,
                    const std::function<void(std::string_view)>& read) const;
    /// Stores the stream's bytes (held back in a transacted storage, without a copy).
    void WriteStream(const std::wstring& name, std::string bytes);
    bool CanWrite() const;

  private:
    long long FindChild(const std::wstring& name) const;  // 0 when none
    bool HasStoredStream(const std::wstring& name) const;
    void Bind(nedit::JobDatabase& job, long long id, const std::wstring& name, unsigned mode);

    nedit::JobDatabase* job_ = nullptr;
    long long id_ = 0;
    std::wstring name_;
    bool transacted_ = false;
    bool writable_ = false;
    // Held-back stream writes of a transacted storage; no value means the stream is deleted.
    std::map<std::wstring, std::optional<std::string>> pending_;
};
