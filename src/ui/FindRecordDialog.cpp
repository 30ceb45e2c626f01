#include "ui/FindRecordDialog.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QVBoxLayout>

namespace nedit {

FindRecordDialog::FindRecordDialog(QWidget* parent)
    : QDialog(parent),
      text_(new QLineEdit(this)),
      match_case_(new QCheckBox(QStringLiteral("Match case"), this)),
      whole_word_(new QCheckBox(QStringLiteral("Match whole word only"), this)),
      up_(new QRadioButton(QStringLiteral("Up"), this)),
      down_(new QRadioButton(QStringLiteral("Down"), this)) {
    setObjectName(QStringLiteral("Find"));
    setWindowTitle(QStringLiteral("Find"));
    setAttribute(Qt::WA_DeleteOnClose);
    setModal(false);
    auto* layout = new QGridLayout(this);
    layout->addWidget(new QLabel(QStringLiteral("Find what:"), this), 0, 0);
    layout->addWidget(text_, 0, 1, 1, 2);
    auto* options = new QVBoxLayout();
    options->addWidget(whole_word_);
    options->addWidget(match_case_);
    layout->addLayout(options, 1, 0, 1, 2);
    auto* direction = new QGroupBox(QStringLiteral("Direction"), this);
    auto* directions = new QHBoxLayout(direction);
    directions->addWidget(up_);
    directions->addWidget(down_);
    down_->setChecked(true);
    layout->addWidget(direction, 1, 2);
    auto* find = new QPushButton(QStringLiteral("Find Next"), this);
    find->setDefault(true);
    auto* cancel = new QPushButton(QStringLiteral("Cancel"), this);
    auto* buttons = new QVBoxLayout();
    buttons->addWidget(find);
    buttons->addWidget(cancel);
    buttons->addStretch();
    layout->addLayout(buttons, 0, 3, 2, 1);
    connect(find, &QPushButton::clicked, this, &FindRecordDialog::FindNext);
    connect(cancel, &QPushButton::clicked, this, &FindRecordDialog::close);
}

void FindRecordDialog::FindNext() {
    const QString text = text_->text().trimmed();
    if (text.isEmpty()) return;
    emit findNext(text, down_->isChecked(), match_case_->isChecked(), whole_word_->isChecked());
}

}  // namespace nedit
