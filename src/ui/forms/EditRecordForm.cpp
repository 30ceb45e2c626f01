#include "ui/forms/EditRecordForm.h"

#include <QFontDatabase>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QVBoxLayout>

namespace nedit {

EditRecordForm::EditRecordForm(UEditRecordDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Edit Record Data"), parent), dialog_(dialog) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* key = new QLabel(QString::fromStdWString(dialog_.Record.key), this);
    QFont bold = key->font();
    bold.setBold(true);
    key->setFont(bold);
    layout->addWidget(key);
    auto* fields = new QFormLayout();
    const QFont fixed = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    for (const RecordFields::Field& field : dialog_.Record.fields) {
        auto* edit = new QLineEdit(QString::fromStdWString(field.value), this);
        edit->setFont(fixed);
        edit->setMinimumWidth(edit->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 24);
        edits_.push_back(edit);
        fields->addRow(
            field.name.empty() ? QStringLiteral("Value") : QString::fromStdWString(field.name),
            edit);
    }
    layout->addLayout(fields);
    AddButtons(layout);
}

void EditRecordForm::Store() {
    for (std::size_t i = 0; i < edits_.size(); ++i)
        dialog_.Record.fields[i].value = edits_[i]->text().trimmed().toStdWString();
}

}  // namespace nedit
