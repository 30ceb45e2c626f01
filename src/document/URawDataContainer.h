#pragma once
// All raw-data documents of a job: one child storage each, under the storage "RawData" of
// the job file.
//
// Decisions:
// - A document comes into being with its streams in one transaction of the job, and a
//   rename is one transaction: after a crash at any moment the job holds the old state or
//   the new one, never an empty document or two copies.
// - A name is chosen inside the same write transaction that makes the storage, against the
//   names in the job file as they are then, not as this container saw them when it opened:
//   another program may have stored a document since. A name taken by then is refused (or,
//   for a numbered name, the next free one taken); a document is never overwritten.

#include <functional>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "document/UNeditDoc.h"
#include "platform/job/UDocument.h"

class USurveyDoc;

class URawDataContainer : public UDocument {
  public:
    static constexpr const wchar_t* kStorageName = L"RawData";
    /// Names are "Data%d" and the like; no number reaches this.
    static constexpr int kNameLimit = 1024;

    explicit URawDataContainer(USurveyDoc* job);
    ~URawDataContainer() override;

    /// Opens the container's storage in the job, making it when the job has none yet, and
    /// makes a document for every child storage. 0 when the job cannot give it.
    int OpenDocument(const std::wstring& name, UDocument* job) override;
    /// The open container of `job`.
    int Open();

    UNeditDoc* GetNeditDoc(const std::wstring& name) const;
    /// The names of the documents, in the order of their storages.
    std::vector<std::wstring> GetDocumentNames() const;
    /// "Data%d" with the lowest free number from 1; the search ends at 1023.
    std::wstring GetUntitledName() const;
    /// Makes a new empty document named `name`, or by GetUntitledName when it is empty,
    /// marked modified; null when the name is taken or its storage cannot be made.
    UNeditDoc* CreateNeditDoc(const std::wstring& name = L"");
    /// Makes a document of a neutral file (UTF-8) named `baseName` with the lowest free
    /// number from 1 behind it ("Data" when empty). Blank lines of the file are left out: a
    /// blank line would end the stored records when they are read back. 0 when no name is
    /// free below 1024, or the file or the storage cannot be had.
    int CreateNEditDocFromNeutralFile(const std::wstring& baseName, const std::wstring& path,
                                      std::wstring* createdName = nullptr);
    /// Makes a document of a neutral file, as CreateNEditDocFromNeutralFile does, under exactly
    /// `name`. 0 when that name is taken (see HasName), or the file or the storage cannot be had.
    int CreateNEditDocNamed(const std::wstring& name, const std::wstring& path);
    /// True when a document or another element of the container has the name, in this
    /// container or, since it was opened, in the job file.
    bool HasName(const std::wstring& name) const { return TakenNames().count(name) != 0; }
    bool DeleteNeditDoc(const std::wstring& name);
    /// Gives the document `oldName` the name `newName`, in one transaction; false when
    /// `newName` is taken (see HasName) or `oldName` does not exist.
    bool RenameNeditDoc(const std::wstring& newName, const std::wstring& oldName, int flag = 0);
    /// Copies every document into `target`, a container of `targetSurvey`.
    void CopyDocument(URawDataContainer& target, USurveyDoc* targetSurvey);

  private:
    /// The names of the documents and of every element of the container's storage.
    std::set<std::wstring> TakenNames() const;
    /// The lowest number from 1 that makes `base` and it a free name; `last` when none below.
    int FirstFreeNumber(const std::wstring& base, int last) const;
    UNeditDoc* Adopt(std::unique_ptr<UNeditDoc> doc);
    /// Stores the lines of the file at `path` as a new document, named by `chooseName` inside
    /// the write transaction (empty: no name is free); 1 when done.
    int StoreNeutralFile(const std::wstring& path, const std::function<std::wstring()>& chooseName,
                         std::wstring* createdName);

    USurveyDoc* Job;
    std::vector<std::unique_ptr<UNeditDoc>> Documents;
};
