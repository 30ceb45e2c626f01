#include "document/UNeditDoc.h"

#include "document/UListCtrl.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/settings/DataDirectory.h"
#include "platform/storage/UStreamFile.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/NamelessCoordinates.h"
#include "records/RecordTypes.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

constexpr const wchar_t* kReportTitle = L"Raw Data Reduction Report";

// The stream holds exactly the rows, each ended by a line feed, as Save writes them.
bool HoldsRows(std::string_view stored, const UListCtrl& list) {
    std::size_t at = 0;
    for (int row = 0; row < list.GetItemCount(); ++row) {
        const std::string_view text = list.GetRowUtf8(row);
        if (stored.size() - at < text.size() + 1 || stored.compare(at, text.size(), text) != 0 ||
            stored[at + text.size()] != '\n') {
            return false;
        }
        at += text.size() + 1;
    }
    return at == stored.size();
}

}  // namespace

UNeditDoc::UNeditDoc(USurveyDoc* job, UDocument* parent)
    : UNeutralFileFormat(&Settings), SurveyDoc(job), ParentDoc(parent) {
    if (SurveyDoc != nullptr) Settings = SurveyDoc->GetSettings();
    InitMaps();
    ClearMaps();
    LoadNeutralFileDefinition(nedit::FromUtf8(nedit::DataDirectory()));
    SetFlagsFromOrder(OutputParameters, nedit::ReadOrderKey());
    TakeJobUnits();
}

UNeditDoc::~UNeditDoc() {
    AbortProcessOn = false;
    ClearMaps();
    Database.reset();
    NReport.reset();
    while (XInput* input = Pop()) {
        if (!input->IsOwnedElsewhere()) delete input;
    }
}

// ---- Storage ----------------------------------------------------------------------------------

int UNeditDoc::CreateDocument(const std::wstring& name, UDocument* container) {
    if (!UDocument::CreateDocument(name, container)) return 0;
    if (CreateReport && !CreateNReport()) return 0;
    SetModified(1);
    return 1;
}

int UNeditDoc::OpenDocument(const std::wstring& name, UDocument* container) {
    if (!UDocument::OpenDocument(name, container)) return CreateDocument(name, container);
    if (CreateReport && !NReport) CreateNReport();
    return 1;
}

int UNeditDoc::Load(UListCtrl* list) {
    UStorage* storage = GetStorage();
    if (list == nullptr || storage == nullptr) return 0;
    const bool own_rows = list == List.get() && list->GetItemCount() == 0;
    bool held_as_rows = false;
    // The stream is read where the job holds it, without a copy of its own.
    const bool read = storage->ReadStream(kNeutralDataStream, [&](std::string_view stored) {
        LoadRows(stored, list);
        held_as_rows = own_rows && HoldsRows(stored, *list);
    });
    if (!read) return 0;
    StoredRevision = held_as_rows ? list->GetRevision() : ~std::uint64_t{0};
    std::string settings;
    if (storage->ReadStream(kSettingsStream, settings) && !NeditSettings.Read(settings)) return 0;
    return 1;
}

void UNeditDoc::LoadRows(std::string_view stored, UListCtrl* list) {
    // The document's own list is its text; the text read into another list is kept here.
    const bool keep_text = list != List.get();
    NeuText.clear();
    NamelessCoordinates coordinates;
    std::string decoded;
    std::string upper;
    std::string completed;
    // The next line without its line end (LF or CR LF); false at the end.
    std::size_t at = 0;
    auto next_line = [&](std::string_view& line) {
        if (at >= stored.size()) return false;
        const std::size_t end = std::min(stored.find('\n', at), stored.size());
        line = stored.substr(at, end - at);
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        at = end + 1;
        return true;
    };
    bool first = true;
    for (std::string_view bytes; next_line(bytes);) {
        Progress->Update(static_cast<int>(100 * std::min(at, stored.size()) / stored.size()), L"");
        if (bytes.empty()) {
            int rest = 0;
            while (next_line(bytes)) ++rest;
            if (rest > 0) {
                nedit::AppMessageBox(Host,
                                     nedit::Translate(L"The records of {1} end at an empty line; "
                                                      L"{2} further lines were not read.",
                                                      {GetName(), std::to_wstring(rest)}),
                                     nedit::mb::IconExclamation);
            }
            break;
        }
        std::string_view line = nedit::TextLineAsUtf8(bytes, decoded);
        if (first) {
            upper = nedit::ToUpperUtf8(line);
            line = upper;
        }
        first = false;
        const int row = list->AddRecordUtf8(
            list->GetItemCount(),
            coordinates.CompleteUtf8(*this, GetRecordTypeUtf8(line), line, completed));
        if (row >= 0 && keep_text) {
            NeuText += list->GetRowUtf8(row);
            NeuText += '\n';
        }
        if (GetAbortProcess()) break;
    }
}

int UNeditDoc::Save(UListCtrl* list, int additionPoints) {
    if (list == nullptr && NeuText.empty()) return 1;
    if (Database && list != nullptr) {
        if (additionPoints) {
            Database->SaveAdditionPt2CtrlList(list);
        } else {
            Database->SaveAdjustedPt2CtrlList(list);
        }
    }
    UStorage* storage = GetStorage();
    // The stream holds these very rows already.
    if (list != nullptr && list == List.get() && list->GetRevision() == StoredRevision)
        return WriteSettingsStream();
    UStreamFile stream;
    if (storage == nullptr || !stream.CreateStream(*storage, kNeutralDataStream, kCreateMode))
        return 0;
    if (list != nullptr) {
        const bool keep_text = list != List.get();
        NeuText.clear();
        std::size_t bytes = 0;
        for (int row = 0; row < list->GetItemCount(); ++row)
            bytes += list->GetRowUtf8(row).size() + 1;
        stream.Reserve(bytes);
        for (int row = 0; row < list->GetItemCount(); ++row) {
            const std::string_view text = list->GetRowUtf8(row);
            stream.Write(text.data(), text.size());
            stream.Write("\n", 1);
            if (keep_text) {
                NeuText += text;
                NeuText += '\n';
            }
        }
    } else {
        stream.Write(NeuText.data(), NeuText.size());
    }
    stream.Close();
    if (list != nullptr && list == List.get()) StoredRevision = list->GetRevision();
    return WriteSettingsStream();
}

int UNeditDoc::WriteSettingsStream() {
    UStorage* storage = GetStorage();
    UStreamFile stream;
    if (storage == nullptr || !stream.CreateStream(*storage, kSettingsStream, kCreateMode))
        return 0;
    const std::string bytes = NeditSettings.Write();
    stream.Write(bytes.data(), bytes.size());
    stream.Close();
    return 1;
}

int UNeditDoc::Save(const std::wstring& path, const UListCtrl* list) const {
    std::string text;
    if (list != nullptr) {
        for (int row = 0; row < list->GetItemCount(); ++row) {
            text += list->GetRowUtf8(row);
            text += '\n';
        }
    }
    return nedit::ReplaceFile(nedit::ToUtf8(path), text) ? 1 : 0;
}

int UNeditDoc::SaveData() {
    return Save(List.get(), 0);
}

void UNeditDoc::CopyDocument(UNeditDoc& target) {
    UStorage* storage = GetStorage();
    UStreamFile stream;
    if (storage != nullptr && stream.OpenStream(*storage, kNeutralDataStream, kReadMode)) {
        std::string decoded;
        for (std::string_view bytes; stream.ReadLine(bytes);) {
            target.NeuText += nedit::TextLineAsUtf8(bytes, decoded);
            target.NeuText += '\n';
        }
        stream.Abort();
    }
    target.NeditSettings = NeditSettings;
}

UListCtrl& UNeditDoc::OpenList() {
    if (!List) {
        List = MakeList();
        Load(List.get());
    }
    return *List;
}

std::unique_ptr<UListCtrl> UNeditDoc::MakeList() {
    auto list = std::make_unique<UListCtrl>(this);
    list->SetDialogHost(Host);
    // While a download runs the list leaves the form alone and ignores the mouse.
    list->SetAbortProcessQuery([this] { return AbortProcessOn; });
    return list;
}

void UNeditDoc::SetDialogHost(nedit::DialogHost* host) {
    Host = host;
    if (List) List->SetDialogHost(host);
}

// ---- Reductions -------------------------------------------------------------------------------

int UNeditDoc::SetupDataBase(UListCtrl* list) {
    Database.reset();
    UpdateDisplaySettings();
    StartEngine(list);
    if (list != nullptr && list->GetItemCount() > 0) Database->SetOutput(true);
    return RunEngine(list);
}

int UNeditDoc::SetupDataBase(const std::wstring& path) {
    Database.reset();
    if (!List) List = MakeList();
    StartEngine(List.get());
    if (!Database->LoadNeFile(path)) return 0;
    Database->SetOutput(false);
    return RunEngine(List.get());
}

void UNeditDoc::StartEngine(UListCtrl* list) {
    Database = std::make_unique<UNeditDatabase>(this, list, SurveyDoc, Host, Progress, L"*CHK");
    Database->SetReportPtr(NReport.get());
    // The routes of an engine die with it.
    Routes.ClearTraverseList();
    Database->AddStage(&Routes);
    for (nedit::RunStage* stage : RunStages) Database->AddStage(stage);
    Database->SetFileName(NeuFileName);  // the bearing store lies beside the neutral file
}

int UNeditDoc::RunEngine(UListCtrl* list) {
    if (!Database->Process()) {
        Progress->Update(100, L"");
        return 0;
    }
    // Coordinates the run was given go into the rows, and so into the document.
    if (!Database->GetAddPtList().empty()) {
        Save(list, 1);
        Database->ClearAddPtList();
    }
    Database->CreateContent();
    Progress->Update(100, L"");
    return 1;
}

void UNeditDoc::Regenerate(UListCtrl* list) {
    if (NReport &&
        nedit::AppMessageBox(
            Host, nedit::Translate(L"Would you like to OVERWRITE the reduction REPORT ?"),
            nedit::mb::YesNo | nedit::mb::IconQuestion) == nedit::mb::IdYes) {
        NReport->Clear();
    }
    SetupDataBase(list);
}

std::wstring UNeditDoc::FormRecBuf(int recordType) const {
    if (recordType == rec::AdjPts) return kAdjustedPointsMarker;
    std::wstring key;
    std::wstring fields;
    if (!GetRecordTemplate(recordType, fields) || !FindRecordKey(recordType, key)) return {};
    return nedit::Format(L"%s %s", key, fields);
}

// ---- Report
// ---------------------------------------------------------------------------------------

int UNeditDoc::CreateNReport() {
    NReport = std::make_unique<UNeditReport>(this, kReportTitle);
    UpdateNReportTitle();
    return 1;
}

void UNeditDoc::UpdateNReportTitle() {
    if (!NReport) return;
    std::wstring job_title;
    if (SurveyDoc != nullptr) {
        const std::wstring path = nedit::FromUtf8(SurveyDoc->GetPathName());
        job_title = path.substr(
            path.find_last_of(L"/\\") == std::wstring::npos ? 0 : path.find_last_of(L"/\\") + 1);
        job_title = job_title.substr(0, job_title.find(L" - "));
    }
    NReport->SetReportTitle(job_title + L" - " + kReportTitle + L" - " + GetName());
}

void UNeditDoc::ClearReport() {
    NReport.reset();
}

void UNeditDoc::UpdateDisplaySettings() {
    if (SurveyDoc != nullptr) Settings = SurveyDoc->GetSettings();
    TakeJobUnits();
    if (NReport) NReport->UpdateSettings();
}

void UNeditDoc::TakeJobUnits() {
    OutputParameters.AngularUnit = nedit::IndexOf(Settings.GetAngleUnit());
    OutputParameters.LinearUnit = nedit::IndexOf(Settings.GetLengthUnit());
}

void UNeditDoc::SetAbortProcess(bool abort) {
    if (abort) {
        Progress->RequestAbort();
    } else {
        Progress->ClearAbort();
    }
}

// ---- Inputs and commands
// ---------------------------------------------------------------------------

int UNeditDoc::Push(XInput* input) {
    if (input == nullptr) return 0;
    InputStack.push_back(input);
    return 1;
}

XInput* UNeditDoc::Pop() {
    if (InputStack.empty()) return nullptr;
    XInput* top = InputStack.back();
    InputStack.pop_back();
    return top;
}

int UNeditDoc::SetOption(XInputOption* option) {
    if (Option) return 0;
    Option.reset(option);
    return 1;
}

void UNeditDoc::OnAbortModalOption() {
    if (!ModalOptionActive) return;
    if (XInput* top = Pop()) top->Terminate(2);
    ModalOptionActive = 0;
}

int UNeditDoc::OnCmdMsg(unsigned id, int code, void* extra) {
    if (code != 0) return 0;
    auto terminate_top = [this](unsigned command) {
        if (XInput* top = Top()) top->Terminate(static_cast<int>(command));
    };
    if (nedit::input::EndsInput(id)) {
        terminate_top(id);
        return 1;
    }
    using namespace nedit::input;
    switch (id) {
        case kAbortModalOption:
            OnAbortModalOption();
            return 1;
        case kSetOptionValueA:
            OptionValueA = *static_cast<int*>(extra);
            return 1;
        case kGetOptionValueA:
            *static_cast<int*>(extra) = OptionValueA;
            return 1;
        case kSetOptionValueB:
            OptionValueB = *static_cast<int*>(extra);
            return 1;
        case kGetOptionValueB:
            *static_cast<int*>(extra) = OptionValueB;
            return 1;
        case kGetOptionIdsB:
            *static_cast<std::vector<unsigned>**>(extra) = &OptionIdsB;
            return 1;
        case kGetOptionIdsA:
            *static_cast<std::vector<unsigned>**>(extra) = &OptionIdsA;
            return 1;
        case kPushInput:
            return Push(static_cast<XInput*>(extra));
        case kPopInput:
            *static_cast<XInput**>(extra) = Pop();
            return 1;
        case kTopInput:
            *static_cast<XInput**>(extra) = Top();
            return 1;
        case kGetOption:
            *static_cast<XInputOption**>(extra) = GetOption();
            return 1;
        case kRemoveOption:
            *static_cast<XInputOption**>(extra) = RemoveOption();
            return 1;
        case kGetInputStack:
            *static_cast<std::vector<XInput*>**>(extra) = &InputStack;
            return 1;
        default:
            return 0;
    }
}
