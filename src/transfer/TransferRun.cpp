#include "transfer/TransferRun.h"

#include <unordered_set>

#include "platform/job/JobError.h"
#include "platform/job/JobTransfers.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/ProgressSink.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "transfer/LineworkTransfer.h"
#include "transfer/LockedLayersQuestion.h"
#include "transfer/PointCodeReader.h"
#include "transfer/PointTransfer.h"
#include "transfer/StringsToJob.h"
#include "transfer/TransferContext.h"
#include "transfer/UToSvyDlg.h"

namespace nedit {

TransferRun::TransferRun(USurveyDoc* job, DialogHost* host, ProgressSink* progress,
                         const PointCodeReader& codes)
    : Job(job), Host(host), Progress(progress), Codes(codes) {}

int TransferRun::TransferToJob(const TransferSource& source) {
    Report = TransferReport();
    if (Job == nullptr) return 0;
    try {
        UDBSQLiteTransaction transaction(Job);
        TransferContext context(*Job, Host, Progress, Codes, Report);
        const int result = Run(context, source);
        if (Report.End == TransferEnd::Finished || Report.End == TransferEnd::Failed ||
            Report.End == TransferEnd::Aborted) {
            RecordTransfer(Job->Database(), RecordOf(source.Name));
            transaction.Commit();
            Report.Kept = true;
        } else {
            transaction.Rollback();
            Report.Undone();
        }
        const std::wstring summary = Report.Summary();
        if (!summary.empty()) context.Tell(summary, mb::IconExclamation);
        if (Report.End == TransferEnd::Aborted) {
            context.Tell(Translate(L"The transfer was stopped: what was written before the stop "
                                   L"({1}) is kept in the job, the rest was not written.",
                                   {Report.WrittenText()}),
                         mb::IconInformation);
        }
        return result;
    } catch (const JobError& error) {
        Report.Undone();
        Report.End = TransferEnd::Failed;
        AppMessageBox(
            Host, Translate(L"The transfer to the job was undone: {1}", {FromUtf8(error.what())}),
            mb::Ok | mb::IconStop);
        AppMessageBox(Host, Translate(L"Data Transfer Error !"), mb::Ok | mb::IconStop);
        return 0;
    }
}

TransferRecord TransferRun::RecordOf(const std::wstring& source) const {
    TransferRecord record;
    record.Source = source;
    record.Points = Report.PointsAdded + Report.PointsUpdated;
    record.Lines = Report.LinesAdded + Report.LinesUpdated;
    record.Arcs = Report.ArcsAdded + Report.ArcsUpdated;
    record.Circles = Report.Circles;
    record.Polylines = Report.PolylinesAdded + Report.PolylinesReplaced;
    record.Complete = Report.End == TransferEnd::Finished;
    record.Left = Report.Left;
    return record;
}

int TransferRun::Run(TransferContext& context, const TransferSource& source) {
    Report.End = TransferEnd::Declined;
    if (LockedLayersDlg(context, source.Points) != 1) return 0;
    const long total =
        static_cast<long>(source.Lines.size() + source.Points.size() + source.Arcs.size());
    if (total < 1) {
        Report.End = TransferEnd::NotRun;
        return 0;
    }
    UToSvyDlg settings(GetStringTransferSettings());
    if (context.Ask(settings) != mb::IdOk) return 0;

    Job->GetSurveyCodeLibrary(true);
    UnLockedLayers();
    context.SetTotal(total);
    context.ResetPtNewID();
    PointTransfer points(context, source.Points, source.DbCoordNames, settings.Settings,
                         Job->GetCodeSettings());
    long n = 0;
    const PointTransfer::End pointsEnd = points.TransferPoints(n);
    if (pointsEnd == PointTransfer::End::Failed) {
        Report.End = TransferEnd::Failed;
        return TransferToJobFinal(context, 0);
    }
    if (pointsEnd == PointTransfer::End::Aborted) {
        Report.End = TransferEnd::Aborted;
        return TransferToJobFinal(context, 1);
    }

    context.FreezePoints();
    USvyCodeLib* library = Job->GetSurveyCodeLibraryFromJob();
    if (library != nullptr && library->IsModified()) {
        Job->UpdatePropertyBar(2);
        library->Save(false, true);
    }
    StringMap lineMap;
    StringMap arcMap;
    LineworkTransfer linework(context, source.Lines, source.Arcs, points.RenameUsed());
    if (!linework.TransferLines(n, lineMap) || !linework.TransferArcs(n, arcMap)) {
        Report.End = TransferEnd::Failed;
        return TransferToJobFinal(context, 0);
    }
    if (!context.WasAborted()) {
        StringsToJob(context, source.Lines, source.Arcs)
            .SaveStringsToJob(lineMap, arcMap, points.RenameUsed() ? 1 : 0);
    }
    Report.End = context.WasAborted() ? TransferEnd::Aborted : TransferEnd::Finished;
    TransferToJobFinal(context, 1);
    context.ResetPtNewID();
    return 1;
}

int TransferRun::LockedLayersDlg(TransferContext& context, const std::vector<UNeditPt>& points) {
    LockedLayers.clear();
    std::unordered_set<std::wstring> checked;
    for (const UNeditPt& point : points) {
        const std::vector<CodeGroup> groups = Codes.Parse(Trim(point.GetCode()));
        if (groups.empty()) continue;
        const std::wstring feature = Trim(groups.front().Code);
        if (feature.empty() || !checked.insert(feature).second) continue;
        const long id = Job->GetLayerId(feature);
        if (id != 0 && Job->IsLayerLocked(id)) LockedLayers.push_back(feature);
    }
    if (LockedLayers.empty()) return 1;
    LockedLayersQuestion question(LockedLayers);
    return context.Ask(question) == mb::IdOk ? 1 : 0;
}

void TransferRun::UnLockedLayers() {
    for (const std::wstring& layer : LockedLayers) Job->ClearLayerLocked(Job->GetLayerId(layer));
}

int TransferRun::TransferToJobFinal(TransferContext& context, int ok) {
    if (Progress != nullptr) Progress->Update(100, L"Save To Survey");
    Job->UpdatePropertyBar(2);
    Job->Regen();
    Job->SetModified(1);
    Job->UpdateAllViews(nullptr, 0);
    if (ok == 0) context.Tell(Translate(L"Data Transfer Error !"), mb::IconStop);
    return ok;
}

}  // namespace nedit
