#include "ui/forms/BackBearingForm.h"

#include <QCheckBox>
#include <QFormLayout>
#include <QLabel>
#include <QVBoxLayout>

#include "platform/job/UJobSettings.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

BackBearingForm::BackBearingForm(UBKBCoordDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Back Bearing"), parent, context), dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* fields = new QFormLayout();
    fields->addRow(
        QStringLiteral("Point Name"),
        new QLabel(QStringLiteral("<b>%1</b>")
                       .arg(QString::fromStdWString(dialog_.GetPointName()).toHtmlEscaped()),
                   this));
    const bool north_first =
        context.job != nullptr && context.job->GetCoordinateOrder() == UJobSettings::kNorthEast;
    // Made in the order shown, so that Tab walks them so.
    for (const bool east : {!north_first, north_first}) {
        if (east) {
            east_ = maker.Edit("COORDINATE", dialog_.East);
            fields->addRow(QStringLiteral("Easting"), east_);
        } else {
            north_ = maker.Edit("COORDINATE", dialog_.North);
            fields->addRow(QStringLiteral("Northing"), north_);
        }
    }
    height_ = maker.Edit("DISTANCE", dialog_.Height);
    fields->addRow(QStringLiteral("Height"), height_);
    bearing_ = maker.Edit("BEARING", dialog_.Bearing);
    fields->addRow(QStringLiteral("Bearing"), bearing_);
    layout->addLayout(fields);
    apply_bearing_ = maker.Check("CHECK,0", QStringLiteral("Apply Bearing"), dialog_.ApplyBearing);
    layout->addWidget(apply_bearing_);
    AddButtons(layout, QDialogButtonBox::Ok);
    connect(&maker, &UDlgMaker::changed, this, &BackBearingForm::UpdateEditable);
    UpdateEditable();
}

void BackBearingForm::UpdateEditable() {
    for (UEdit* field : {east_, north_, height_})
        field->setEnabled(dialog_.AreCoordinatesEditable());
    bearing_->setEnabled(dialog_.IsBearingEditable());
}

}  // namespace nedit
