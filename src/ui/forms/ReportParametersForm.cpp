#include "ui/forms/ReportParametersForm.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QRadioButton>
#include <QVBoxLayout>

namespace nedit {

namespace {

struct Column {
    int option;
    const char* text;
};

constexpr Column kMeasurementColumns[] = {
    {opt::ID, "ID"},
    {opt::LN, "Line No."},
    {opt::HA, "Horiz. Angle"},
    {opt::VA, "Vertical Angle"},
    {opt::SD, "Slope Distance"},
    {opt::HD, "Horiz. Distance"},
    {opt::VD, "Vertical Distance"},
    {opt::HT, "Target Height"},
    {opt::CO, "Code"},
};
constexpr Column kCoordinateColumns[] = {
    {opt::EC, "Easting"},
    {opt::NC, "Northing"},
    {opt::HC, "Elevation"},
};

QGroupBox* RadioGroup(const QString& title, const QStringList& texts, QButtonGroup* group,
                      int checked, QWidget* parent) {
    auto* box = new QGroupBox(title, parent);
    auto* layout = new QVBoxLayout(box);
    for (int i = 0; i < texts.size(); ++i) {
        auto* radio = new QRadioButton(texts[i], box);
        radio->setChecked(i == checked);
        group->addButton(radio, i);
        layout->addWidget(radio);
    }
    return box;
}

}  // namespace

ReportParametersForm::ReportParametersForm(UOutputParamDlg& dialog, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Report Parameters"), parent),
      dialog_(dialog),
      angular_(new QButtonGroup(this)),
      linear_(new QButtonGroup(this)) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* units = new QHBoxLayout();
    units->addWidget(RadioGroup(
        QStringLiteral("Angular  Output Units"),
        {QStringLiteral("DDD MM SS"), QStringLiteral("Decimal Degree"), QStringLiteral("Gon")},
        angular_, dialog_.AngularRadio, this));
    units->addWidget(RadioGroup(QStringLiteral("Linear Output Units"),
                                {QStringLiteral("Meters"), QStringLiteral("Feet")}, linear_,
                                dialog_.LinearRadio, this));
    layout->addLayout(units);
    auto add_columns = [this, layout](const QString& title, const auto& columns) {
        auto* box = new QGroupBox(title, this);
        auto* grid = new QGridLayout(box);
        int index = 0;
        for (const Column& column : columns) {
            auto* check = new QCheckBox(QString::fromLatin1(column.text), box);
            check->setChecked(dialog_.IsChecked(column.option));
            columns_[column.option] = check;
            grid->addWidget(check, index / 3, index % 3);
            ++index;
        }
        layout->addWidget(box);
    };
    add_columns(QStringLiteral("Measurement Output"), kMeasurementColumns);
    add_columns(QStringLiteral("Reduced Coordinates Output"), kCoordinateColumns);
    AddButtons(layout);
}

void ReportParametersForm::Store() {
    dialog_.AngularRadio = angular_->checkedId();
    dialog_.LinearRadio = linear_->checkedId();
    for (const auto& [option, box] : columns_) dialog_.SetChecked(option, box->isChecked());
}

}  // namespace nedit
