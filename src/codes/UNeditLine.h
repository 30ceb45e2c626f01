#pragma once
// A line between two reduced points: an observation or traverse leg, or a line of a string.

#include <string>

#include "codes/UNeditLinework.h"
#include "codes/UNeditPt.h"
#include "platform/geometry/UWLine.h"

class UNeditLine : public UWLine, public UNeditLinework {
  public:
    UNeditLine() = default;
    /// From `from` to `to`, with their coordinates and names.
    UNeditLine(const UNeditPt& from, const UNeditPt& to)
        : UWLine(from, to), FromPt(from.GetID()), ToPt(to.GetID()) {}
    virtual ~UNeditLine() = default;
    UNeditLine(const UNeditLine&) = default;
    UNeditLine& operator=(const UNeditLine&) = default;

    int GetStationLine() const { return StationLine; }
    void SetStationLine(int value) { StationLine = value; }
    const std::wstring& GetFromPt() const { return FromPt; }
    const std::wstring& GetToPt() const { return ToPt; }

  private:
    int StationLine = 0;
    std::wstring FromPt;
    std::wstring ToPt;
};
