#include "transfer/UOverridePolyDlg.h"

#include <utility>

#include "platform/messages/Translate.h"

UOverridePolyDlg::UOverridePolyDlg(std::wstring name) : Name(std::move(name)) {}

std::wstring UOverridePolyDlg::GetMessage() const {
    return nedit::Translate(L"String {1} is in the database, do you want to override it?", {Name});
}
