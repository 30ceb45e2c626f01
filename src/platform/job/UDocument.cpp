#include "platform/job/UDocument.h"

#include "platform/job/USurveyDoc.h"

UDocument::~UDocument() = default;

int UDocument::CreateDocument(const std::wstring& name, UDocument* parent) {
    if (parent == nullptr || parent->GetStorage() == nullptr) return 0;
    const unsigned mode = nedit::stgm::Transacted | nedit::stgm::Create |
                          nedit::stgm::ShareExclusive | nedit::stgm::ReadWrite;
    if (storage_.Create(*parent->GetStorage(), name, mode) == 0) return 0;
    name_ = name;
    parent_ = parent;
    return 1;
}

int UDocument::OpenDocument(const std::wstring& name, UDocument* parent) {
    if (parent == nullptr || parent->GetStorage() == nullptr) return 0;
    const unsigned mode =
        nedit::stgm::Transacted | nedit::stgm::ShareExclusive | nedit::stgm::ReadWrite;
    if (storage_.Open(*parent->GetStorage(), name, mode) == 0) return 0;
    name_ = name;
    parent_ = parent;
    return 1;
}

int UDocument::SaveDocument() {
    if (!storage_.IsOpen() || SaveData() == 0) return 0;
    if (Commit() == 0) return 0;
    SetModified(0);
    return 1;
}

int UDocument::SaveAsDocument(const std::wstring& name) {
    if (!storage_.IsOpen()) return 0;
    if (name != name_) {
        if (parent_ == nullptr || parent_->GetStorage() == nullptr) return 0;
        UStorage* parentStorage = parent_->GetStorage();
        // Commit first, so that the renamed storage takes everything written so far with it.
        if (SaveData() == 0 || Commit() == 0) return 0;
        if (parentStorage->RenameElement(name_, name) == 0) return 0;
        const unsigned mode = nedit::stgm::Transacted | nedit::stgm::ReadWrite;
        if (storage_.Open(*parentStorage, name, mode) == 0) return 0;
        name_ = name;
        SetModified(0);
        return 1;
    }
    return SaveDocument();
}

int UDocument::Commit(unsigned flags) {
    return storage_.Commit(flags);
}

bool UDocument::Delete(const std::wstring& name) {
    return storage_.IsOpen() && storage_.DestroyElement(name) != 0;
}

void UDocument::CloseDocument() {
    storage_.Release();
}

USurveyDoc* UDocument::GetSurveyDocument() const {
    return parent_ != nullptr ? parent_->GetSurveyDocument() : nullptr;
}

UJobSettings* UDocument::GetJobSettings() const {
    USurveyDoc* job = GetSurveyDocument();
    return job != nullptr ? &job->GetSettings() : nullptr;
}

int UDocument::GetSymbolIndex(const std::wstring& name, long layer) {
    USurveyDoc* job = GetSurveyDocument();
    return job != nullptr ? job->SymbolIndex(name, layer) : 0;
}

int UDocument::GetLineTypeIndex(const std::wstring& name, long layer) {
    USurveyDoc* job = GetSurveyDocument();
    return job != nullptr ? job->LineTypeIndex(name, layer) : 0;
}

int UDocument::GetLineThicknessIndex(const std::wstring& name, long layer) {
    USurveyDoc* job = GetSurveyDocument();
    return job != nullptr ? job->LineThicknessIndex(name, layer) : 0;
}

USvyCodeLib* UDocument::GetSurveyCodeLibraryFromJob() {
    USurveyDoc* job = GetSurveyDocument();
    return job != nullptr ? job->GetJobCodeLibrary() : nullptr;
}
