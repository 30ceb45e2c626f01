#include "ui/forms/ObjectInfoForm.h"

#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QVBoxLayout>

namespace nedit {

ObjectInfoForm::ObjectInfoForm(UObjectInfoDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent) {
    dialog.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    if (!dialog.GetHeading().empty()) {
        auto* heading = new QLabel(QString::fromStdWString(dialog.GetHeading()), this);
        QFont bold = heading->font();
        bold.setBold(true);
        heading->setFont(bold);
        layout->addWidget(heading);
    }
    auto* rows = new QFormLayout();
    for (const UObjectInfoDlg::Row& row : dialog.GetRows()) {
        auto* value = new QLineEdit(QString::fromStdWString(row.value), this);
        value->setReadOnly(true);
        value->setMinimumWidth(value->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 18);
        rows->addRow(QString::fromStdWString(row.label), value);
    }
    layout->addLayout(rows);
    AddButtons(layout, QDialogButtonBox::Ok);
}

}  // namespace nedit
