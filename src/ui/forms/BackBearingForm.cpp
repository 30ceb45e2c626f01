#include "ui/forms/BackBearingForm.h"

#include <QCheckBox>
#include <QFormLayout>
#include <QLabel>
#include <QVBoxLayout>

#include "platform/job/UJobSettings.h"
#include "platform/units/Units.h"
#include "ui/forms/NumberField.h"

namespace nedit {

namespace {

AngleUnit UnitOf(const UJobSettings* settings) {
    return settings != nullptr ? settings->GetAngleUnit() : AngleUnit::DegMinSec;
}

}  // namespace

BackBearingForm::BackBearingForm(UBKBCoordDlg& dialog, const UJobSettings* settings,
                                 QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Back Bearing"), parent),
      dialog_(dialog),
      settings_(settings),
      east_(new NumberField(this)),
      north_(new NumberField(this)),
      height_(new NumberField(this)),
      bearing_(new NumberField(this)),
      apply_bearing_(new QCheckBox(QStringLiteral("Apply Bearing"), this)) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* fields = new QFormLayout();
    fields->addRow(QStringLiteral("Point Name"),
                   new QLabel(QString::fromStdWString(dialog_.GetPointName()), this));
    fields->addRow(QStringLiteral("Easting"), east_);
    fields->addRow(QStringLiteral("Northing"), north_);
    fields->addRow(QStringLiteral("Height"), height_);
    fields->addRow(QStringLiteral("Bearing"), bearing_);
    layout->addLayout(fields);
    layout->addWidget(apply_bearing_);
    east_->SetValue(dialog_.East);
    north_->SetValue(dialog_.North);
    height_->SetValue(dialog_.Height);
    bearing_->SetValue(FromDegrees(dialog_.Bearing, UnitOf(settings_)), 4);
    apply_bearing_->setChecked(dialog_.ApplyBearing);
    connect(apply_bearing_, &QCheckBox::toggled, this, [this](bool on) {
        dialog_.ApplyBearing = on;
        UpdateEditable();
    });
    UpdateEditable();
    AddButtons(layout, QDialogButtonBox::Ok);
}

void BackBearingForm::UpdateEditable() {
    for (NumberField* field : {east_, north_, height_})
        field->setEnabled(dialog_.AreCoordinatesEditable());
    bearing_->setEnabled(dialog_.IsBearingEditable());
}

void BackBearingForm::Store() {
    dialog_.East = east_->Value();
    dialog_.North = north_->Value();
    dialog_.Height = height_->Value();
    dialog_.Bearing = ToDegrees(bearing_->Value(), UnitOf(settings_));
    dialog_.ApplyBearing = apply_bearing_->isChecked();
}

}  // namespace nedit
