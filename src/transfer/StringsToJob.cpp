#include "transfer/StringsToJob.h"

#include "platform/geometry/UWRect.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBPolyLine.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "transfer/ArcPieces.h"
#include "transfer/TransferContext.h"
#include "transfer/UOverridePolyDlg.h"

namespace nedit {

namespace {

// The walk over the job's polylines takes them all with this rectangle and mask.
constexpr unsigned kPolylineMask = 0x500000;

// The lines or the arcs of a string that its chain has not taken yet, tried in their order.
// Those taken are marked as they go and leave the string's array when the string is done, so
// a long string in order costs one try per piece, and the array keeps what is left for the
// next time the string's name comes up.
class Pieces {
  public:
    enum Tried { kFailed, kGrew, kNone };

    explicit Pieces(std::vector<int>* indices)
        : Indices(indices),
          Taken(indices != nullptr ? indices->size() : 0, false),
          Remaining(Taken.size()) {}
    ~Pieces() {
        if (Indices == nullptr) return;
        std::size_t kept = 0;
        for (std::size_t i = 0; i < Taken.size(); ++i) {
            if (!Taken[i]) (*Indices)[kept++] = (*Indices)[i];
        }
        Indices->resize(kept);
    }
    Pieces(const Pieces&) = delete;
    Pieces& operator=(const Pieces&) = delete;

    std::size_t Left() const { return Remaining; }
    /// The first piece not taken; only while some are left.
    int First() const { return (*Indices)[Next]; }
    void TakeFirst() { Take(Next); }
    /// Tries the pieces not taken in order with `attach`, which gives kFailed, kGrew or kNone,
    /// and takes the first that grew the chain. Gives what the last try gave.
    template <class Attach>
    Tried TakeFirstThat(Attach attach) {
        for (std::size_t i = Next; i < Taken.size(); ++i) {
            if (Taken[i]) continue;
            const Tried tried = attach((*Indices)[i]);
            if (tried == kGrew) Take(i);
            if (tried != kNone) return tried;
        }
        return kNone;
    }

  private:
    void Take(std::size_t i) {
        Taken[i] = true;
        --Remaining;
        while (Next < Taken.size() && Taken[Next]) ++Next;
    }

    std::vector<int>* Indices;
    std::vector<bool> Taken;
    std::size_t Remaining;
    std::size_t Next = 0;
};

}  // namespace

StringsToJob::StringsToJob(TransferContext& context, const std::vector<UNeditLine>& lines,
                           const std::vector<UNeditArc>& arcs)
    : Context(context), Lines(lines), Arcs(arcs) {}

void StringsToJob::SaveStringsToJob(StringMap& lineMap, StringMap& arcMap, int newNames) {
    if (lineMap.empty() && arcMap.empty()) return;
    ReadExistingStrings();
    std::vector<std::wstring> names;
    for (const auto& entry : lineMap) names.push_back(entry.first);
    for (const auto& entry : arcMap) names.push_back(entry.first);
    for (const std::wstring& name : names) {
        if (Context.AbortRequested()) break;
        const auto lines = lineMap.find(name);
        const auto arcs = arcMap.find(name);
        SaveString(name, lines != lineMap.end() ? &lines->second : nullptr,
                   arcs != arcMap.end() ? &arcs->second : nullptr, newNames);
    }
    lineMap.clear();
    arcMap.clear();
}

const UWPoint& StringsToJob::Position(long point) {
    const auto known = Positions.find(point);
    if (known != Positions.end()) return known->second;
    return Positions.emplace(point, UDBPoint(&Context.Job(), point).GetPoint()).first->second;
}

void StringsToJob::ReadExistingStrings() {
    ExistingStrings.clear();
    UDBPolyLine walk(&Context.Job());
    walk.Enumerate(UWRect(0.0, 0.0, 0.0, 0.0), kPolylineMask);
    for (long id = walk.Next(); id != 0; id = walk.Next()) {
        if (!walk.GetName().empty()) ExistingStrings[walk.GetName()] = id;
    }
}

void StringsToJob::SaveString(const std::wstring& name, std::vector<int>* L, std::vector<int>* A,
                              int newNames) {
    Pieces lines(L);
    Pieces arcs(A);
    if (lines.Left() == 0 && arcs.Left() == 0) return;
    UDBPolyLine poly(&Context.Job());
    USvyCode code;
    // The seed: the first line of the string, else its first arc.
    if (lines.Left() > 0) {
        code = Context.SurveyCode(Lines[static_cast<std::size_t>(lines.First())].GetCode(), false,
                                  true);
        if (AddLineVertices(poly, name, lines.First(), newNames) == Step::Failed) return;
        lines.TakeFirst();
    } else {
        code =
            Context.SurveyCode(Arcs[static_cast<std::size_t>(arcs.First())].GetCode(), false, true);
        if (AddArcVertices(poly, name, arcs.First(), newNames, 1) == Step::Failed) return;
        arcs.TakeFirst();
    }
    if (poly.GetCount() == 0) return;

    int dir = 0;
    int idle = 0;
    int lastCount = 0;
    while (lines.Left() + arcs.Left() > 0) {
        if (idle > 3) {
            Context.Leave(L"string", name,
                          Translate(L"{1} of its lines and arcs do not join its chain (a gap, a "
                                    L"second closing or a leg it shares with another string), so "
                                    L"none of it was saved",
                                    {std::to_wstring(lines.Left() + arcs.Left())}));
            return;
        }
        dir = dir == 0 ? 1 : 0;
        if (poly.GetCount() > lastCount) {
            lastCount = poly.GetCount();
            idle = 0;
        } else {
            ++idle;
        }
        const bool attached =
            lines.TakeFirstThat([&](int index) {
                const int before = poly.GetCount();
                if (AddLineVertices(poly, name, index, newNames) == Step::Failed)
                    return Pieces::kFailed;
                return poly.GetCount() > before ? Pieces::kGrew : Pieces::kNone;
            }) != Pieces::kFailed &&
            arcs.TakeFirstThat([&](int index) {
                const int before = poly.GetCount();
                if (AddArcVertices(poly, name, index, newNames, dir) == Step::Failed)
                    return Pieces::kFailed;
                return poly.GetCount() > before ? Pieces::kGrew : Pieces::kNone;
            }) != Pieces::kFailed;
        if (!attached) return;
    }
    if (poly.GetCount() < 2) {
        Context.Tell(Translate(L"String {1} could not be created because at least 2 vertices are "
                               L"required.",
                               {name}),
                     mb::IconExclamation);
        Context.Leave(L"string", name, Translate(L"it has fewer than 2 vertices"));
        return;
    }
    WriteString(poly, name, code);
}

void StringsToJob::WriteString(UDBPolyLine& poly, const std::wstring& name, const USvyCode& code) {
    USurveyDoc& job = Context.Job();
    const long layer = Context.GetLayerId(code);
    poly.SetLayer(layer);
    poly.SetLineStyle(job.GetLineTypeIndex(code.LineType, layer));
    poly.SetColour(TextToInt(code.LineColour));
    poly.SetThickness(job.GetLineThicknessIndex(code.Thickness, layer));
    poly.SetFlags(code.LineUseInSurface != 0 ? poly.GetFlags() | UDBObject::kUseInSurface
                                             : poly.GetFlags() & ~UDBObject::kUseInSurface);
    poly.SetName(name);

    const auto existing = ExistingStrings.find(name);
    if (existing != ExistingStrings.end()) {
        if (!OverrideAll) {
            UOverridePolyDlg dialog(name);
            Context.Ask(dialog);
            OverrideAnswer = dialog.Answer == mb::IdYes ? 1 : 0;
            OverrideAll = dialog.ApplyAll;
        }
        UDBPolyLine old(&job);
        if (OverrideAnswer == 1 && old.Load(existing->second)) {
            old.ReleaseLinkage();
            poly.SetId(existing->second);
            old = poly;
            if (old.Save(4, false, false)) {
                ++Context.Report().PolylinesReplaced;
            } else {
                Context.Leave(L"string", name, old.LastError());
            }
            old.AddLinkage();
            return;
        }
    }
    if (poly.Save(0, false, false)) {
        ++Context.Report().PolylinesAdded;
    } else {
        Context.Leave(L"string", name, poly.LastError());
    }
}

bool StringsToJob::JobPoints(const std::wstring& string, std::vector<std::wstring> names,
                             int newNames, std::vector<long>& ids) {
    ids.clear();
    std::wstring problem;
    for (std::wstring& point : names) {
        if (newNames) point = Context.GetNewPoint(point);
        const long id = Context.PointId(point);
        for (std::size_t k = 0; k < ids.size() && problem.empty(); ++k) {
            if (id != 0 && ids[k] == id)
                problem =
                    Translate(L"points {1} and {2} are one point in the job", {names[k], point});
        }
        if (id == 0 && problem.empty())
            problem = Translate(L"point {1} is not in the job", {point});
        ids.push_back(id);
    }
    if (problem.empty()) return true;
    Context.Tell(Translate(L"String {1} could not be created because some vertices were not "
                           L"found in the database.",
                           {string}),
                 mb::IconExclamation);
    Context.Leave(L"string", string, problem);
    return false;
}

StringsToJob::Step StringsToJob::AddLineVertices(UDBPolyLine& poly, const std::wstring& name,
                                                 int index, int newNames) {
    const UNeditLine& line = Lines[static_cast<std::size_t>(index)];
    std::vector<long> ids;
    if (!JobPoints(name, {line.GetFromPt(), line.GetToPt()}, newNames, ids)) return Step::Failed;
    if (poly.GetCount() == 0) {
        poly.Add({0.0, ids[0]});
        poly.Add({0.0, ids[1]});
        return Step::Done;
    }
    // Lines attach at the tail only, whichever way they run.
    const long tail = poly.GetIdAt(poly.GetCount() - 1);
    if (tail == ids[0]) {
        poly.Add({0.0, ids[1]});
    } else if (tail == ids[1]) {
        poly.Add({0.0, ids[0]});
    }
    return Step::Done;
}

StringsToJob::Step StringsToJob::AddArcVertices(UDBPolyLine& poly, const std::wstring& name,
                                                int index, int newNames, int dir) {
    const UNeditArc& arc = Arcs[static_cast<std::size_t>(index)];
    std::vector<long> ids;
    if (!JobPoints(name, {arc.GetStartPt(), arc.GetEndPt(), arc.GetThirdPt()}, newNames, ids))
        return Step::Failed;
    const long S = ids[0];
    const long E = ids[1];
    const long T = ids[2];
    ArcType type = arc.GetArcType();
    const bool threePoint = (type & UWArc::kThirdOnArc) != 0;
    if (!threePoint) {
        type = arc.IsClockwise() ? type & ~UWArc::kAnticlockwise : type | UWArc::kAnticlockwise;
    }
    const bool empty = poly.GetCount() == 0;
    const int V = dir == 1 ? poly.GetCount() - 1 : 0;
    const long X = empty ? 0 : poly.GetIdAt(V);
    // An arc that meets neither end of the chain adds nothing.
    if (!empty && X != S && X != E) return Step::Done;
    UWArc W(Position(S), Position(E), Position(T), type);
    const UWPoint third = W.GetThird();
    UWArc first;
    UWArc second;
    auto split = [&] {
        if (SplitArcAt(W, third, first, second)) return true;
        Context.Leave(L"string", name,
                      Translate(L"point {1} does not lie on the arc from {2} to {3}",
                                {arc.GetThirdPt(), arc.GetStartPt(), arc.GetEndPt()}));
        return false;
    };

    if (empty) {
        if (!threePoint) {
            poly.Add({W.GetBulgeFactor(), S});
            poly.Add({0.0, E});
            return Step::Done;
        }
        if (!split()) return Step::Failed;
        poly.Add({first.GetBulgeFactor(), S});
        poly.Add({second.GetBulgeFactor(), T});
        poly.Add({0.0, E});
        return Step::Done;
    }

    // The arc must run away from the tail, or towards the head.
    if ((dir == 0 && X == S) || (dir == 1 && X == E)) W = ReversedArc(W);
    const long O = X == S ? E : S;
    if (!threePoint) {
        if (dir == 1) {
            poly.SetAt(V, {W.GetBulgeFactor(), X});
            poly.Add({0.0, O});
        } else {
            poly.AddVertexAt(0, {W.GetBulgeFactor(), O});
        }
        return Step::Done;
    }
    if (!split()) return Step::Failed;
    if (dir == 1) {
        poly.SetAt(V, {first.GetBulgeFactor(), X});
        poly.Add({second.GetBulgeFactor(), T});
        poly.Add({0.0, O});
    } else {
        poly.AddVertexAt(0, {second.GetBulgeFactor(), T});
        poly.AddVertexAt(0, {first.GetBulgeFactor(), O});
    }
    return Step::Done;
}

}  // namespace nedit
