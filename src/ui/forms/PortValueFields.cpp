#include "ui/forms/PortValueFields.h"

#include <QComboBox>
#include <QFormLayout>

#include "instruments/PortLists.h"
#include "instruments/PortStores.h"
#include "ui/forms/UDlgMaker.h"

namespace nedit {

PortValueFields PortValueFields::Make(UDlgMaker& maker, QFormLayout* layout, std::wstring& baud,
                                      std::wstring& dataBits, std::wstring& stopBits,
                                      std::wstring& parity, std::wstring& flow) {
    PortValueFields fields;
    fields.baud = maker.List("TEXT", baud, BaudItems(), true);
    fields.dataBits = maker.List("TEXT", dataBits, DataBitItems(), false);
    fields.stopBits = maker.List("TEXT", stopBits, StopBitItems(), false);
    fields.parity = maker.List("TEXT", parity, ParityItems(), false);
    fields.flow = maker.List("TEXT", flow, FlowItems(), false);
    layout->addRow(QStringLiteral("Baud Rate"), fields.baud);
    layout->addRow(QStringLiteral("Data Bit"), fields.dataBits);
    layout->addRow(QStringLiteral("Stop Bit"), fields.stopBits);
    layout->addRow(QStringLiteral("Parity"), fields.parity);
    layout->addRow(QStringLiteral("Flow Control"), fields.flow);
    return fields;
}

QString PortValueFields::DeviceText(const std::wstring& port) {
    return QStringLiteral("(%1)").arg(QString::fromStdString(PortsStore().DevicePath(port)));
}

}  // namespace nedit
