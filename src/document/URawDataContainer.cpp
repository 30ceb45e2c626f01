#include "document/URawDataContainer.h"

#include <algorithm>

#include "platform/io/LineReader.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/storage/UStreamFile.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"

namespace {

// A new document's storage holds its streams back until it is committed, so that they reach
// the job together (69650).
constexpr unsigned kNewDocumentMode = nedit::stgm::Transacted | nedit::stgm::Create |
                                      nedit::stgm::ShareExclusive | nedit::stgm::ReadWrite;

}  // namespace

URawDataContainer::URawDataContainer(USurveyDoc* job) : Job(job) {}

URawDataContainer::~URawDataContainer() = default;

int URawDataContainer::Open() {
    return OpenDocument(kStorageName, Job);
}

int URawDataContainer::OpenDocument(const std::wstring& name, UDocument* job) {
    Documents.clear();
    if (!UDocument::OpenDocument(name, job)) {
        // Made under the write lock, so that two programs opening a new job at once do not
        // each make one, the second replacing the first with what was stored in it.
        if (job == nullptr || job->GetStorage() == nullptr) return 0;
        UDBSQLiteTransaction transaction(*job->GetStorage()->GetJob());
        if (!UDocument::OpenDocument(name, job) && !UDocument::CreateDocument(name, job)) return 0;
        transaction.Commit();
    }
    for (const UStorageElement& element : GetStorage()->EnumElements()) {
        if (element.Type != UStorageElement::kStorage) continue;
        auto doc = std::make_unique<UNeditDoc>(Job);
        if (doc->OpenDocument(element.Name, this)) Adopt(std::move(doc));
    }
    return 1;
}

UNeditDoc* URawDataContainer::Adopt(std::unique_ptr<UNeditDoc> doc) {
    Documents.push_back(std::move(doc));
    return Documents.back().get();
}

UNeditDoc* URawDataContainer::GetNeditDoc(const std::wstring& name) const {
    for (const auto& doc : Documents) {
        if (doc->GetName() == name) return doc.get();
    }
    return nullptr;
}

std::vector<std::wstring> URawDataContainer::GetDocumentNames() const {
    std::vector<std::wstring> names;
    for (const auto& doc : Documents) names.push_back(doc->GetName());
    return names;
}

std::set<std::wstring> URawDataContainer::TakenNames() const {
    std::set<std::wstring> taken;
    for (const auto& doc : Documents) taken.insert(doc->GetName());
    if (storage_.IsOpen()) {
        for (const UStorageElement& element : storage_.EnumElements()) taken.insert(element.Name);
    }
    return taken;
}

int URawDataContainer::FirstFreeNumber(const std::wstring& base, int last) const {
    const std::set<std::wstring> taken = TakenNames();
    int number = 1;
    while (number < last && taken.count(nedit::Format(L"%s%d", base, number)) != 0) ++number;
    return number;
}

std::wstring URawDataContainer::GetUntitledName() const {
    return nedit::Format(L"Data%d", FirstFreeNumber(L"Data", kNameLimit - 1));
}

UNeditDoc* URawDataContainer::CreateNeditDoc(const std::wstring& name) {
    if (!name.empty() && TakenNames().count(name) != 0) return nullptr;
    auto doc = std::make_unique<UNeditDoc>(Job);
    if (!doc->CreateDocument(name.empty() ? GetUntitledName() : name, this)) return nullptr;
    return Adopt(std::move(doc));
}

int URawDataContainer::CreateNEditDocFromNeutralFile(const std::wstring& baseName,
                                                     const std::wstring& path,
                                                     std::wstring* createdName) {
    const std::wstring base = baseName.empty() ? std::wstring(L"Data") : baseName;
    return StoreNeutralFile(
        path,
        [this, &base] {
            const int number = FirstFreeNumber(base, kNameLimit);
            return number < kNameLimit ? nedit::Format(L"%s%d", base, number) : std::wstring();
        },
        createdName);
}

int URawDataContainer::CreateNEditDocNamed(const std::wstring& name, const std::wstring& path) {
    return StoreNeutralFile(
        path, [this, &name] { return HasName(name) ? std::wstring() : name; }, nullptr);
}

int URawDataContainer::StoreNeutralFile(const std::wstring& path,
                                        const std::function<std::wstring()>& chooseName,
                                        std::wstring* createdName) {
    if (GetStorage() == nullptr) return 0;
    // The file is read before the job is locked, so that other programs wait only for the
    // writing.
    nedit::LineReader reader;
    if (!reader.Open(nedit::ToUtf8(path))) return 0;
    std::string text;
    for (std::string line; reader.ReadLine(line);) {
        if (nedit::TrimView(nedit::DecodeTextLine(line)).empty()) continue;
        text += line;
        text += '\n';
    }

    UDBSQLiteTransaction transaction(*GetStorage()->GetJob());
    const std::wstring name = chooseName();
    if (name.empty()) return 0;
    UStorage storage;
    if (!storage.Create(*GetStorage(), name, kNewDocumentMode)) return 0;
    UStreamFile stream;
    if (!stream.CreateStream(storage, UNeditDoc::kNeutralDataStream, UNeditDoc::kCreateMode)) {
        return 0;
    }
    stream.Write(text.data(), text.size());
    stream.Close();
    UStreamFile settings;
    if (settings.CreateStream(storage, UNeditDoc::kSettingsStream, UNeditDoc::kCreateMode)) {
        const std::string bytes = UNeditSettings().Write();
        settings.Write(bytes.data(), bytes.size());
        settings.Close();
    }
    if (!storage.Commit() || !Commit(nedit::stgc::OnlyIfCurrent)) return 0;
    storage.Release();
    transaction.Commit();

    auto doc = std::make_unique<UNeditDoc>(Job);
    if (!doc->OpenDocument(name, this)) return 0;
    Adopt(std::move(doc));
    if (createdName != nullptr) *createdName = name;
    return 1;
}

bool URawDataContainer::DeleteNeditDoc(const std::wstring& name) {
    const auto found = std::find_if(Documents.begin(), Documents.end(),
                                    [&name](const auto& doc) { return doc->GetName() == name; });
    if (found == Documents.end()) return false;
    (*found)->CloseDocument();
    Documents.erase(found);
    return Delete(name) && Commit();
}

bool URawDataContainer::RenameNeditDoc(const std::wstring& newName, const std::wstring& oldName,
                                       int /*flag*/) {
    UNeditDoc* old_doc = GetNeditDoc(oldName);
    if (old_doc == nullptr || GetStorage() == nullptr) return false;
    UDBSQLiteTransaction transaction(*GetStorage()->GetJob());
    if (HasName(newName)) return false;
    if (old_doc->GetModified()) old_doc->SaveData();
    auto renamed = std::make_unique<UNeditDoc>(Job);
    renamed->SetCreateReport(false);
    if (!renamed->CreateDocument(newName, this)) return false;
    old_doc->CopyDocument(*renamed);
    if (!renamed->SaveAsDocument(newName) || !Delete(oldName) || !Commit()) return false;
    transaction.Commit();
    // Only what the job now holds is shown.
    old_doc->CloseDocument();
    Documents.erase(std::find_if(Documents.begin(), Documents.end(),
                                 [old_doc](const auto& doc) { return doc.get() == old_doc; }));
    Adopt(std::move(renamed));
    return true;
}

void URawDataContainer::CopyDocument(URawDataContainer& target, USurveyDoc* targetSurvey) {
    for (const auto& doc : Documents) {
        auto copy = std::make_unique<UNeditDoc>(targetSurvey);
        copy->SetCreateReport(false);
        if (!copy->CreateDocument(doc->GetName(), &target)) continue;
        doc->CopyDocument(*copy);
        if (copy->SaveAsDocument(doc->GetName())) target.Adopt(std::move(copy));
    }
    target.Commit();
}
