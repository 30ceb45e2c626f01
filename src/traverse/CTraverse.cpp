// The route of a traverse, its unadjusted stage, the misclose of every stage and the run of
// a computation with its dialog. The adjusting stages are in CTraverseAdjust.cpp.

#include "traverse/CTraverse.h"

#include <climits>
#include <cmath>
#include <unordered_map>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWPolygon.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "reduction/CError.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

/// An angle beyond half a turn either way, folded back by a turn.
double Fold(double angle) {
    if (std::fabs(angle) <= 180.0) return angle;
    return (angle > 0.0 ? 1.0 : -1.0) * (std::fabs(angle) - 360.0);
}

UWPoint PositionOf(const CTravStn& entry) {
    return UWPoint(entry.X, entry.Y, entry.Z);
}

UWPoint PositionOf(const STNSTRUCT& station) {
    return UWPoint(station.East, station.North, station.Height);
}

double ZeroIfZero(double value) {
    return Is_Zero(value, false) ? 0.0 : value;
}

/// The accuracy ratio as the dialog shows it, cut to a whole number; a ratio beyond the
/// whole numbers the text can hold shows the largest, and one of coordinates that are no
/// numbers shows 0.
std::wstring AccuracyText(double ratio) {
    double whole = std::isnan(ratio) ? 0.0 : ratio;
    if (whole >= static_cast<double>(INT_MAX)) whole = INT_MAX;
    return nedit::Format(L"1:%d", static_cast<int>(whole));
}

}  // namespace

CTraverse::CTraverse(UNeditDatabase* db) : Db(db) {}

CTraverse::~CTraverse() = default;

nedit::DialogHost* CTraverse::GetHost() const {
    return Db != nullptr ? Db->GetDialogHost() : nullptr;
}

TraverseParams& CTraverse::GetParams() {
    if (!Params) Params = std::make_unique<TraverseParams>();
    return *Params;
}

int CTraverse::Fail(int code) const {
    return CError::Show(code, GetHost());
}

bool CTraverse::CreateStnList(const std::wstring& names) {
    Route.clear();
    std::vector<std::wstring> list;
    // Text after the last comma is no name.
    for (std::size_t start = 0, comma; (comma = names.find(L',', start)) != std::wstring::npos;
         start = comma + 1) {
        list.push_back(names.substr(start, comma - start));
    }
    if (list.size() < 2) return false;
    // The set-ups of each name without regard to case, in list order, leaving out nodes that
    // only carry a point: one pass over the stations, however long the route.
    std::unordered_map<std::wstring, std::vector<const STNSTRUCT*>> set_ups;
    for (const std::wstring& name : list) set_ups.emplace(nedit::ToUpper(name), 0);
    for (const auto& station : Db->GetStations()) {
        if (station->PointOnly) continue;
        const auto wanted = set_ups.find(nedit::ToUpper(station->StnName));
        if (wanted != set_ups.end()) wanted->second.push_back(station.get());
    }
    for (std::size_t i = 0; i + 1 < list.size(); ++i) {
        CTravStn entry;
        entry.Name = list[i];
        for (const STNSTRUCT* set_up : set_ups[nedit::ToUpper(list[i])]) {
            entry.SS = set_up->SSList.Find(list[i + 1]);
            if (entry.SS != nullptr) {
                entry.Stn = set_up;
                break;
            }
        }
        if (entry.SS == nullptr) {
            Route.clear();
            return false;
        }
        Route.push_back(entry);
    }
    CTravStn last;
    last.Name = list.back();
    last.Stn = Db->searchSTN(last.Name);
    if (last.Stn == nullptr) {
        std::wstring code;
        Db->GetPointFromPtList(last.Name, last.X, last.Y, last.Z, code, 0);
    }
    Route.push_back(last);
    return true;
}

int CTraverse::CheckBackSights() {
    std::wstring previous;
    for (std::size_t i = 0; i < Route.size(); ++i) {
        const CTravStn& entry = Route[i];
        if (i > 0 && entry.Stn != nullptr && !entry.Stn->BSList.empty() &&
            !nedit::EqualsIgnoreCase(entry.Stn->BkStnName, previous)) {
            nedit::AppMessageBox(
                GetHost(),
                nedit::Translate(L"Backsight point {1} from Occupied point {2} is not the "
                                 L"previous traverse point.\n",
                                 {std::wstring(entry.Stn->BkStnName), entry.Name}),
                nedit::mb::Ok);
            return 0;
        }
        previous = entry.Name;
    }
    return 1;
}

int CTraverse::CheckLeg(const CTravStn& entry, const SSSTRUCT* observation) const {
    if (entry.Stn == nullptr) return kNoSetUp;
    if (observation == nullptr) return kNoObservation;
    if (!observation->MeanValid || !observation->AngleValid) return kNotAveraged;
    return 0;
}

double CTraverse::CloseMisclose(const TraverseParams& params) const {
    const STNSTRUCT& close = *Route.back().Stn;
    // The reference is the station before the closing one in the station list.
    double reference = 0.0;
    const auto& stations = Db->GetStations();
    for (std::size_t i = 1; i < stations.size(); ++i) {
        if (stations[i].get() == &close) {
            reference = PositionOf(close).BearingTo(PositionOf(*stations[i - 1]));
            break;
        }
    }
    // A reading in bearing mode is a bearing already.
    const double observed =
        Db->GetHMode() == L'B' ? CloseSS->AngleFromBS : CloseSS->AngleFromBS + reference;
    return Fold(observed - params.CloseBearing);
}

int CTraverse::Compute(TraverseParams& params, std::vector<std::wstring>* records) {
    if (Route.size() < 2) {
        nedit::AppMessageBox(GetHost(), nedit::Translate(L"Invalid or empty traverse route !"),
                             nedit::mb::IconStop);
        return kGivenUp;
    }
    const STNSTRUCT* close = Route.back().Stn;
    const bool angle_check = params.AdjustAngle != 0 && close != nullptr;
    if (angle_check) {
        CloseSS = params.ChkPt.empty() ? nullptr : close->SSList.Find(params.ChkPt);
        if (CloseSS == nullptr) return Fail(kInvalidCheckPoint);
        AngCorrSum = 0.0;
    }
    AngMisclose = 0.0;
    if (angle_check) {
        for (std::size_t i = 0; i < Route.size(); ++i) {
            const bool last = i + 1 == Route.size();
            const int code = CheckLeg(Route[i], last ? CloseSS : Route[i].SS);
            if (code != 0) return Fail(code);
        }
        AngMisclose = CloseMisclose(params);
    }
    if (!Params) Params = std::make_unique<TraverseParams>(params);
    StartBearing = params.StartBearing;

    // A stage error has been shown; the dialog shows what was computed up to it.
    ComputeUnadjusted(params);
    nedit::DialogHost* host = GetHost();
    int answer = nedit::mb::IdOk;
    if (host != nullptr) {
        answer = host->Run(Report);
    } else {
        Report.OnInitDialog();
    }
    if (answer != nedit::mb::IdOk) return kGivenUp;
    if (!CoordAdjusted &&
        nedit::AppMessageBox(host, nedit::Translate(L"Adjust Traverse ?"),
                             nedit::mb::YesNo | nedit::mb::IconQuestion) != nedit::mb::IdYes) {
        return kGivenUp;
    }
    Close(params, records);
    return kDone;
}

void CTraverse::Close(TraverseParams& params, std::vector<std::wstring>* records) {
    if (CloseDialog) CloseDialog();
    if (params.AdjustAngle != 0 && !AngleAdjusted) AdjustAngles(params);
    if (!CoordAdjusted) AdjustCoords(params, Report.GetAdjustElevations());
    std::vector<UNeditPt> points;
    points.reserve(Route.size());
    for (const CTravStn& entry : Route)
        points.emplace_back(entry.Name, entry.X, entry.Y, entry.Z, L"", 0);
    Db->UpdateTraversePoints(&points);
    if (UNeditReport* report = Db->GetReport())
        report->PrintAdjustedSideShotsHead(nedit::Translate(L"Adjusted sideshots"));
    Db->ProcessCoord(UNeditDatabase::kSideShotPass, 1, 1, records);
    Db->SetMinMaxCoord();
}

void CTraverse::StartAtStart(const TraverseParams& params) {
    Length = 0.0;
    MiscloseX = MiscloseY = MiscloseZ = 0.0;
    // The typed start replaces the reduced one, for its own entry only.
    Route.front().X = params.StartX;
    Route.front().Y = params.StartY;
    Route.front().Z = params.StartZ;
}

void CTraverse::PrintHead(const std::wstring& title, bool elevAdj) const {
    UNeditReport* report = Db->GetReport();
    if (report == nullptr) return;
    report->PrintTravHead(title, elevAdj);
    const CTravStn& first = Route.front();
    report->PrintCoord(first.Name, first.X, first.Y, first.Z);
}

void CTraverse::PrintFixed(const TraverseParams& params) const {
    if (UNeditReport* report = Db->GetReport())
        report->PrintCoord(params.FixedPt, params.FixedX, params.FixedY, params.FixedZ);
}

int CTraverse::ComputeUnadjusted(TraverseParams& params) {
    StartAtStart(params);
    PrintHead(nedit::Translate(L"Unadjusted traverse"), false);
    UNeditReport* report = Db->GetReport();
    for (std::size_t i = 0; i + 1 < Route.size(); ++i) {
        const CTravStn& entry = Route[i];
        CTravStn& next = Route[i + 1];
        const int code = CheckLeg(entry, entry.SS);
        if (code != 0) return Fail(code);
        // The leg runs to the next set-up as the run placed it.
        const STNSTRUCT* target = Db->searchSTN(entry.SS->SSName);
        const UWPoint ahead = target != nullptr ? PositionOf(*target) : PositionOf(next);
        const UWPoint here = PositionOf(entry);
        const double bearing = here.BearingTo(ahead);
        const double distance = here.DistanceTo(ahead, false);
        Length += distance;
        if (target != nullptr) {
            next.X = target->East;
            next.Y = target->North;
            next.Z = target->Height;
        }
        if (report != nullptr) {
            report->PrintLine(std::wstring(entry.SS->SSName), entry.SS->AngleFromBS, bearing,
                              distance, next.X, next.Y, next.Z, false, 0.0);
        }
    }
    PrintFixed(params);
    ComputeMisclose(params, kUnadjusted);
    return kDone;
}

double CTraverse::ObservedCloseBearing() const {
    const CTravStn& tail = Route.back();
    if (tail.Stn == nullptr) return 0.0;
    const CTravStn* reference = nullptr;
    if (!tail.Stn->BSList.empty() && !tail.Stn->BkStnName.empty()) {
        for (const CTravStn& entry : Route) {
            if (nedit::EqualsIgnoreCase(entry.Name, tail.Stn->BkStnName)) {
                reference = &entry;
                break;
            }
        }
    } else if (Route.size() >= 2) {
        reference = &Route[Route.size() - 2];
    }
    double bearing = 0.0;
    if (reference != nullptr) {
        bearing = PositionOf(tail).BearingTo(PositionOf(*reference));
        // A bearing reading turns with the change the adjustment made to the back line.
        UWPoint tail_reduced, reference_reduced;
        if (Db->GetHMode() == L'B' && ReducedPosition(tail.Name, tail_reduced) &&
            ReducedPosition(reference->Name, reference_reduced)) {
            bearing -= tail_reduced.BearingTo(reference_reduced);
        }
    }
    if (CloseSS != nullptr) bearing += CloseSS->AngleFromBS;
    if (bearing > 360.0) bearing -= 360.0;
    return bearing;
}

bool CTraverse::ReducedPosition(const std::wstring& name, UWPoint& position) const {
    if (const STNSTRUCT* station = Db->searchSTN(name)) {
        position = PositionOf(*station);
        return true;
    }
    std::wstring code;
    return Db->GetPointFromPtList(name, position.x, position.y, position.z, code, 0) != 0;
}

void CTraverse::ComputeMisclose(TraverseParams& params, int stage) {
    const CTravStn& last = Route.back();
    const UWPoint fixed(params.FixedX, params.FixedY, params.FixedZ);
    MiscloseX = last.X - fixed.x;
    MiscloseY = last.Y - fixed.y;
    MiscloseZ = last.Z - fixed.z;
    Report.FixedID = params.FixedPt;
    Report.FixedE = fixed.x;
    Report.FixedN = fixed.y;
    Report.FixedH = fixed.z;
    Report.ObservedID = last.Name;
    Report.ObservedE = last.X;
    Report.ObservedN = last.Y;
    Report.ObservedH = last.Z;
    Report.MiscloseBearing = PositionOf(last).BearingTo(fixed);
    Report.DiffE = -MiscloseX;
    Report.DiffN = -MiscloseY;
    Report.DiffH = -MiscloseZ;

    double observed = 0.0;
    if (params.AdjustAngle != 0) {
        double error = AngMisclose;
        if (stage == kUnadjusted) {
            observed = params.CloseBearing + AngMisclose;
            if (observed > 360.0) observed -= 360.0;
        } else {
            // The angle stage turned the legs by all shares but the closing angle's own.
            if (stage == kAfterAngles && CloseSS != nullptr) AngCorrSum += Report.PerStation;
            observed = ObservedCloseBearing() + (stage == kAfterAngles ? AngCorrSum : 0.0);
            error = observed - params.CloseBearing;
            if (std::fabs(error) > 180.0) {
                error = Fold(error);
                observed = params.CloseBearing + error;
                if (observed > 360.0) observed -= 360.0;
            }
        }
        // Shared over every entry of the route, the last one included.
        Report.AngularError = ZeroIfZero(-error);
        Report.PerStation = ZeroIfZero(-error / static_cast<double>(Route.size()));
        if (stage == kAfterAngles) AngMisclose = -Report.AngularError;
    }
    Report.MiscloseDist = std::hypot(MiscloseX, MiscloseY);
    const double ratio =
        Is_Zero(Report.MiscloseDist, false) ? 1000000000.0 : Length / Report.MiscloseDist;
    Report.Accuracy = stage == kAfterCoordinates ? std::wstring() : AccuracyText(ratio);
    Report.Setups = static_cast<long>(Route.size()) - 1;
    Report.TraverseLength = Length;
    if (Route.size() >= 3 && Route.front().Name == Report.FixedID) ComputeArea();

    if (UNeditReport* report = Db->GetReport()) {
        report->NewLines(1);
        report->PrintTraverseInfo(Report.DiffE, Report.DiffN, Report.DiffH, Report.MiscloseBearing,
                                  Report.MiscloseDist, Report.EnclosedArea, Report.TraverseLength,
                                  static_cast<int>(Report.Setups), Report.Accuracy,
                                  stage == kAfterAngles && Report.GetAdjustElevations(),
                                  params.AdjustAngle != 0, Report.AngularError, Report.PerStation,
                                  params.CloseBearing, observed);
    }
    if (StageObserver) StageObserver(stage);
}

void CTraverse::ComputeArea() {
    // A closed figure: the closing entry is no corner of its own where it meets the first.
    UWPolygon figure;
    for (std::size_t i = 0; i < Route.size(); ++i) {
        const UWPoint corner = PositionOf(Route[i]);
        if (i + 1 == Route.size() && figure.GetSize() > 0 && corner == figure.GetAt(0)) break;
        figure.Add(corner);
    }
    if (!figure.IsSelfIntersecting()) Report.EnclosedArea = figure.Area();
}
