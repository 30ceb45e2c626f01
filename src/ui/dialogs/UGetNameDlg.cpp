#include "ui/dialogs/UGetNameDlg.h"

#include <algorithm>

#include "platform/text/WideText.h"

namespace nedit {

UGetNameDlg::UGetNameDlg(Mode mode, std::vector<std::wstring> names, std::wstring name)
    : Name(std::move(name)), Which(mode), Names(std::move(names)) {}

std::wstring UGetNameDlg::DialogName() const {
    return Which == Mode::Open ? L"Open Raw Data" : L"Save Raw Data As";
}

bool UGetNameDlg::OnOK() {
    Name = Trim(Name);
    if (Name.empty()) return false;
    if (Which == Mode::Open) return std::find(Names.begin(), Names.end(), Name) != Names.end();
    return Name.size() <= kMaxName && Name.find_first_of(L"/\\") == std::wstring::npos;
}

}  // namespace nedit
