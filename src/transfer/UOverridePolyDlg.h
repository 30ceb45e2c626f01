#pragma once
// "Override String": the question when the job holds a polyline of the name of a string
// being written. "Yes" replaces the job's polyline, "No" (the default) keeps it and writes a
// second polyline of that name; "Apply to All" makes the answer stand for the strings that
// follow. Both buttons take the check box.

#include <string>

#include "platform/messages/DialogHost.h"

class UOverridePolyDlg : public nedit::UDialogLogic {
  public:
    explicit UOverridePolyDlg(std::wstring name);

    std::wstring DialogName() const override { return L"Override String"; }
    /// "String NAME is in the database, do you want to override it?"
    std::wstring GetMessage() const;
    const std::wstring& GetName() const { return Name; }

    /// The buttons: each takes the answer and gives it as the end of the dialog.
    int OnYes() { return Answer = nedit::mb::IdYes; }
    int OnNo() { return Answer = nedit::mb::IdNo; }

    /// nedit::mb::IdYes or IdNo; No until a button says otherwise.
    int Answer = nedit::mb::IdNo;
    bool ApplyAll = false;

  private:
    std::wstring Name;
};
