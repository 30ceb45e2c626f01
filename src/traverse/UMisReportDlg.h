#pragma once
// "Traverse Misclose Report": how far a traverse misses its fixed end, after each stage, with
// the buttons that adjust it. The logic is here; a DialogHost shows it. Its fields are the
// figures the computation last filled (MiscloseFigures); a face formats them by the job's settings
// (coordinates, bearings, distances, angles, areas) and shows the title of the stage reached.

#include <string>

#include "platform/messages/DialogHost.h"

class CTraverse;

/// How far a traverse misses its fixed end, as the misclose report shows it.
struct MiscloseFigures {
    std::wstring FixedID;
    double FixedE = 0.0;
    double FixedN = 0.0;
    double FixedH = 0.0;
    std::wstring ObservedID;
    double ObservedE = 0.0;
    double ObservedN = 0.0;
    double ObservedH = 0.0;
    /// Fixed minus observed.
    double DiffE = 0.0;
    double DiffN = 0.0;
    double DiffH = 0.0;
    /// From the observed to the fixed point, and its horizontal length.
    double MiscloseBearing = 0.0;
    double MiscloseDist = 0.0;
    double AngularError = 0.0;
    double PerStation = 0.0;
    double EnclosedArea = 0.0;
    std::wstring Accuracy;
    double TraverseLength = 0.0;
    /// The number of legs.
    long Setups = 0;
};

class UMisReportDlg : public nedit::UDialogLogic, public MiscloseFigures {
  public:
    static constexpr int kDialogId = 8041;
    // Controls the logic enables and disables.
    static constexpr int kAnglesButton = 1007;
    static constexpr int kCoordinatesButton = 1103;
    static constexpr int kAngularErrorField = 1078;
    static constexpr int kPerStationField = 1082;

    /// The dialog of `traverse`, whose stages its buttons run.
    explicit UMisReportDlg(CTraverse& traverse) : Traverse(traverse) {}

    /// The title of the stage shown: "Unadjusted traverse" once opened.
    std::wstring DialogName() const override { return Title; }
    /// "Angles" is enabled only when the route dialog asked for an angle check.
    void OnInitDialog() override;

    /// "Angles": the angle stage on the misclose left; may be pressed again.
    void OnAngleAdjust();
    /// "Coordinates": the angle stage first when it is asked for and not done, then the
    /// coordinate stage; the angular fields are blanked and disabled afterwards.
    void OnCoordinateAdjust();
    /// The box "Adjust Elevations".
    void OnAdjustElevations(bool checked) { AdjustElevations = checked ? 1 : 0; }
    bool GetAdjustElevations() const { return AdjustElevations != 0; }

    bool IsEnabled(int control) const;
    /// The angular fields are blank after the coordinate stage.
    bool AngularFieldsShown() const { return AngularShown; }
    const CTraverse& GetTraverse() const { return Traverse; }

    /// Set when the route dialog asked for an angle check.
    int AngleEnabled = 0;
    int AdjustElevations = 0;

  private:
    CTraverse& Traverse;
    std::wstring Title = L"Traverse Misclose Report";
    bool AngularShown = true;
};
