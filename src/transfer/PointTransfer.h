#pragma once
// The points of a transfer: each reduced point into the job under its name stripped of leading
// blanks and zeros, with its code, layer, symbols, flags, images, attributes and note, and the
// circles its code asks for. A point the job holds with other coordinates is settled through
// DuplicatePtsDlg: overwritten, created anew under a prefix or a new number, or the transfer
// aborted.
//
// Decisions:
// - Extra symbols are stored once the point is saved, since the job keeps them by the point's
//   identifier.
// - Saving a point never moves the job's point counter here, so arc centres (names holding
//   "CENTER") take no number of the job's sequence without a step of their own.
// - A point whose coordinates the user took from the job during the reduction, a note that
//   will not attach, images and attributes that will not load, and points locked in the job
//   that are written over are all named in the report.

#include <cstddef>
#include <set>
#include <string>
#include <vector>

#include "codes/UNeditPt.h"
#include "platform/job/CodeSettings.h"
#include "platform/job/UDBPoint.h"
#include "transfer/JobCircles.h"
#include "transfer/StringTransferSettings.h"

namespace nedit {

class TransferContext;
struct CodeGroup;

class PointTransfer {
  public:
    /// How the points ended: all done (or the user's abort flag stopped the loop), a
    /// failure, or the user's "Abort" in DuplicatePtsDlg.
    enum class End { Done, Failed, Aborted };

    /// `jobCoordinates`: the names whose coordinates the user took from the job.
    PointTransfer(TransferContext& context, const std::vector<UNeditPt>& points,
                  const std::set<std::wstring, std::less<>>* jobCoordinates,
                  const StringTransferSettings& settings, const CodeSettings& codeSettings);

    /// Every point in order; `n` counts the objects of the run.
    End TransferPoints(long& n);
    /// Some point took another name in the job.
    bool RenameUsed() const { return Renamed; }

    /// The point's name as the job keeps it: without leading blanks and zeros.
    static std::wstring StrippedName(const std::wstring& id);
    /// The point code built from the groups by the settings.
    static std::wstring PointCodeText(const std::vector<CodeGroup>& groups,
                                      const StringTransferSettings& settings, bool strNoFirst);

  private:
    End TransferPoint(std::size_t index);
    /// Step 7: the question about a point of the job with other coordinates. False for Abort.
    bool SettleDuplicate(std::size_t index, const std::wstring& stripped, bool& existing);
    /// Steps 8 to 14: code, layer, position, symbols and flags of the working point; the
    /// extra symbols to store once it is saved. False on a failure, after its message.
    bool Describe(const UNeditPt& point, const std::vector<CodeGroup>& groups, const USvyCode& code,
                  std::vector<UExtraSymbol>& extras);
    /// Saves the working point: UnLock, Save and Lock as the settings say. False on a failure.
    bool SavePoint(bool existing, int undoFlag);
    /// Steps 19 to 21: images, attributes and the note of the saved point. False when the
    /// point cannot be saved again.
    bool Attach(const UNeditPt& point);
    /// Names an attachment that would not go with the point, and asks whether to go on
    /// with the others of its kind; No clears `goOn`.
    void AttachmentFailed(const wchar_t* kind, const std::wstring& name,
                          const std::wstring& question, bool& goOn);
    /// Shows why the run stops at this point.
    void Fail(const std::wstring& name, const std::wstring& reason);

    TransferContext& Context;
    const std::vector<UNeditPt>& Points;
    const std::set<std::wstring, std::less<>>* JobCoordinates;
    StringTransferSettings Settings;
    CodeSettings Grammar;
    UDBPoint Working;
    JobCircles Circles;

    bool ApplyAll = false;
    bool LockSeen = false;
    bool CreateNew = false;
    bool Renamed = false;
    int DupMode = 1;
    std::wstring Prefix = L"NEW";
    std::wstring WorkPrefix = L"NEW";
    std::wstring NextNumber;
    bool DoImages;
    bool DoAttributes;
    bool DoNotes;
};

}  // namespace nedit
