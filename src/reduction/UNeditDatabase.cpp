// The engine's life and its runs: construction, the stages of a run in order, the re-runs,
// the error table and the record of what the rows held at the last good run.

#include "reduction/UNeditDatabase.h"

#include <cstdio>

#include "platform/messages/DialogHost.h"
#include "platform/messages/ProgressSink.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"

namespace {

// Rows of these types are no content: changing them does not call for a new reduction.
bool IsContentType(int type) {
    switch (type) {
        case rec::Comment:
        case rec::Note:
        case rec::Job:
        case rec::Date:
        case rec::Name:
        case rec::Drec:
        case rec::Instru:
        case rec::Edm:
            return false;
        default:
            return true;
    }
}

}  // namespace

UNeditDatabase::UNeditDatabase(UNeutralFileFormat* format, nedit::RowSource* rows, USurveyDoc* job,
                               nedit::DialogHost* host, nedit::ProgressSink* progress,
                               const std::wstring& chkCode)
    : Doc(format),
      Rows(rows),
      SurveyDoc(job),
      Host(host),
      Progress(progress),
      ChkCode(chkCode.empty() ? L"*CHK" : chkCode) {
    // Older field programs left a debugging file behind; an engine clears it away.
    std::remove("DEBUG.DAT");
    LoadSvyCodeCtrl();
    if (!chkCode.empty()) ChkCode = chkCode;
    InitUnitsAndAngleModes();
    DeleteTopoLines();
}

UNeditDatabase::~UNeditDatabase() {
    ScaleFactor = 1.0;
    DeleteList();
    SaveBearingArray();
    DeleteBearingArray();
}

bool UNeditDatabase::AbortRequested() const {
    return Progress != nullptr && Progress->AbortRequested();
}

void UNeditDatabase::UpdateProgress(unsigned percent, std::wstring_view text) {
    // Only changes go out, so that a run of millions of records does not flood the sink.
    if (Progress == nullptr || (percent == LastPercent && text == LastProgressText)) return;
    LastPercent = percent;
    LastProgressText = text;
    Progress->Update(static_cast<int>(percent), LastProgressText);
}

int UNeditDatabase::GetAngleType() const {
    switch (AngleUnit) {
        case L'D':
        case L'd':
            return 1;
        case L'G':
        case L'g':
            return 2;
        default:
            return 0;
    }
}

int UNeditDatabase::GetError() {
    if (ErrorCode != 0) CError::Show(ErrorCode, Host);
    return ErrorCode;
}

void UNeditDatabase::InitHeadList() {
    DeleteList();
}

void UNeditDatabase::SetMaxMin(const UWRect& extents) {
    XMin = extents.GetMinX();
    YMin = extents.GetMinY();
    XMax = extents.GetMaxX();
    YMax = extents.GetMaxY();
    DocRect = extents;
}

int UNeditDatabase::Process() {
    if (Doc != nullptr && !Doc->IsKeysInitialised()) {
        nedit::AppMessageBox(Host,
                             nedit::Translate(L"Record keys or fields have not been initialised."),
                             nedit::mb::IconStop);
        return 0;
    }
    CorrectDist = false;
    ResetCircleData();
    if (!PrepareList() || !PrepareForwardNoBS()) return 0;
    LoadBearingArray();
    ProcessAverageMeas();
    ProcessAverageAngle();
    const int result = ProcessCoord(kAllPasses, Output ? 1 : 0, 0, nullptr);
    UseForAll = false;
    SetMinMaxCoord();
    if (result == 0) return 0;
    RunStages(nedit::RunStep::Routes);
    ProcessAttachments();
    RunStages(nedit::RunStep::Attachments);
    return 1;
}

void UNeditDatabase::RunStages(nedit::RunStep step) {
    for (nedit::RunStage* stage : Stages) stage->Run(*this, step);
}

void UNeditDatabase::ResetForRerun() {
    LoadSvyCodeCtrl();
    DeleteList();
    SaveBearingArray();
    DeleteBearingArray();
    DeleteTopoLines();
    XMin = YMin = XMax = YMax = -1e12;
    ErrorCode = 0;
}

void UNeditDatabase::Regenerate() {
    ResetForRerun();
    if (!PrepareList() || !PrepareForwardNoBS()) return;
    LoadBearingArray();
    if (!ProcessAverageMeas()) return;
    ProcessAverageAngle();
    const int result = ProcessCoord(kAllPasses, 0, 0, nullptr);
    SetMinMaxCoord();
    if (result != 0) RunStages(nedit::RunStep::Routes);
}

void UNeditDatabase::Generate(const std::vector<std::wstring>& rows, bool findRoutes) {
    ResetForRerun();
    PrepareList(rows);
    PrepareForwardNoBS();
    LoadBearingArray();
    ProcessAverageMeas();
    ProcessAverageAngle();
    const int result = ProcessCoord(kAllPasses, 1, 0, nullptr);
    if (result == 0 || findRoutes) {
        UseForAll = false;
        SetMinMaxCoord();
    }
    if (result != 0 && findRoutes) {
        // The routes are found in the rows of this run, not in the record list.
        GivenRows = &rows;
        RunStages(nedit::RunStep::Routes);
        GivenRows = nullptr;
    }
}

nedit::RunRows UNeditDatabase::GetRunRows() const {
    static const std::vector<std::wstring> no_rows;
    if (GivenRows != nullptr) return nedit::RunRows(*GivenRows);
    return Rows != nullptr ? nedit::RunRows(*Rows) : nedit::RunRows(no_rows);
}

nedit::TextLines UNeditDatabase::ContentRows() const {
    if (Rows == nullptr || Doc == nullptr) return nedit::TextLines();
    // Rows that are as the reduction reads them are shared with the list, not copied.
    const nedit::TextLines* lines = Rows->GetLines();
    nedit::TextLines rows =
        lines != nullptr ? nedit::TextLines::SharingBlocksOf(*lines) : nedit::TextLines();
    std::string buffer;
    for (int row = 0; row < Rows->GetItemCount(); ++row) {
        const std::string_view stored = Rows->GetRowUtf8(row);
        const std::string_view text = RowAsRead(stored, buffer);
        if (!IsContentType(Doc->GetRecordTypeUtf8(text))) continue;
        if (lines != nullptr && text.data() == stored.data() && text.size() == stored.size()) {
            rows.PushShared(*lines, static_cast<std::size_t>(row));
        } else {
            rows.push_back(text);
        }
    }
    return rows;
}

void UNeditDatabase::CreateContent() {
    ContentLines = ContentRows();
}

bool UNeditDatabase::IsContentModified() const {
    if (Rows == nullptr || Doc == nullptr) return false;
    const nedit::TextLines present = ContentRows();
    if (present.size() != ContentLines.size()) return true;
    FieldMap stored_fields;
    FieldMap present_fields;
    for (std::size_t i = 0; i < present.size(); ++i) {
        const std::wstring stored = nedit::FromUtf8(ContentLines[i]);
        const std::wstring now = nedit::FromUtf8(present[i]);
        const int stored_type = Doc->GetRecordType(stored);
        if (stored_type != Doc->GetRecordType(now)) return true;
        const int stored_parsed = Doc->ProcessRecord(stored_type, stored, stored_fields);
        const int present_parsed = Doc->ProcessRecord(stored_type, now, present_fields);
        if (stored_parsed != present_parsed) return true;
        if (!stored_parsed) continue;
        // A field only the present row has does not count; a changed case does not either.
        for (const auto& [id, value] : stored_fields) {
            const auto found = present_fields.find(id);
            if (found == present_fields.end() ||
                nedit::ToUpper(found->second) != nedit::ToUpper(value))
                return true;
        }
    }
    return false;
}
