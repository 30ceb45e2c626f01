#include "ui/forms/PointCodeForm.h"

#include <QCheckBox>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"

namespace nedit {

PointCodeForm::PointCodeForm(UToSvyDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent) {
    dialog.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    StringTransferSettings& settings = dialog.Settings;
    for (const auto& [text, member] :
         {std::pair{"Include String Numbers", &settings.IncludeStringNumbers},
          std::pair{"Include Comments", &settings.IncludeComments},
          std::pair{"Include Commands", &settings.IncludeCommands},
          std::pair{"Description", &settings.SaveDescription},
          std::pair{"Feature Code", &settings.SaveFeatureCode},
          std::pair{"Locked", &settings.Locked}}) {
        layout->addWidget(Maker().Check("CHECK,0", QString::fromLatin1(text), *member));
    }
    AddButtons(layout);
}

QCheckBox* PointCodeForm::Box(const QString& text) const {
    for (QCheckBox* box : findChildren<QCheckBox*>()) {
        if (box->text() == text) return box;
    }
    return nullptr;
}

}  // namespace nedit
