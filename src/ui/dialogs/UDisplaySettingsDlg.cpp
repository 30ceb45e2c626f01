#include "ui/dialogs/UDisplaySettingsDlg.h"

namespace nedit {

UDisplaySettingsDlg::UDisplaySettingsDlg(UNeditSettings& settings) : Settings(settings) {
    OnInitDialog();
}

void UDisplaySettingsDlg::OnInitDialog() {
    for (const UNeditSettings::Id id : kAll) SetValue(id, Settings.Get(id));
}

bool UDisplaySettingsDlg::OnOK() {
    for (const UNeditSettings::Id id : kAll) {
        if (Settings.Get(id) == GetValue(id)) continue;
        Settings.Set(id, GetValue(id));
        Changed = true;
    }
    return true;
}

const wchar_t* UDisplaySettingsDlg::Label(UNeditSettings::Id id) {
    switch (id) {
        case UNeditSettings::ShowPoints:
            return L"Points";
        case UNeditSettings::ShowLines:
            return L"Lines";
        case UNeditSettings::ShowSymbols:
            return L"Symbols";
        case UNeditSettings::ShowLineStyles:
            return L"Line Styles";
        case UNeditSettings::ShowPointNumbers:
            return L"Point Numbers";
        case UNeditSettings::ShowPointCodes:
            return L"Point Codes";
        default:
            return L"Display Text Size";
    }
}

bool UDisplaySettingsDlg::IsEditable(UNeditSettings::Id id) {
    return id == UNeditSettings::ShowPointNumbers || id == UNeditSettings::ShowPointCodes ||
           id == UNeditSettings::TextSize;
}

}  // namespace nedit
