#include "ui/forms/MiscloseReportForm.h"

#include <QCheckBox>
#include <QFormLayout>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include "platform/job/UJobSettings.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

/// A figure is read, not typed: it keeps out of the walk of Tab and looks so.
UEdit* Shown(UEdit* field) {
    field->setReadOnly(true);
    field->setFocusPolicy(Qt::ClickFocus);
    QPalette colours = field->palette();
    colours.setColor(QPalette::Base, colours.color(QPalette::Window));
    field->setPalette(colours);
    field->setMinimumWidth(field->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 14);
    return field;
}

}  // namespace

MiscloseReportForm::MiscloseReportForm(UMisReportDlg& dialog, const FormContext& context,
                                       QWidget* parent)
    : LogicForm(dialog, QString::fromStdWString(dialog.DialogName()), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    stage_ = new QLabel(this);
    QFont bold = stage_->font();
    bold.setBold(true);
    bold.setPointSizeF(bold.pointSizeF() * 1.2);
    stage_->setFont(bold);
    layout->addWidget(stage_);
    const bool north_first =
        context.job != nullptr && context.job->GetCoordinateOrder() == UJobSettings::kNorthEast;

    // The fixed and the observed end, a column each of East, North and Elevation.
    auto* ends = new QGridLayout();
    ends->addWidget(new QLabel(QStringLiteral("ID"), this), 0, 1);
    const QStringList plan = north_first
                                 ? QStringList{QStringLiteral("North"), QStringLiteral("East")}
                                 : QStringList{QStringLiteral("East"), QStringLiteral("North")};
    for (int place = 0; place < 2; ++place)
        ends->addWidget(new QLabel(plan[place], this), 0, place + 2);
    ends->addWidget(new QLabel(QStringLiteral("Elevation"), this), 0, 4);
    struct End {
        const char* label;
        std::wstring* id;
        double* east;
        double* north;
        double* height;
    };
    const End fixed{"Fixed", &dialog_.FixedID, &dialog_.FixedE, &dialog_.FixedN, &dialog_.FixedH};
    const End observed{"Observed", &dialog_.ObservedID, &dialog_.ObservedE, &dialog_.ObservedN,
                       &dialog_.ObservedH};
    int row = 1;
    for (const End& end : {fixed, observed}) {
        const QString label = QString::fromLatin1(end.label);
        ends->addWidget(new QLabel(label + QStringLiteral(" Pt"), this), row, 0);
        UEdit* id = Shown(maker.Edit("TEXT", *end.id));
        id->setMinimumWidth(id->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 8);
        ends->addWidget(id, row, 1);
        UEdit* east = Shown(maker.Edit("COORDINATE", *end.east));
        east->setObjectName(label + QStringLiteral(" East"));
        UEdit* north = Shown(maker.Edit("COORDINATE", *end.north));
        north->setObjectName(label + QStringLiteral(" North"));
        ends->addWidget(north_first ? north : east, row, 2);
        ends->addWidget(north_first ? east : north, row, 3);
        UEdit* height = Shown(maker.Edit("ELEVATION", *end.height));
        height->setObjectName(label + QStringLiteral(" Elevation"));
        ends->addWidget(height, row, 4);
        ++row;
    }
    layout->addLayout(ends);

    auto* figures = new QHBoxLayout();
    auto* misclose = new QGroupBox(QStringLiteral("Coordinate Misclose"), this);
    auto* differences = new QFormLayout(misclose);
    const auto add = [&maker](QFormLayout* rows, const char* label, const char* definition,
                              double& value) {
        UEdit* field = Shown(maker.Edit(definition, value));
        field->setObjectName(QString::fromLatin1(label));
        rows->addRow(QString::fromLatin1(label), field);
        return field;
    };
    if (north_first) add(differences, "North Diff", "COORDINATE", dialog_.DiffN);
    add(differences, "East Diff", "COORDINATE", dialog_.DiffE);
    if (!north_first) add(differences, "North Diff", "COORDINATE", dialog_.DiffN);
    add(differences, "Elev Diff", "COORDINATE", dialog_.DiffH);
    add(differences, "Misclose Bearing", "BEARING", dialog_.MiscloseBearing);
    add(differences, "Distance", "DISTANCE", dialog_.MiscloseDist);
    figures->addWidget(misclose);

    auto* traverse = new QGroupBox(QStringLiteral("Traverse"), this);
    auto* rows = new QFormLayout(traverse);
    angular_error_ = add(rows, "Angular Error", "ANGLE", dialog_.AngularError);
    per_station_ = add(rows, "Per Station", "ANGLE", dialog_.PerStation);
    add(rows, "Enclosed Area", "AREA", dialog_.EnclosedArea);
    UEdit* accuracy = Shown(maker.Edit("TEXT", dialog_.Accuracy));
    accuracy->setObjectName(QStringLiteral("Accuracy"));
    rows->addRow(QStringLiteral("Accuracy"), accuracy);
    add(rows, "Traverse Length", "DISTANCE", dialog_.TraverseLength);
    UEdit* setups = Shown(maker.Edit(
        "LONG", [this] { return static_cast<double>(dialog_.Setups); }, [](double) {}));
    setups->setObjectName(QStringLiteral("No of Setup"));
    rows->addRow(QStringLiteral("No of Setup"), setups);
    figures->addWidget(traverse);
    layout->addLayout(figures);

    elevations_ = maker.Check(
        "CHECK,0", QStringLiteral("Adjust Elevations"),
        [this] { return dialog_.GetAdjustElevations(); },
        [this](bool on) { dialog_.OnAdjustElevations(on); });
    layout->addWidget(elevations_);
    layout->addWidget(
        new QLabel(QStringLiteral("Click OK to reduce side shots and save the points."), this));

    // The stages stand apart from OK and Cancel, which end the dialog.
    auto* foot = new QHBoxLayout();
    angles_ = new QPushButton(QStringLiteral("Angles"), this);
    coordinates_ = new QPushButton(QStringLiteral("Coordinates"), this);
    for (QPushButton* stage : {angles_, coordinates_}) {
        stage->setAutoDefault(false);  // Enter is OK, never a stage run by chance
        foot->addWidget(stage);
    }
    foot->addStretch();
    layout->addLayout(foot);
    AddButtons(foot)->button(QDialogButtonBox::Ok)->setDefault(true);
    connect(angles_, &QPushButton::clicked, this, [this] {
        dialog_.OnAngleAdjust();
        ShowStage();
    });
    connect(coordinates_, &QPushButton::clicked, this, [this] {
        dialog_.OnCoordinateAdjust();
        ShowStage();
    });
    ShowStage();
}

UEdit* MiscloseReportForm::Figure(const QString& label) const {
    return findChild<UEdit*>(label);
}

void MiscloseReportForm::ShowStage() {
    Maker().UpdateData(false);
    setWindowTitle(QString::fromStdWString(dialog_.DialogName()));
    stage_->setText(windowTitle());
    angles_->setEnabled(dialog_.IsEnabled(UMisReportDlg::kAnglesButton));
    coordinates_->setEnabled(dialog_.IsEnabled(UMisReportDlg::kCoordinatesButton));
    for (UEdit* field : {angular_error_, per_station_}) {
        const bool shown = dialog_.AngularFieldsShown();
        field->setEnabled(shown);
        if (!shown) field->clear();
    }
}

}  // namespace nedit
