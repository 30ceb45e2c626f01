#include "ui/forms/EditRecordForm.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QFontDatabase>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

#include "records/RecordTypes.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

using Control = UEditRecordDlg::Control;

const char* LinkOf(Control control) {
    switch (control) {
        case Control::PointName:
            return "POINTNAME";
        case Control::Angle:
            return "ANGLE";
        case Control::VAngle:
            return "VANGLE";
        case Control::Distance:
            return "DISTANCE";
        case Control::Length:
            return "LENGTH";
        case Control::Code:
            return "POINTCODE";
        case Control::Coord:
            return "COORDINATE";
        case Control::Elevation:
            return "ELEVATION";
        case Control::Bear:
            return "BEARING";
        case Control::Long:
            return "LONG";
        default:
            return "TEXT";
    }
}

}  // namespace

QString EditRecordForm::Description(int fieldId) {
    switch (fieldId) {
        case fld::ID:
            return QStringLiteral("Point Name");
        case fld::HA:
            return QStringLiteral("Horizontal Angle");
        case fld::VA:
            return QStringLiteral("Zenith Angle");
        case fld::SD:
            return QStringLiteral("Slope Distance");
        case fld::HD:
            return QStringLiteral("Horizontal Distance");
        case fld::VD:
            return QStringLiteral("Vertical Distance");
        case fld::HT:
            return QStringLiteral("Target Height");
        case fld::HI:
            return QStringLiteral("Instrument Height");
        case fld::CO:
            return QStringLiteral("Code");
        case fld::E:
            return QStringLiteral("Easting");
        case fld::N:
            return QStringLiteral("Northing");
        case fld::H:
            return QStringLiteral("Height");
        case fld::OffsetAlong:
            return QStringLiteral("Offset Along");
        case fld::OffsetRight:
            return QStringLiteral("Offset Right");
        case fld::OffsetUp:
            return QStringLiteral("Offset Up");
        case fld::HCorr:
            return QStringLiteral("Horizontal Correction");
        case fld::VCorr:
            return QStringLiteral("Vertical Correction");
        case fld::BkBearing:
            return QStringLiteral("Bearing");
        case fld::Bearing2:
            return QStringLiteral("Second Bearing");
        case fld::File:
            return QStringLiteral("File");
        default:
            return {};
    }
}

EditRecordForm::EditRecordForm(UEditRecordDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QString(), parent, context), dialog_(dialog) {
    dialog_.OnInitDialog();
    setWindowTitle(QString::fromStdWString(dialog_.GetTitle()));
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* row = new QLabel(QString::fromStdWString(dialog_.GetRecordText()), this);
    row->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    row->setTextInteractionFlags(Qt::TextSelectableByMouse);
    layout->addWidget(row);
    if (dialog_.ShowsUnitChoices() || dialog_.ShowsModeChoices()) {
        auto* choices = new QHBoxLayout();
        if (dialog_.ShowsUnitChoices()) {
            first_ = maker.Radio("RADIO,1,", dialog_.LinearChoice,
                                 {{0, QStringLiteral("Meters")},
                                  {1, QStringLiteral("Feet")},
                                  {2, QStringLiteral("US Feet")}});
            second_ = maker.Radio("RADIO,1,", dialog_.AngularChoice,
                                  {{0, QStringLiteral("Deg Min Sec")},
                                   {1, QStringLiteral("Decimal Degrees")},
                                   {2, QStringLiteral("Gon")}});
            choices->addWidget(UDlgMaker::RadioBox(QStringLiteral("Linear"), first_, this));
            choices->addWidget(UDlgMaker::RadioBox(QStringLiteral("Angular"), second_, this));
        } else {
            first_ = maker.Radio(
                "RADIO,1,", dialog_.HorizontalChoice,
                {{0, QStringLiteral("North Azimuth")}, {1, QStringLiteral("South Azimuth")}});
            second_ = maker.Radio("RADIO,1,", dialog_.VerticalChoice,
                                  {{2, QStringLiteral("Zenith")},
                                   {4, QStringLiteral("Vertical")},
                                   {3, QStringLiteral("Nadir")}});
            choices->addWidget(
                UDlgMaker::RadioBox(QStringLiteral("Horizontal Angle"), first_, this));
            choices->addWidget(
                UDlgMaker::RadioBox(QStringLiteral("Vertical Angle"), second_, this));
        }
        layout->addLayout(choices);
    } else {
        auto* fields = new QFormLayout();
        fields->setLabelAlignment(Qt::AlignLeft);
        for (UEditRecordDlg::UFieldWindow& window : dialog_.Windows) {
            const char* link = LinkOf(window.Edit);
            UEdit* edit = UDlgMaker::KindOf(link) >= UEdit::Kind::Long
                              ? maker.Edit(
                                    link, [&window] { return window.Number; },
                                    [&window](double value) { window.Number = value; })
                              : maker.Edit(link, window.Value);
            edit->SetMinimumDecimals(window.Decimals);
            edit->setMinimumWidth(edit->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 22);
            const QString description = Description(window.Id);
            const QString name = QString::fromStdWString(window.Name);
            fields->addRow(description.isEmpty()
                               ? name
                               : QStringLiteral("%1   <span style=\"color:gray\">%2</span>")
                                     .arg(name, description),
                           edit);
            edits_.push_back(edit);
        }
        // Shown again with the places of each value; a number the record does not hold
        // shows as the record has it. Only what the user types afterwards is an edit.
        maker.UpdateData(false);
        for (std::size_t i = 0; i < edits_.size(); ++i) {
            UEditRecordDlg::UFieldWindow& window = dialog_.Windows[i];
            if (edits_[i]->IsNumber() && !window.HasNumber)
                edits_[i]->setText(QString::fromStdWString(window.Value));
            connect(edits_[i], &QLineEdit::textChanged, this, [&window](const QString& text) {
                window.Value = text.toStdWString();
                window.Edited = true;
            });
        }
        layout->addLayout(fields);
    }
    AddButtons(layout);
}

UEdit* EditRecordForm::FieldEdit(int index) const {
    return index >= 0 && index < static_cast<int>(edits_.size())
               ? edits_[static_cast<std::size_t>(index)]
               : nullptr;
}

}  // namespace nedit
