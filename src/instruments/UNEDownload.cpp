#include "instruments/UNEDownload.h"

#include "instruments/PortLists.h"
#include "instruments/PortStores.h"
#include "instruments/UDeviceManager.h"
#include "instruments/UPortSetting.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"

UNEDownload::UNEDownload(nedit::DialogHost* host, UDeviceManager* manager)
    : Host(host), DeviceManager(manager) {}

bool UNEDownload::ApplyAckNakRule(const std::wstring& instrument, int& ackNak) {
    const auto holds = [&](const wchar_t* part) {
        return instrument.find(part) != std::wstring::npos;
    };
    // "KVR-200" before "KVR-2", which it holds.
    if (holds(L"KVR-3")) {
        ackNak = 1;
        return true;
    }
    if (holds(L"KVR-200")) return true;
    if (holds(L"KVR-2")) {
        ackNak = 1;
        return true;
    }
    if (holds(L"DQ-5") || holds(L"DQ-2")) return true;
    ackNak = 0;
    return false;
}

void UNEDownload::OnInitDialog() {
    Instruments.clear();
    if (DeviceManager != nullptr) DeviceManager->GetNameList(Instruments);
    AckNakEnabled = ApplyAckNakRule(Instrument, AckNak);
    const nedit::InstrumentProfile profile;
    if (profile.HasDownloadSettings()) {
        const nedit::InstrumentProfile::Current current = profile.ReadCurrent();
        Instrument = current.instrument;
        Comm = current.comm;
        if (current.ackNak) AckNak = *current.ackNak;
        if (current.saveRaw) SaveRaw = *current.saveRaw;
    }
    LoadPortSettings();
    const int instrument = nedit::FindItem(Instruments, Instrument);
    if (instrument >= 0) {
        Instrument = Instruments[static_cast<std::size_t>(instrument)];
    } else if (!Instruments.empty()) {
        Instrument = Instruments.front();
    }
    if (nedit::FindItem(nedit::PortItems(8), Comm) < 0) Comm = L"COM1";
}

void UNEDownload::LoadPortSettings() {
    const nedit::InstrumentProfile profile;
    const auto stored =
        profile.HasDownloadSettings() ? profile.ReadPortSettings(Instrument) : std::nullopt;
    if (!stored) {
        UPortSetting::LoadTexts(Comm, Baud, DataBits, StopBits, Parity, Flow);
        return;
    }
    const std::wstring& text = *stored;
    const std::wstring port = UPortSetting::GetString(text, 0);
    Comm = nedit::FindItem(nedit::PortItems(8), port) >= 0 ? port : L"COM1";
    const std::wstring parity = UPortSetting::GetString(text, 2);
    const std::wstring flow = UPortSetting::GetString(text, 5);
    UPortSetting::ToTexts(
        UPortSetting::GetBaud(nedit::TextToInt(UPortSetting::GetString(text, 1))),
        UPortSetting::GetDataBit(nedit::TextToInt(UPortSetting::GetString(text, 3))),
        UPortSetting::GetStopBit(UPortSetting::GetString(text, 4)),
        parity.empty() ? 0 : UPortSetting::GetParity(parity[0]),
        UPortSetting::GetCtrls(flow.empty() ? L'n' : flow[0]), Baud, DataBits, StopBits, Parity,
        Flow);
}

void UNEDownload::OnSelchangeInstrument(const std::wstring& instrument) {
    nedit::InstrumentProfile().WritePortSettings(Instrument, PortSettingsText());
    Instrument = instrument;
    AckNakEnabled = ApplyAckNakRule(Instrument, AckNak);
    LoadPortSettings();
}

void UNEDownload::OnDriverDetail() {
    if (DeviceManager != nullptr) DeviceManager->ShowDeviceDetails(Instrument);
}

bool UNEDownload::OnOK() {
    FocusId = 0;
    if (Baud.size() >= 6) {
        nedit::AppMessageBox(Host, nedit::Translate(L"No more than 5 characters please"),
                             nedit::mb::Ok | nedit::mb::IconExclamation);
        FocusId = kBaudList;
        return false;
    }
    nedit::SerialPort port;
    if (UPortSetting::OpenComm(Comm, port)) {
        UPortSetting::SetCommPortTexts(port, Baud, DataBits, StopBits, Parity, Flow);
        port.Close();
    }
    UPortSetting::SaveCommSetting(Comm, Baud, DataBits, StopBits, Parity, Flow);
    const nedit::InstrumentProfile profile;
    profile.WriteCurrent({Instrument, Comm, AckNak, SaveRaw});
    profile.WritePortSettings(Instrument, PortSettingsText());
    return true;
}

std::wstring UNEDownload::PortSettingsText() const {
    return nedit::Format(L"%s,%d,%c,%d,%s,%c", Comm, nedit::TextToInt(Baud),
                         UPortSetting::ParityChar(Parity), nedit::TextToInt(DataBits), StopBits,
                         UPortSetting::FlowChar(Flow));
}

std::vector<std::wstring> UNEDownload::GetItems(int id) const {
    switch (id) {
        case kInstrumentList:
            return Instruments;
        case kPortList:
            return nedit::PortItems(8);
        case kBaudList:
            return nedit::BaudItems();
        case kDataBitList:
            return nedit::DataBitItems();
        case kStopBitList:
            return nedit::StopBitItems();
        case kParityList:
            return nedit::ParityItems();
        case kFlowList:
            return nedit::FlowItems();
        default:
            return {};
    }
}
