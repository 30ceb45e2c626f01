#pragma once
// An arc through or about reduced points, as a string of survey codes draws it.

#include <string>

#include "codes/UNeditLinework.h"
#include "codes/UNeditPt.h"
#include "platform/geometry/UWArc.h"

class UNeditArc : public UWArc, public UNeditLinework {
  public:
    UNeditArc() = default;
    /// From the three points' coordinates and names; `type` says how the third is read.
    UNeditArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third, ArcType type)
        : UWArc(first, second, third, type),
          StartPt(first.GetID()),
          EndPt(second.GetID()),
          ThirdPt(third.GetID()) {}
    virtual ~UNeditArc() = default;
    UNeditArc(const UNeditArc&) = default;
    UNeditArc& operator=(const UNeditArc&) = default;

    const std::wstring& GetStartPt() const { return StartPt; }
    const std::wstring& GetEndPt() const { return EndPt; }
    const std::wstring& GetThirdPt() const { return ThirdPt; }

  private:
    std::wstring StartPt;
    std::wstring EndPt;
    std::wstring ThirdPt;
};
