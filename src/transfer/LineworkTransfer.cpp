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

bool LineworkTransfer::TransferLines(long& n, StringMap& lineMap) {
    for (std::size_t index = 0; index < Lines.size(); ++index) {
        ++n;
        if (Context.AbortRequested()) return true;
        Context.Progress(n);
        const UNeditLine& line = Lines[index];
        const USvyCode code = Context.SurveyCode(line.GetCode(), false, true);
        if (code.IsString != 0 && !line.GetStringNo().empty()) {
            lineMap[line.GetStringNo()].push_back(static_cast<int>(index));
            continue;
        }
        std::vector<long> ids;
        if (!JobPoints(L"line", {line.GetFromPt(), line.GetToPt()}, ids)) continue;
        const long existing = GetUDBLine(ids[0], ids[1]);
        UDBLine object(&Context.Job());
        const std::wstring name =
            Translate(L"Line {1}", {Joined({line.GetFromPt(), line.GetToPt()})});
        if (existing != 0) {
            if (ObjectKindOf(existing) != kLineKind || !object.Load(existing)) {
                Context.Tell(Translate(L"{1} could not be written to the job: the job's object "
                                       L"between its points is no line.",
                                       {name}),
                             mb::IconStop);
                return false;
            }
        } else {
            object.SetPoints(ids[0], ids[1]);
        }
        if (!StyleAndSave(object, code, name)) return false;
        ++(existing != 0 ? Context.Report().LinesUpdated : Context.Report().LinesAdded);
    }
    return true;
}

bool LineworkTransfer::TransferArcs(long& n, StringMap& arcMap) {
    for (std::size_t index = 0; index < Arcs.size(); ++index) {
        ++n;
        if (Context.AbortRequested()) return true;
        Context.Progress(n);
        const UNeditArc& arc = Arcs[index];
        const USvyCode code = Context.SurveyCode(arc.GetCode(), false, true);
        if (code.IsString != 0 && !arc.GetStringNo().empty()) {
            arcMap[arc.GetStringNo()].push_back(static_cast<int>(index));
            continue;
        }
        std::vector<long> ids;
        if (!JobPoints(L"arc", {arc.GetStartPt(), arc.GetEndPt(), arc.GetThirdPt()}, ids)) continue;
        const long existing = GetUDBArc(ids[0], ids[1], ids[2]);
        UDBArc object(&Context.Job());
        const std::wstring name =
            Translate(L"Arc {1}", {Joined({arc.GetStartPt(), arc.GetEndPt(), arc.GetThirdPt()})});
        if (existing != 0) {
            if (ObjectKindOf(existing) != kArcKind || !object.Load(existing)) {
                Context.Tell(Translate(L"{1} could not be written to the job: the job's object "
                                       L"on its points is no arc.",
                                       {name}),
                             mb::IconStop);
                return false;
            }
        } else {
            object.SetPoints(ids[0], ids[1], ids[2]);
            object.SetArcType(static_cast<int>(arc.GetArcType()));
        }
        if (!StyleAndSave(object, code, name)) return false;
        ++(existing != 0 ? Context.Report().ArcsUpdated : Context.Report().ArcsAdded);
    }
    return true;
}

long LineworkTransfer::GetUDBLine(long a, long b) {
    return a == 0 ? 0 : Context.Job().GetLineBetween(a, b);
}

long LineworkTransfer::GetUDBArc(long a, long b, long third) {
    return a == 0 ? 0 : Context.Job().GetArcOn(a, b, third);
}

}  // namespace nedit
