#pragma once
// What a transfer to the job did: how many objects of each kind it wrote, which points took
// other names in the job, and everything it did not write, each by name with the reason.
// Some rules of the transfer leave an object out without a word (a line whose points are not
// in the job, a string whose pieces do not join, a note that would not attach) or rewrite a
// point locked in the job; the run names each such case here, so that the user learns of it
// from the program and not from the drawing.

#include <string>
#include <vector>

#include "platform/job/JobTransfers.h"

namespace nedit {

/// A point stored under another name: the name of the reduction and the name in the job.
struct RenamedPoint {
    std::wstring Id;
    std::wstring JobName;
};

/// How a run ended.
enum class TransferEnd {
    NotRun,    // no job, or nothing to transfer
    Declined,  // the user declined a question before anything was written
    Finished,
    Aborted,  // the user stopped the run: what was written before the stop stays
    Failed,   // a failure stopped the run: what was written before it stays
};

struct TransferReport {
    TransferEnd End = TransferEnd::NotRun;
    /// The changes were kept in the job.
    bool Kept = false;
    int PointsAdded = 0;
    int PointsUpdated = 0;
    int LinesAdded = 0;
    int LinesUpdated = 0;
    int ArcsAdded = 0;
    int ArcsUpdated = 0;
    int Circles = 0;
    int PolylinesAdded = 0;
    int PolylinesReplaced = 0;
    std::vector<RenamedPoint> Renamed;
    std::vector<NotWritten> Left;
    /// Points that were locked in the job and have been written over.
    std::vector<std::wstring> LockedRewritten;

    /// Everything undone: the counts go back to 0 and no point was renamed; what was left
    /// out stays listed.
    void Undone();
    /// The message that names what was left out and the locked points written over, at most
    /// kListed of each; empty when there is none.
    std::wstring Summary() const;
    /// What was written, counted for people: "3 points, 2 lines, 0 arcs, 0 circles,
    /// 1 polyline".
    std::wstring WrittenText() const;
    static constexpr std::size_t kListed = 50;
};

}  // namespace nedit
