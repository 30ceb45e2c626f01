// Check shots: an observation of a known point, marked by the check code in its code field.
// It makes no point and no line: it is reduced as a side shot would be, compared with the
// known coordinates, and the differences are printed and kept for the run's results. The
// system judges nothing: there are no tolerances, only differences.

#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWLine.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "reduction/StationWork.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

bool UNeditDatabase::IsCheckShot(int type, std::wstring_view code) const {
    return (type == rec::Ss || type == rec::Ss2) && !ChkShotCode.empty() &&
           code.find(ChkShotCode) != std::wstring_view::npos;
}

void UNeditDatabase::TakeCheckShot(const SSSTRUCT& target, const MEASSTRUCT& measurement) {
    CurStn->HasCheck = true;
    if (!CurChkList) CurChkList = std::make_unique<std::vector<SSCheck>>();
    SSCheck check;
    check.SSName = std::wstring(target.SSName);
    check.SSCode = std::wstring(target.SSCode);
    check.HAng = measurement.HAng;
    check.VAng = measurement.VAng;
    // Each check is one record, never meaned: face 2 is folded to face 1 here.
    if (check.VAng > 180.0 && check.VAng < 360.0) {
        check.VAng = 360.0 - check.VAng;
        check.HAng = chgface(check.HAng);
    }
    check.SDist = measurement.SDist;
    check.HtTarget = measurement.HtTarget;
    check.RecordNo = target.RecordNo;
    CurChkList->push_back(std::move(check));
    // An Offset record that follows belongs to this check shot.
    CurSS = nullptr;
}

bool UNeditDatabase::GetChkPtName(const std::wstring& code, std::wstring& name) const {
    if (code.empty() || ChkCode.empty()) return false;
    const std::size_t at = code.find(ChkCode);
    if (at == std::wstring::npos) return false;
    std::wstring rest = nedit::Trim(code.substr(at + ChkCode.size()));
    rest = nedit::Trim(rest.substr(0, rest.find(SvyCodeCtrl.Separator())));
    if (rest.empty()) return false;
    name = rest;
    return true;
}

void UNeditDatabase::ProcessChkShot(const SparseList<SSCheck>& checks, const STNSTRUCT& station,
                                    const StationWork& work) {
    for (const SSCheck& check : checks) PrintChkShot(station, work, check);
}

void UNeditDatabase::PrintChkShot(const STNSTRUCT& station, const StationWork& work,
                                  const SSCheck& check) {
    if (Report == nullptr) return;
    const double zenith = check.VAng * kRadiansPerDegree;
    const double horizontal = std::sin(zenith) * check.SDist + PrismConst;
    const double vertical = std::cos(zenith) * check.SDist;
    const double theta =
        station.HMode == L'B' ? check.HAng : work.BackBearing + check.HAng - work.BsReading;
    double e = std::sin(theta * kRadiansPerDegree) * horizontal + work.StnE;
    double n = std::cos(theta * kRadiansPerDegree) * horizontal + work.StnN;
    double z =
        work.StnZ > kNoHeight ? vertical + work.StnZ + station.HtInst - check.HtTarget : work.StnZ;
    const bool offsets = !Is_Zero(check.OffsetAlong, false) || !Is_Zero(check.OffsetRight, false) ||
                         !Is_Zero(check.OffsetUp, false);
    if (offsets) ApplyOffsets(e, n, z, check.OffsetAlong, check.OffsetRight, check.OffsetUp, theta);
    if (work.Printing) {
        Report->PrintChkStn(check.SSName, check.HAng, check.VAng, check.SDist, check.HtTarget,
                            check.SSCode, check.RecordNo);
        if (offsets) Report->PrintOffset(check.OffsetAlong, check.OffsetRight, check.OffsetUp);
    }
    CheckResult result;
    result.Station = std::wstring(station.StnName);
    result.Id = check.SSName;
    result.KnownName = check.SSName;
    GetChkPtName(check.SSCode, result.KnownName);
    result.E = e;
    result.N = n;
    result.H = z;
    std::wstring code;
    const NameId known = NameOf(result.KnownName);
    result.Known =
        FindCoordOf(known, result.KnownE, result.KnownN, result.KnownH, code, 1, true) != 0 ||
        GetCoordOf(known, &result.KnownE, &result.KnownN, &result.KnownH, code, 1, true) != 0;
    if (!result.Known) {
        if (work.Printing) {
            Report->WriteText(
                nedit::Translate(L"Check point {1} coordinates not known.", {result.KnownName}), 0,
                1, 0);
        }
        CheckResults.push_back(std::move(result));
        return;
    }
    const UWLine to_known(UWPoint(work.StnE, work.StnN, work.StnZ),
                          UWPoint(result.KnownE, result.KnownN, result.KnownH));
    result.Bearing = std::fmod(theta, 360.0);
    result.KnownBearing = to_known.Bearing();
    result.BearingDiff = std::fmod(theta - result.KnownBearing, 360.0);
    result.Distance = horizontal;
    result.KnownDistance = to_known.Length(false);
    result.DistanceDiff = horizontal - result.KnownDistance;
    if (work.Printing) {
        Report->PrintChkStnBlk(result.Station, result.Id, e, n, z, result.KnownE, result.KnownN,
                               result.KnownH, result.Bearing, result.KnownBearing,
                               result.BearingDiff, result.Distance, result.KnownDistance,
                               result.DistanceDiff);
    }
    CheckResults.push_back(std::move(result));
}
