#pragma once
// An arc through or about reduced points, as a string of survey codes draws it.

#include <string>

#include "codes/UNeditPt.h"
#include "platform/geometry/UWArc.h"

class UNeditArc : public UWArc {
public:
    UNeditArc() = default;
    /// From the three points' coordinates and names; `type` says how the third is read.
    UNeditArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third, ArcType type)
        : UWArc(first, second, third, type),
          StartPt(first.GetID()), EndPt(second.GetID()), ThirdPt(third.GetID()) {}
    virtual ~UNeditArc() = default;
    UNeditArc(const UNeditArc&) = default;
    UNeditArc& operator=(const UNeditArc&) = default;

    const std::wstring& GetStartPt() const { return StartPt; }
    const std::wstring& GetEndPt() const { return EndPt; }
    const std::wstring& GetThirdPt() const { return ThirdPt; }
    int GetColor() const { return Color; }
    void SetColor(int color) { Color = color; }
    const std::wstring& GetCode() const { return Code; }
    void SetCode(const std::wstring& code) { Code = code; }
    const std::wstring& GetLayer() const { return Layer; }
    void SetLayer(const std::wstring& layer) { Layer = layer; }
    int GetLineType() const { return LineType; }
    void SetLineType(int type) { LineType = type; }
    int GetThickness() const { return Thickness; }
    void SetThickness(int thickness) { Thickness = thickness; }
    const std::wstring& GetStringNo() const { return StringNo; }
    void SetStringNo(const std::wstring& name) { StringNo = name; }

private:
    std::wstring StartPt;
    std::wstring EndPt;
    std::wstring ThirdPt;
    int Color = 15;
    std::wstring Code;
    std::wstring Layer;
    int LineType = 0;
    int Thickness = 0;
    std::wstring StringNo;
};
