#pragma once
// A document of a job: the job itself (USurveyDoc), the container of its raw-data documents
// and each raw-data document. Each document owns one storage of the job file; a child
// document's storage is a child storage of its parent's. The desktop's views and windows are
// not this class's business: the upkeep operations (UpdateAllViews, UpdatePropertyBar) do
// nothing here and are there to be overridden.

#include <memory>
#include <string>

#include "platform/storage/UStorage.h"

class USurveyDoc;
class USvyCodeLib;
class UJobSettings;

class UDocument {
  public:
    UDocument() = default;
    virtual ~UDocument();
    UDocument(const UDocument&) = delete;
    UDocument& operator=(const UDocument&) = delete;

    /// Makes the child storage `name` in the storage of `parent` (transacted, replacing one
    /// of that name) and binds this document to it. 1 on success, 0 when the parent has no
    /// open storage or the job cannot be written.
    virtual int CreateDocument(const std::wstring& name, UDocument* parent);
    /// Binds this document to the existing child storage `name` of `parent`; 0 when there is
    /// none.
    virtual int OpenDocument(const std::wstring& name, UDocument* parent);
    /// Lets the document write its data (SaveData), then commits its storage and clears the
    /// modified flag. 1 on success, 0 when SaveData refused or no storage is open.
    int SaveDocument();
    /// As SaveDocument, after renaming the document's storage to `name` when it differs.
    /// 0 when another element of the parent has that name.
    int SaveAsDocument(const std::wstring& name);
    /// Commits the document's storage; the flags are accepted and change nothing.
    int Commit(unsigned flags = 0);
    /// Deletes the child storage `name` of this document's storage, with all it holds.
    bool Delete(const std::wstring& name);
    /// Releases the storage; what was not committed is forgotten.
    void CloseDocument();

    /// Writes the document's own data into its storage; SaveDocument calls it. 1 here.
    virtual int SaveData() { return 1; }

    UStorage* GetStorage() { return storage_.IsOpen() ? &storage_ : nullptr; }
    const std::wstring& GetName() const { return name_; }
    UDocument* GetParentDocument() const { return parent_; }
    /// The job this document belongs to; null when it is bound to none.
    virtual USurveyDoc* GetSurveyDocument() const;
    /// The job's settings; null without a job.
    UJobSettings* GetJobSettings() const;

    virtual void SetModified(int modified) { modified_ = modified; }
    int GetModified() const { return modified_; }
    virtual void UpdatePropertyBar(int /*what*/) {}
    virtual void UpdateAllViews(UDocument* /*sender*/ = nullptr, long /*hint*/ = 0) {}

    /// Indexes in the job's tables of symbols, line types and thicknesses (see USurveyDoc);
    /// 0 without a job.
    int GetSymbolIndex(const std::wstring& name, long layer);
    int GetLineTypeIndex(const std::wstring& name, long layer);
    int GetLineThicknessIndex(const std::wstring& name, long layer);
    /// The job's own survey code library; null without a job.
    USvyCodeLib* GetSurveyCodeLibraryFromJob();

  protected:
    UStorage storage_;
    std::wstring name_;
    UDocument* parent_ = nullptr;
    int modified_ = 0;
};
