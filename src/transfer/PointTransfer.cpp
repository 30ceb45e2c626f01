#include "transfer/PointTransfer.h"

#include "platform/geometry/Tolerance.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/PointCodeReader.h"
#include "transfer/TransferContext.h"

namespace nedit {

namespace {

// The point flags of the job's flags word that a survey code gives, in the order of its four
// point flags.
constexpr unsigned kCodeFlags[4] = {0x4000, 0x2000, 0x1000, 0x800};
constexpr unsigned kAllCodeFlags = 0x7800;
constexpr unsigned kExtraFlag = 0x1000;

unsigned Follow(unsigned flags, unsigned bit, bool on) {
    return on ? flags | bit : flags & ~bit;
}

}  // namespace

PointTransfer::PointTransfer(TransferContext& context, const std::vector<UNeditPt>& points,
                             const std::set<std::wstring, std::less<>>* jobCoordinates,
                             const StringTransferSettings& settings,
                             const CodeSettings& codeSettings)
    : Context(context),
      Points(points),
      JobCoordinates(jobCoordinates),
      Settings(settings),
      Grammar(codeSettings),
      Working(&context.Job()),
      Circles(context, codeSettings.CircleRadiusCmd, codeSettings.CircleCircumCmd),
      DoImages(settings.TransferImages != 0),
      DoAttributes(settings.TransferAttributes != 0),
      DoNotes(settings.TransferNotes != 0) {}

std::wstring PointTransfer::StrippedName(const std::wstring& id) {
    const std::size_t first = id.find_first_not_of(L" \t0");
    return first == std::wstring::npos ? std::wstring() : id.substr(first);
}

std::wstring PointTransfer::PointCodeText(const std::vector<CodeGroup>& groups,
                                          const StringTransferSettings& settings, bool strNoFirst) {
    std::wstring text;
    for (const CodeGroup& group : groups) {
        if (group.Code.empty()) continue;
        if (settings.IncludeStringNumbers != 0 && !group.StrNo.empty()) {
            if (!text.empty()) text += L"*";
            text += strNoFirst ? group.StrNo + group.Code : group.Code + group.StrNo;
        } else if (!text.empty() && settings.IncludeCommands == 0) {
            continue;
        } else {
            if (!text.empty()) text += L"*";
            text += group.Code;
        }
    }
    if (!groups.empty()) {
        if (settings.IncludeCommands != 0 && !groups.front().Commands.empty())
            text += groups.front().Commands;
        if (settings.IncludeComments != 0 && !groups.front().Comment.empty())
            text += groups.front().Comment;
    }
    return text;
}

PointTransfer::End PointTransfer::TransferPoints(long& n) {
    for (std::size_t index = 0; index < Points.size(); ++index) {
        ++n;
        if (Context.AbortRequested()) return End::Done;
        Context.Progress(n);
        Working.ReInit();
        const End end = TransferPoint(index);
        if (end != End::Done) return end;
    }
    return End::Done;
}

void PointTransfer::Fail(const std::wstring& name, const std::wstring& reason) {
    Context.Tell(Translate(L"Point {1} could not be written to the job: {2}.", {name, reason}),
                 mb::IconStop);
}

bool PointTransfer::SettleDuplicate(std::size_t index, const std::wstring& stripped,
                                    bool& existing) {
    const UNeditPt& point = Points[index];
    const bool locked = Working.IsLocked();
    if (!ApplyAll || (locked && !LockSeen)) {
        std::wstring message = Translate(
            L"Point {1}'s reduced coordinates are different to its coordinates in database.\n",
            {point.GetID()});
        if (locked) {
            message += Translate(L"Point {1} is also LOCKED.", {point.GetID()}) + L"\n";
            LockSeen = true;
        }
        message += L"\n" + Translate(
                               L"How would you like to deal with this point:  Overwrite / "
                               L"Create New / Abort ?");
        NextNumber = Context.Job().GetNextPointNumber(L"");
        DuplicatePtsDlg dialog(&Context.Job(), Points, static_cast<int>(index), Context.Host());
        dialog.Message = message;
        dialog.Prefix = Prefix;
        dialog.Mode = DupMode;
        dialog.NewNumber = NextNumber;
        if (Context.Ask(dialog) == mb::IdCancel) return false;
        ApplyAll = dialog.ApplyAll;
        DupMode = dialog.Mode;
        CreateNew = DupMode == DuplicatePtsDlg::kPrefix || DupMode == DuplicatePtsDlg::kNewNumber;
        if (CreateNew) {
            WorkPrefix = Prefix = Trim(dialog.Prefix);
            NextNumber = dialog.NewNumber;
            if (DupMode == DuplicatePtsDlg::kNewNumber) WorkPrefix.clear();
        }
    }
    if (!CreateNew) {
        if (locked) Context.Report().LockedRewritten.push_back(point.GetID());
        return true;
    }
    Renamed = true;
    existing = false;
    Working.SetId(0);
    std::wstring name;
    if (!WorkPrefix.empty()) {
        name = WorkPrefix + stripped;
    } else if (!NextNumber.empty()) {
        name = NextNumber;
        NextNumber.clear();
    } else {
        name = Context.Job().GetNextPointNumber();
    }
    if (Context.PointId(name) != 0) name = Context.Job().GetNextPointNumber();
    Working.SetName(name);
    Context.SetNewID(point.GetID(), name);
    Context.Report().Renamed.push_back({point.GetID(), name});
    return true;
}

PointTransfer::End PointTransfer::TransferPoint(std::size_t index) {
    const UNeditPt& point = Points[index];
    if (JobCoordinates != nullptr && JobCoordinates->count(point.GetID()) != 0 &&
        Context.PointId(point.GetID()) != 0) {
        Context.Leave(L"point", point.GetID(),
                      Translate(L"the reduction took its coordinates from the job, which stand"));
        return End::Done;
    }
    const std::wstring stripped = StrippedName(point.GetID());
    if (stripped.empty()) {
        Context.Tell(Translate(L"Point ID={1}, is invalid.", {point.GetID()}), mb::IconStop);
        return End::Failed;
    }
    const long id = Context.PointId(stripped);
    bool existing = id != 0 && Working.Load(id) && Working.GetName() == stripped;
    if (!existing) {
        Working.ReInit();
        Working.SetName(stripped);
    } else {
        const bool same = Is_Zero(Working.GetX() - point.x, false) &&
                          Is_Zero(Working.GetY() - point.y, false) &&
                          Is_Zero(Working.GetZ() - point.z, false);
        if (!same) {
            if (!SettleDuplicate(index, stripped, existing)) return End::Aborted;
        } else if (Working.IsLocked()) {
            Context.Report().LockedRewritten.push_back(point.GetID());
        }
    }

    const std::vector<CodeGroup> groups = Context.Codes().Parse(Trim(point.GetCode()));
    if (groups.empty()) {
        Fail(point.GetID(), Translate(L"its code {1} cannot be read", {point.GetCode()}));
        return End::Failed;
    }
    const USvyCode code = Context.SurveyCode(Trim(groups.front().Code), true, false);
    std::vector<UExtraSymbol> extras;
    if (!Describe(point, groups, code, extras)) return End::Failed;
    if (!SavePoint(existing, existing ? 0 : 1)) return End::Failed;
    ++(existing ? Context.Report().PointsUpdated : Context.Report().PointsAdded);
    if (!extras.empty() && !Working.SaveExtraSymbols(extras))
        Context.Leave(L"point", point.GetID(), Working.LastError());

    const bool hit = Circles.Takes(Working, groups.front(), point.GetCode());
    if (!Attach(point)) return End::Failed;
    if (hit) Circles.Add(Working, groups.front(), code);
    return End::Done;
}

bool PointTransfer::Describe(const UNeditPt& point, const std::vector<CodeGroup>& groups,
                             const USvyCode& code, std::vector<UExtraSymbol>& extras) {
    USurveyDoc& job = Context.Job();
    const CodeGroup& first = groups.front();
    const long layer = Context.GetLayerId(code);
    if (layer == 0) {
        Fail(point.GetID(), Context.LayerProblem());
        return false;
    }
    Working.SetLayer(layer);
    Working.SetX(point.x);
    Working.SetY(point.y);
    Working.SetHeight(point.z);

    if (Settings.SaveDescription != 0) {
        if (!code.Description.empty()) Working.SetCode(code.Description);
    } else {
        const std::wstring text = PointCodeText(groups, Settings, Grammar.StrNoFirst != 0);
        if (!text.empty()) Working.SetCode(text);
    }

    unsigned flags = Follow(Working.GetFlags(), UDBObject::kUseInSurface, code.UseInSurface != 0);
    if ((Grammar.ContourDigit != 0 || first.ContourGiven) &&
        (first.ContourValue == 0 || first.ContourValue == 1))
        flags = Follow(flags, UDBObject::kUseInSurface, first.ContourValue == 1);

    Working.SetSymbolValues(first.SymbolValues[0], first.SymbolValues[1], first.SymbolValues[2]);
    Working.SetPointMark(TextToInt(code.PointMark));
    Working.SetColour(TextToInt(code.PointColour));
    if (groups.size() == 1) {
        Working.SetSymbol(job.GetSymbolIndex(code.Symbol, layer));
    } else {
        bool symbolSet = false;
        for (const CodeGroup& group : groups) {
            const USvyCode other = Context.SurveyCode(group.Code, false, true);
            const int symbol = job.GetSymbolIndex(other.Symbol, layer);
            if (symbol <= 0) continue;
            if (!symbolSet) {
                Working.SetSymbol(symbol);
                symbolSet = true;
            } else {
                extras.push_back({symbol, group.SymbolValues[0], group.SymbolValues[0], 0.0});
            }
        }
    }

    flags &= ~kAllCodeFlags;
    if (Settings.UseCodeFlags != 0) {
        const int codeFlags[4] = {code.PointFlag1, code.PointFlag2, code.PointFlag3,
                                  code.PointFlag4};
        for (int i = 0; i < 4; ++i) flags = Follow(flags, kCodeFlags[i], codeFlags[i] != 0);
    }
    if (first.ExtraFlagGiven != 0) flags = Follow(flags, kExtraFlag, first.ExtraFlag != 0);
    flags = Follow(flags, UDBObject::kLocked, Settings.Locked != 0);
    Working.SetFlags(flags);
    // A derived point (a corner, a centre, an offset) has no height of its own.
    if (point.IsPTInterpolated()) Working.ClearHeight();
    return true;
}

bool PointTransfer::SavePoint(bool existing, int undoFlag) {
    if (existing) Working.UnLock();
    Working.SetStatus(Working.GetStatus() | UDBPoint::kStatusTransferred);
    const bool saved = Working.Save(undoFlag, false, false);
    if (saved && existing && Settings.Locked != 0) Working.Lock();
    if (!saved) Fail(Working.GetName(), Working.LastError());
    return saved;
}

void PointTransfer::AttachmentFailed(const wchar_t* kind, const std::wstring& name,
                                     const std::wstring& question, bool& goOn) {
    Context.Leave(kind, name, Working.LastError());
    if (AppMessageBox(Context.Host(), question, mb::YesNo | mb::IconQuestion) == mb::IdNo)
        goOn = false;
}

bool PointTransfer::Attach(const UNeditPt& point) {
    const std::wstring& name = point.GetID();
    if (DoImages && point.GetImageSize() > 0) {
        if (Working.AttachImageFiles(point.GetImages(), false, L"")) {
            if (!SavePoint(true, 0)) return false;
        } else {
            AttachmentFailed(
                L"images", name,
                Translate(L"Images for point: {1} could not be loaded.  Load remaining images ?",
                          {name}),
                DoImages);
        }
    }
    if (DoAttributes && !Working.GetCode().empty() &&
        !Working.AddAttributeObjectData(point.GetPointAttributes(), true, true, true) &&
        point.GetPointAttributeSize() > 0) {
        AttachmentFailed(L"attributes", name,
                         Translate(L"Attributes for point {1} could not be loaded.  Load "
                                   L"remaining attributes ?",
                                   {name}),
                         DoAttributes);
    }
    if (DoNotes && !point.GetNote().empty()) {
        if (Working.SaveExtendedData(point.GetNote(), UDBObject::kNoteData)) {
            Working.SetPointNote(point.GetNote());
            return SavePoint(true, 0);
        }
        Context.Leave(L"note", name, Working.LastError());
    }
    return true;
}

}  // namespace nedit
