#pragma once
// The rules of the serial link settings: their text, stored and numeric forms, the [Ports]
// entries, and how the values reach a port. A class without data; every operation is
// static. The stores are those of PortStores.h in the configuration directory.
//
// Forms of each value (text shown / char stored / numeric):
//   parity  "NONE" 'n' 0, "ODD" 'o' 1, "EVEN" 'e' 2, "MARK" 'm' 3, "SPACE" 's' 4
//   flow    "NONE" ' ' 0, "XON/XOFF" 'x' 1, "HARDWARE" 'p' 2
//   stop    "1" 0, "1.5" 1, "2" 2

#include <string>

#include "platform/serial/SerialPort.h"

class UPortSetting {
  public:
    /// The listed rates stay; shortened forms are widened (12 is 1200, ..., 9216 is 921600);
    /// anything else gives 9600.
    static int GetBaud(int baud);
    /// 5 to 8 stay; anything else gives 8.
    static int GetDataBit(int bits);
    /// 'E'/'e' 2, 'M'/'m' 3, 'O'/'o' 1, 'S'/'s' 4, else 0.
    static int GetParity(wchar_t c);
    /// 'P'/'p' 2 (hardware), 'X'/'x' 1 (XON/XOFF), else 0.
    static int GetCtrls(wchar_t c);
    /// "1" 0, "1.5" 1, else 2.
    static int GetStopBit(const std::wstring& text);
    /// Token `index` of a comma-separated text, blanks dropped wherever they stand, in upper
    /// case: "9600, n ,8" has the tokens 9600, N and 8.
    static std::wstring GetString(const std::wstring& text, int index);
    static int GetDataReady(short) { return 1; }

    /// Reads the [Ports] entry of `port` into the numeric forms; a missing or malformed entry
    /// gives 9600 baud, no parity, 8 data bits, 2 stop bits, no flow control. Always 1.
    static int LoadCommSetting(const std::wstring& port, int& baud, int& dataBits, int& stopBits,
                               int& parity, int& ctrl);
    /// The [Ports] entry of `port` as the port takes it.
    static nedit::SerialSettings LoadSettings(const std::wstring& port);
    /// Writes the [Ports] entry of `port` from the texts; gives the result of the write.
    static int SaveCommSetting(const std::wstring& port, const std::wstring& baud,
                               const std::wstring& dataBits, const std::wstring& stopBits,
                               const std::wstring& parity, const std::wstring& flow);

    /// Opens the device of `port` (COM1 to COM8 through the store, else a device path). 1 on
    /// success; 0, with the port's LastError(), else.
    static int OpenComm(const std::wstring& port, nedit::SerialPort& handle);
    /// The four values the port is set to, and all of them in `state`; 0 when it cannot tell.
    static int GetCommPort(const nedit::SerialPort& handle, int& baud, int& dataBits, int& stopBits,
                           int& parity, nedit::SerialSettings& state);
    /// Applies the numeric values to the port by the port rule; 1 when the port took them.
    static int SetCommPort(nedit::SerialPort& handle, int baud, int dataBits, int stopBits,
                           int parity, int ctrl);
    /// Applies values as the lists show them ("9600", "8", "1.5", "EVEN", "XON/XOFF").
    static int SetCommPortTexts(nedit::SerialPort& handle, const std::wstring& baud,
                                const std::wstring& dataBits, const std::wstring& stopBits,
                                const std::wstring& parity, const std::wstring& flow);
    /// The numeric values as the lists show them.
    static void ToTexts(int baud, int dataBits, int stopBits, int parity, int ctrl,
                        std::wstring& baudText, std::wstring& dataBitsText,
                        std::wstring& stopBitsText, std::wstring& parityText,
                        std::wstring& flowText);
    /// The [Ports] entry of `port` as the lists show it.
    static void LoadTexts(const std::wstring& port, std::wstring& baud, std::wstring& dataBits,
                          std::wstring& stopBits, std::wstring& parity, std::wstring& flow);
    /// The values as the port takes them.
    static nedit::SerialSettings ToSettings(int baud, int dataBits, int stopBits, int parity,
                                            int ctrl);

    /// The stored char of a parity or flow text ('n' and ' ' for texts not in the tables).
    static wchar_t ParityChar(const std::wstring& text);
    static wchar_t FlowChar(const std::wstring& text);
    /// The texts of the numeric forms ("NONE" for values not in the tables, "2" for stop).
    static std::wstring ParityText(int parity);
    static std::wstring FlowText(int ctrl);
    static std::wstring StopText(int stopBits);
};
