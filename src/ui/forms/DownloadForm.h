#pragma once
// "Download Parameters": the instrument, the port it is plugged into (with the device that
// port stands for) and the link's values, and whether to keep the raw file. Choosing another
// instrument stores the port settings of the one before and shows those of the new one;
// "Driver Detail" shows what is known of its driver. OK refuses a baud rate of more than
// five characters with the system's message and puts the cursor there.

#include "instruments/UNEDownload.h"
#include "ui/forms/LogicForm.h"
#include "ui/forms/PortValueFields.h"

class QCheckBox;
class QComboBox;
class QLabel;
class QPushButton;

namespace nedit {

class DownloadForm : public LogicForm {
    Q_OBJECT
  public:
    DownloadForm(UNEDownload& dialog, const FormContext& context, QWidget* parent);

    /// A list by the number of its control (UNEDownload::kInstrumentList, kPortList, ...).
    QComboBox* List(int id) const;
    QCheckBox* SaveRawBox() const { return save_raw_; }
    QCheckBox* AckNakBox() const { return ack_nak_; }
    QPushButton* DriverDetailButton() const { return detail_; }
    /// The device the chosen port stands for.
    QLabel* DeviceLabel() const { return device_; }

  protected:
    void Refused() override;

  private:
    void InstrumentChosen(const QString& instrument);
    void ShowDevice();

    UNEDownload& dialog_;
    QComboBox* instrument_ = nullptr;
    QComboBox* port_ = nullptr;
    PortValueFields values_;
    QCheckBox* save_raw_ = nullptr;
    QCheckBox* ack_nak_ = nullptr;
    QPushButton* detail_ = nullptr;
    QLabel* device_ = nullptr;
};

}  // namespace nedit
