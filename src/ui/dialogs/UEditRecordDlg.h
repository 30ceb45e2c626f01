#pragma once
// "Edit Record Data", opened by a double click on a row: every field of one record with
// its value, as text. OK gives the record's text joined again; the row is then put through
// the list's gate like any other change.

#include <string>

#include "platform/messages/DialogHost.h"
#include "ui/RecordFields.h"

namespace nedit {

class UEditRecordDlg : public UDialogLogic {
  public:
    std::wstring DialogName() const override { return L"Edit Record Data"; }

    /// Splits `text` into the dialog's fields; false for a row without fields (a comment).
    bool LoadRecord(const std::wstring& text);
    std::wstring GetRecordText() const { return Record.Join(); }

    /// The record being edited: its key and its fields, which the form changes.
    RecordFields Record;
};

}  // namespace nedit
