#include "reduction/UCoordEntryDlg.h"

UCoordEntryDlg::UCoordEntryDlg(int dialogId, nedit::DialogHost* host)
    : DialogId(dialogId), Host(host) {
    Entered.Offered = true;
}

void UCoordEntryDlg::InitXYZ(double e, double n, double z, const std::wstring& code) {
    Entered = {e, n, z, code, true};
}

void UCoordEntryDlg::InitXYZLocal(double e, double n, double z, const std::wstring& code) {
    Field = {e, n, z, code, true};
}

void UCoordEntryDlg::InitXYZSvy(double e, double n, double z, const std::wstring& code) {
    Database = {e, n, z, code, true};
}

const UCoordEntryDlg::Row& UCoordEntryDlg::RowOf(Source source) const {
    static const Row kBlank;
    switch (source) {
        case Source::Database:
            return Database.Offered ? Database : kBlank;
        case Source::Field:
            return Field.Offered ? Field : kBlank;
        default:
            return Entered;
    }
}

UCoordEntryDlg::Source UCoordEntryDlg::BestOffered() const {
    if (Database.Offered) return Source::Database;
    if (Field.Offered) return Source::Field;
    return Source::Enter;
}

void UCoordEntryDlg::OnInitDialog() {
    Selected = BestOffered();
}

void UCoordEntryDlg::SelectSource(Source source) {
    if (IsOffered(source)) Selected = source;
}

void UCoordEntryDlg::TakeSource(Source source) {
    Chosen = source;
    Result = RowOf(source);
}

bool UCoordEntryDlg::OnOK() {
    TakeSource(Selected);
    return true;
}

int UCoordEntryDlg::ProcessOnly(const std::wstring& name) {
    Name = name;
    TakeSource(BestOffered());
    return 1;
}

int UCoordEntryDlg::process(const std::wstring& name, bool& applyAll) {
    if (applyAll) return ProcessOnly(name);
    Name = name;
    if (Host == nullptr) return ProcessOnly(name);  // nobody to ask: the best source offered
    const int answer = Host->Run(*this);
    if (answer != nedit::mb::IdOk) return answer;
    if (ApplyToAll) applyAll = true;
    return 1;
}
