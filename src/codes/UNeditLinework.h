#pragma once
// What a line or an arc of a run takes from its survey code: colour, layer, line type,
// thickness, the feature code and the string it belongs to.

#include <string>

class UNeditLinework {
  public:
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
    int Color = 15;
    std::wstring Layer;
    int LineType = 0;
    int Thickness = 0;
    std::wstring Code;
    std::wstring StringNo;
};
