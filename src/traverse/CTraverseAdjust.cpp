// The adjusting stages of a traverse: the angles, then the coordinates by the Compass or the
// Transit rule. The start never moves; the fixed end is what the last entry is brought to.

#include <cmath>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/geometry/UWBrgDst.h"
#include "platform/geometry/UWLine.h"
#include "platform/messages/Translate.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"
#include "traverse/CTraverse.h"

namespace {

/// The bearing of the way back along a leg of `bearing`.
double Reverse(double bearing) {
    bearing += 180.0;
    return bearing >= 360.0 ? bearing - 360.0 : bearing;
}

}  // namespace

UWTraverse CTraverse::Positions() const {
    UWTraverse positions;
    for (const CTravStn& entry : Route) positions.Add(UWPoint(entry.X, entry.Y, entry.Z));
    return positions;
}

int CTraverse::AdjustAngles(TraverseParams& params) {
    if (Is_Zero(AngMisclose, false)) return 1;
    StartAtStart(params);
    PrintHead(nedit::Translate(L"Traverse after angle adjustment"), false);
    UWTraverse positions = Positions();
    positions.AngleAdjustment(AngMisclose * -1.0, StartBearing);
    UNeditReport* report = Db->GetReport();
    double back = StartBearing;
    for (std::size_t i = 0; i + 1 < Route.size(); ++i) {
        CTravStn& entry = Route[i];
        CTravStn& next = Route[i + 1];
        const int code = CheckLeg(entry, entry.SS);
        if (code != 0) return Fail(code);
        const UWPoint& ahead = positions[static_cast<int>(i) + 1];
        const UWBrgDst leg(UWPoint(entry.X, entry.Y, entry.Z), ahead);
        double angle = leg.bearing - back;
        if (angle < 0.0) angle += 360.0;
        angle = std::fmod(angle, 360.0);
        // The height is carried by the observation, not by the rebuilt leg.
        const SSSTRUCT& shot = *entry.SS;
        double height = std::cos(shot.VAng * kRadiansPerDegree) * shot.SDist + entry.Z +
                        entry.Stn->HtInst - shot.HtTarget;
        if (Is_Zero(entry.Z - kNoHeight, false)) height = kNoHeight;
        if (report != nullptr)
            report->PrintLine(std::wstring(shot.SSName), angle, leg.bearing, leg.distance, ahead.x,
                              ahead.y, height, false, 0.0);
        entry.Dist = leg.distance;
        Length += leg.distance;
        next.X = ahead.x;
        next.Y = ahead.y;
        next.Z = height;
        back = Reverse(leg.bearing);
    }
    AngleAdjusted = true;
    PrintFixed(params);
    ComputeMisclose(params, kAfterAngles);
    return kDone;
}

int CTraverse::AdjustCoords(TraverseParams& params, bool adjustElev) {
    if (params.UseBSCoord != 0) {
        double e = 0.0, n = 0.0, z = kNoHeight;
        std::wstring code;
        if (Db->findCoord(params.BSName, e, n, z, code, 1, false))
            Db->setCoord(params.BSName, params.BSX, params.BSY, z, code,
                         UNeditDatabase::kSetCoordOverwrite, 1, 0);
    }
    if (Is_Zero(MiscloseX, false) && Is_Zero(MiscloseY, false) && Is_Zero(MiscloseZ, false)) {
        nedit::AppMessageBox(GetHost(),
                             nedit::Translate(L"No misclosure. The traverse will not be adjusted."),
                             nedit::mb::Ok);
        return kDone;
    }
    Method = params.Transit != 0 ? kTransit : kCompass;
    PrintHead(nedit::Translate(Method == kTransit
                                   ? L"Results after coordinate adjustment (Transit Rule)"
                                   : L"Results after coordinate adjustment (Compass Rule)"),
              adjustElev);
    double back = StartBearing;
    Length = 0.0;
    UWTraverse positions = Positions();
    UNeditReport* report = Db->GetReport();
    if (positions.GetSize() >= 2) {
        const UWPoint fixed(params.FixedX, params.FixedY, params.FixedZ);
        // A degenerate traverse is left as it is; its positions are still written back.
        if (Method == kTransit) {
            positions.TransitAdjustment(fixed, adjustElev);
        } else {
            positions.CompassAdjustment(fixed, adjustElev);
        }
        for (std::size_t i = 0; i < Route.size(); ++i) {
            CTravStn& entry = Route[i];
            const double old_height = entry.Z;
            const UWPoint& adjusted = positions[static_cast<int>(i)];
            entry.X = adjusted.x;
            entry.Y = adjusted.y;
            entry.Z = adjusted.z;
            Db->setCoord(entry.Name, entry.X, entry.Y, entry.Z, L"",
                         UNeditDatabase::kSetCoordOverwrite, 1, 1);
            if (i == 0) continue;
            const CTravStn& previous = Route[i - 1];
            const UWLine leg(UWPoint(previous.X, previous.Y, previous.Z), adjusted);
            double bearing = leg.Bearing();
            const double length = leg.Length(false);
            if (bearing < back) bearing += 360.0;
            Length += length;
            if (report != nullptr)
                report->PrintLine(entry.Name, bearing - back, bearing, length, entry.X, entry.Y,
                                  entry.Z, adjustElev && entry.Z > kNoHeight, entry.Z - old_height);
            back = Reverse(bearing);
        }
    }
    CoordAdjusted = true;
    PrintFixed(params);
    if (report != nullptr) report->NewLines(1);
    ComputeMisclose(params, kAfterCoordinates);
    return 1;
}
