#include "instruments/UPortSetting.h"

#include "instruments/PortStores.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace {

constexpr const wchar_t* kParityTexts[] = {L"NONE", L"ODD", L"EVEN", L"MARK", L"SPACE"};
constexpr wchar_t kParityChars[] = {L'n', L'o', L'e', L'm', L's'};
constexpr const wchar_t* kFlowTexts[] = {L"NONE", L"XON/XOFF", L"HARDWARE"};
constexpr wchar_t kFlowChars[] = {L' ', L'x', L'p'};
constexpr const wchar_t* kStopTexts[] = {L"1", L"1.5", L"2"};

}  // namespace

int UPortSetting::GetBaud(int baud) {
    switch (baud) {
        case 110:
        case 300:
        case 600:
        case 1200:
        case 2400:
        case 4800:
        case 9600:
        case 19200:
        case 38400:
        case 57600:
        case 115200:
        case 230400:
        case 460800:
        case 921600:
            return baud;
        case 12:
        case 24:
        case 48:
        case 192:
        case 384:
        case 576:
        case 1152:
        case 2304:
        case 4608:
        case 9216:
            return baud * 100;
        default:
            return 9600;
    }
}

int UPortSetting::GetDataBit(int bits) {
    return bits >= 5 && bits <= 8 ? bits : 8;
}

int UPortSetting::GetParity(wchar_t c) {
    switch (c) {
        case L'E':
        case L'e':
            return 2;
        case L'M':
        case L'm':
            return 3;
        case L'O':
        case L'o':
            return 1;
        case L'S':
        case L's':
            return 4;
        default:
            return 0;
    }
}

int UPortSetting::GetCtrls(wchar_t c) {
    if (c == L'P' || c == L'p') return 2;
    if (c == L'X' || c == L'x') return 1;
    return 0;
}

int UPortSetting::GetStopBit(const std::wstring& text) {
    if (text == L"1") return 0;
    if (text == L"1.5") return 1;
    return 2;
}

std::wstring UPortSetting::GetString(const std::wstring& text, int index) {
    std::wstring token;
    int counter = 0;
    for (const wchar_t c : text) {
        if (c == L' ') continue;
        if (c == L',') {
            if (++counter > index) break;
            continue;
        }
        if (counter == index) token += c;
    }
    return nedit::ToUpper(token);
}

int UPortSetting::LoadCommSetting(const std::wstring& port, int& baud, int& dataBits, int& stopBits,
                                  int& parity, int& ctrl) {
    const std::wstring entry = nedit::PortsStore().ReadEntry(port);
    baud = GetBaud(nedit::TextToInt(GetString(entry, 0)));
    const std::wstring parity_token = GetString(entry, 1);
    parity = parity_token.empty() ? 0 : GetParity(parity_token[0]);
    dataBits = GetDataBit(nedit::TextToInt(GetString(entry, 2)));
    stopBits = GetStopBit(GetString(entry, 3));
    const std::wstring flow_token = GetString(entry, 4);
    ctrl = GetCtrls(flow_token.empty() ? L'n' : flow_token[0]);
    return 1;
}

nedit::SerialSettings UPortSetting::LoadSettings(const std::wstring& port) {
    int baud = 0;
    int data_bits = 0;
    int stop_bits = 0;
    int parity = 0;
    int ctrl = 0;
    LoadCommSetting(port, baud, data_bits, stop_bits, parity, ctrl);
    return ToSettings(baud, data_bits, stop_bits, parity, ctrl);
}

int UPortSetting::SaveCommSetting(const std::wstring& port, const std::wstring& baud,
                                  const std::wstring& dataBits, const std::wstring& stopBits,
                                  const std::wstring& parity, const std::wstring& flow) {
    const std::wstring entry =
        nedit::Format(L"%d,%c,%d,%s,%c", nedit::TextToInt(baud), ParityChar(parity),
                      nedit::TextToInt(dataBits), stopBits, FlowChar(flow));
    return nedit::PortsStore().WriteEntry(port, entry) ? 1 : 0;
}

int UPortSetting::OpenComm(const std::wstring& port, nedit::SerialPort& handle) {
    return handle.Open(nedit::PortsStore().DevicePath(port)) ? 1 : 0;
}

int UPortSetting::GetCommPort(const nedit::SerialPort& handle, int& baud, int& dataBits,
                              int& stopBits, int& parity, nedit::SerialSettings& state) {
    if (!handle.Current(state)) return 0;
    baud = state.baud;
    dataBits = state.dataBits;
    stopBits = static_cast<int>(state.stopBits);
    parity = static_cast<int>(state.parity);
    return 1;
}

int UPortSetting::SetCommPort(nedit::SerialPort& handle, int baud, int dataBits, int stopBits,
                              int parity, int ctrl) {
    return handle.Apply(ToSettings(baud, dataBits, stopBits, parity, ctrl)) ? 1 : 0;
}

int UPortSetting::SetCommPortTexts(nedit::SerialPort& handle, const std::wstring& baud,
                                   const std::wstring& dataBits, const std::wstring& stopBits,
                                   const std::wstring& parity, const std::wstring& flow) {
    return SetCommPort(handle, nedit::TextToInt(baud), nedit::TextToInt(dataBits),
                       GetStopBit(stopBits), GetParity(ParityChar(parity)),
                       GetCtrls(FlowChar(flow)));
}

void UPortSetting::ToTexts(int baud, int dataBits, int stopBits, int parity, int ctrl,
                           std::wstring& baudText, std::wstring& dataBitsText,
                           std::wstring& stopBitsText, std::wstring& parityText,
                           std::wstring& flowText) {
    baudText = nedit::Format(L"%d", baud);
    dataBitsText = nedit::Format(L"%d", dataBits);
    stopBitsText = StopText(stopBits);
    parityText = ParityText(parity);
    flowText = FlowText(ctrl);
}

void UPortSetting::LoadTexts(const std::wstring& port, std::wstring& baud, std::wstring& dataBits,
                             std::wstring& stopBits, std::wstring& parity, std::wstring& flow) {
    const nedit::SerialSettings settings = LoadSettings(port);
    ToTexts(settings.baud, settings.dataBits, static_cast<int>(settings.stopBits),
            static_cast<int>(settings.parity), static_cast<int>(settings.flow), baud, dataBits,
            stopBits, parity, flow);
}

nedit::SerialSettings UPortSetting::ToSettings(int baud, int dataBits, int stopBits, int parity,
                                               int ctrl) {
    nedit::SerialSettings settings;
    settings.baud = baud;
    settings.dataBits = dataBits;
    settings.stopBits = stopBits == 0   ? nedit::StopBits::One
                        : stopBits == 1 ? nedit::StopBits::OneAndHalf
                                        : nedit::StopBits::Two;
    settings.parity =
        parity >= 1 && parity <= 4 ? static_cast<nedit::Parity>(parity) : nedit::Parity::None;
    settings.flow = ctrl == 1   ? nedit::FlowControl::XonXoff
                    : ctrl == 2 ? nedit::FlowControl::Hardware
                                : nedit::FlowControl::None;
    return settings;
}

wchar_t UPortSetting::ParityChar(const std::wstring& text) {
    for (int i = 0; i < 5; ++i) {
        if (nedit::EqualsIgnoreCase(text, kParityTexts[i])) return kParityChars[i];
    }
    return L'n';
}

wchar_t UPortSetting::FlowChar(const std::wstring& text) {
    for (int i = 0; i < 3; ++i) {
        if (nedit::EqualsIgnoreCase(text, kFlowTexts[i])) return kFlowChars[i];
    }
    return L' ';
}

std::wstring UPortSetting::ParityText(int parity) {
    return parity >= 0 && parity <= 4 ? kParityTexts[parity] : kParityTexts[0];
}

std::wstring UPortSetting::FlowText(int ctrl) {
    return ctrl >= 0 && ctrl <= 2 ? kFlowTexts[ctrl] : kFlowTexts[0];
}

std::wstring UPortSetting::StopText(int stopBits) {
    return stopBits >= 0 && stopBits <= 2 ? kStopTexts[stopBits] : kStopTexts[2];
}
