#pragma once
// What the steps of one transfer share: the job, the host of its questions and messages, the
// progress and abort flag, the code reader, the report, the names that points took in the job,
// and the layers looked up so far.
//
// Decisions: a layer's identifier is looked up (and the layer made, switched on and checked
// for saving) once per run and then kept, and so is a point's identifier once the points are
// written: within the run's transaction nothing but the run changes the job, so every later
// look-up would give the same answer.

#include <string>
#include <unordered_map>

#include "platform/job/USvyCode.h"
#include "platform/messages/DialogHost.h"
#include "transfer/TransferReport.h"

class USurveyDoc;

namespace nedit {

class PointCodeReader;
class ProgressSink;

class TransferContext {
  public:
    TransferContext(USurveyDoc& job, DialogHost* host, ProgressSink* progress,
                    const PointCodeReader& codes, TransferReport& report);

    USurveyDoc& Job() const { return Survey; }
    DialogHost* Host() const { return Questions; }
    const PointCodeReader& Codes() const { return Reader; }
    TransferReport& Report() const { return Outcome; }

    /// The user asked to stop; once seen it stays so for the run.
    bool AbortRequested();
    bool WasAborted() const { return Aborted; }
    /// Objects of the run, for the progress; `n` counts them from 1 across the run's loops.
    void SetTotal(long total) { Total = total; }
    /// Progress when `n` is a multiple of 5.
    void Progress(long n);

    /// The job's definition of `code` (GetSurveyCodeEx with these flags, never asking).
    USvyCode SurveyCode(const std::wstring& code, bool create, bool useDefault);
    /// The job's layer of `code` ("$$DEFAULT" when it names none), made when the job does not
    /// know it, and switched on; 0 when it cannot be made or is locked (LayerProblem says
    /// which).
    long GetLayerId(const USvyCode& code);
    const std::wstring& LayerProblem() const { return LastLayerProblem; }

    /// The identifier of the job's point of that exact name; 0 when there is none.
    long PointId(const std::wstring& name);
    /// The points are written: from now on the run writes no point, so each name is looked
    /// up in the job once and kept.
    void FreezePoints() { PointsFrozen = true; }
    /// The name that the point `name` took in the job in this run, or `name`.
    const std::wstring& GetNewPoint(const std::wstring& name) const;
    void SetNewID(const std::wstring& id, const std::wstring& jobName);
    /// Forgets the names given in this run.
    void ResetPtNewID() { NewIDs.clear(); }

    /// Lists an object that was not written.
    void Leave(const std::wstring& kind, const std::wstring& name, const std::wstring& reason);
    /// Shows a message with OK.
    void Tell(const std::wstring& text, unsigned icon) const;
    /// Runs a dialog through the host; without one it is accepted as it stands.
    template <class Dialog>
    int Ask(Dialog& dialog) const {
        if (Questions != nullptr) return Questions->Run(dialog);
        dialog.OnInitDialog();
        return dialog.OnOK() ? mb::IdOk : mb::IdCancel;
    }

  private:
    USurveyDoc& Survey;
    DialogHost* Questions;
    ProgressSink* Sink;
    const PointCodeReader& Reader;
    TransferReport& Outcome;
    bool Aborted = false;
    long Total = 0;
    std::unordered_map<std::wstring, std::wstring> NewIDs;
    bool PointsFrozen = false;
    std::unordered_map<std::wstring, long> PointIds;
    std::unordered_map<std::wstring, long> Layers;
    std::unordered_map<std::wstring, std::wstring> LayerProblems;
    std::wstring LastLayerProblem;
};

}  // namespace nedit
