#include "report/UOutputParamDlg.h"

#include "report/NeditIni.h"

UOutputParamDlg::UOutputParamDlg(const OutParamStruct& parameters) : Parameters(parameters) {
    AngularRadio =
        parameters.AngularUnit == 1 || parameters.AngularUnit == 2 ? parameters.AngularUnit : 0;
    LinearRadio = parameters.LinearUnit == 1 || parameters.LinearUnit == 2 ? 1 : 0;
}

void UOutputParamDlg::SetChecked(int option, bool on) {
    if (int* flag = ColumnFlag(Parameters, option)) *flag = on ? 1 : 0;
}

bool UOutputParamDlg::OnOK() {
    Parameters.AngularUnit = AngularRadio;
    Parameters.LinearUnit = LinearRadio;
    nedit::WriteOrderKey(OrderText(Parameters));
    return true;
}
