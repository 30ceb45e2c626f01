#include "codes/UNeditPt.h"

UNeditPt::UNeditPt(const UWPoint& point, const std::wstring& id, unsigned flags)
    : UWPoint(point), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(const UWVector& vector, const std::wstring& id, unsigned flags)
    : UWPoint(vector.x, vector.y, vector.z), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(double east, double north, const std::wstring& id, unsigned flags)
    : UWPoint(east, north, 0.0), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(const std::wstring& id, double east, double north, double height,
                   const std::wstring& code, unsigned flags)
    : UWPoint(east, north, height), ID(id), Code(code), Flags(flags) {}

void UNeditPt::SetImage(double number1, double number2, const std::wstring& file) {
    Images.push_back({file, number1, number2});
}

bool UNeditPt::SetPointAttribute(const std::wstring& name, const std::wstring& type,
                                 const std::wstring& value) {
    if (name.empty()) return false;
    Attributes.push_back({name, type, value});
    return true;
}
