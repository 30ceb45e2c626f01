#pragma once
// Route discovery. A field file declares no traverse: after every run the rows are read once
// more and the chains of set-ups along which the work went are found, each a route of names
// in which every name was observed from the set-up of the one before it, in forward record
// order. The search reads the text of the records through the record service, never the
// observation model; of the run it needs only which names became points.
//
// It is a stage of the run: the document hands it to every engine it builds, and the routes
// live here until the next search. The route dialog may add a route between searches.
//
// Decisions:
// - The routes are held with look-ups by name (RouteList), so the search stays linear in the
//   records for routes of bounded length. The routes themselves are what it gives: a set-up
//   that branches copies the route so far, as the route list has always shown a branch whole.

#include <deque>
#include <memory>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "records/FieldMap.h"
#include "reduction/RunRows.h"
#include "reduction/RunStage.h"
#include "traverse/NameList.h"
#include "traverse/RouteList.h"
#include "traverse/UNeditStn.h"

class UNeditDatabase;
class UNeutralFileFormat;

namespace nedit {

class TraverseRoutes : public RunStage {
  public:
    /// `format` parses the rows; it must outlive this object.
    explicit TraverseRoutes(UNeutralFileFormat& format) : Format(format) {}

    /// Finds the routes at the run's routes step.
    void Run(UNeditDatabase& engine, RunStep step) override;

    /// The search over the rows the engine's run read. Gives the number of routes, 0 without
    /// rows or with fewer than 2.
    int FindTraverse(UNeditDatabase& engine);
    /// The search over `records`. Gives the number of routes.
    int FindTraverse(UNeditDatabase& engine, const RunRows& records);

    /// The set-up of that name whose STN record stands at `row`, or null.
    UNeditStn* FindStn(const std::wstring& name, int row) const;
    /// The first set-up of that name whose STN record stands after `row`, or null.
    UNeditStn* FindNextStn(const std::wstring& name, int row) const;
    /// Each route's stretch from its start up to its first entry of `name` (no case), as new
    /// lists of the bin, into `out`; gives their count.
    int FindTraverseRoute(const std::wstring& name, std::vector<NameList*>& out);
    /// See RouteList::IsNeighbour.
    bool IsPartOfTraverseRoute(const std::wstring& a, const std::wstring& b) const {
        return TraverseList.IsNeighbour(a, b);
    }
    /// `list`, or a list of the same names, is among the routes; false for null.
    bool IsInTravList(const NameList* list) const;
    /// A copy of `list` in the bin; null for null.
    NameList* CloneNameList(const NameList* list);
    /// Forgets every route, list and set-up.
    void ClearTraverseList();
    /// A station line along every leg of every route whose ends are points.
    void SaveTraverseLines(UNeditDatabase& engine) const;
    /// Puts `route` into the bin and among the routes; gives it.
    const NameList* AddRoute(NameList route);

    const std::vector<const NameList*>& GetTraverseList() const { return TraverseList.Routes(); }
    const std::vector<std::unique_ptr<NameList>>& GetTraverseBinList() const {
        return TraverseBinList;
    }
    /// The row of the first side-shot record of `target` (no case) that a set-up of `name`
    /// holds after `row`, set-ups and records in order; -1 if none.
    int IsPtObserved(const std::wstring& name, int row, const std::wstring& target) const;

  private:
    /// A route still growing, with its names for the test of a return.
    struct GrowingRoute {
        NameList* List;
        std::unordered_set<std::wstring> Names;
    };
    using Visited = std::unordered_set<std::wstring>;

    void CreateTraverseList(const UNeditStn& start, Visited& visited);
    /// Seeds the routes that leave `start`, onto `work`.
    void SeedRoutes(const UNeditStn& start, Visited& visited, std::deque<GrowingRoute>& work);
    /// A route that goes no further: among the routes unless an equal one is.
    void Finish(NameList* route);
    NameList* NewList(NameList content = {});
    GrowingRoute Growing(NameList* list) const;
    /// Steps 2 and 4 of the search: the set-ups in row order, then the records of each block.
    std::vector<UNeditStn*> CollectSetUps(const UNeditDatabase& engine, const RunRows& records);
    bool FillSetUps(const UNeditDatabase& engine, const RunRows& records,
                    const std::vector<UNeditStn*>& setUps);
    /// A field of the record just parsed, or its current value when the record leaves it empty.
    const std::wstring& Value(int id) const;

    UNeutralFileFormat& Format;
    FieldMap Fields;
    std::vector<int> RowTypes;  // the type of each row of the search, kept for its memory
    RouteList TraverseList;
    std::vector<std::unique_ptr<NameList>> TraverseBinList;
    // Every set-up of a name, in row order.
    std::unordered_map<std::wstring, std::vector<std::unique_ptr<UNeditStn>>> StnMap;
};

}  // namespace nedit
