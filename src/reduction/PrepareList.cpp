// From the record list to the observation model: every row through ProcessRecord, then the
// forward pointers that link a side shot to the station it hits.

#include <algorithm>
#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/UNeditDatabase.h"

double CurInstHt = 0.0;

namespace {

constexpr const wchar_t* kGeneratingGraphics = L"Generating Graphics";

// Below this an instrument height counts as not given.
constexpr double kNoInstrumentHeight = 0.0001;

// The earth radius used when a distance correction is asked for before any Radius record:
// the mean radius, so that the correction stays finite and close to what was meant.
constexpr double kMeanEarthRadiusMetres = 6370000.0;

double Number(const std::wstring& text) {
    return nedit::TextToDouble(text);
}

void AppendNames(std::vector<std::wstring>& to, const std::vector<std::wstring>& names) {
    to.insert(to.end(), names.begin(), names.end());
}

// A row as the reduction reads it: at most 255 characters, trimmed, in upper case. Rows
// that came through the list's gate are so already and are read in place.
const std::wstring& ReadRow(const std::wstring& row, std::wstring& buffer) {
    const bool ready =
        row.size() <= static_cast<std::size_t>(kMaxRowLength) &&
        (row.empty() || (!nedit::IsBlank(row.front()) && !nedit::IsBlank(row.back()))) &&
        std::none_of(row.begin(), row.end(), [](wchar_t c) { return c >= L'a'; });
    if (ready) return row;
    buffer = nedit::ToUpper(nedit::TrimView(std::wstring_view(row).substr(0, kMaxRowLength)));
    return buffer;
}

wchar_t FirstLetter(const std::wstring& text, wchar_t fallback) {
    return text.empty() ? fallback : text[0];
}

}  // namespace

int UNeditDatabase::PrepareList() {
    PrismConst = 0.0;
    if (Rows == nullptr) {
        ResetPassValues();
        ErrorCode = 1;
        return 0;
    }
    std::vector<std::wstring> rows;
    rows.reserve(static_cast<std::size_t>(Rows->GetItemCount()));
    for (int row = 0; row < Rows->GetItemCount(); ++row) rows.push_back(Rows->GetItemText(row));
    return PrepareRows(rows);
}

int UNeditDatabase::PrepareList(const std::vector<std::wstring>& rows) {
    DbCoordNames.clear();
    LocalCoordNames.clear();
    if (rows.empty()) return 0;
    return PrepareRows(rows);
}

void UNeditDatabase::ResetPassValues() {
    if (Doc != nullptr) Doc->ResetCurrentValues();
    FirstSwing = CurSwing = HCorr = VCorr = 0.0;
    CurSS = nullptr;
}

int UNeditDatabase::PrepareRows(const std::vector<std::wstring>& rows) {
    ResetPassValues();
    DeleteList();
    // Every row may name a station or a point: room for all of them up front spares the
    // name tables their rehashing as a large survey fills them.
    PointList.Reserve(rows.size());
    TravFlag = 0;
    const std::size_t count = rows.size();
    std::wstring normalised;
    for (std::size_t index = 0; index < count; ++index) {
        if (AbortRequested()) return 0;
        UpdateProgress(static_cast<unsigned>(100 * (index + 1) / count), kGeneratingGraphics);
        const std::wstring& row = ReadRow(rows[index], normalised);
        if (row == kAdjustedPointsMarker) TravFlag = 1;
        const int type = Doc != nullptr ? Doc->GetRecordType(row) : rec::None;
        ProcessRecord(type, row, static_cast<int>(index) + 1);
        if (index + 1 == count && type != rec::Stn && PendingStn) {
            if (DummyStn(*PendingStn)) {
                PendingStn.reset();
                CurStn = nullptr;
            } else {
                InsertStn(std::move(PendingStn), 0);
            }
        }
    }
    TravFlag = 0;
    return 1;
}

const std::wstring& UNeditDatabase::GetValue(int id) const {
    static const std::wstring kNone;
    const auto found = Fields.find(id);
    if (found != Fields.end() && !found->second.empty()) return found->second;
    return Doc != nullptr ? Doc->GetCurrentValue(id) : kNone;
}

const std::wstring& UNeditDatabase::OwnValue(int id) const {
    static const std::wstring kNone;
    const auto found = Fields.find(id);
    return found == Fields.end() ? kNone : found->second;
}

int UNeditDatabase::ProcessRecord(int type, const std::wstring& row, int recordNo) {
    if (type == rec::None || Doc == nullptr) return 0;
    if (!Doc->ProcessRecord(type, row, Fields)) return 0;
    switch (type) {
        case rec::Date:
            DateText = nedit::TrimChars(nedit::Trim(GetValue(rec::Date)), L",");
            return 1;
        case rec::Unit:
        case rec::Unit2:
            LengthUnit = FirstLetter(GetValue(fld::UL), LengthUnit);
            AngleUnit = FirstLetter(GetValue(fld::UA), AngleUnit);
            if (CurStn) {
                CurStn->LengthUnit = LengthUnit;
                CurStn->AngleUnit = AngleUnit;
            }
            return 1;
        case rec::Amode:
            HMode = FirstLetter(GetValue(fld::HMode), HMode);
            VMode = FirstLetter(GetValue(fld::VMode), VMode);
            if (CurStn) {
                CurStn->HMode = HMode;
                CurStn->VMode = VMode;
            }
            return 1;
        case rec::Acorr:
            HCorr = Number(GetValue(fld::HCorr));
            VCorr = Number(GetValue(fld::VCorr));
            return 1;
        case rec::Swing: {
            const double swing = Number(GetValue(rec::Swing));
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
            std::wstring id = OwnValue(fld::ID);
            if (id.empty() && CurStn) id = CurStn->StnName;
            if (!id.empty()) {
                KnownCoordMap[id] = {Number(GetValue(fld::E)), Number(GetValue(fld::N)),
                                     Number(GetValue(fld::H))};
            }
            return 1;
        }
        case rec::Bs:
        case rec::Ss:
        case rec::Ss2:
            ProcessObservation(type, recordNo);
            return 1;
        case rec::Offset:
            if (CurSS != nullptr) {
                CurSS->OffsetAlong = Number(GetValue(fld::OffsetAlong));
                CurSS->OffsetRight = Number(GetValue(fld::OffsetRight));
                CurSS->OffsetUp = Number(GetValue(fld::OffsetUp));
            }
            return 1;
        case rec::Insht:
            CurInstHt = Number(GetValue(rec::Insht));
            if (CurStn && CurStn->HtInst < kNoInstrumentHeight) CurStn->HtInst = CurInstHt;
            return 1;
        case rec::Targetht:
        case rec::Targetht2:
            Doc->SetCurrentValue(Doc->GetFieldId(type), GetValue(type));
            return 1;
        case rec::Scale: {
            ScaleFactor = 1.0;
            const double scale = Number(GetValue(rec::Scale));
            if (!Is_Zero(scale, false)) {
                ScaleFactor = scale;
                if (CurStn) StnScaleMap[CurStn->StnName] = scale;
            }
            return 1;
        }
        case rec::Radius:
            EarthRadius = Number(GetValue(rec::Radius));
            return 1;
        case rec::Dcorr:
            Refraction = Number(GetValue(rec::Dcorr));
            CorrectDist = true;
            return 1;
        case rec::Prism:
            PrismConst = Number(GetValue(rec::Prism));
            return 1;
        default:
            return 0;
    }
}

void UNeditDatabase::ProcessPtRecord() {
    const std::wstring id = OwnValue(fld::ID);
    if (id.empty()) return;
    SavePoint(id, Number(GetValue(fld::E)), Number(GetValue(fld::N)), Number(GetValue(fld::H)),
              OwnValue(fld::CO), 1, kSaveFromPTRecord, 0);
    if (!CurPtNames) CurPtNames = std::make_unique<std::vector<std::wstring>>();
    if (CurPtNames->empty() || !nedit::EqualsIgnoreCase(CurPtNames->back(), id)) {
        CurPtNames->push_back(id);
    }
}

void UNeditDatabase::ProcessStnRecord() {
    const std::wstring id = OwnValue(fld::ID);
    if (id.empty()) return;
    auto station = std::make_unique<STNSTRUCT>();
    station->StnName = id;
    station->HtInst = Number(GetValue(fld::HI));
    if (station->HtInst < kNoInstrumentHeight) station->HtInst = CurInstHt;
    station->StnCode = OwnValue(fld::CO);
    station->Swing = FirstSwing;
    CurSwing = 0.0;
    if (CurPtNames) {
        station->PtNames = std::move(*CurPtNames);
        CurPtNames.reset();
    }
    if (PendingStn) {
        if (DummyStn(*PendingStn)) {
            // A station with nothing observed is dropped; the points named before it move on.
            AppendNames(station->PtNames, PendingStn->PtNames);
        } else {
            if (CurChkList) {
                PendingStn->ChkShots = std::move(*CurChkList);
                CurChkList.reset();
            }
            InsertStn(std::move(PendingStn), 0);
        }
    }
    PendingStn = std::move(station);
    CurStn = PendingStn.get();
    CurSS = nullptr;
}

void UNeditDatabase::ProcessBkbRecord() {
    if (!CurStn) return;
    CurStn->BkStnName = OwnValue(fld::ID);
    CurStn->BkStnGiven = 1;
    // Whether a bearing or a reading was given is the record's own business: an empty field
    // here means "none", not the value of an earlier record.
    const std::wstring& bearing = OwnValue(fld::BkBearing);
    if (bearing.empty()) {
        CurStn->BkBearingGiven = 0;
    } else {
        CurStn->BkBearing = Number(bearing);
        CurStn->BkBearingGiven = 1;
    }
    const std::wstring& reading = OwnValue(fld::HA);
    if (!reading.empty()) {
        CurStn->BkAngle = UAngle::ValidateData(Number(reading) + HCorr);
    } else if (HMode == L'B' && CurStn->BkBearingGiven) {
        CurStn->BkAngle = CurStn->BkBearing;
    }
}

void UNeditDatabase::ProcessObservation(int type, int recordNo) {
    if (!CurStn) return;
    auto target = std::make_unique<SSSTRUCT>();
    target->SSName = OwnValue(fld::ID);
    target->SSCode = OwnValue(fld::CO);
    target->Stn = CurStn;
    target->RecordNo = recordNo;

    MEASSTRUCT measurement;
    measurement.HAng = UAngle::ValidateData(Number(GetValue(fld::HA)) + CurStn->Swing + HCorr);
    CurStn->SwingOpen = false;
    measurement.VAng = Doc->ConvertToZenithVA(Number(GetValue(fld::VA))) + VCorr;
    measurement.SDist = Number(GetValue(fld::SD)) * GetStnScaleFactor(CurStn->StnName);
    if (CorrectDist && measurement.SDist >= 1e-40) ApplyDistanceCorrection(measurement);
    measurement.HtTarget = Number(GetValue(fld::HT));

    SSSTRUCT* inserted = target.get();
    CurSS = inserted;
    InsertSSMS(std::move(target), measurement, type == rec::Bs);
    if (type == rec::Bs) {
        CurStn->BkStnGiven = 1;
        return;
    }
    // A target observed again already holds the names filed before its first observation:
    // the names filed since then join them.
    if (CurPtNames) {
        AppendNames(inserted->PtNames, *CurPtNames);
        CurPtNames.reset();
    }
    if (CurChkList) {
        if (inserted->ChkShots.empty()) inserted->ChkShots = std::move(*CurChkList);
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

int UNeditDatabase::InsertStn(std::unique_ptr<STNSTRUCT> station, int makeCurrent) {
    station->HMode = HMode;
    station->VMode = VMode;
    station->AngleUnit = AngleUnit;
    station->LengthUnit = LengthUnit;
    STNSTRUCT* inserted = station.get();
    AppendStation(std::move(station));
    if (makeCurrent) CurStn = inserted;
    return 1;
}

void UNeditDatabase::AppendStation(std::unique_ptr<STNSTRUCT> station) {
    STNSTRUCT* added = station.get();
    Stations.push_back(std::move(station));
    const std::size_t first = StationsByName.Find(added->StnName);
    if (first == NameIndex::npos) {
        StationsByName.Set(added->StnName, Stations.size() - 1);
        return;
    }
    STNSTRUCT* head = Stations[first].get();
    (head->LastSameName != nullptr ? head->LastSameName : head)->NextSameName = added;
    head->LastSameName = added;
}

STNSTRUCT* UNeditDatabase::FirstNamed(const std::wstring& name) const {
    const std::size_t first = StationsByName.Find(name);
    return first == NameIndex::npos ? nullptr : Stations[first].get();
}

int UNeditDatabase::InsertSSMS(std::unique_ptr<SSSTRUCT> target, const MEASSTRUCT& measurement,
                               int isBackSight) {
    if (CurStn == nullptr) return 0;
    TargetList& list = isBackSight ? CurStn->BSList : CurStn->SSList;
    SSSTRUCT* existing = list.Find(target->SSName);
    if (existing == nullptr) {
        target->Meas->push_back(measurement);
        list.Append(std::move(target));
        return 1;
    }
    // A further observation of the same name: the new node takes the old one's place and its
    // measurements, so the code and record number are those of the latest observation.
    target->Meas = existing->Meas;
    target->Meas->push_back(measurement);
    // Check shots and point names filed before the old observation stay with the target.
    target->ChkShots = std::move(existing->ChkShots);
    target->PtNames = std::move(existing->PtNames);
    if (CurSS == existing) CurSS = target.get();
    list.Replace(existing, std::move(target));
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
    auto copy = std::make_unique<SSSTRUCT>();
    CopySS(*target, *copy);  // the copy shares the side shot's measurements
    // What was filed before the side shot stays with it; its forward copy carries none.
    copy->PtNames.clear();
    copy->ChkShots.clear();
    station->FSList.Append(std::move(copy));
    return 1;
}

int UNeditDatabase::AddReverseFSptr(STNSTRUCT* station, SSSTRUCT* target) {
    auto reverse = std::make_unique<STNSTRUCT>();
    reverse->StnName = target->SSName;
    reverse->ReverseStn = 1;
    reverse->HMode = HMode;
    reverse->VMode = VMode;
    reverse->AngleUnit = AngleUnit;
    reverse->LengthUnit = LengthUnit;
    auto back = std::make_unique<SSSTRUCT>();
    back->SSName = station->StnName;
    back->Stn = reverse.get();
    reverse->FSList.Append(std::move(back));
    AppendStation(std::move(reverse));
    return 1;
}

// The occupied stations of that exact name, other than `observer`.
std::vector<STNSTRUCT*> UNeditDatabase::OccupiedStations(const std::wstring& name,
                                                         const STNSTRUCT* observer) const {
    std::vector<STNSTRUCT*> found;
    for (STNSTRUCT* station = FirstNamed(name); station != nullptr;
         station = station->NextSameName) {
        if (!station->PointOnly && !station->ReverseStn && station != observer)
            found.push_back(station);
    }
    return found;
}

int UNeditDatabase::PrepareForwardNoBS() {
    std::size_t steps = Stations.size();
    for (const auto& station : Stations) steps += station->SSList.size();
    std::size_t done = 0;
    // Reverse nodes are appended as the walk goes; they are no set-ups and are passed over.
    for (std::size_t s = 0; s < Stations.size(); ++s) {
        STNSTRUCT* station = Stations[s].get();
        if (AbortRequested()) return 0;
        UpdateProgress(static_cast<unsigned>(100 * ++done / std::max<std::size_t>(steps, 1)),
                       kGeneratingGraphics);
        if (station->PointOnly || station->ReverseStn) continue;
        for (std::size_t t = 0; t < station->SSList.size(); ++t) {
            SSSTRUCT* target = station->SSList.at(t);
            UpdateProgress(static_cast<unsigned>(100 * ++done / std::max<std::size_t>(steps, 1)),
                           kGeneratingGraphics);
            if (target->SkipMean) continue;
            for (STNSTRUCT* sighted : OccupiedStations(target->SSName, station)) {
                sighted->Sighted = 1;
                AddToFSptr(station, target);
                AddReverseFSptr(station, target);
                target->ForwardFlag = 1;
            }
        }
    }
    return 1;
}

int UNeditDatabase::PrepareForwardWithBS() {
    for (std::size_t s = 0; s < Stations.size(); ++s) {
        STNSTRUCT* station = Stations[s].get();
        if (station->PointOnly || station->ReverseStn) continue;
        for (const auto& target : station->SSList) {
            if (target->SkipMean) continue;
            for (STNSTRUCT* sighted : OccupiedStations(target->SSName, station)) {
                if (sighted->BkStnName != station->StnName) continue;
                sighted->Sighted = 1;
                AddToFSptr(station, target.get());
                target->ForwardFlag = 1;
            }
        }
    }
    return 1;
}

int UNeditDatabase::AddForwPtr(const std::wstring& name) {
    for (const auto& station : Stations) {
        SSSTRUCT* side_shot = station->SSList.Find(name);
        if (side_shot != nullptr) AddToFSptr(station.get(), side_shot);
    }
    return 1;
}

int UNeditDatabase::AddNewStn(const std::wstring& name) {
    auto station = std::make_unique<STNSTRUCT>();
    station->StnName = name;
    station->Sighted = 1;
    AppendStation(std::move(station));
    if (Rows == nullptr) return 0;
    return Rows->AddRecord(Rows->GetItemCount(),
                           nedit::Format(L"%-10s ID=%s,HI=0.000,CO= ", L"STN", name)) >= 0;
}

int UNeditDatabase::DeleteForwPtr() {
    for (const auto& station : Stations) station->FSList.Clear();
    return 1;
}

int UNeditDatabase::DeleteList() {
    Stations.clear();
    StationsByName.Clear();
    PendingStn.reset();
    CurStn = nullptr;
    CurSS = nullptr;
    return 1;
}

int UNeditDatabase::GetListCount(int& stations, int& sideShots, int& forward) const {
    stations = static_cast<int>(Stations.size());
    sideShots = forward = 0;
    for (const auto& station : Stations) {
        sideShots += static_cast<int>(station->SSList.size());
        forward += static_cast<int>(station->FSList.size());
    }
    return stations + sideShots + forward;
}

STNSTRUCT* UNeditDatabase::searchSTN(const std::wstring& name) const {
    for (STNSTRUCT* station = FirstNamed(name); station != nullptr;
         station = station->NextSameName) {
        if (!station->PointOnly) return station;
    }
    return nullptr;
}

int UNeditDatabase::SearchSTN(const std::wstring& name, std::vector<STNSTRUCT*>& out) const {
    out.clear();
    const std::wstring wanted = nedit::ToUpper(name);
    for (const auto& station : Stations) {
        if (!station->PointOnly && nedit::ToUpper(station->StnName) == wanted)
            out.push_back(station.get());
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
    const auto found = StnScaleMap.find(name);
    return found == StnScaleMap.end() ? ScaleFactor : found->second;
}
