#include "traverse/UMisReportDlg.h"

#include "platform/messages/Translate.h"
#include "traverse/CTraverse.h"

void UMisReportDlg::OnInitDialog() {
    AngleEnabled = Traverse.GetParams().AdjustAngle != 0 ? 1 : 0;
    Title = nedit::Translate(L"Unadjusted traverse");
}

bool UMisReportDlg::IsEnabled(int control) const {
    if (control == kAnglesButton) return AngleEnabled != 0;
    if (control == kAngularErrorField || control == kPerStationField) return AngularShown;
    return true;
}

void UMisReportDlg::OnAngleAdjust() {
    if (Traverse.AdjustAngles(Traverse.GetParams()) == 1) {
        nedit::AppMessageBox(Traverse.GetHost(), nedit::Translate(L"No angle misclosure."),
                             nedit::mb::Ok);
        return;
    }
    Title = nedit::Translate(L"Traverse after angle adjustment");
}

void UMisReportDlg::OnCoordinateAdjust() {
    if (AngleEnabled != 0 && !Traverse.IsAngleAdjusted())
        Traverse.AdjustAngles(Traverse.GetParams());
    Traverse.AdjustCoords(Traverse.GetParams(), GetAdjustElevations());
    Title = nedit::Translate(L"Results after coordinate adjustment");
    AngularShown = false;
}
