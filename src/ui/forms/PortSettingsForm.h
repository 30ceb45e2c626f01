#pragma once
// "Set Comm Configuration": a port (with the device it stands for) and its values as
// [Ports] keeps them. Choosing another port gives the port before what the form showed and
// shows the values of the new one; OK applies them to the port and stores them.

#include "instruments/USetComm.h"
#include "ui/forms/LogicForm.h"
#include "ui/forms/PortValueFields.h"

class QComboBox;
class QLabel;

namespace nedit {

class PortSettingsForm : public LogicForm {
    Q_OBJECT
  public:
    PortSettingsForm(USetComm& dialog, const FormContext& context, QWidget* parent);

    /// A list by the number of its control (USetComm::kPortList, kBaudList, ...).
    QComboBox* List(int id) const;
    QLabel* DeviceLabel() const { return device_; }

  private:
    void PortChosen(const QString& port);
    void ShowDevice();

    USetComm& dialog_;
    QComboBox* port_ = nullptr;
    PortValueFields values_;
    QLabel* device_ = nullptr;
};

}  // namespace nedit
