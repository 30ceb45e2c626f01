// From the record list to the observation model: every row through ProcessRecord, then the
// forward pointers that link a side shot to the station it hits.

#include <algorithm>
#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/ProgressPercent.h"
#include "reduction/UNeditDatabase.h"

double CurInstHt = 0.0;

namespace {

constexpr const wchar_t* kGeneratingGraphics = L"Generating Graphics";

// Below this an instrument height counts as not given.
constexpr double kNoInstrumentHeight = 0.0001;

// The earth radius used when a distance correction is asked for before any Radius record:
// the mean radius, so that the correction stays finite and close to what was meant.
constexpr double kMeanEarthRadiusMetres = 6370000.0;

void AppendNames(SparseList<std::wstring>& to, const std::vector<std::wstring>& names) {
    to.append(names);
}

wchar_t FirstLetter(const RecordValue& value, wchar_t fallback) {
    if (value.empty()) return fallback;
    if (!value.converted && static_cast<unsigned char>(value.text[0]) < 0x80) return value.text[0];
    return value.WideText()[0];
}

}  // namespace

int UNeditDatabase::PrepareList() {
    PrismConst = 0.0;
    if (Rows == nullptr) {
        ResetPassValues();
        ErrorCode = 1;
        return 0;
    }
    return PrepareRows(
        static_cast<std::size_t>(Rows->GetItemCount()),
        [this](std::size_t row, std::string&) { return Rows->GetRowUtf8(static_cast<int>(row)); });
}

int UNeditDatabase::PrepareList(const std::vector<std::wstring>& rows) {
    DbCoordNames.clear();
    LocalCoordNames.clear();
    if (rows.empty()) return 0;
    return PrepareRows(rows.size(), [&rows](std::size_t row, std::string& buffer) {
        buffer = nedit::ToUtf8(rows[row]);
        return std::string_view(buffer);
    });
}

void UNeditDatabase::ResetPassValues() {
    if (Doc != nullptr) Doc->ResetCurrentValues();
    FirstSwing = CurSwing = HCorr = VCorr = 0.0;
    CurSS = nullptr;
}

template <typename RowAt>
int UNeditDatabase::PrepareRows(std::size_t count, RowAt rowAt) {
    ResetPassValues();
    DeleteList();
    TravFlag = 0;
    ChkShotCode = ChkCode;
    Filing = true;
    std::string text;
    std::string normalised;
    for (std::size_t index = 0; index < count; ++index) {
        if (AbortRequested()) {
            Filing = false;
            return 0;
        }
        UpdateProgress(ProgressPercent(index + 1, count), kGeneratingGraphics);
        const std::string_view row = RowAsRead(rowAt(index, text), normalised);
        if (row == std::string_view("##########ADJUSTED-POINTS")) TravFlag = 1;
        const int type = Doc != nullptr ? Doc->GetRecordTypeUtf8(row) : rec::None;
        ReadRecord(type, row, static_cast<int>(index) + 1);
        if (index + 1 == count && type != rec::Stn && CurStnPending) {
            if (DummyStn(*CurStn)) {
                Setups.pop_back();  // the station in hand is always the last one made
                CurStn = nullptr;
            } else {
                InsertStn(CurStn, 0);
            }
            CurStnPending = false;
        }
    }
    TravFlag = 0;
    Filing = false;
    // The fields are views into the rows read: no record is in hand after the pass.
    Fields.clear();
    // What a repeated observation needed to find its target is not needed after the pass.
    FiledBackSights = std::vector<FiledTarget>();
    FiledSideShots = std::vector<FiledTarget>();
    return 1;
}

const std::wstring& UNeditDatabase::GetValue(int id) const {
    ValueText = Value(id).WideText();
    return ValueText;
}

RecordValue UNeditDatabase::Value(int id) const {
    const RecordValue* own = Fields.find(id);
    if (own != nullptr && !own->empty()) return *own;
    return Doc != nullptr ? Doc->CurrentValueOf(id) : RecordValue();
}

RecordValue UNeditDatabase::OwnValue(int id) const {
    const RecordValue* own = Fields.find(id);
    return own == nullptr ? RecordValue() : *own;
}

NameId UNeditDatabase::NameOf(const RecordValue& value) {
    if (value.converted) return Names.Intern(value.WideText());
    nedit::FromUtf8(value.text, NameBuffer);
    return Names.Intern(NameBuffer);
}

NameId UNeditDatabase::CodeOf(const RecordValue& value) {
    if (value.converted) return Codes.Intern(value.WideText());
    nedit::FromUtf8(value.text, NameBuffer);
    return Codes.Intern(NameBuffer);
}

int UNeditDatabase::ProcessRecord(int type, const std::wstring& row, int recordNo) {
    const std::string text = nedit::ToUtf8(row);
    return ReadRecord(type, text, recordNo);
}

int UNeditDatabase::ReadRecord(int type, std::string_view row, int recordNo) {
    if (type == rec::None || Doc == nullptr) return 0;
    if (!Doc->ReadRecord(type, row, Fields)) return 0;
    switch (type) {
        case rec::Date:
            DateText = nedit::TrimChars(nedit::Trim(Value(rec::Date).WideText()), L",");
            return 1;
        case rec::Unit:
        case rec::Unit2:
            LengthUnit = FirstLetter(Value(fld::UL), LengthUnit);
            AngleUnit = FirstLetter(Value(fld::UA), AngleUnit);
            if (CurStn) {
                CurStn->LengthUnit = LengthUnit;
                CurStn->AngleUnit = AngleUnit;
            }
            return 1;
        case rec::Amode:
            HMode = FirstLetter(Value(fld::HMode), HMode);
            VMode = FirstLetter(Value(fld::VMode), VMode);
            if (CurStn) {
                CurStn->HMode = HMode;
                CurStn->VMode = VMode;
            }
            return 1;
        case rec::Acorr:
            HCorr = Number(fld::HCorr);
            VCorr = Number(fld::VCorr);
            return 1;
        case rec::Swing: {
            const double swing = Number(rec::Swing);
            if (!CurStn) {
                FirstSwing = swing;
            } else if (CurStn->SwingOpen) {
                CurStn->Swing = swing;
                CurSwing = swing;
            }
            return 1;
        }
        case rec::Pt:
            ProcessPtRecord();
            return 1;
        case rec::Stn:
            ProcessStnRecord();
            return 1;
        case rec::Bkb:
            ProcessBkbRecord();
            return 1;
        case rec::Xyz: {
            const RecordValue id = OwnValue(fld::ID);
            NameId name = id.empty() ? kNoName : NameOf(id);
            if (name == kNoName && CurStn) name = CurStn->Name;
            if (name != kNoName)
                KnownCoordMap[name] = {Number(fld::E), Number(fld::N), Number(fld::H)};
            return 1;
        }
        case rec::Bs:
        case rec::Ss:
        case rec::Ss2:
            ProcessObservation(type, recordNo);
            return 1;
        case rec::Offset:
            if (CurSS != nullptr) {
                CurSS->OffsetAlong = Number(fld::OffsetAlong);
                CurSS->OffsetRight = Number(fld::OffsetRight);
                CurSS->OffsetUp = Number(fld::OffsetUp);
            } else if (CurChkList && !CurChkList->empty()) {
                CurChkList->back().OffsetAlong = Number(fld::OffsetAlong);
                CurChkList->back().OffsetRight = Number(fld::OffsetRight);
                CurChkList->back().OffsetUp = Number(fld::OffsetUp);
            }
            return 1;
        case rec::Insht:
            CurInstHt = Number(rec::Insht);
            if (CurStn && CurStn->HtInst < kNoInstrumentHeight) CurStn->HtInst = CurInstHt;
            return 1;
        case rec::Targetht:
        case rec::Targetht2:
            Doc->SetCurrentValue(Doc->GetFieldId(type), Value(type));
            return 1;
        case rec::Scale: {
            ScaleFactor = 1.0;
            const double scale = Number(rec::Scale);
            if (!Is_Zero(scale, false)) {
                ScaleFactor = scale;
                if (CurStn) StnScaleMap[CurStn->Name] = scale;
            }
            return 1;
        }
        case rec::Radius:
            EarthRadius = Number(rec::Radius);
            return 1;
        case rec::Dcorr:
            Refraction = Number(rec::Dcorr);
            CorrectDist = true;
            return 1;
        case rec::Prism:
            PrismConst = Number(rec::Prism);
            return 1;
        default:
            return 0;
    }
}

void UNeditDatabase::ProcessPtRecord() {
    const RecordValue id = OwnValue(fld::ID);
    if (id.empty()) return;
    const NameId name = NameOf(id);
    const std::wstring code = OwnValue(fld::CO).WideText();
    SavePointOf(name, Number(fld::E), Number(fld::N), Number(fld::H), code, kSaveFromPTRecord, 0);
    if (!CurPtNames) CurPtNames = std::make_unique<std::vector<std::wstring>>();
    const std::wstring_view text = Names.Name(name);
    if (CurPtNames->empty() || !nedit::EqualsIgnoreCase(CurPtNames->back(), text)) {
        CurPtNames->emplace_back(text);
    }
}

STNSTRUCT& UNeditDatabase::NewSetup() {
    STNSTRUCT& station = Setups.emplace_back();
    station.Place = static_cast<std::uint32_t>(Setups.size() - 1);
    return station;
}

SSSTRUCT& UNeditDatabase::NewTarget() {
    return Targets.emplace_back();
}

MeasurementList* UNeditDatabase::NewMeasurements() {
    return &Measurements.emplace_back();
}

void UNeditDatabase::ProcessStnRecord() {
    const RecordValue id = OwnValue(fld::ID);
    if (id.empty()) return;
    // The station in hand is the last one made: a new one goes behind it.
    STNSTRUCT* pending = CurStnPending ? CurStn : nullptr;
    STNSTRUCT& station = NewSetup();
    station.Name = NameOf(id);
    station.StnName = Names.Name(station.Name);
    station.HtInst = Number(fld::HI);
    if (station.HtInst < kNoInstrumentHeight) station.HtInst = CurInstHt;
    const RecordValue code = OwnValue(fld::CO);
    if (!code.empty()) station.StnCode = Codes.Name(CodeOf(code));
    station.Swing = FirstSwing;
    CurSwing = 0.0;
    if (CurPtNames) {
        station.PtNames = std::move(*CurPtNames);
        CurPtNames.reset();
    }
    if (pending != nullptr) {
        if (DummyStn(*pending)) {
            // A station with nothing observed is dropped; the points named before it move on.
            SparseList<std::wstring> names = std::move(station.PtNames);
            names.append(pending->PtNames);
            STNSTRUCT kept = std::move(station);
            kept.PtNames = std::move(names);
            kept.Place = pending->Place;
            Setups.pop_back();
            Setups.pop_back();
            Setups.push_back(std::move(kept));
        } else {
            if (CurChkList) {
                pending->ChkShots = std::move(*CurChkList);
                CurChkList.reset();
            }
            InsertStn(pending, 0);
        }
    }
    CurStn = &Setups.back();
    CurStnPending = true;
    ++StationsOpened;
    CurSS = nullptr;
}

void UNeditDatabase::ProcessBkbRecord() {
    if (!CurStn) return;
    const RecordValue back = OwnValue(fld::ID);
    CurStn->BkStnName = back.empty() ? nedit::NameText() : Names.Name(NameOf(back));
    CurStn->BkStnGiven = 1;
    // Whether a bearing or a reading was given is the record's own business: an empty field
    // here means "none", not the value of an earlier record.
    const RecordValue bearing = OwnValue(fld::BkBearing);
    if (bearing.empty()) {
        CurStn->BkBearingGiven = 0;
    } else {
        CurStn->BkBearing = bearing.Number();
        CurStn->BkBearingGiven = 1;
    }
    const RecordValue reading = OwnValue(fld::HA);
    if (!reading.empty()) {
        CurStn->BkAngle = UAngle::ValidateData(reading.Number() + HCorr);
    } else if (HMode == L'B' && CurStn->BkBearingGiven) {
        CurStn->BkAngle = CurStn->BkBearing;
    }
}

void UNeditDatabase::ProcessObservation(int type, int recordNo) {
    if (!CurStn) return;
    SSSTRUCT target;
    const RecordValue id = OwnValue(fld::ID);
    target.Name = NameOf(id);
    target.SSName = Names.Name(target.Name);
    const RecordValue code = OwnValue(fld::CO);
    if (!code.empty()) target.SSCode = Codes.Name(CodeOf(code));
    target.Stn = CurStn;
    target.RecordNo = recordNo;

    MEASSTRUCT measurement;
    measurement.HAng = UAngle::ValidateData(Number(fld::HA) + CurStn->Swing + HCorr);
    CurStn->SwingOpen = false;
    measurement.VAng = Doc->ConvertToZenithVA(Number(fld::VA)) + VCorr;
    measurement.SDist = Number(fld::SD) * StnScaleFactor(CurStn->Name);
    if (CorrectDist && measurement.SDist >= 1e-40) ApplyDistanceCorrection(measurement);
    measurement.HtTarget = Number(fld::HT);

    if (IsCheckShot(type, target.SSCode)) {
        TakeCheckShot(target, measurement);
        return;
    }
    InsertSSMS(target, measurement, type == rec::Bs);
    if (type == rec::Bs) {
        CurStn->BkStnGiven = 1;
        return;
    }
    // A target observed again already holds the names filed before its first observation:
    // the names filed since then join them.
    if (CurPtNames) {
        AppendNames(CurSS->PtNames, *CurPtNames);
        CurPtNames.reset();
    }
    if (CurChkList) {
        if (CurSS->ChkShots.empty()) CurSS->ChkShots = std::move(*CurChkList);
        CurChkList.reset();
    }
}

void UNeditDatabase::ApplyDistanceCorrection(MEASSTRUCT& measurement) const {
    // The constants of the field programs, kept so that corrected distances agree with theirs.
    constexpr double kDegToRad = 0.017453293005625408;
    constexpr double kRadToDeg = 57.29577791868205;
    constexpr double kQuarterTurn = 1.5707963705062866;
    constexpr double kHalfTurn = 3.1415927410125732;
    const double radius =
        EarthRadius > 0.0 ? EarthRadius
                          : nedit::ConvertLength(kMeanEarthRadiusMetres, nedit::LengthUnit::Metres,
                                                 Doc->GetJobSettings() != nullptr
                                                     ? Doc->GetJobSettings()->GetLengthUnit()
                                                     : nedit::LengthUnit::Metres);
    const double d = measurement.SDist;
    const double z = measurement.VAng * kDegToRad;
    const double a = d * std::sin(z) / (2.0 * radius);
    const double b = Refraction * d * std::sin(z) / (2.0 * radius);
    const double h = (std::sin(z) - (2.0 * a - b) * std::cos(z)) * d;
    const double v = ((a - b) * std::sin(z) + std::cos(z)) * d;
    measurement.SDist = std::sqrt(v * v + h * h);
    if (h == 0.0 && v == 0.0) {
        measurement.VAng = 0.0;
        return;
    }
    const double t = std::fabs(h) > std::fabs(v) ? std::atan(-std::fabs(v / h)) + kQuarterTurn
                                                 : std::atan(std::fabs(h / v));
    double angle;
    if (v >= 0.0) {
        angle = h >= 0.0 ? t : -t;
    } else {
        angle = h >= 0.0 ? kHalfTurn - t : t + kHalfTurn;
    }
    measurement.VAng = angle * kRadToDeg;
}

int UNeditDatabase::InsertStn(STNSTRUCT* station, int makeCurrent) {
    station->HMode = HMode;
    station->VMode = VMode;
    station->AngleUnit = AngleUnit;
    station->LengthUnit = LengthUnit;
    AppendSetup(*station);
    if (makeCurrent) CurStn = station;
    return 1;
}

void UNeditDatabase::AppendNode(std::uint32_t ref, NameId name) {
    const auto node = static_cast<std::uint32_t>(Nodes.size());
    Nodes.push_back({ref, NodeEntry::kNone});
    if (name >= FirstNodeOfName.size()) {
        FirstNodeOfName.resize(std::max<std::size_t>(name + 1, Names.size()), NodeEntry::kNone);
        LastNodeOfName.resize(FirstNodeOfName.size(), NodeEntry::kNone);
    }
    if (FirstNodeOfName[name] == NodeEntry::kNone) {
        FirstNodeOfName[name] = node;
    } else {
        Nodes[LastNodeOfName[name]].NextSameName = node;
    }
    LastNodeOfName[name] = node;
}

void UNeditDatabase::AppendSetup(STNSTRUCT& station) {
    AppendNode(station.Place, station.Name);
}

void UNeditDatabase::AppendPointNode(NameId name, double e, double n, double z, NameId code) {
    PointNode point;
    point.Name = name;
    point.Code = code;
    point.East = e;
    point.North = n;
    point.Height = z;
    point.Modes = ModesNow();
    AppendNode(static_cast<std::uint32_t>(PointNodes.size()) | NodeEntry::kPointOnly, name);
    PointNodes.push_back(point);
}

std::uint32_t UNeditDatabase::ModesNow() {
    const ModeSet now{HMode, VMode, AngleUnit, LengthUnit};
    const auto found = std::find(ModeSets.begin(), ModeSets.end(), now);
    if (found != ModeSets.end()) return static_cast<std::uint32_t>(found - ModeSets.begin());
    ModeSets.push_back(now);
    return static_cast<std::uint32_t>(ModeSets.size() - 1);
}

std::uint32_t UNeditDatabase::FirstNodeOf(NameId name) const {
    return name < FirstNodeOfName.size() ? FirstNodeOfName[name] : NodeEntry::kNone;
}

STNSTRUCT* UNeditDatabase::FirstSetupOf(NameId name) const {
    for (std::uint32_t node = FirstNodeOf(name); node != NodeEntry::kNone;
         node = Nodes[node].NextSameName) {
        if (!Nodes[node].IsPointOnly()) return const_cast<STNSTRUCT*>(&Setups[Nodes[node].Index()]);
    }
    return nullptr;
}

int UNeditDatabase::InsertSSMS(const SSSTRUCT& target, const MEASSTRUCT& measurement,
                               int isBackSight) {
    if (CurStn == nullptr) return 0;
    TargetList& list = isBackSight ? CurStn->BSList : CurStn->SSList;
    std::vector<FiledTarget>& filed = isBackSight ? FiledBackSights : FiledSideShots;
    if (target.Name >= filed.size())
        filed.resize(std::max<std::size_t>(target.Name + 1, Names.size()));
    FiledTarget& place = filed[target.Name];
    // While the rows are read every target of the station in hand is filed; otherwise its
    // list is searched.
    SSSTRUCT* existing = place.Station == StationsOpened ? place.Target : nullptr;
    if (existing == nullptr && !Filing) existing = list.Find(target.SSName);
    if (existing == nullptr) {
        SSSTRUCT& added = NewTarget();
        added = target;
        added.Meas = NewMeasurements();
        added.Meas->push_back(measurement);
        list.Append(&added);
        place = {StationsOpened, &added};
        CurSS = &added;
        return 1;
    }
    // A further observation of the same name takes the place of the one before: its code and
    // record number are those of the latest observation, its offsets none yet, and it keeps
    // the measurements, the check shots and the point names filed before.
    existing->SSCode = target.SSCode;
    existing->RecordNo = target.RecordNo;
    existing->OffsetAlong = existing->OffsetUp = existing->OffsetRight = 0.0;
    existing->Meas->push_back(measurement);
    place = {StationsOpened, existing};
    CurSS = existing;
    return 1;
}

int UNeditDatabase::CopySS(const SSSTRUCT& from, SSSTRUCT& to) const {
    to = from;
    return 1;
}

int UNeditDatabase::DummyStn(const STNSTRUCT& station) const {
    return station.BSList.empty() && station.SSList.empty() && station.FSList.empty() &&
           station.Sighted == 0 && !station.HasCheck;
}

int UNeditDatabase::AddToFSptr(STNSTRUCT* station, SSSTRUCT* target) {
    if (station->FSList.Find(target->SSName) != nullptr) return 1;
    AppendForward(*station, *target);
    return 1;
}

void UNeditDatabase::AppendForward(STNSTRUCT& station, const SSSTRUCT& target) {
    SSSTRUCT& copy = NewTarget();
    CopySS(target, copy);  // the copy shares the side shot's measurements
    // What was filed before the side shot stays with it; its forward copy carries none.
    copy.PtNames.clear();
    copy.ChkShots.clear();
    station.FSList.Append(&copy);
}

int UNeditDatabase::AddReverseFSptr(STNSTRUCT* station, SSSTRUCT* target) {
    STNSTRUCT& reverse = NewSetup();
    reverse.Name = target->Name;
    reverse.StnName = target->SSName;
    reverse.ReverseStn = 1;
    reverse.HMode = HMode;
    reverse.VMode = VMode;
    reverse.AngleUnit = AngleUnit;
    reverse.LengthUnit = LengthUnit;
    SSSTRUCT& back = NewTarget();
    back.Name = station->Name;
    back.SSName = station->StnName;
    back.Stn = &reverse;
    back.Meas = NewMeasurements();
    reverse.FSList.Append(&back);
    AppendSetup(reverse);
    return 1;
}

// The occupied stations of that name, other than `observer`.
std::vector<STNSTRUCT*> UNeditDatabase::OccupiedStations(NameId name,
                                                         const STNSTRUCT* observer) const {
    std::vector<STNSTRUCT*> found;
    for (std::uint32_t node = FirstNodeOf(name); node != NodeEntry::kNone;
         node = Nodes[node].NextSameName) {
        if (Nodes[node].IsPointOnly()) continue;
        STNSTRUCT* station = const_cast<STNSTRUCT*>(&Setups[Nodes[node].Index()]);
        if (!station->ReverseStn && station != observer) found.push_back(station);
    }
    return found;
}

int UNeditDatabase::PrepareForwardNoBS() {
    std::size_t steps = Nodes.size();
    for (const STNSTRUCT& station : Setups) steps += station.SSList.size();
    std::size_t done = 0;
    // The forward copies a station holds, by name id, so that each name is copied once.
    std::vector<std::uint32_t> copied(Names.size(), NodeEntry::kNone);
    // Reverse nodes are appended as the walk goes; they are no set-ups and are passed over.
    for (std::size_t s = 0; s < Setups.size(); ++s) {
        STNSTRUCT& station = Setups[s];
        if (AbortRequested()) return 0;
        UpdateProgress(ProgressPercent(++done, steps), kGeneratingGraphics);
        if (station.PointOnly || station.ReverseStn) continue;
        for (const SSSTRUCT* forward : station.FSList)
            copied[forward->Name] = static_cast<std::uint32_t>(s);
        for (std::size_t t = 0; t < station.SSList.size(); ++t) {
            SSSTRUCT* target = station.SSList.at(t);
            UpdateProgress(ProgressPercent(++done, steps), kGeneratingGraphics);
            if (target->SkipMean) continue;
            // Reverse nodes of the name join its chain as it is walked; they are passed over.
            for (std::uint32_t node = FirstNodeOf(target->Name); node != NodeEntry::kNone;
                 node = Nodes[node].NextSameName) {
                if (Nodes[node].IsPointOnly()) continue;
                STNSTRUCT& sighted = Setups[Nodes[node].Index()];
                if (sighted.ReverseStn || &sighted == &station) continue;
                sighted.Sighted = 1;
                if (copied[target->Name] != s) {
                    AppendForward(station, *target);
                    copied[target->Name] = static_cast<std::uint32_t>(s);
                }
                AddReverseFSptr(&station, target);
                target->ForwardFlag = 1;
            }
        }
    }
    return 1;
}

int UNeditDatabase::PrepareForwardWithBS() {
    for (std::size_t s = 0; s < Setups.size(); ++s) {
        STNSTRUCT& station = Setups[s];
        if (station.PointOnly || station.ReverseStn) continue;
        for (SSSTRUCT* target : station.SSList) {
            if (target->SkipMean) continue;
            for (STNSTRUCT* sighted : OccupiedStations(target->Name, &station)) {
                if (sighted->BkStnName != station.StnName) continue;
                sighted->Sighted = 1;
                AddToFSptr(&station, target);
                target->ForwardFlag = 1;
            }
        }
    }
    return 1;
}

int UNeditDatabase::AddForwPtr(const std::wstring& name) {
    for (STNSTRUCT& station : Setups) {
        SSSTRUCT* side_shot = station.SSList.Find(name);
        if (side_shot != nullptr) AddToFSptr(&station, side_shot);
    }
    return 1;
}

int UNeditDatabase::AddNewStn(const std::wstring& name) {
    STNSTRUCT& station = NewSetup();
    station.Name = NameOf(name);
    station.StnName = Names.Name(station.Name);
    station.Sighted = 1;
    AppendSetup(station);
    if (Rows == nullptr) return 0;
    return AppendRow(*Rows, nedit::Format(L"%-10s ID=%s,HI=0.000,CO= ", L"STN", name)) >= 0;
}

int UNeditDatabase::DeleteForwPtr() {
    for (STNSTRUCT& station : Setups) station.FSList.Clear();
    return 1;
}

int UNeditDatabase::DeleteList() {
    Setups.clear();
    PointNodes.clear();
    Nodes.clear();
    FirstNodeOfName.clear();
    LastNodeOfName.clear();
    Targets.clear();
    Measurements.clear();
    FiledBackSights.clear();
    FiledSideShots.clear();
    CurStn = nullptr;
    CurStnPending = false;
    CurSS = nullptr;
    return 1;
}

int UNeditDatabase::GetListCount(int& stations, int& sideShots, int& forward) const {
    stations = static_cast<int>(Nodes.size());
    sideShots = forward = 0;
    for (const STNSTRUCT& station : Setups) {
        sideShots += static_cast<int>(station.SSList.size());
        forward += static_cast<int>(station.FSList.size());
    }
    return stations + sideShots + forward;
}

STNSTRUCT* UNeditDatabase::searchSTN(std::wstring_view name) const {
    return FirstSetupOf(Names.Find(name));
}

int UNeditDatabase::SearchSTN(const std::wstring& name, std::vector<STNSTRUCT*>& out) const {
    out.clear();
    const std::wstring wanted = nedit::ToUpper(name);
    for (const NodeEntry& node : Nodes) {
        if (node.IsPointOnly()) continue;
        const STNSTRUCT& station = Setups[node.Index()];
        if (nedit::ToUpper(station.StnName) == wanted)
            out.push_back(const_cast<STNSTRUCT*>(&station));
    }
    return static_cast<int>(out.size());
}

void UNeditDatabase::InitUnitsAndAngleModes() {
    HMode = L'A';
    VMode = L'Z';
    AngleUnit = L'S';
    LengthUnit = L'M';
    if (Doc != nullptr) Doc->InitUnitsAndAngleModes(AngleUnit, LengthUnit, HMode, VMode);
}

double UNeditDatabase::GetStnScaleFactor(const std::wstring& name) const {
    return StnScaleFactor(Names.Find(name));
}

double UNeditDatabase::StnScaleFactor(NameId station) const {
    if (StnScaleMap.empty()) return ScaleFactor;
    const auto found = StnScaleMap.find(station);
    return found == StnScaleMap.end() ? ScaleFactor : found->second;
}
