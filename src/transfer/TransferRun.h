#pragma once
// "Save To Survey": the stores of one reduction written into the job's survey database. First
// every point with its code, symbols, layer, flags, images, attributes and note, and the
// circles its code asks for; then the lines and arcs that stand alone; then the strings, as
// polylines. The run settles with the user the locked layers that the points' codes name,
// the points the job holds with other coordinates (DuplicatePtsDlg) and the polylines of the
// same name (UOverridePolyDlg), reports progress every fifth object and stops at the user's
// abort between objects.
//
// Decisions:
// - One transaction holds the whole run, so a killed program leaves the job as it was. A run
//   that ends is kept; so is a run that the user stops, by the dialog's "Abort" or by the stop
//   between objects, and a run stopped by a failure: what was written before the stop stays,
//   as it always has, and the user is told how much that was and that the rest was not
//   written. A stop between points still saves the code library and ends as a finished run
//   does. A failure of the database itself (a busy job, a full disk) undoes the run, and
//   says why.
// - The locked layers asked about are those that the first feature codes of the points name
//   (a feature code is compared with the names of the job's layers, as it always was); the
//   run finds them itself from the points it is given.
// - Everything the rules leave out without a word, and every point locked in the job that is
//   written over, is named in the report and, at the end of the run, in one message. A run
//   that is kept leaves its record in the job (JobTransfers.h), with what it left out.
// - The user's choices for the point codes are asked as "Point Code" (UToSvyDlg) through the
//   run's host, which stands for the job's own question about them.
// - The reader of point codes is handed in: until the code grammar reads codes for the
//   transfer, a code is one group, its whole text the feature code (PointCodeReader).

#include <set>
#include <string>
#include <vector>

#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "codes/UNeditPt.h"
#include "transfer/TransferReport.h"

class USurveyDoc;

namespace nedit {

class DialogHost;
class PointCodeReader;
class ProgressSink;
class TransferContext;

/// What a transfer reads: the stores of one reduction, the names whose coordinates the user
/// took from the job during it (null for none), and the name of the document or file they
/// come from, which the job's record of the transfer keeps.
struct TransferSource {
    const std::vector<UNeditPt>& Points;
    const std::vector<UNeditLine>& Lines;
    const std::vector<UNeditArc>& Arcs;
    const std::set<std::wstring, std::less<>>* DbCoordNames = nullptr;
    std::wstring Name;
};

class TransferRun {
  public:
    /// A run into `job` (null: nothing is done), asking through `host` (null: every question
    /// takes its default), with progress and the abort flag on `progress` (may be null).
    TransferRun(USurveyDoc* job, DialogHost* host, ProgressSink* progress,
                const PointCodeReader& codes);

    /// 1 when the run came to its end or the user aborted; 0 when nothing was done (no job,
    /// nothing to transfer, a question declined) or on a failure.
    int TransferToJob(const TransferSource& source);
    const TransferReport& GetReport() const { return Report; }

  private:
    int Run(TransferContext& context, const TransferSource& source);
    /// The locked layers named by the points' first feature codes: none gives 1, else the
    /// question's answer (1 for OK).
    int LockedLayersDlg(TransferContext& context, const std::vector<UNeditPt>& points);
    void UnLockedLayers();
    /// The job's record of this run.
    TransferRecord RecordOf(const std::wstring& source) const;
    /// The closing upkeep of the job; with `ok` 0 also "Data Transfer Error !". Gives `ok`.
    int TransferToJobFinal(TransferContext& context, int ok);

    USurveyDoc* Job;
    DialogHost* Host;
    ProgressSink* Progress;
    const PointCodeReader& Codes;
    TransferReport Report;
    std::vector<std::wstring> LockedLayers;
};

}  // namespace nedit
