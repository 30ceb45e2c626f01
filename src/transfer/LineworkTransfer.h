#pragma once
// The lines and arcs of a transfer that stand alone: each into the job between the job's points
// of its names, over a line or arc the job has between the same points, or new. Lines and arcs
// whose code is a string code and that name a string are gathered by that name instead, for
// the polylines.
//
// A line or arc whose points are not in the job is left out, as it always was; the run names
// it in its report, with the point that is missing.

#include <string>
#include <vector>

#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "platform/job/USvyCode.h"
#include "transfer/StringsToJob.h"

class UDBLinework;

namespace nedit {

class TransferContext;

class LineworkTransfer {
  public:
    /// `renameUsed`: points took other names in the job in this run.
    LineworkTransfer(TransferContext& context, const std::vector<UNeditLine>& lines,
                     const std::vector<UNeditArc>& arcs, bool renameUsed);

    /// Every line in order, `n` counting on; the lines of strings go into `lineMap`. False on a
    /// failure, after its message; the user's abort ends the loop with true.
    bool TransferLines(long& n, StringMap& lineMap);
    bool TransferArcs(long& n, StringMap& arcMap);

    /// The job's line between two of its points, in either direction (the first one, when the
    /// job has several); 0 when there is none. Looked up by the two points, which finds what
    /// the lines at the first point's position would give.
    long GetUDBLine(long a, long b);
    /// The job's arc with these ends, in either order, and this third point; 0 when none.
    long GetUDBArc(long a, long b, long third);

  private:
    struct LineShape;
    struct ArcShape;
    /// The walk over the lines or the arcs; `Shape` says what differs between the two.
    template <class Shape>
    bool TransferEach(long& n, const std::vector<typename Shape::Item>& items, StringMap& strings,
                      int& added, int& updated);
    /// The job's identifiers of `names` (through the run's new names); false, after listing
    /// the object as not written, when one is missing or two are the same.
    bool JobPoints(const wchar_t* kind, const std::vector<std::wstring>& names,
                   std::vector<long>& ids);
    /// Layer, line style, colour, thickness and flags from `code`, and the save. False on a
    /// failure, after its message.
    bool StyleAndSave(UDBLinework& object, const USvyCode& code, const std::wstring& name);

    TransferContext& Context;
    const std::vector<UNeditLine>& Lines;
    const std::vector<UNeditArc>& Arcs;
    bool RenameUsed;
};

}  // namespace nedit
