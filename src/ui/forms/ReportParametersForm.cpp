#include "ui/forms/ReportParametersForm.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QCheckBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"

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

}  // namespace

ReportParametersForm::ReportParametersForm(UOutputParamDlg& dialog, const FormContext& context,
                                           QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Report Parameters"), parent, context), dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* units = new QHBoxLayout();
    angular_ = maker.Radio("RADIO,1,", dialog_.AngularRadio,
                           {{0, QStringLiteral("DDD MM SS")},
                            {1, QStringLiteral("Decimal Degree")},
                            {2, QStringLiteral("Gon")}});
    units->addWidget(UDlgMaker::RadioBox(QStringLiteral("Angular  Output Units"), angular_, this));
    linear_ = maker.Radio("RADIO,1,", dialog_.LinearRadio,
                          {{0, QStringLiteral("Meters")}, {1, QStringLiteral("Feet")}});
    units->addWidget(UDlgMaker::RadioBox(QStringLiteral("Linear Output Units"), linear_, this));
    layout->addLayout(units);
    auto add_columns = [this, layout, &maker](const QString& title, const auto& columns) {
        auto* box = new QGroupBox(title, this);
        auto* grid = new QGridLayout(box);
        int index = 0;
        for (const Column& column : columns) {
            const int option = column.option;
            QCheckBox* check = maker.Check(
                "CHECK,1", QString::fromLatin1(column.text),
                [this, option] { return dialog_.IsChecked(option); },
                [this, option](bool on) { dialog_.SetChecked(option, on); });
            columns_[option] = check;
            grid->addWidget(check, index / 3, index % 3);
            ++index;
        }
        layout->addWidget(box);
    };
    add_columns(QStringLiteral("Measurement Output"), kMeasurementColumns);
    add_columns(QStringLiteral("Reduced Coordinates Output"), kCoordinateColumns);
    AddButtons(layout);
}

}  // namespace nedit
