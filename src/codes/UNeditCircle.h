#pragma once
// A circle that a circle command of the field codes made, with the feature code of the group
// that asked for it.

#include <string>

#include "platform/geometry/UWCircle.h"

class UNeditCircle : public UWCircle {
  public:
    UNeditCircle() = default;
    UNeditCircle(const UWCircle& circle, const std::wstring& code) : UWCircle(circle), Code(code) {}
    const std::wstring& GetCode() const { return Code; }

  private:
    std::wstring Code;
};
