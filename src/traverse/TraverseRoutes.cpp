#include "traverse/TraverseRoutes.h"

#include <algorithm>

#include "platform/geometry/Tolerance.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace nedit {

namespace {

bool ByIndex(const std::unique_ptr<UNeditStn>& node, int row) {
    return node->GetIndex() < row;
}

}  // namespace

void TraverseRoutes::Run(UNeditDatabase& engine, RunStep step) {
    if (step == RunStep::Routes) FindTraverse(engine);
}

int TraverseRoutes::FindTraverse(UNeditDatabase& engine) {
    ClearTraverseList();
    return FindTraverse(engine, engine.GetRunRows());
}

int TraverseRoutes::FindTraverse(UNeditDatabase& engine, const RunRows& records) {
    ClearTraverseList();
    if (records.size() < 3) return 0;
    const std::vector<UNeditStn*> set_ups = CollectSetUps(engine, records);
    if (StnMap.empty() || !FillSetUps(engine, records, set_ups)) {
        ClearTraverseList();
        return 0;
    }
    Visited visited;
    for (const UNeditStn* node : set_ups) {
        if (!node->GetStnList().empty()) CreateTraverseList(*node, visited);
    }
    SaveTraverseLines(engine);
    return static_cast<int>(TraverseList.size());
}

const std::wstring& TraverseRoutes::Value(int id) const {
    const auto field = Fields.find(id);
    if (field != Fields.end() && !field->second.empty()) return field->second;
    return Format.GetCurrentValue(id);
}

std::vector<UNeditStn*> TraverseRoutes::CollectSetUps(const UNeditDatabase& engine,
                                                      const RunRows& records) {
    std::vector<UNeditStn*> set_ups;
    RowTypes.resize(records.size());
    for (std::size_t row = 0; row < records.size(); ++row) {
        const std::wstring text = records[row];
        RowTypes[row] = Format.GetRecordType(text);
        if (RowTypes[row] != rec::Stn || !Format.ProcessRecord(rec::Stn, text, Fields)) continue;
        const std::wstring name = Value(fld::ID);
        if (name.empty()) continue;
        // A station the run could not position, or a point of a PT record, is no set-up.
        const int point = engine.GetPointIdx(name);
        if (point < 0 || engine.GetPointList()[static_cast<std::size_t>(point)].IsPTRecord())
            continue;
        auto node = std::make_unique<UNeditStn>(name, static_cast<int>(row));
        set_ups.push_back(node.get());
        StnMap[name].push_back(std::move(node));
    }
    return set_ups;
}

bool TraverseRoutes::FillSetUps(const UNeditDatabase& engine, const RunRows& records,
                                const std::vector<UNeditStn*>& setUps) {
    const std::wstring& check_code = engine.GetChkShotCode();
    bool any_edge = false;
    for (std::size_t s = 0; s < setUps.size(); ++s) {
        UNeditStn& node = *setUps[s];
        // A block runs to the next set-up: an STN record passed over above ends none.
        const std::size_t end = s + 1 < setUps.size()
                                    ? static_cast<std::size_t>(setUps[s + 1]->GetIndex())
                                    : records.size();
        for (std::size_t row = static_cast<std::size_t>(node.GetIndex()) + 1; row < end; ++row) {
            const int type = RowTypes[row];
            if (type != rec::Bkb && type != rec::Bs && type != rec::Ss && type != rec::Ss2)
                continue;
            if (!Format.ProcessRecord(type, records[row], Fields)) continue;
            const std::wstring& name = Value(fld::ID);
            if (name.empty()) continue;
            const int at = static_cast<int>(row);
            if (type == rec::Bkb) {
                node.AddBKB(name, at);
                continue;
            }
            if (type == rec::Bs) {
                node.AddBS(name, at);
                continue;
            }
            node.AddSS(name, at);
            // The first character does not count: a code that begins with the check
            // command leaves the shot an edge.
            const std::wstring& code = Value(fld::CO);
            const std::size_t check_at =
                check_code.empty() ? std::wstring::npos : code.find(check_code);
            const bool check_shot = check_at != std::wstring::npos && check_at > 0;
            if (check_shot || EqualsIgnoreCase(name, node.GetStnName()) ||
                Is_Zero(TextToDouble(Value(fld::SD)), false) || StnMap.count(name) == 0) {
                continue;
            }
            node.AddStn(name, at);
            any_edge = true;
        }
    }
    return any_edge;
}

TraverseRoutes::GrowingRoute TraverseRoutes::Growing(NameList* list) const {
    GrowingRoute route{list, {}};
    for (const NameEntry& entry : *list) route.Names.insert(entry.Key);
    return route;
}

void TraverseRoutes::SeedRoutes(const UNeditStn& start, Visited& visited,
                                std::deque<GrowingRoute>& work) {
    const std::wstring& name = start.GetStnName();
    std::unordered_set<std::wstring> seen;
    for (const NameEntry& edge : start.GetStnList()) {
        const std::wstring& target = edge.Key;
        // Two observations of one target from one set-up give one branch, the first.
        if (!seen.insert(target).second) continue;
        const bool start_visited = visited.count(name) != 0;
        const bool target_visited = visited.count(target) != 0;
        if (!start_visited && !target_visited) {
            work.push_back(Growing(NewList({{name, start.GetIndex()}, edge})));
            visited.insert(name);
            visited.insert(target);
        } else if (IsPartOfTraverseRoute(name, target)) {
            // The leg is on a route already.
        } else if (start_visited) {
            // A station on a route already becomes a branch point of each route through it.
            std::vector<NameList*> prefixes;
            if (FindTraverseRoute(name, prefixes) > 0) {
                for (NameList* prefix : prefixes) {
                    if (prefix->back().Key == target) continue;
                    prefix->push_back(edge);
                    visited.insert(target);
                    work.push_back(Growing(prefix));
                }
            } else {
                work.push_back(Growing(NewList({{name, start.GetIndex()}, edge})));
                visited.insert(target);
            }
        }
        // Otherwise the leg starts no route; a set-up reached from a route takes it up.
    }
}

void TraverseRoutes::CreateTraverseList(const UNeditStn& start, Visited& visited) {
    std::deque<GrowingRoute> work;
    SeedRoutes(start, visited, work);
    std::unordered_set<std::wstring> seen;
    std::vector<const NameEntry*> candidates;
    // Breadth first: new and grown routes go to the end of the work list.
    while (!work.empty()) {
        const NameList& route = *work.front().List;
        const NameEntry tail = route.back();
        // Routes run forward through the file, never back to an earlier set-up.
        const UNeditStn* next = FindNextStn(tail.Key, tail.Value);
        candidates.clear();
        seen.clear();
        if (next != nullptr) {
            for (const NameEntry& edge : next->GetStnList()) {
                if (EqualsIgnoreCase(edge.Key, tail.Key) || seen.count(edge.Key) != 0) continue;
                // No step straight back.
                if (route.size() >= 2 && EqualsIgnoreCase(edge.Key, route[route.size() - 2].Key))
                    continue;
                seen.insert(edge.Key);
                candidates.push_back(&edge);
            }
        }
        GrowingRoute taken = std::move(work.front());
        work.pop_front();
        if (candidates.empty()) {
            Finish(taken.List);
            continue;
        }
        // A copy takes each candidate but the last; the route itself takes the last.
        for (std::size_t c = 0; c < candidates.size(); ++c) {
            GrowingRoute grown = c + 1 < candidates.size()
                                     ? GrowingRoute{CloneNameList(taken.List), taken.Names}
                                     : std::move(taken);
            const NameEntry& candidate = *candidates[c];
            // Back at a name it holds: the route ends, without the repeated name.
            if (grown.Names.count(candidate.Key) != 0) {
                Finish(grown.List);
                continue;
            }
            grown.List->push_back(candidate);
            grown.Names.insert(candidate.Key);
            visited.insert(candidate.Key);
            work.push_back(std::move(grown));
        }
    }
}

void TraverseRoutes::Finish(NameList* route) {
    if (!IsInTravList(route)) TraverseList.Append(route);
}

NameList* TraverseRoutes::NewList(NameList content) {
    TraverseBinList.push_back(std::make_unique<NameList>(std::move(content)));
    return TraverseBinList.back().get();
}

UNeditStn* TraverseRoutes::FindStn(const std::wstring& name, int row) const {
    const auto found = StnMap.find(name);
    if (found == StnMap.end()) return nullptr;
    const auto& nodes = found->second;
    const auto node = std::lower_bound(nodes.begin(), nodes.end(), row, ByIndex);
    return node != nodes.end() && (*node)->GetIndex() == row ? node->get() : nullptr;
}

UNeditStn* TraverseRoutes::FindNextStn(const std::wstring& name, int row) const {
    const auto found = StnMap.find(name);
    if (found == StnMap.end()) return nullptr;
    const auto& nodes = found->second;
    const auto node = std::lower_bound(nodes.begin(), nodes.end(), row + 1, ByIndex);
    return node != nodes.end() ? node->get() : nullptr;
}

int TraverseRoutes::FindTraverseRoute(const std::wstring& name, std::vector<NameList*>& out) {
    out.clear();
    for (const RouteList::Place& place : TraverseList.FirstPlaces(name)) {
        const NameList& route = *TraverseList.Routes()[place.Route];
        const auto end = route.begin() + static_cast<std::ptrdiff_t>(place.Entry) + 1;
        out.push_back(NewList(NameList(route.begin(), end)));
    }
    return static_cast<int>(out.size());
}

bool TraverseRoutes::IsInTravList(const NameList* list) const {
    return list != nullptr && TraverseList.Holds(*list);
}

NameList* TraverseRoutes::CloneNameList(const NameList* list) {
    return list == nullptr ? nullptr : NewList(*list);
}

void TraverseRoutes::ClearTraverseList() {
    TraverseList.Clear();
    TraverseBinList.clear();
    StnMap.clear();
}

void TraverseRoutes::SaveTraverseLines(UNeditDatabase& engine) const {
    for (const NameList* route : TraverseList.Routes()) {
        if (route->size() < 2) continue;
        int from = engine.GetPointIdx(route->front().Key);
        for (std::size_t i = 1; i < route->size(); ++i) {
            const int to = engine.GetPointIdx((*route)[i].Key);
            if (from >= 0 && to >= 0 && from != to)
                engine.SaveLine(static_cast<unsigned>(from), static_cast<unsigned>(to), 1);
            from = to;
        }
    }
}

const NameList* TraverseRoutes::AddRoute(NameList route) {
    NameList* list = NewList(std::move(route));
    TraverseList.Append(list);
    return list;
}

int TraverseRoutes::IsPtObserved(const std::wstring& name, int row,
                                 const std::wstring& target) const {
    const auto found = StnMap.find(name);
    if (found == StnMap.end()) return -1;
    for (const auto& node : found->second) {
        for (const NameEntry& shot : node->GetSSList()) {
            if (shot.Value > row && EqualsIgnoreCase(shot.Key, target)) return shot.Value;
        }
    }
    return -1;
}

}  // namespace nedit
