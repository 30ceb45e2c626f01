#pragma once
// The user's input to one traverse computation: the parameters of the route dialog that the
// computation reads. Angles and bearings in degrees, coordinates in the job's length unit.

#include <string>

struct TraverseParams {
    double StartX = 0.0;
    double StartY = 0.0;
    double StartZ = 0.0;
    /// The back sight of the start, and whether the start bearing comes from its coordinates.
    std::wstring BSName;
    int UseBSCoord = 0;
    double BSX = 0.0;
    double BSY = 0.0;
    /// Bearing from the start to its back sight.
    double StartBearing = 0.0;
    /// The known closing point and its coordinates.
    std::wstring FixedPt;
    double FixedX = 0.0;
    double FixedY = 0.0;
    double FixedZ = 0.0;
    /// An angle check at the closing station: the point observed from it, and the known
    /// bearing to it, or the coordinates that give that bearing.
    int AdjustAngle = 0;
    std::wstring ChkPt;
    int UseCloseCoord = 1;
    double CloseX = 0.0;
    double CloseY = 0.0;
    double CloseBearing = 0.0;
    /// Non-zero: the Transit rule; zero: the Compass rule.
    int Transit = 0;
};
