#include "ui/dialogs/UEditRecordDlg.h"

namespace nedit {

bool UEditRecordDlg::LoadRecord(const std::wstring& text) {
    Record = RecordFields::Split(text);
    return !Record.fields.empty();
}

}  // namespace nedit
