#pragma once
// "Set Comm Configuration" (dialog 130, command 34607): the [Ports] entries of COM1 to COM4.
// The dialog holds its port open, exclusively, from construction to destruction, and shows
// and applies the values of the port chosen. A port that cannot be opened gives no message:
// the dialog works on the stored values all the same, and writes them on OK.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"
#include "platform/serial/SerialPort.h"

class USetComm : public nedit::UDialogLogic {
  public:
    static constexpr int kResourceId = 130;
    static constexpr int kPortList = 1010;
    static constexpr int kParityList = 1006;
    static constexpr int kStopBitList = 1007;
    static constexpr int kBaudList = 1009;
    static constexpr int kDataBitList = 1003;
    static constexpr int kFlowList = 1011;

    /// Opens COM1 and takes its values.
    explicit USetComm(nedit::DialogHost* host);
    /// Purges and closes the port.
    ~USetComm() override;

    std::wstring DialogName() const override { return L"Set Comm Configuration"; }
    /// Selects the port in its list.
    void OnInitDialog() override;
    /// Refuses values longer than their lists allow (parity 5, stop bits 3, baud 5, data bits
    /// 1, flow 10 characters) with the framework's message; else applies them to the port
    /// and writes the port's [Ports] entry.
    bool OnOK() override;

    /// Another port was chosen: the old one gets what the dialog showed and is closed, the
    /// new one is opened and its values shown.
    void OnSelendokCoCombo1(const std::wstring& port);
    /// Sets the port and takes its stored values, without opening it.
    void SetPort(const std::wstring& port);
    const std::wstring& GetPort() const { return Port; }
    /// Applies the values shown to the open port.
    void GetCommFld();
    /// Takes the stored values of the port, and applies them.
    void SetCommFld();
    /// Selects `text` in list `id`; false when the list has no such item.
    bool SetComboBoxFld(int id, const std::wstring& text);
    /// The items of list `id`; the selected text is the member bound to it.
    std::vector<std::wstring> GetItems(int id) const;
    const nedit::SerialPort& GetHandle() const { return Handle; }

    // The values, as the lists show them.
    std::wstring Port = L"COM1";
    std::wstring Parity = L"NONE";
    std::wstring StopBits;
    std::wstring Baud;
    std::wstring DataBits;
    std::wstring Flow;

  private:
    std::wstring* Member(int id);

    nedit::DialogHost* Host;
    nedit::SerialPort Handle;
};
