#include "instruments/ULoadRawDlg.h"

#include "instruments/PortStores.h"
#include "instruments/UDeviceManager.h"
#include "platform/text/WideText.h"

ULoadRawDlg::ULoadRawDlg(UDeviceManager* manager) : DeviceManager(manager) {}

void ULoadRawDlg::OnInitDialog() {
    Names.clear();
    if (DeviceManager != nullptr) DeviceManager->GetNameList(Names);
    const std::wstring last = nedit::InstrumentProfile().ReadInstrument();
    int found = -1;
    for (std::size_t i = 0; i < Names.size() && found < 0; ++i) {
        if (nedit::EqualsIgnoreCase(nedit::Left(Names[i], last.size()), last))
            found = static_cast<int>(i);
    }
    OnSelchangeList(found);
}

void ULoadRawDlg::OnSelchangeList(int index) {
    Selected = index >= 0 && index < static_cast<int>(Names.size()) ? index : -1;
    Details = Selected >= 0 && DeviceManager != nullptr
                  ? DeviceManager->GetDeviceDescription(Names[static_cast<std::size_t>(Selected)])
                  : std::wstring();
}

int ULoadRawDlg::OnButton(int id) {
    if (Selected >= 0) {
        Device = Names[static_cast<std::size_t>(Selected)];
        nedit::InstrumentProfile().WriteInstrument(Device);
    }
    EndCode = id;
    return id;
}
