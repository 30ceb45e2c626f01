#pragma once
// The values of a serial link as lists of a form, as the download and the port dialogs both
// show them: baud rate (which may also be typed in), data bits, stop bits, parity and flow
// control, each bound to its member; and the device a port name stands for.

#include <QString>
#include <string>

class QComboBox;
class QFormLayout;

namespace nedit {

class UDlgMaker;

struct PortValueFields {
    /// The five lists, made by `maker` and added to `layout` under their labels.
    static PortValueFields Make(UDlgMaker& maker, QFormLayout* layout, std::wstring& baud,
                                std::wstring& dataBits, std::wstring& stopBits,
                                std::wstring& parity, std::wstring& flow);
    /// "(/dev/ttyS0)" for "COM1": what the port stands for on this machine.
    static QString DeviceText(const std::wstring& port);

    QComboBox* baud = nullptr;
    QComboBox* dataBits = nullptr;
    QComboBox* stopBits = nullptr;
    QComboBox* parity = nullptr;
    QComboBox* flow = nullptr;
};

}  // namespace nedit
