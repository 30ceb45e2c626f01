#pragma once
// "Back Bearing": the user gives the back station's coordinates, or, with "Apply Bearing"
// ticked, the bearing to it. It has OK only; whatever stands in its fields is taken.

#include <string>

#include "platform/messages/DialogHost.h"

class UBKBCoordDlg : public nedit::UDialogLogic {
  public:
    static constexpr int kDialogId = 8035;

    explicit UBKBCoordDlg(const std::wstring& pointName) : PointName(pointName) {}

    std::wstring DialogName() const override { return L"Back Bearing"; }

    const std::wstring& GetPointName() const { return PointName; }
    /// With the box clear the coordinates can be edited and the bearing cannot; set, the reverse.
    bool AreCoordinatesEditable() const { return !ApplyBearing; }
    bool IsBearingEditable() const { return ApplyBearing; }

    double East = 0.0;
    double North = 0.0;
    double Height = 0.0;
    double Bearing = 0.0;
    bool ApplyBearing = false;

  private:
    std::wstring PointName;
};
