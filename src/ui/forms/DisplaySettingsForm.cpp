#include "ui/forms/DisplaySettingsForm.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QVBoxLayout>

namespace nedit {

DisplaySettingsForm::DisplaySettingsForm(UDisplaySettingsDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Display Settings"), parent), dialog_(dialog) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* sizes = new QFormLayout();
    for (const UNeditSettings::Id id : UDisplaySettingsDlg::kAll) {
        const QString label = QString::fromWCharArray(UDisplaySettingsDlg::Label(id));
        if (UDisplaySettingsDlg::IsCheckBox(id)) {
            auto* box = new QCheckBox(label, this);
            box->setChecked(dialog_.GetValue(id) != 0);
            box->setEnabled(UDisplaySettingsDlg::IsEditable(id));
            boxes_[id] = box;
            layout->addWidget(box);
            continue;
        }
        text_size_ = new QComboBox(this);
        for (int index = 0; index < 2; ++index)
            text_size_->addItem(QString::fromWCharArray(UDisplaySettingsDlg::TextSizeEntry(index)));
        text_size_->setCurrentIndex(dialog_.GetValue(id) == 1 ? 1 : 0);
        sizes->addRow(label, text_size_);
    }
    layout->addLayout(sizes);
    AddButtons(layout);
}

void DisplaySettingsForm::Store() {
    for (const auto& [id, box] : boxes_) dialog_.SetValue(id, box->isChecked() ? 1 : 0);
    dialog_.SetValue(UNeditSettings::TextSize, text_size_->currentIndex());
}

}  // namespace nedit
