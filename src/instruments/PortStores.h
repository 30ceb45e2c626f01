#pragma once
// The two stores of the serial link settings, as INI files in the configuration directory.
//
// - PortsStore stands for the system-wide [Ports] section: one entry per port, key the
//   port's name with ':' behind it ("COM1:"), value "%d,%c,%d,%s,%c" (baud, parity char, data
//   bits, stop text, flow char), "9600,n,8,2," when missing. It lives in "ports.ini", whose
//   section [Port Devices] also maps the port names COM1 to COM8 to devices.
// - InstrumentProfile stands for the application profile's key "Download Settings" with its
//   subkeys "Current Settings" and "Port Settings", and the default section's "Instrument"
//   entry. It is the application profile "sxnedit.ini"; the subkeys are the sections
//   "Download Settings\Current Settings" and "Download Settings\Port Settings".
//
// Decisions:
// - COM1 to COM4 are the board's ports /dev/ttyS0 to /dev/ttyS3, COM5 to COM8 the USB
//   adapters /dev/ttyUSB0 to /dev/ttyUSB3, unless [Port Devices] says otherwise. Any other
//   port name is taken as the device's path.
// - A number of the profile ("AckNak", "SaveRawFile") is taken only when it reads exactly
//   "0" or "1"; anything else counts as missing.

#include <optional>
#include <string>

namespace nedit {

class PortsStore {
  public:
    static constexpr const char* kFileName = "ports.ini";
    static constexpr const wchar_t* kPortsSection = L"Ports";
    static constexpr const wchar_t* kDevicesSection = L"Port Devices";
    static constexpr const wchar_t* kDefaultEntry = L"9600,n,8,2,";

    /// The store in the configuration directory, as it is at the time of the call.
    PortsStore();
    /// A store at `path`, for tests.
    explicit PortsStore(std::string path) : path_(std::move(path)) {}

    /// The entry of `port` (its key is "PORT:"); the default when there is none.
    std::wstring ReadEntry(const std::wstring& port) const;
    bool WriteEntry(const std::wstring& port, const std::wstring& value) const;

    /// The device of a port name: the mapped or default device for COM1 to COM8 (in any
    /// case), the name itself for anything else.
    std::string DevicePath(const std::wstring& port) const;
    bool SetDevicePath(const std::wstring& port, const std::string& device) const;

  private:
    std::string path_;
};

class InstrumentProfile {
  public:
    static constexpr const char* kFileName = "sxnedit.ini";
    static constexpr const wchar_t* kCurrentSection = L"Download Settings\\Current Settings";
    static constexpr const wchar_t* kPortSection = L"Download Settings\\Port Settings";
    /// The stand-in for the profile's default section.
    static constexpr const wchar_t* kDefaultSection = L"Settings";

    /// The last choices of the download dialog.
    struct Current {
        std::wstring instrument;
        std::wstring comm;
        std::optional<int> ackNak;
        std::optional<int> saveRaw;
    };

    InstrumentProfile();
    explicit InstrumentProfile(std::string path) : path_(std::move(path)) {}

    /// True when the profile holds the key "Download Settings" at all.
    bool HasDownloadSettings() const;
    Current ReadCurrent() const;
    bool WriteCurrent(const Current& current) const;
    /// The "Port Settings" value of `instrument`; nothing when it has none.
    std::optional<std::wstring> ReadPortSettings(const std::wstring& instrument) const;
    bool WritePortSettings(const std::wstring& instrument, const std::wstring& value) const;

    /// The instrument chosen last for a raw import; empty when none.
    std::wstring ReadInstrument() const;
    bool WriteInstrument(const std::wstring& instrument) const;

  private:
    std::string path_;
};

}  // namespace nedit
