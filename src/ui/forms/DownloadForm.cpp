#include "ui/forms/DownloadForm.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"

namespace nedit {

DownloadForm::DownloadForm(UNEDownload& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Download Parameters"), parent, context), dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* top = new QFormLayout();

    // The instrument's handler needs the instrument chosen before, so the list is not bound
    // to its member: the handler sets it.
    instrument_ = new QComboBox(this);
    for (const std::wstring& name : dialog_.GetItems(UNEDownload::kInstrumentList))
        instrument_->addItem(QString::fromStdWString(name));
    instrument_->setCurrentText(QString::fromStdWString(dialog_.Instrument));
    instrument_->setMinimumContentsLength(24);
    detail_ = new QPushButton(QStringLiteral("Driver Detail"), this);
    auto* instrument_line = new QHBoxLayout();
    instrument_line->addWidget(instrument_, 1);
    instrument_line->addWidget(detail_);
    top->addRow(QStringLiteral("Instrument"), instrument_line);

    port_ = maker.List("TEXT,COM2", dialog_.Comm, dialog_.GetItems(UNEDownload::kPortList), false);
    device_ = new QLabel(this);
    device_->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto* port_line = new QHBoxLayout();
    port_line->addWidget(port_);
    port_line->addWidget(device_, 1);
    top->addRow(QStringLiteral("Com Port"), port_line);
    layout->addLayout(top);

    auto* link = new QGroupBox(QStringLiteral("Port Settings"), this);
    auto* values = new QFormLayout(link);
    values_ = PortValueFields::Make(maker, values, dialog_.Baud, dialog_.DataBits, dialog_.StopBits,
                                    dialog_.Parity, dialog_.Flow);
    layout->addWidget(link);

    save_raw_ = maker.Check("CHECK,1", QStringLiteral("Save Raw Data File"), dialog_.SaveRaw);
    layout->addWidget(save_raw_);
    // Kept as the dialog has always had it: not shown, and only the rule sets it.
    ack_nak_ = maker.Check("CHECK,0", QStringLiteral("Download with Ack/Nak"), dialog_.AckNak);
    ack_nak_->setVisible(false);
    ack_nak_->setEnabled(dialog_.IsAckNakEnabled());
    AddButtons(layout);

    connect(instrument_, &QComboBox::currentTextChanged, this, &DownloadForm::InstrumentChosen);
    connect(detail_, &QPushButton::clicked, this, [this] {
        Maker().UpdateData(true);
        dialog_.OnDriverDetail();
    });
    connect(&maker, &UDlgMaker::changed, this, &DownloadForm::ShowDevice);
    ShowDevice();
}

QComboBox* DownloadForm::List(int id) const {
    switch (id) {
        case UNEDownload::kInstrumentList:
            return instrument_;
        case UNEDownload::kPortList:
            return port_;
        case UNEDownload::kBaudList:
            return values_.baud;
        case UNEDownload::kDataBitList:
            return values_.dataBits;
        case UNEDownload::kStopBitList:
            return values_.stopBits;
        case UNEDownload::kParityList:
            return values_.parity;
        case UNEDownload::kFlowList:
            return values_.flow;
        default:
            return nullptr;
    }
}

void DownloadForm::InstrumentChosen(const QString& instrument) {
    dialog_.OnSelchangeInstrument(instrument.toStdWString());
    Maker().UpdateData(false);
    ack_nak_->setEnabled(dialog_.IsAckNakEnabled());
    ShowDevice();
}

void DownloadForm::ShowDevice() {
    device_->setText(PortValueFields::DeviceText(dialog_.Comm));
}

void DownloadForm::Refused() {
    if (QComboBox* list = List(dialog_.GetFocusId())) {
        list->setFocus();
        if (list->lineEdit() != nullptr) list->lineEdit()->selectAll();
    }
}

}  // namespace nedit
