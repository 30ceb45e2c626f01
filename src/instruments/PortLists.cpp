#include "instruments/PortLists.h"

#include "platform/text/WideText.h"

namespace nedit {

std::vector<std::wstring> PortItems(int count) {
    std::vector<std::wstring> ports;
    for (int number = 1; number <= count; ++number)
        ports.push_back(L"COM" + std::to_wstring(number));
    return ports;
}

const std::vector<std::wstring>& BaudItems() {
    static const std::vector<std::wstring> items = {
        L"110",   L"300",   L"600",    L"1200",   L"2400",   L"4800",   L"9600", L"19200",
        L"38400", L"57600", L"115200", L"230400", L"460800", L"921600", L""};
    return items;
}

const std::vector<std::wstring>& DataBitItems() {
    static const std::vector<std::wstring> items = {L"4", L"5", L"6", L"7", L"8"};
    return items;
}

const std::vector<std::wstring>& StopBitItems() {
    static const std::vector<std::wstring> items = {L"1", L"1.5", L"2"};
    return items;
}

const std::vector<std::wstring>& ParityItems() {
    static const std::vector<std::wstring> items = {L"NONE", L"ODD", L"EVEN", L"MARK", L"SPACE"};
    return items;
}

const std::vector<std::wstring>& FlowItems() {
    static const std::vector<std::wstring> items = {L"NONE", L"XON/XOFF", L"HARDWARE"};
    return items;
}

int FindItem(const std::vector<std::wstring>& items, const std::wstring& text) {
    for (std::size_t i = 0; i < items.size(); ++i) {
        if (EqualsIgnoreCase(items[i], text)) return static_cast<int>(i);
    }
    return -1;
}

}  // namespace nedit
