#include "ui/forms/PortSettingsForm.h"

#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

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
    values_ = PortValueFields::Make(maker, values, dialog_.Baud, dialog_.DataBits, dialog_.StopBits,
                                    dialog_.Parity, dialog_.Flow);
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
            return values_.baud;
        case USetComm::kDataBitList:
            return values_.dataBits;
        case USetComm::kStopBitList:
            return values_.stopBits;
        case USetComm::kParityList:
            return values_.parity;
        case USetComm::kFlowList:
            return values_.flow;
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
    device_->setText(PortValueFields::DeviceText(dialog_.GetPort()));
}

}  // namespace nedit
