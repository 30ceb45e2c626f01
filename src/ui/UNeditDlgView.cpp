#include "ui/UNeditDlgView.h"

#include <QFontDatabase>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>

#include "document/UListCtrl.h"
#include "ui/RecordFields.h"
#include "ui/RowEditRecorder.h"

namespace nedit {

namespace {
constexpr int kFieldsPerLine = 6;
}  // namespace

UNeditDlgView::UNeditDlgView(QWidget* parent)
    : QWidget(parent), label_(new QLabel(this)), grid_(new QGridLayout()) {
    setObjectName(QStringLiteral("RecordForm"));
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(8, 6, 8, 6);
    QFont bold = label_->font();
    bold.setBold(true);
    bold.setPointSizeF(bold.pointSizeF() * 1.15);
    label_->setFont(bold);
    label_->setMinimumWidth(label_->fontMetrics().horizontalAdvance(QStringLiteral("TARGETHT2")));
    label_->setAlignment(Qt::AlignLeft | Qt::AlignTop);
    layout->addWidget(label_);
    grid_->setHorizontalSpacing(6);
    grid_->setVerticalSpacing(4);
    layout->addLayout(grid_, 1);
}

void UNeditDlgView::ClearFields() {
    for (QLabel* name : names_) delete name;
    for (QLineEdit* edit : edits_) delete edit;
    names_.clear();
    edits_.clear();
    field_names_.clear();
    key_.clear();
    label_->clear();
    row_ = -1;
}

int UNeditDlgView::ShowRecord(const std::wstring& text, int row) {
    const RecordFields record = RecordFields::Split(text);
    ClearFields();
    if (record.key.empty()) return 0;
    row_ = row;
    key_ = record.key;
    label_->setText(QString::fromStdWString(record.key));
    const QFont fixed = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    int index = 0;
    for (const RecordFields::Field& field : record.fields) {
        auto* name = new QLabel(
            field.name.empty() ? QStringLiteral("Value") : QString::fromStdWString(field.name),
            this);
        auto* edit = new QLineEdit(QString::fromStdWString(field.value), this);
        edit->setFont(fixed);
        edit->setMinimumWidth(edit->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 10);
        connect(edit, &QLineEdit::textEdited, this, &UNeditDlgView::FieldEdited);
        const int line = index / kFieldsPerLine;
        const int column = (index % kFieldsPerLine) * 2;
        grid_->addWidget(name, line, column, Qt::AlignRight);
        grid_->addWidget(edit, line, column + 1);
        names_.push_back(name);
        edits_.push_back(edit);
        field_names_.push_back(field.name);
        ++index;
    }
    return record.fields.empty() ? 0 : 1;
}

void UNeditDlgView::FieldEdited() {
    if (list_ == nullptr || row_ < 0) return;
    RecordFields record;
    record.key = key_;
    for (std::size_t i = 0; i < edits_.size(); ++i)
        record.fields.push_back({field_names_[i], edits_[i]->text().toStdWString()});
    RowEditStep step(recorder_, tr("Typing"), true);
    if (list_->SetRecord(row_, record.Join()) >= 0) SetModified();
}

QLineEdit* UNeditDlgView::FieldEdit(int index) const {
    return index >= 0 && index < static_cast<int>(edits_.size())
               ? edits_[static_cast<std::size_t>(index)]
               : nullptr;
}

QString UNeditDlgView::RecordLabel() const {
    return label_->text();
}

int UNeditDlgView::HeightForLines(int lines) const {
    return fontMetrics().lineSpacing() * lines;
}

}  // namespace nedit
