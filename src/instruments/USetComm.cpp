#include "instruments/USetComm.h"

#include "instruments/PortLists.h"
#include "instruments/UPortSetting.h"
#include "platform/messages/Translate.h"

USetComm::USetComm(nedit::DialogHost* host) : Host(host) {
    UPortSetting::OpenComm(Port, Handle);
    SetCommFld();
}

USetComm::~USetComm() {
    Handle.Close();
}

void USetComm::OnInitDialog() {
    SetComboBoxFld(kPortList, Port);
}

bool USetComm::OnOK() {
    const std::pair<const std::wstring*, std::size_t> limits[] = {
        {&Parity, 5}, {&StopBits, 3}, {&Baud, 5}, {&DataBits, 1}, {&Flow, 10}};
    for (const auto& [value, limit] : limits) {
        if (value->size() > limit) {
            nedit::AppMessageBox(Host,
                                 nedit::Translate(L"Please enter no more than {1} characters.",
                                                  {std::to_wstring(limit)}),
                                 nedit::mb::Ok | nedit::mb::IconExclamation);
            return false;
        }
    }
    GetCommFld();
    UPortSetting::SaveCommSetting(Port, Baud, DataBits, StopBits, Parity, Flow);
    return true;
}

void USetComm::OnSelendokCoCombo1(const std::wstring& port) {
    GetCommFld();
    Handle.Close();
    Port = port;
    UPortSetting::OpenComm(Port, Handle);
    SetCommFld();
}

void USetComm::SetPort(const std::wstring& port) {
    Port = port;
    SetCommFld();
}

void USetComm::GetCommFld() {
    if (Handle.IsOpen())
        UPortSetting::SetCommPortTexts(Handle, Baud, DataBits, StopBits, Parity, Flow);
}

void USetComm::SetCommFld() {
    UPortSetting::LoadTexts(Port, Baud, DataBits, StopBits, Parity, Flow);
    GetCommFld();
}

bool USetComm::SetComboBoxFld(int id, const std::wstring& text) {
    std::wstring* member = Member(id);
    const std::vector<std::wstring> items = GetItems(id);
    const int found = nedit::FindItem(items, text);
    if (member == nullptr || found < 0) return false;
    *member = items[static_cast<std::size_t>(found)];
    return true;
}

std::vector<std::wstring> USetComm::GetItems(int id) const {
    switch (id) {
        case kPortList:
            return nedit::PortItems(4);
        case kParityList:
            return nedit::ParityItems();
        case kStopBitList:
            return nedit::StopBitItems();
        case kBaudList:
            return nedit::BaudItems();
        case kDataBitList:
            return nedit::DataBitItems();
        case kFlowList:
            return nedit::FlowItems();
        default:
            return {};
    }
}

std::wstring* USetComm::Member(int id) {
    switch (id) {
        case kPortList:
            return &Port;
        case kParityList:
            return &Parity;
        case kStopBitList:
            return &StopBits;
        case kBaudList:
            return &Baud;
        case kDataBitList:
            return &DataBits;
        case kFlowList:
            return &Flow;
        default:
            return nullptr;
    }
}
