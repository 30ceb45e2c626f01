#pragma once
// "Display Settings" of the plan.

#include <map>

#include "ui/dialogs/UDisplaySettingsDlg.h"
#include "ui/forms/LogicForm.h"

class QCheckBox;
class QComboBox;

namespace nedit {

class DisplaySettingsForm : public LogicForm {
    Q_OBJECT
  public:
    DisplaySettingsForm(UDisplaySettingsDlg& dialog, QWidget* parent);

    QCheckBox* Box(UNeditSettings::Id id) const { return boxes_.at(id); }
    QComboBox* TextSizeList() const { return text_size_; }

  protected:
    void Store() override;

  private:
    UDisplaySettingsDlg& dialog_;
    std::map<UNeditSettings::Id, QCheckBox*> boxes_;
    QComboBox* text_size_ = nullptr;
};

}  // namespace nedit
