#pragma once
// "Report Parameters": the user's choice of output units and columns for the next run.
// The dialog works on a copy of the document's block; its owner copies it back after OK.

#include <string>

#include "platform/messages/DialogHost.h"
#include "report/OutParamStruct.h"

class UOutputParamDlg : public nedit::UDialogLogic {
  public:
    static constexpr int kDialogId = 8012;

    explicit UOutputParamDlg(const OutParamStruct& parameters);

    std::wstring DialogName() const override { return L"Report Parameters"; }
    /// Takes the radios and boxes into the block and stores the columns as NEDIT.INI's ORDER.
    bool OnOK() override;

    /// Radio index of "DDD MM SS", "Decimal Degree", "Gon"; and of "Meters", "Feet" (US feet
    /// show as feet: there is no third linear radio).
    int AngularRadio = 0;
    int LinearRadio = 0;
    /// The twelve column boxes, by option id.
    bool IsChecked(int option) const { return GetCheckOn(Parameters, option) != 0; }
    void SetChecked(int option, bool on);

    const OutParamStruct& GetParameters() const { return Parameters; }

  private:
    OutParamStruct Parameters;
};
