#include "transfer/LineworkTransfer.h"

#include "platform/job/UDBArc.h"
#include "platform/job/UDBLine.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "transfer/TransferContext.h"

namespace nedit {

namespace {

// A line or arc of the job has this bit of its flags cleared before it is saved.
constexpr unsigned kClearedBit = 1;

std::wstring Joined(const std::vector<std::wstring>& names) {
    std::wstring text;
    for (const std::wstring& name : names) text += (text.empty() ? L"" : L"-") + name;
    return text;
}

}  // namespace

LineworkTransfer::LineworkTransfer(TransferContext& context, const std::vector<UNeditLine>& lines,
                                   const std::vector<UNeditArc>& arcs, bool renameUsed)
    : Context(context), Lines(lines), Arcs(arcs), RenameUsed(renameUsed) {}

bool LineworkTransfer::JobPoints(const wchar_t* kind, const std::vector<std::wstring>& names,
                                 std::vector<long>& ids) {
    ids.clear();
    for (const std::wstring& name : names) {
        const long id = Context.PointId(RenameUsed ? Context.GetNewPoint(name) : name);
        for (std::size_t k = 0; k < ids.size(); ++k) {
            if (id != 0 && ids[k] == id) {
                Context.Leave(
                    kind, Joined(names),
                    Translate(L"points {1} and {2} are one point in the job", {names[k], name}));
                return false;
            }
        }
        if (id == 0) {
            Context.Leave(kind, Joined(names),
                          Translate(L"point {1} is not in the job",
                                    {RenameUsed ? Context.GetNewPoint(name) : name}));
            return false;
        }
        ids.push_back(id);
    }
    return true;
}

bool LineworkTransfer::StyleAndSave(UDBLinework& object, const USvyCode& code,
                                    const std::wstring& name) {
    USurveyDoc& job = Context.Job();
    const long layer = Context.GetLayerId(code);
    if (layer == 0) {
        Context.Tell(
            Translate(L"{1} could not be written to the job: {2}.", {name, Context.LayerProblem()}),
            mb::IconStop);
        return false;
    }
    object.SetLayer(layer);
    object.SetLineStyle(job.GetLineTypeIndex(code.LineType, layer));
    object.SetColour(TextToInt(code.LineColour));
    object.SetThickness(job.GetLineThicknessIndex(code.Thickness, layer));
    unsigned flags = object.GetFlags() & ~kClearedBit;
    flags = code.LineUseInSurface != 0 ? flags | UDBObject::kUseInSurface
                                       : flags & ~UDBObject::kUseInSurface;
    object.SetFlags(flags);
    if (object.Save(0, false, false)) return true;
    Context.Tell(
        Translate(L"{1} could not be written to the job: {2}.", {name, object.LastError()}),
        mb::IconStop);
    return false;
}

// What a line is to the walk over the linework.
struct LineworkTransfer::LineShape {
    using Item = UNeditLine;
    using Object = UDBLine;
    static constexpr const wchar_t* kKind = L"line";
    static constexpr int kObjectKind = kLineKind;
    static std::wstring Label(const std::wstring& names) { return Translate(L"Line {1}", {names}); }
    static std::vector<std::wstring> Names(const UNeditLine& line) {
        return {line.GetFromPt(), line.GetToPt()};
    }
    static void Place(UDBLine& object, const std::vector<long>& ids, const UNeditLine&) {
        object.SetPoints(ids[0], ids[1]);
    }
};

// What an arc is to it: three points and the arc's type.
struct LineworkTransfer::ArcShape {
    using Item = UNeditArc;
    using Object = UDBArc;
    static constexpr const wchar_t* kKind = L"arc";
    static constexpr int kObjectKind = kArcKind;
    static std::wstring Label(const std::wstring& names) { return Translate(L"Arc {1}", {names}); }
    static std::vector<std::wstring> Names(const UNeditArc& arc) {
        return {arc.GetStartPt(), arc.GetEndPt(), arc.GetThirdPt()};
    }
    static void Place(UDBArc& object, const std::vector<long>& ids, const UNeditArc& arc) {
        object.SetPoints(ids[0], ids[1], ids[2]);
        object.SetArcType(static_cast<int>(arc.GetArcType()));
    }
};

template <class Shape>
bool LineworkTransfer::TransferEach(long& n, const std::vector<typename Shape::Item>& items,
                                    StringMap& strings, int& added, int& updated) {
    for (std::size_t index = 0; index < items.size(); ++index) {
        ++n;
        if (Context.AbortRequested()) return true;
        Context.Progress(n);
        const typename Shape::Item& item = items[index];
        const USvyCode code = Context.SurveyCode(item.GetCode(), false, true);
        if (code.IsString != 0 && !item.GetStringNo().empty()) {
            strings[item.GetStringNo()].push_back(static_cast<int>(index));
            continue;
        }
        const std::vector<std::wstring> names = Shape::Names(item);
        std::vector<long> ids;
        if (!JobPoints(Shape::kKind, names, ids)) continue;
        const long existing =
            ids.size() == 2 ? GetUDBLine(ids[0], ids[1]) : GetUDBArc(ids[0], ids[1], ids[2]);
        typename Shape::Object object(&Context.Job());
        const std::wstring label = Shape::Label(Joined(names));
        if (existing != 0) {
            if (ObjectKindOf(existing) != Shape::kObjectKind || !object.Load(existing)) {
                Context.Tell(Translate(L"{1} could not be written to the job: the job's object "
                                       L"on its points is of another kind.",
                                       {label}),
                             mb::IconStop);
                return false;
            }
        } else {
            Shape::Place(object, ids, item);
        }
        if (!StyleAndSave(object, code, label)) return false;
        ++(existing != 0 ? updated : added);
    }
    return true;
}

bool LineworkTransfer::TransferLines(long& n, StringMap& lineMap) {
    TransferReport& report = Context.Report();
    return TransferEach<LineShape>(n, Lines, lineMap, report.LinesAdded, report.LinesUpdated);
}

bool LineworkTransfer::TransferArcs(long& n, StringMap& arcMap) {
    TransferReport& report = Context.Report();
    return TransferEach<ArcShape>(n, Arcs, arcMap, report.ArcsAdded, report.ArcsUpdated);
}

long LineworkTransfer::GetUDBLine(long a, long b) {
    return a == 0 ? 0 : Context.Job().GetLineBetween(a, b);
}

long LineworkTransfer::GetUDBArc(long a, long b, long third) {
    return a == 0 ? 0 : Context.Job().GetArcOn(a, b, third);
}

}  // namespace nedit
