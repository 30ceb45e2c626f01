#pragma once
// "Load Raw File Entry" (dialog 8008): the instrument whose driver reads a raw file. The
// dialog ends with the button that ended it: kImport, kImportFromDevice (hidden), or
// Cancel; Enter does nothing. The instrument chosen is remembered in the profile's
// "Instrument" entry, and the next dialog starts on the first name that begins with it.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

class UDeviceManager;

class ULoadRawDlg : public nedit::UDialogLogic {
  public:
    static constexpr int kResourceId = 8008;
    static constexpr int kInstrumentList = 1100;
    static constexpr int kDetails = 1101;
    static constexpr int kImport = 1102;
    static constexpr int kImportFromDevice = 1007;

    /// `manager` gives the instruments; not owned, may be null.
    explicit ULoadRawDlg(UDeviceManager* manager);

    std::wstring DialogName() const override { return L"Load Raw File Entry"; }
    /// Fills the list, selects the remembered instrument and shows its description.
    void OnInitDialog() override;
    /// Enter: the dialog stays.
    bool OnOK() override { return false; }

    /// The selection moved to row `index` (-1 for none).
    void OnSelchangeList(int index);
    /// "Import..." or "Import from Device...": with an instrument selected it becomes Device
    /// and is remembered. Gives the button's id, the end code of the dialog.
    int OnButton(int id);

    const std::vector<std::wstring>& GetNames() const { return Names; }
    int GetSelected() const { return Selected; }
    /// The text of "Driver details".
    const std::wstring& GetDetails() const { return Details; }
    /// The end code: kImport, kImportFromDevice, or mb::IdCancel before a button.
    int GetEndCode() const { return EndCode; }

    std::wstring Device;

  private:
    UDeviceManager* DeviceManager;
    std::vector<std::wstring> Names;
    int Selected = -1;
    std::wstring Details;
    int EndCode = nedit::mb::IdCancel;
};
