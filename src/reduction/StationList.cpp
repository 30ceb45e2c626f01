#include "reduction/StationList.h"

StationRef StationList::operator[](std::size_t at) const {
    const NodeEntry& entry = Nodes[at];
    if (!entry.IsPointOnly()) return StationRef(&Setups[entry.Index()]);
    const PointNode& point = Points[entry.Index()];
    STNSTRUCT& picture = Pictures.emplace_back();
    picture.StnName = Names.Name(point.Name);
    if (point.Code != kNoName) picture.StnCode = Codes.Name(point.Code);
    picture.East = point.East;
    picture.North = point.North;
    picture.Height = point.Height;
    picture.CoordKnown = 1;
    picture.PointOnly = 1;
    picture.CoordFixed = point.CoordFixed;
    const ModeSet& modes = Modes[point.Modes];
    picture.HMode = modes[0];
    picture.VMode = modes[1];
    picture.AngleUnit = modes[2];
    picture.LengthUnit = modes[3];
    picture.Name = point.Name;
    return StationRef(&picture);
}
