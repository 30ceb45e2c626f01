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
    picture.HMode = point.HMode;
    picture.VMode = point.VMode;
    picture.AngleUnit = point.AngleUnit;
    picture.LengthUnit = point.LengthUnit;
    picture.Name = point.Name;
    return StationRef(&picture);
}
