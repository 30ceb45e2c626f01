#include "codes/UNeditPt.h"

const std::wstring UNeditPt::Extras::kNone;
const std::vector<UAttachedImageFile> UNeditPt::Extras::kNoImages;
const std::vector<UAttributeObject> UNeditPt::Extras::kNoAttributes;

namespace {

std::shared_ptr<const std::wstring> CodeText(const std::wstring& code) {
    return code.empty() ? nullptr : std::make_shared<const std::wstring>(code);
}

}  // namespace

UNeditPt::UNeditPt(const UWPoint& point, const std::wstring& id, unsigned flags)
    : UWPoint(point), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(const UWVector& vector, const std::wstring& id, unsigned flags)
    : UWPoint(vector.x, vector.y, vector.z), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(double east, double north, const std::wstring& id, unsigned flags)
    : UWPoint(east, north, 0.0), ID(id), Flags(flags) {}

UNeditPt::UNeditPt(const std::wstring& id, double east, double north, double height,
                   const std::wstring& code, unsigned flags)
    : UNeditPt(id, east, north, height, CodeText(code), flags) {}

UNeditPt::UNeditPt(const std::wstring& id, double east, double north, double height,
                   std::shared_ptr<const std::wstring> code, unsigned flags)
    : UWPoint(east, north, height), ID(id), Code(std::move(code)), Flags(flags) {
    if (Code && Code->empty()) Code.reset();
}

UNeditPt::UNeditPt(const UNeditPt& other)
    : UWPoint(other),
      ID(other.ID),
      Code(other.Code),
      Color(other.Color),
      Marker(other.Marker),
      ContourFlag(other.ContourFlag),
      PtFlag(other.PtFlag),
      Flags(other.Flags),
      More(other.More ? std::make_unique<Extras>(*other.More) : nullptr) {}

UNeditPt& UNeditPt::operator=(const UNeditPt& other) {
    if (this != &other) *this = UNeditPt(other);
    return *this;
}

UNeditPt::Extras& UNeditPt::Extra() {
    if (!More) More = std::make_unique<Extras>();
    return *More;
}

void UNeditPt::SetImage(double number1, double number2, const std::wstring& file) {
    Extra().Images.push_back({file, number1, number2});
}

bool UNeditPt::SetPointAttribute(const std::wstring& name, const std::wstring& type,
                                 const std::wstring& value) {
    if (name.empty()) return false;
    Extra().Attributes.push_back({name, type, value});
    return true;
}
