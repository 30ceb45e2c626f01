#include "ui/forms/PortSettingsForm.h"

#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

#include "instruments/PortStores.h"
#include "ui/forms/UDlgMaker.h"

namespace nedit {

PortSettingsForm::PortSettingsForm(USetComm& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Set Comm Configuration"), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* values = new QFormLayout();
    // The port's handler works on the port chosen before, so the list is not bound to its
    // member: the handler sets it.
    port_ = new QComboBox(this);
    for (const std::wstring& port : dialog_.GetItems(USetComm::kPortList))
        port_->addItem(QString::fromStdWString(port));
    port_->setCurrentText(QString::fromStdWString(dialog_.GetPort()));
    device_ = new QLabel(this);
    device_->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto* port_line = new QHBoxLayout();
    port_line->addWidget(port_);
    port_line->addWidget(device_, 1);
    values->addRow(QStringLiteral("Port"), port_line);
    baud_ = maker.List("TEXT", dialog_.Baud, dialog_.GetItems(USetComm::kBaudList), true);
    data_bits_ =
        maker.List("TEXT", dialog_.DataBits, dialog_.GetItems(USetComm::kDataBitList), false);
    stop_bits_ =
        maker.List("TEXT", dialog_.StopBits, dialog_.GetItems(USetComm::kStopBitList), false);
    parity_ = maker.List("TEXT", dialog_.Parity, dialog_.GetItems(USetComm::kParityList), false);
    flow_ = maker.List("TEXT", dialog_.Flow, dialog_.GetItems(USetComm::kFlowList), false);
    values->addRow(QStringLiteral("Baud Rate"), baud_);
    values->addRow(QStringLiteral("Data Bits"), data_bits_);
    values->addRow(QStringLiteral("Stop Bits"), stop_bits_);
    values->addRow(QStringLiteral("Parity"), parity_);
    values->addRow(QStringLiteral("Flow Control"), flow_);
    layout->addLayout(values);
    AddButtons(layout);
    connect(port_, &QComboBox::currentTextChanged, this, &PortSettingsForm::PortChosen);
    ShowDevice();
}

QComboBox* PortSettingsForm::List(int id) const {
    switch (id) {
        case USetComm::kPortList:
            return port_;
        case USetComm::kBaudList:
            return baud_;
        case USetComm::kDataBitList:
            return data_bits_;
        case USetComm::kStopBitList:
            return stop_bits_;
        case USetComm::kParityList:
            return parity_;
        case USetComm::kFlowList:
            return flow_;
        default:
            return nullptr;
    }
}

void PortSettingsForm::PortChosen(const QString& port) {
    dialog_.OnSelendokCoCombo1(port.toStdWString());
    Maker().UpdateData(false);
    ShowDevice();
}

void PortSettingsForm::ShowDevice() {
    device_->setText(QStringLiteral("(%1)").arg(
        QString::fromStdString(PortsStore().DevicePath(dialog_.GetPort()))));
}

}  // namespace nedit
