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
    UStreamFile stream;
    if (list == nullptr || storage == nullptr ||
        !stream.OpenStream(*storage, kNeutralDataStream, kReadMode))
        return 0;
    NeuText.clear();
    NamelessCoordinates coordinates;
    std::wstring line;
    bool first = true;
    while (stream.ReadString(line)) {
        if (stream.GetLength() > 0) {
            Progress->Update(static_cast<int>(100 * stream.GetPosition() / stream.GetLength()),
                             L"");
        }
        if (line.empty()) {
            int rest = 0;
            while (stream.ReadString(line)) ++rest;
            if (rest > 0) {
                nedit::AppMessageBox(Host,
                                     nedit::Translate(L"The records of {1} end at an empty line; "
                                                      L"{2} further lines were not read.",
                                                      {GetName(), std::to_wstring(rest)}),
                                     nedit::mb::IconExclamation);
            }
            break;
        }
        if (first) line = MakeUpperCaseString(line);
        first = false;
        line = coordinates.Complete(*this, GetRecordType(line), line);
        if (list->AddRecord(list->GetItemCount(), line) >= 0)
            NeuText += list->GetItemText(list->GetItemCount() - 1) + L"\n";
        if (GetAbortProcess()) break;
    }
    stream.Abort();
    std::string settings;
    if (storage->ReadStream(kSettingsStream, settings) && !NeditSettings.Read(settings)) return 0;
    return 1;
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
    UStreamFile stream;
    if (storage == nullptr || !stream.CreateStream(*storage, kNeutralDataStream, kCreateMode))
        return 0;
    if (list != nullptr) {
        NeuText.clear();
        for (const std::wstring& row : list->GetRows()) {
            stream.WriteString(row);
            NeuText += row + L"\n";
        }
    } else {
        const std::string bytes = nedit::ToUtf8(NeuText);
        stream.Write(bytes.data(), bytes.size());
    }
    stream.Close();
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
        for (const std::wstring& row : list->GetRows()) text += nedit::ToUtf8(row) + '\n';
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
        for (std::wstring line; stream.ReadString(line);) target.NeuText += line + L"\n";
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
