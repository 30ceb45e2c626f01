// The walk down the station list that positions and orients each set-up and reduces its
// forward observations and side shots to East, North, Height.

#include <cmath>

#include "platform/geometry/CoordinateGeometry.h"
#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWVector.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/ProgressPercent.h"
#include "reduction/StationWork.h"
#include "reduction/UBKBCoordDlg.h"
#include "reduction/UCoordEntryDlg.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

constexpr const wchar_t* kGeneratingGraphics = L"Generating Graphics";

}  // namespace

void UNeditDatabase::geo_coord(double e, double n, double bearing, double dist, double* eOut,
                               double* nOut) {
    nedit::geo_coord(e, n, bearing, dist, eOut, nOut);
}

void UNeditDatabase::ApplyOffsets(double& e, double& n, double& z, double along, double right,
                                  double up, double bearing) {
    const UWVector ahead(UWBrgDst(bearing, along));
    const UWVector aside(UWBrgDst(bearing + 90.0, right));
    e += ahead.x + aside.x;
    n += ahead.y + aside.y;
    z += up;
}

bool UNeditDatabase::IsSelfObservation(const STNSTRUCT& station, const SSSTRUCT& target) const {
    return nedit::EqualsIgnoreCase(target.SSName, station.StnName);
}

void UNeditDatabase::ReduceTarget(const STNSTRUCT& station, SSSTRUCT& target,
                                  const StationWork& work, double& e, double& n, double& z) const {
    Process_Code_Offsets(target);
    const double zenith = target.VAng * kRadiansPerDegree;
    const double horizontal = std::sin(zenith) * target.SDist + PrismConst;
    const double vertical = std::cos(zenith) * target.SDist;
    const double theta =
        station.HMode == L'B' ? target.HAng : work.BackBearing + target.AngleFromBS;
    e = std::sin(theta * kRadiansPerDegree) * horizontal + work.StnE;
    n = std::cos(theta * kRadiansPerDegree) * horizontal + work.StnN;
    z = work.StnZ > kNoHeight ? vertical + work.StnZ + station.HtInst - target.HtTarget : work.StnZ;
    if (!Is_Zero(target.OffsetAlong, false) || !Is_Zero(target.OffsetRight, false) ||
        !Is_Zero(target.OffsetUp, false)) {
        ApplyOffsets(e, n, z, target.OffsetAlong, target.OffsetRight, target.OffsetUp, theta);
    }
}

int UNeditDatabase::ProcessCoord(int passes, int report, int fixedOnly,
                                 std::vector<std::wstring>* records) {
    // Every point and point-only node has a name of the table, and there are no more of them
    // than names: room for all of them up front spares the stores a copy of themselves as
    // they grow.
    PointList.Reserve(Names.size());
    PointNodes.reserve(Names.size());
    Nodes.reserve(Setups.size() + Names.size());
    StationWork work;
    work.Steps = Nodes.size();
    for (const STNSTRUCT& station : Setups)
        work.Steps += station.SSList.size() + station.FSList.size();

    Strings.DeleteStrNoList();
    CodeNotices.clear();
    if (report == 1) CheckResults.clear();
    const STNSTRUCT* last_station = nullptr;
    StationWork last_work;
    ResetCircleData();

    const bool printing = Report != nullptr && report == 1;
    if (printing) PrintRunHead();
    work.Printing = printing && Report->KeepsText();

    bool aborted = false;
    // Point-only nodes, which setCoord appends as the walk goes, are passed over.
    for (std::size_t s = 0; s < Setups.size() && !aborted; ++s) {
        STNSTRUCT& station = Setups[s];
        if (AbortRequested()) {
            aborted = true;
            break;
        }
        if (station.PointOnly || station.ReverseStn) continue;
        if (station.BSList.empty() && station.SSList.empty() && station.FSList.empty() &&
            station.Sighted == 0 && !station.HasCheck) {
            continue;
        }
        UpdateProgress(ProgressPercent(++work.StepsDone, work.Steps), kGeneratingGraphics);

        work.BackBearing = 0.0;
        work.BsReading = station.BkAngle;
        if (!station.BSList.empty() && station.BSList.front()->MeanValid) {
            work.BsReading = station.BSList.front()->HAng;
        }
        if (station.BkStnGiven) {
            if (station.BkBearingGiven) {
                work.BackBearing = station.BkBearing;
            } else if (!OrientByCoordinates(station, work)) {
                UpdateProgress(100, L"");
                return 0;
            }
        }

        const int position = PositionStation(station, work, report, fixedOnly);
        if (position == kPositionFailed) return 0;
        if (position == kStationLeftOut) continue;

        if (position == kPositionFound) {
            double be = 0.0, bn = 0.0, bz = kNoHeight;
            std::wstring back_code;
            if (FindCoordOf(NameOf(station.BkStnName), be, bn, bz, back_code, report, true) &&
                Report != nullptr) {
                double distance = 0.0;
                nedit::geo_brgdst(work.StnE, work.StnN, be, bn, &work.BackBearing, &distance);
            }
        }
        if (!LineBearings.empty()) {
            const double stored =
                GetBearingFromArray(std::wstring(station.StnName), std::wstring(station.BkStnName));
            if (stored >= 0.0) work.BackBearing = stored;
        }

        ArrangePtNames(station.PtNames.begin(), station.PtNames.end());
        work.HasShots = HaveSideshotsToReport(&station, records);
        work.HeadPrinted = false;
        // A side-shot pass alone (after an adjustment) prints only stations with shots.
        if (work.Printing && !(passes == kSideShotPass && !work.HasShots))
            PrintStationBlock(station, work);

        if ((passes & kForwardPass) != 0 && !station.FSList.empty() &&
            !ForwardPass(station, work, report))
            aborted = true;
        if (!aborted && (passes & kSideShotPass) != 0 && !station.SSList.empty() &&
            !SideShotPass(station, work, report)) {
            aborted = true;
        }
        if (report == 1) ProcessChkShot(station.ChkShots, station, work);
        last_station = &station;
        last_work = work;
    }
    Strings.ProcessOffsetStringPoints();
    if (report == 1 && last_station != nullptr && CurChkList) {
        for (const SSCheck& check : *CurChkList) PrintChkShot(*last_station, last_work, check);
    }
    if (CurPtNames) ArrangePtNames(CurPtNames->data(), CurPtNames->data() + CurPtNames->size());
    UpdateProgress(100, L"");
    if (printing) PrintUnDefineCode();
    if (aborted) return 0;
    ProcessString();
    ShowCodeNotices(printing);
    return 1;
}

int UNeditDatabase::OrientByCoordinates(STNSTRUCT& station, StationWork& work) {
    if (!station.CoordKnown) {
        std::wstring code(station.StnCode);
        if (FindCoordOf(station.Name, station.East, station.North, station.Height, code, 0, true) ||
            PointFromPtList(station.Name, station.East, station.North, station.Height, code, 1)) {
            station.StnCode = Codes.Name(CodeOf(code));
        } else if (FindXYZ(std::wstring(station.StnName), station.East, station.North,
                           station.Height) >= 0) {
            station.CoordKnown = 1;
        } else {
            UCoordEntryDlg dialog(
                CoordsOrderXY() ? UCoordEntryDlg::kEastFirstId : UCoordEntryDlg::kNorthFirstId,
                Host);
            if (dialog.process(std::wstring(station.StnName), UseForAll) != 1) return 0;
            station.East = dialog.getEast();
            station.North = dialog.getNorth();
            station.Height = dialog.getZ();
            station.StnCode = Codes.Name(CodeOf(dialog.getCode()));
            station.CoordKnown = 1;
        }
    }
    const UWPoint here(station.East, station.North, station.Height);
    double be = 0.0, bn = 0.0, bz = kNoHeight;
    std::wstring back_code;
    const NameId back = NameOf(station.BkStnName);
    bool found = FindCoordOf(back, be, bn, bz, back_code, 0, true) != 0;
    if (!found) {
        const int point = PointOf(back);
        if (point >= 0) {
            const UNeditPt& known = PointList[static_cast<std::size_t>(point)];
            be = known.x;
            bn = known.y;
            bz = known.z;
            found = !known.IsPTRecord();
        }
    }
    if (found) {
        work.BackBearing = UWLine(here, UWPoint(be, bn, bz)).Bearing();
    } else {
        AskBackStation(station, work, here);
    }
    station.BkBearing = work.BackBearing;
    return 1;
}

void UNeditDatabase::AskBackStation(const STNSTRUCT& station, StationWork& work,
                                    const UWPoint& here) {
    const std::wstring back(station.BkStnName);
    UBKBCoordDlg dialog(back);
    // The dialog has OK only: whatever stands in its fields is taken.
    if (Host != nullptr) Host->Run(dialog);
    if (dialog.ApplyBearing) {
        work.BackBearing = dialog.Bearing;
        const int row = FindRecord(rec::Bkb, back);
        if (row >= 0) {
            ReplaceRow(*Rows, row,
                       FormatBKBRecord(back, station.BkAngle - FirstSwing - CurSwing - HCorr,
                                       dialog.Bearing));
        }
        return;
    }
    work.BackBearing = UWLine(here, UWPoint(dialog.East, dialog.North, dialog.Height)).Bearing();
    const std::wstring text = FormatXYZRecord(back, dialog.East, dialog.North, dialog.Height);
    double e = 0.0, n = 0.0, z = 0.0;
    const int row = FindXYZ(back, e, n, z);
    if (row < 0) {
        if (Rows != nullptr) AppendRow(*Rows, text);
    } else if (!Is_Zero(e - dialog.East, false) || !Is_Zero(n - dialog.North, false) ||
               !Is_Zero(z - dialog.Height, false)) {
        ReplaceRow(*Rows, row, text);
    }
}

int UNeditDatabase::PositionStation(STNSTRUCT& station, StationWork& work, int report,
                                    int fixedOnly) {
    work.StnE = work.StnN = 0.0;
    work.StnZ = kNoHeight;
    work.StnCodeOut.clear();
    const NameId name = station.Name;
    auto take_node = [&]() {
        work.StnE = station.East;
        work.StnN = station.North;
        work.StnZ = station.Height;
    };
    // The user is asked when nothing else knows the station; no answer ends the run.
    auto ask_user = [&](int fix) {
        double e = 0.0, n = 0.0, z = kNoHeight;
        if (!GetCoordOf(name, &e, &n, &z, work.StnCodeOut, 1, true)) {
            ErrorCode = 1;
            UpdateProgress(100, L"");
            return false;
        }
        SetCoordOf(name, e, n, z, work.StnCodeOut, kSetCoordOverwrite, fix, 1);
        station.CoordKnown = 1;
        SaveTravPoint(std::wstring(station.StnName), e, n, z, work.StnCodeOut, 1);
        work.StnE = e;
        work.StnN = n;
        work.StnZ = z;
        return true;
    };

    if (station.CoordKnown && station.CoordFixed == 1) {
        take_node();
        return kPositionFound;
    }
    if (station.CoordKnown) {
        if (fixedOnly) return kStationLeftOut;
        take_node();
        SetCoordOf(name, work.StnE, work.StnN, work.StnZ, station.StnCode, kSetCoordOverwrite,
                   report, 1);
        SaveTravPoint(std::wstring(station.StnName), work.StnE, work.StnN, work.StnZ,
                      std::wstring(station.StnCode), 1);
        return kPositionFound;
    }
    double e = 0.0, n = 0.0, z = kNoHeight;
    if (FindCoordOf(name, e, n, z, work.StnCodeOut, report, true)) {
        station.East = e;
        station.North = n;
        station.Height = z;
        station.CoordKnown = 1;
        take_node();
        return kPositionFound;
    }
    if (report == 1) {
        if (fixedOnly) return kStationLeftOut;
        return ask_user(report) ? kPositionFound : kPositionFailed;
    }
    const int point = PointOf(name);
    if (point >= 0) {
        const UNeditPt& known = PointList[static_cast<std::size_t>(point)];
        work.StnE = known.x;
        work.StnN = known.y;
        work.StnZ = known.z;
        work.StnCodeOut.clear();
        return kPositionNotFound;
    }
    return ask_user(0) ? kPositionNotFound : kPositionFailed;
}

int UNeditDatabase::ForwardPass(STNSTRUCT& station, StationWork& work, int report) {
    const int from = PointOf(station.Name);
    for (std::size_t t = 0; t < station.FSList.size(); ++t) {
        SSSTRUCT& target = *station.FSList.at(t);
        if (!work.HeadPrinted && work.Printing) {
            Report->PrintSSHead();
            work.HeadPrinted = true;
        }
        if (AbortRequested()) return 0;
        UpdateProgress(ProgressPercent(++work.StepsDone, work.Steps), kGeneratingGraphics);
        if (!TravPtList.empty() && GetTravPointIdx(std::wstring(target.SSName)) >= 0) {
            const int to = PointOf(target.Name);
            if (from >= 0 && to >= 0 && from != to)
                SaveLine(static_cast<unsigned>(from), static_cast<unsigned>(to), 1);
            continue;
        }
        if (!target.AngleValid) continue;
        double e = 0.0, n = 0.0, z = kNoHeight;
        ReduceTarget(station, target, work, e, n, z);
        if (work.Printing) PrintTarget(station, target, e, n, z, true);
        if (IsSelfObservation(station, target)) continue;
        if (FirstSetupOf(target.Name) != nullptr)
            SetCoordOf(target.Name, e, n, z, target.SSCode, kSetCoordOverwrite, report, 0);
        const int to = PointOf(target.Name);
        if (from >= 0 && to >= 0 && from != to)
            SaveLine(static_cast<unsigned>(from), static_cast<unsigned>(to), 0);
    }
    return 1;
}

int UNeditDatabase::SideShotPass(STNSTRUCT& station, StationWork& work, int report) {
    for (std::size_t t = 0; t < station.SSList.size(); ++t) {
        SSSTRUCT& target = *station.SSList.at(t);
        if (AbortRequested()) return 0;
        UpdateProgress(ProgressPercent(++work.StepsDone, work.Steps), kGeneratingGraphics);
        // A traverse point keeps the position its adjustment gave it.
        if (IsTraversePoint(target.SSName)) continue;
        ArrangePtNames(target.PtNames.begin(), target.PtNames.end());
        if (!work.HeadPrinted && work.Printing) {
            if (work.HasShots) Report->PrintSSHead();
            work.HeadPrinted = true;
        }
        if (report == 1) ProcessChkShot(target.ChkShots, station, work);
        if (!target.AngleValid || target.ForwardFlag) continue;
        double e = 0.0, n = 0.0, z = kNoHeight;
        ReduceTarget(station, target, work, e, n, z);
        if (work.Printing) PrintTarget(station, target, e, n, z, false);
        if (IsSelfObservation(station, target)) continue;
        SetCoordOf(target.Name, e, n, z, target.SSCode, kSetCoordOverwrite, report, 0);
        Arrange_SS_String(std::wstring(target.SSCode), std::wstring(target.SSName));
    }
    return 1;
}

void UNeditDatabase::PrintRunHead() {
    using nedit::Format;
    using nedit::Translate;
    if (!Report->GetHeaderOutputed()) {
        Report->PrintMainReportHead();
        // The corrections of the file are not printed here: the head shows them as zero.
        Report->PrintHeadHDegree(L"HCORR", 0.0, true);
        Report->PrintHeadVDegree(L"VCORR", 0.0);
        Report->PrintEdmHead();
        Report->PrintHeadDVal(L"PRISM", PrismConst);
        Report->WriteText(Format(L"%-29s : %-15.8f", Translate(L"Scale Factor"), ScaleFactor), 0, 1,
                          0);
        Report->SetHeaderOutputed(true);
    }
    if (!Is_Zero(FirstSwing, false))
        Report->PrintHeadHDegree(Translate(L"Swing"), FirstSwing, true);
    if (!DateText.empty()) {
        Report->WriteText(
            Format(L"%s                          : %-s", Translate(L"Date"), DateText), 0, 1, 0);
    }
}

void UNeditDatabase::PrintStationBlock(const STNSTRUCT& station, const StationWork& work) {
    const bool bearing_mode = station.HMode == L'B';
    std::vector<double> back_readings;
    if (!station.BSList.empty()) {
        for (const MEASSTRUCT& measurement : *station.BSList.front()->Meas)
            back_readings.push_back(measurement.HAng);
    }
    Report->PrintOccStnBlk(
        back_readings, std::wstring(station.StnName), work.StnE, work.StnN, work.StnZ,
        std::wstring(station.StnCode), station.HtInst, StnScaleFactor(station.Name),
        bearing_mode ? std::wstring() : std::wstring(station.BkStnName),
        bearing_mode ? 0.0 : work.BackBearing, bearing_mode ? 0.0 : work.BsReading);
    if (!Is_Zero(station.Swing - FirstSwing, false))
        Report->PrintHeadHDegree(L"Swing", station.Swing, true);
}

void UNeditDatabase::PrintTarget(const STNSTRUCT& station, const SSSTRUCT& target, double e,
                                 double n, double z, bool forward) {
    using nedit::Format;
    using nedit::Translate;
    const bool self = IsSelfObservation(station, target);
    if (self) {
        Report->WriteText(
            forward ? Translate(L"   *** Observation to the station itself not processed  ***")
                    : Format(L"   *** %s  ***",
                             Translate(L"Observation to the station itself not processed")),
            0, 1, 0);
    }
    const MeasurementList& measurements = *target.Meas;
    const std::wstring name(target.SSName);
    if (measurements.size() >= 2) {
        for (const MEASSTRUCT& m : measurements) {
            Report->PrintSSLine(name, m.HAng, m.VAng, m.SDist, m.HtTarget, 0.0, 0.0, 0.0, L"", 0,
                                false);
        }
    }
    Report->PrintSSLine((measurements.size() >= 2 ? L"*" : L"") + name, target.HAng, target.VAng,
                        target.SDist, target.HtTarget, e, n, z, std::wstring(target.SSCode),
                        target.RecordNo, true);
    if (!Is_Zero(target.OffsetAlong, false) || !Is_Zero(target.OffsetRight, false) ||
        !Is_Zero(target.OffsetUp, false)) {
        Report->PrintOffset(target.OffsetAlong, target.OffsetRight, target.OffsetUp);
    }
    if (self)
        Report->WriteText(L"   ****************************************************************", 0,
                          1, 0);
}

bool UNeditDatabase::HaveSideshotsToReport(const STNSTRUCT* station,
                                           const std::vector<std::wstring>* /*records*/) const {
    if (station == nullptr) return false;
    for (const auto& target : station->SSList) {
        if (IsTraversePoint(target->SSName)) continue;
        if (!target->PtNames.empty() || !target->ChkShots.empty()) return true;
        if (target->AngleValid && !target->ForwardFlag) return true;
    }
    return false;
}
