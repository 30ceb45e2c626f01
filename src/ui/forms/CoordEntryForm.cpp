#include "ui/forms/CoordEntryForm.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QRadioButton>
#include <QVBoxLayout>

#include "platform/geometry/UWPoint.h"
#include "ui/forms/NumberField.h"

namespace nedit {

namespace {

using Source = UCoordEntryDlg::Source;
constexpr std::array<Source, 3> kSources = {Source::Database, Source::Field, Source::Enter};
constexpr std::array<const char*, 3> kSourceTexts = {"Database Coordinate", "Field Coordinate",
                                                     "Enter Coordinate"};

int IndexOf(Source source) {
    return static_cast<int>(source);
}

}  // namespace

CoordEntryForm::CoordEntryForm(UCoordEntryDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Control Point Coordinate"), parent), dialog_(dialog) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* name = new QLabel(QStringLiteral("Point Name: <b>%1</b>")
                                .arg(QString::fromStdWString(dialog_.GetName()).toHtmlEscaped()),
                            this);
    layout->addWidget(name);
    layout->addWidget(new QLabel(
        QStringLiteral("Select the desired source or enter the point coordinates."), this));

    const bool east_first = dialog_.GetDialogId() != UCoordEntryDlg::kNorthFirstId;
    // Grid columns of East, North and Height in this form's order.
    const std::array<int, 3> column = {east_first ? 1 : 2, east_first ? 2 : 1, 3};
    auto* grid = new QGridLayout();
    grid->addWidget(new QLabel(QStringLiteral("Easting"), this), 0, column[0]);
    grid->addWidget(new QLabel(QStringLiteral("Northing"), this), 0, column[1]);
    grid->addWidget(new QLabel(QStringLiteral("Height"), this), 0, column[2]);
    for (const Source source : kSources) {
        const int row = IndexOf(source) + 1;
        auto* radio = new QRadioButton(QString::fromLatin1(kSourceTexts[IndexOf(source)]), this);
        radio->setEnabled(dialog_.IsOffered(source) || source == Source::Enter);
        radio->setChecked(dialog_.GetSelectedSource() == source);
        connect(radio, &QRadioButton::toggled, this, [this, source](bool on) {
            if (on) Choose(source);
        });
        sources_[IndexOf(source)] = radio;
        grid->addWidget(radio, row, 0);
        const UCoordEntryDlg::Row& values = dialog_.RowOf(source);
        const std::array<double, 3> numbers = {values.East, values.North, values.Height};
        for (int i = 0; i < 3; ++i) {
            auto* field = new NumberField(this);
            const bool shown = source == Source::Enter || dialog_.IsOffered(source);
            if (shown && (i < 2 || numbers[i] > UWPoint::kNoHeight)) field->SetValue(numbers[i]);
            field->setReadOnly(source != Source::Enter);
            if (source == Source::Enter) entered_[i] = field;
            grid->addWidget(field, row, column[i]);
        }
    }
    layout->addLayout(grid);
    if (dialog_.HasFixedPointCheck()) {
        fixed_ = new QCheckBox(QStringLiteral("Fixed"), this);
        fixed_->setChecked(dialog_.IsFixedPoint());
        layout->addWidget(fixed_);
    } else {
        apply_all_ = new QCheckBox(QStringLiteral("Apply to All"), this);
        apply_all_->setChecked(dialog_.GetApplyToAll());
        layout->addWidget(apply_all_);
    }
    AddButtons(layout);
    Choose(dialog_.GetSelectedSource());
}

QRadioButton* CoordEntryForm::SourceButton(Source source) const {
    return sources_[IndexOf(source)];
}

void CoordEntryForm::Choose(Source source) {
    dialog_.SelectSource(source);
    for (NumberField* field : entered_) field->setEnabled(dialog_.IsEntryEditable());
}

void CoordEntryForm::Store() {
    if (dialog_.IsEntryEditable()) {
        const UCoordEntryDlg::Row& typed = dialog_.RowOf(Source::Enter);
        dialog_.InitXYZ(entered_[0]->Value(), entered_[1]->Value(),
                        entered_[2]->Value(UWPoint::kNoHeight), typed.Code);
        dialog_.SelectSource(Source::Enter);
    }
    if (apply_all_ != nullptr) dialog_.SetApplyToAll(apply_all_->isChecked());
    if (fixed_ != nullptr) dialog_.SetFixedPoint(fixed_->isChecked());
}

}  // namespace nedit
