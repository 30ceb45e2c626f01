#include "transfer/UToSvyDlg.h"

bool UToSvyDlg::OnOK() {
    SetStringTransferSettings(Settings);
    return true;
}
