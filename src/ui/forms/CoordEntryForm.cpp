#include "ui/forms/CoordEntryForm.h"

#include <QButtonGroup>
#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QRadioButton>
#include <QVBoxLayout>

#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

using Source = UCoordEntryDlg::Source;
constexpr std::array<Source, 3> kSources = {Source::Database, Source::Field, Source::Enter};
constexpr std::array<const char*, 3> kSourceTexts = {"Database Coordinate", "Field Coordinate",
                                                     "Enter Coordinate"};
constexpr std::array<const char*, 3> kColumnTexts = {"Easting", "Northing", "Height"};
constexpr std::array<const char*, 3> kColumnLinks = {"COORDINATE", "COORDINATE", "ELEVATION"};

int IndexOf(Source source) {
    return static_cast<int>(source);
}

double ValueOf(const UCoordEntryDlg::Row& row, int column) {
    return column == 0 ? row.East : column == 1 ? row.North : row.Height;
}

}  // namespace

CoordEntryForm::CoordEntryForm(UCoordEntryDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Control Point Coordinate"), parent, context),
      dialog_(dialog) {
    dialog_.OnInitDialog();
    UDlgMaker& maker = Maker();
    auto* layout = new QVBoxLayout(this);
    auto* name = new QLabel(QStringLiteral("Point Name: <b>%1</b>")
                                .arg(QString::fromStdWString(dialog_.GetName()).toHtmlEscaped()),
                            this);
    layout->addWidget(name);
    layout->addWidget(new QLabel(
        QStringLiteral("Select the desired source or enter the point coordinates."), this));

    // The columns in the order of the dialog's form: East, North, Height or North first.
    const bool east_first = dialog_.GetDialogId() != UCoordEntryDlg::kNorthFirstId;
    const std::array<int, 3> order = {east_first ? 0 : 1, east_first ? 1 : 0, 2};
    auto* grid = new QGridLayout();
    for (int place = 0; place < 3; ++place) {
        grid->addWidget(new QLabel(QString::fromLatin1(kColumnTexts[order[place]]), this), 0,
                        place + 1, Qt::AlignCenter);
    }
    std::vector<std::pair<int, QString>> choices;
    for (const Source source : kSources)
        choices.emplace_back(IndexOf(source), QString::fromLatin1(kSourceTexts[IndexOf(source)]));
    sources_ = maker.Radio(
        "RADIO,1,", [this] { return IndexOf(dialog_.GetSelectedSource()); },
        [this](int index) { dialog_.SelectSource(kSources[static_cast<std::size_t>(index)]); },
        choices);
    for (const Source source : kSources) {
        const int row = IndexOf(source) + 1;
        QAbstractButton* radio = sources_->button(IndexOf(source));
        radio->setEnabled(dialog_.IsOffered(source));
        grid->addWidget(radio, row, 0);
        // Made in the order shown, so that Tab walks the columns as they stand.
        for (int place = 0; place < 3; ++place) {
            const int column = order[place];
            UEdit* field = nullptr;
            if (source == Source::Enter) {
                field = maker.Edit(
                    kColumnLinks[column],
                    [this, column] { return ValueOf(dialog_.RowOf(Source::Enter), column); },
                    [this, column](double value) {
                        UCoordEntryDlg::Row typed = dialog_.RowOf(Source::Enter);
                        (column == 0   ? typed.East
                         : column == 1 ? typed.North
                                       : typed.Height) = value;
                        dialog_.InitXYZ(typed.East, typed.North, typed.Height, typed.Code);
                    });
            } else {
                field = new UEdit(UDlgMaker::KindOf(kColumnLinks[column]), context.job, this);
                if (dialog_.IsOffered(source))
                    field->SetValue(ValueOf(dialog_.RowOf(source), column));
                field->setReadOnly(true);
                field->setFocusPolicy(Qt::NoFocus);
            }
            field->setMinimumWidth(field->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 16);
            fields_[static_cast<std::size_t>(IndexOf(source))][static_cast<std::size_t>(column)] =
                field;
            grid->addWidget(field, row, place + 1);
        }
    }
    layout->addLayout(grid);
    if (dialog_.HasFixedPointCheck()) {
        fixed_ = maker.Check(
            "CHECK,1", QStringLiteral("Fixed"), [this] { return dialog_.IsFixedPoint(); },
            [this](bool on) { dialog_.SetFixedPoint(on); });
        layout->addWidget(fixed_);
    } else {
        apply_all_ = maker.Check(
            "CHECK,0", QStringLiteral("Apply to All"), [this] { return dialog_.GetApplyToAll(); },
            [this](bool on) { dialog_.SetApplyToAll(on); });
        layout->addWidget(apply_all_);
    }
    AddButtons(layout);
    connect(&maker, &UDlgMaker::changed, this, &CoordEntryForm::UpdateEditable);
    UpdateEditable();
}

QRadioButton* CoordEntryForm::SourceButton(Source source) const {
    return static_cast<QRadioButton*>(sources_->button(IndexOf(source)));
}

UEdit* CoordEntryForm::Field(Source source, int column) const {
    return fields_[static_cast<std::size_t>(IndexOf(source))][static_cast<std::size_t>(column)];
}

void CoordEntryForm::UpdateEditable() {
    for (UEdit* field : fields_[static_cast<std::size_t>(IndexOf(Source::Enter))])
        field->setEnabled(dialog_.IsEntryEditable());
}

}  // namespace nedit
