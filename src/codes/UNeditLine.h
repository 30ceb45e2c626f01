#pragma once
// A line between two reduced points: an observation or traverse leg, or a line of a string.

#include <string>

#include "codes/UNeditPt.h"
#include "platform/geometry/UWLine.h"

class UNeditLine : public UWLine {
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
    int GetColor() const { return Color; }
    void SetColor(int color) { Color = color; }
    const std::wstring& GetLayer() const { return Layer; }
    void SetLayer(const std::wstring& layer) { Layer = layer; }
    int GetLineType() const { return LineType; }
    void SetLineType(int type) { LineType = type; }
    int GetThickness() const { return Thickness; }
    void SetThickness(int thickness) { Thickness = thickness; }
    const std::wstring& GetCode() const { return Code; }
    void SetCode(const std::wstring& code) { Code = code; }
    const std::wstring& GetStringNo() const { return StringNo; }
    void SetStringNo(const std::wstring& name) { StringNo = name; }

private:
    int StationLine = 0;
    std::wstring FromPt;
    std::wstring ToPt;
    int Color = 15;
    std::wstring Layer;
    int LineType = 0;
    int Thickness = 0;
    std::wstring Code;
    std::wstring StringNo;
};
