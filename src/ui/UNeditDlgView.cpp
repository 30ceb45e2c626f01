#include "ui/UNeditDlgView.h"

#include <QEvent>
#include <QFontDatabase>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <algorithm>

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/units/Units.h"
#include "ui/RowEditRecorder.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

constexpr int kFieldsPerLine = 8;
constexpr int kFieldWidthInDigits = 10;

UEdit::Kind EditKindOf(int kind) {
    switch (kind) {
        case 1:
        case 2:
            return UEdit::Kind::Long;
        case URecordDlg::kRealNumber:
            return UEdit::Kind::Double;
        case URecordDlg::kAngle:
            return UEdit::Kind::Angle;
        default:
            return UEdit::Kind::Text;
    }
}

/// What fields a record needs: its label, and the caption and kind of each field.
std::wstring LayoutOf(const URecordDlg& dialog) {
    std::wstring layout = dialog.GetLabel();
    for (const URecordDlg::EDITFLDPTR& field : dialog.GetFields())
        layout += L'|' + field.Caption + L':' + std::to_wstring(field.Kind);
    return layout;
}

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
    grid_->setHorizontalSpacing(8);
    grid_->setVerticalSpacing(2);
    grid_->setAlignment(Qt::AlignTop);
    layout->addLayout(grid_, 1);
}

UNeditDlgView::~UNeditDlgView() = default;

void UNeditDlgView::SetDoc(UNeditDoc* doc) {
    RemoveFields();
    dialog_.reset();
    if (doc == nullptr) return;
    dialog_ = std::make_unique<URecordDlg>(*doc);
    dialog_->SetDoc(doc);
    dialog_->SetList(list_);
}

void UNeditDlgView::SetList(UListCtrl* list) {
    list_ = list;
    if (dialog_) dialog_->SetList(list);
}

void UNeditDlgView::SetAngType(int type) {
    if (dialog_) dialog_->SetAngType(type);
}

void UNeditDlgView::SetModified() {
    if (dialog_) dialog_->SetModified();
}

bool UNeditDlgView::GetModifiedFlag() const {
    return dialog_ && dialog_->GetModifiedFlag() != 0;
}

void UNeditDlgView::ClearModified() {
    if (dialog_) dialog_->ClearModified();
}

int UNeditDlgView::Row() const {
    return dialog_ ? dialog_->GetRow() : -1;
}

void UNeditDlgView::ClearFields() {
    if (dialog_) dialog_->ClearFields();
    RemoveFields();
}

void UNeditDlgView::RemoveFields() {
    for (QLabel* caption : captions_) delete caption;
    for (UEdit* edit : edits_) delete edit;
    captions_.clear();
    edits_.clear();
    layout_.clear();
    label_->clear();
}

int UNeditDlgView::ShowRecord(const std::wstring& text, int row) {
    if (!dialog_) return 0;
    const int shown = dialog_->ShowRecord(text, row);
    ShowFields();
    return shown;
}

void UNeditDlgView::ShowFields() {
    const std::vector<URecordDlg::EDITFLDPTR>& fields = dialog_->GetFields();
    const AngleUnit angles = AngleUnitFromIndex(dialog_->GetAngType());
    const std::wstring layout = LayoutOf(*dialog_);
    if (fields.empty() || layout != layout_) {
        RemoveFields();
        if (fields.empty()) return;
        layout_ = layout;
        label_->setText(QString::fromStdWString(dialog_->GetLabel()));
        const QFont fixed = QFontDatabase::systemFont(QFontDatabase::FixedFont);
        // A line shown whole takes the width of the form.
        const int span = dialog_->GetLabel().empty() ? kFieldsPerLine : 1;
        for (std::size_t i = 0; i < fields.size(); ++i) {
            auto* caption = new QLabel(QString::fromStdWString(fields[i].Caption), this);
            auto* edit = new UEdit(EditKindOf(fields[i].Kind), nullptr, this);
            edit->setFont(fixed);
            edit->setMinimumWidth(edit->fontMetrics().horizontalAdvance(QLatin1Char('0')) *
                                  kFieldWidthInDigits);
            edit->setReadOnly(!fields[i].Linked);
            edit->installEventFilter(this);
            const int index = static_cast<int>(i);
            connect(edit, &QLineEdit::textEdited, this, [this, index] { FieldEdited(index); });
            const int line = index / kFieldsPerLine * 2;
            const int column = index % kFieldsPerLine;
            grid_->addWidget(caption, line, column, 1, span, Qt::AlignLeft | Qt::AlignBottom);
            grid_->addWidget(edit, line + 1, column, 1, span);
            captions_.push_back(caption);
            edits_.push_back(edit);
        }
        // The fields share the width of the form between them.
        const int used = std::min(static_cast<int>(fields.size()) * span, kFieldsPerLine);
        for (int column = 0; column < kFieldsPerLine; ++column)
            grid_->setColumnStretch(column, column < used ? 1 : 0);
    }
    for (std::size_t i = 0; i < fields.size(); ++i) {
        edits_[i]->SetAngleUnit(angles);
        edits_[i]->setText(QString::fromStdWString(fields[i].Value));
        edits_[i]->setCursorPosition(0);
    }
}

void UNeditDlgView::FieldEdited(int index) {
    if (!dialog_ || index >= static_cast<int>(edits_.size())) return;
    RowEditStep step(recorder_, tr("Typing"), true);
    dialog_->OnFieldChanged(index, edits_[static_cast<std::size_t>(index)]->text().toStdWString());
    // A unit record typed in changes the unit the angle fields show.
    const AngleUnit angles = AngleUnitFromIndex(dialog_->GetAngType());
    for (UEdit* edit : edits_) edit->SetAngleUnit(angles);
}

bool UNeditDlgView::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() != QEvent::KeyPress) return QWidget::eventFilter(watched, event);
    const auto* key = static_cast<QKeyEvent*>(event);
    const auto found = std::find(edits_.begin(), edits_.end(), watched);
    if (found == edits_.end()) return QWidget::eventFilter(watched, event);
    if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
        emit listFocusWanted();
        return true;
    }
    if (key->key() == Qt::Key_Escape) {
        const int index = static_cast<int>(found - edits_.begin());
        if (!(*found)->isReadOnly()) {
            (*found)->setText(QString::fromStdWString(dialog_->RememberedText(index)));
            FieldEdited(index);
        }
        return true;
    }
    return QWidget::eventFilter(watched, event);
}

QLineEdit* UNeditDlgView::FieldEdit(int index) const {
    return index >= 0 && index < static_cast<int>(edits_.size())
               ? edits_[static_cast<std::size_t>(index)]
               : nullptr;
}

QString UNeditDlgView::FieldCaption(int index) const {
    return index >= 0 && index < static_cast<int>(captions_.size())
               ? captions_[static_cast<std::size_t>(index)]->text()
               : QString();
}

QString UNeditDlgView::RecordLabel() const {
    return label_->text();
}

int UNeditDlgView::HeightForLines(int lines) const {
    return fontMetrics().lineSpacing() * lines;
}

}  // namespace nedit
