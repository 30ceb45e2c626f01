#pragma once
// "Point Code": the user's choices for a transfer, with a check box for each of the first six
// members of StringTransferSettings. OK keeps them as the last used values.

#include <string>

#include "platform/messages/DialogHost.h"
#include "transfer/StringTransferSettings.h"

class UToSvyDlg : public nedit::UDialogLogic {
  public:
    explicit UToSvyDlg(const StringTransferSettings& settings) : Settings(settings) {}

    std::wstring DialogName() const override { return L"Point Code"; }
    /// Keeps the choices as the last used values. A profile that cannot be written does not
    /// stop the transfer: the choices still hold for it.
    bool OnOK() override;

    StringTransferSettings Settings;
};
