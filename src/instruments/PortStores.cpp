#include "instruments/PortStores.h"

#include "platform/settings/ConfigDirectory.h"
#include "platform/settings/IniFile.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

// A value no user writes, to tell a missing entry from an empty one.
constexpr const wchar_t* kMissing = L"\x01missing\x01";

std::optional<std::wstring> ReadOptional(const IniFile& file, const wchar_t* section,
                                         const std::wstring& key) {
    std::wstring value = file.ReadString(section, key, kMissing);
    if (value == kMissing) return std::nullopt;
    return value;
}

std::optional<int> ReadFlag(const IniFile& file, const wchar_t* key) {
    const std::wstring value = file.ReadString(InstrumentProfile::kCurrentSection, key);
    if (value == L"0") return 0;
    if (value == L"1") return 1;
    return std::nullopt;
}

// 1 to 8 for "COM1" to "COM8" in any case, else 0.
int ComNumber(const std::wstring& port) {
    if (port.size() != 4 || !EqualsIgnoreCase(port.substr(0, 3), L"COM")) return 0;
    const int number = port[3] - L'0';
    return number >= 1 && number <= 8 ? number : 0;
}

}  // namespace

PortsStore::PortsStore() : path_(ConfigFile(kFileName)) {}

std::wstring PortsStore::ReadEntry(const std::wstring& port) const {
    return IniFile(path_).ReadString(kPortsSection, port + L":", kDefaultEntry);
}

bool PortsStore::WriteEntry(const std::wstring& port, const std::wstring& value) const {
    return IniFile(path_).WriteString(kPortsSection, port + L":", value);
}

std::string PortsStore::DevicePath(const std::wstring& port) const {
    const int number = ComNumber(port);
    if (number == 0) return ToUtf8(port);
    const std::string fallback = number <= 4 ? "/dev/ttyS" + std::to_string(number - 1)
                                             : "/dev/ttyUSB" + std::to_string(number - 5);
    const std::wstring key = L"COM" + std::to_wstring(number);
    const std::wstring device = IniFile(path_).ReadString(kDevicesSection, key);
    return device.empty() ? fallback : ToUtf8(device);
}

bool PortsStore::SetDevicePath(const std::wstring& port, const std::string& device) const {
    return IniFile(path_).WriteString(kDevicesSection, ToUpper(port), FromUtf8(device));
}

InstrumentProfile::InstrumentProfile() : path_(ConfigFile(kFileName)) {}

bool InstrumentProfile::HasDownloadSettings() const {
    const IniFile file(path_);
    for (const wchar_t* key : {L"Instrument", L"Comm", L"AckNak", L"SaveRawFile"}) {
        if (ReadOptional(file, kCurrentSection, key)) return true;
    }
    return false;
}

InstrumentProfile::Current InstrumentProfile::ReadCurrent() const {
    const IniFile file(path_);
    Current current;
    current.instrument = file.ReadString(kCurrentSection, L"Instrument");
    current.comm = file.ReadString(kCurrentSection, L"Comm");
    current.ackNak = ReadFlag(file, L"AckNak");
    current.saveRaw = ReadFlag(file, L"SaveRawFile");
    return current;
}

bool InstrumentProfile::WriteCurrent(const Current& current) const {
    const IniFile file(path_);
    bool written = file.WriteString(kCurrentSection, L"Instrument", current.instrument);
    written = file.WriteString(kCurrentSection, L"Comm", current.comm) && written;
    if (current.ackNak)
        written = file.WriteString(kCurrentSection, L"AckNak", std::to_wstring(*current.ackNak)) &&
                  written;
    if (current.saveRaw)
        written =
            file.WriteString(kCurrentSection, L"SaveRawFile", std::to_wstring(*current.saveRaw)) &&
            written;
    return written;
}

std::optional<std::wstring> InstrumentProfile::ReadPortSettings(
    const std::wstring& instrument) const {
    return ReadOptional(IniFile(path_), kPortSection, instrument);
}

bool InstrumentProfile::WritePortSettings(const std::wstring& instrument,
                                          const std::wstring& value) const {
    return IniFile(path_).WriteString(kPortSection, instrument, value);
}

std::wstring InstrumentProfile::ReadInstrument() const {
    return IniFile(path_).ReadString(kDefaultSection, L"Instrument");
}

bool InstrumentProfile::WriteInstrument(const std::wstring& instrument) const {
    return IniFile(path_).WriteString(kDefaultSection, L"Instrument", instrument);
}

}  // namespace nedit
