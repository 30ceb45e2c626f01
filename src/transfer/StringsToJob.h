#pragma once
// Strings into the job: the lines and arcs of each string, gathered by the transfer under the
// string's name, chained into one polyline with bulges for its arcs, and offered to replace a
// polyline of the same name.
//
// The chain grows from a seed (the first line of the string, else its first arc) in passes
// that alternate between its tail and its head: each pass attaches at most one line (at the
// tail only, as lines always have) and one arc (at the end the pass is on). A pass that adds
// nothing counts towards giving up; after more than three such passes the string is given up
// and nothing of it is saved. A string named by lines and by arcs comes up twice: the second
// time it works on the pieces the first left, which then make a polyline of their own.
//
// Decisions:
// - Strings are taken in the order of their names (the maps are ordered), lines first, so a
//   run gives the same job every time.
// - What the rules drop without a word (a string given up, an arc whose middle point is not
//   on it, a polyline the job refuses) is named in the run's report; the strings whose
//   points are missing are told as they always were, and named in the report as well.
// - A string whose layer cannot be made or is locked is saved without a layer.

#include <map>
#include <string>
#include <unordered_map>
#include <vector>

#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "platform/job/USvyCode.h"

class UDBPolyLine;

namespace nedit {

class TransferContext;

/// Indices into the line store, or the arc store, by the name of their string.
using StringMap = std::map<std::wstring, std::vector<int>>;

class StringsToJob {
  public:
    StringsToJob(TransferContext& context, const std::vector<UNeditLine>& lines,
                 const std::vector<UNeditArc>& arcs);

    /// Writes every string of the two maps, then empties them. `newNames`: points took other
    /// names in the job in this run, so names go through the run's new names.
    void SaveStringsToJob(StringMap& lineMap, StringMap& arcMap, int newNames);

  private:
    enum class Step { Failed, Done };
    Step AddLineVertices(UDBPolyLine& poly, const std::wstring& name, int index, int newNames);
    Step AddArcVertices(UDBPolyLine& poly, const std::wstring& name, int index, int newNames,
                        int dir);
    /// One string: the seed, the passes, the look and the save. L and A may be null.
    void SaveString(const std::wstring& name, std::vector<int>* L, std::vector<int>* A,
                    int newNames);
    /// Steps 7 to 9: look, name, the question of a polyline of that name, and the save.
    void WriteString(UDBPolyLine& poly, const std::wstring& name, const USvyCode& code);
    /// The job's identifiers of `names`, each through the run's new names when `newNames`;
    /// false, after "some vertices were not found", when one is missing or two are the same.
    bool JobPoints(const std::wstring& string, std::vector<std::wstring> names, int newNames,
                   std::vector<long>& ids);
    void ReadExistingStrings();
    /// Where the job's point is; each point is read once.
    const UWPoint& Position(long point);

    TransferContext& Context;
    const std::vector<UNeditLine>& Lines;
    const std::vector<UNeditArc>& Arcs;
    std::map<std::wstring, long> ExistingStrings;
    std::unordered_map<long, UWPoint> Positions;
    int OverrideAnswer = 0;
    bool OverrideAll = false;
};

}  // namespace nedit
