#include "ui/forms/TraverseForm.h"

#include <QAbstractButton>
#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QSignalBlocker>
#include <QVBoxLayout>
#include <array>

#include "reduction/UNeditDatabase.h"
#include "ui/SXTView.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

namespace nedit {

namespace {

using Dlg = USelRouteDlg;

SXTView::Route NamesOf(const NameList* route) {
    SXTView::Route names;
    if (route != nullptr) {
        for (const NameEntry& entry : *route) names.push_back(entry.Key);
    }
    return names;
}

/// Refills a combo of names and selects `current`; an editable one shows a name that is
/// not among them as typed.
void Fill(QComboBox* combo, const std::vector<std::wstring>& names, const std::wstring& current) {
    const QSignalBlocker quiet(combo);
    combo->clear();
    for (const std::wstring& name : names) combo->addItem(QString::fromStdWString(name));
    const QString text = QString::fromStdWString(current);
    const int index = combo->findText(text, Qt::MatchFixedString);
    combo->setCurrentIndex(index);
    if (index < 0 && combo->isEditable()) combo->setEditText(text);
}

}  // namespace

TraverseForm::TraverseForm(USelRouteDlg& dialog, const FormContext& context, QWidget* parent)
    : LogicForm(dialog, QStringLiteral("Traverse Adjustment"), parent, context),
      dialog_(dialog),
      east_first_(dialog.GetDialogId() != Dlg::kNorthFirstId) {
    dialog_.OnInitDialog();
    auto* layout = new QVBoxLayout(this);
    auto* columns = new QHBoxLayout();
    layout->addLayout(columns);

    // The routes and the plan of the chosen one.
    auto* left = new QVBoxLayout();
    left->addWidget(new QLabel(QStringLiteral("Traverse Routes"), this));
    routes_ = new QListWidget(this);
    routes_->setMaximumHeight(routes_->fontMetrics().height() * 8);
    controls_[Dlg::kRouteList] = routes_;
    left->addWidget(routes_);
    const UNeditDatabase* database = dialog_.GetDatabase();
    preview_ = new SXTView(database != nullptr ? database->GetDocExtents() : UWRect(), this);
    preview_->setMinimumSize(240, 240);
    preview_->SetDatabase(database);
    std::vector<SXTView::Route> all;
    for (const Dlg::RouteRow& row : dialog_.GetRouteRows()) all.push_back(NamesOf(row.Route));
    preview_->SetAllRoutes(std::move(all));
    left->addWidget(preview_, 1);
    columns->addLayout(left);

    auto* middle = new QVBoxLayout();
    middle->addWidget(StartGroup());
    middle->addWidget(EndGroup());
    middle->addStretch();
    columns->addLayout(middle);
    auto* right = new QVBoxLayout();
    right->addWidget(AngleGroup());
    right->addWidget(RuleGroup());
    right->addStretch();
    columns->addLayout(right);

    QDialogButtonBox* buttons = AddButtons(layout, QDialogButtonBox::Cancel);
    QPushButton* compute =
        buttons->addButton(QStringLiteral("Compute"), QDialogButtonBox::AcceptRole);
    compute->setDefault(true);
    controls_[Dlg::kComputeButton] = compute;

    connect(routes_, &QListWidget::currentRowChanged, this,
            [this](int row) { Act([this, row] { dialog_.OnSelectRoute(row); }); });
    connect(&Maker(), &UDlgMaker::changed, this, [this](QObject* control) {
        if (!refreshing_) Refresh(control);
    });
    Refresh();
}

QWidget* TraverseForm::Control(int id) const {
    const auto found = controls_.find(id);
    return found != controls_.end() ? found->second : nullptr;
}

UEdit* TraverseForm::Field(int id) const {
    return qobject_cast<UEdit*>(Control(id));
}

QComboBox* TraverseForm::Combo(int id) const {
    return qobject_cast<QComboBox*>(Control(id));
}

QAbstractButton* TraverseForm::Button(int id) const {
    return qobject_cast<QAbstractButton*>(Control(id));
}

QComboBox* TraverseForm::NameCombo(int id, const NameAct& chosen, const NameAct& typed) {
    auto* combo = new QComboBox(this);
    combo->setEditable(static_cast<bool>(typed));
    combo->setInsertPolicy(QComboBox::NoInsert);
    combo->setMinimumContentsLength(10);
    controls_[id] = combo;
    connect(combo, &QComboBox::textActivated, this, [this, chosen](const QString& name) {
        Act([&chosen, &name] { chosen(name.toStdWString()); });
    });
    if (typed) {
        connect(combo->lineEdit(), &QLineEdit::textEdited, this,
                [this, typed, combo](const QString& text) {
                    Act([&typed, &text] { typed(text.toStdWString()); }, combo);
                });
    }
    return combo;
}

UEdit* TraverseForm::PointField(int id, std::wstring& value, const NameAct& changed) {
    UEdit* field = Maker().Edit("TEXT", value);
    controls_[id] = field;
    connect(field, &QLineEdit::textChanged, this, [this, changed, field](const QString& text) {
        Act([&changed, &text] { changed(text.trimmed().toStdWString()); }, field);
    });
    return field;
}

UEdit* TraverseForm::Coordinate(int id, const char* definition, double& value) {
    UEdit* field = Maker().Edit(definition, value);
    field->setMinimumWidth(field->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 14);
    controls_[id] = field;
    // Once typed, the value shows as every other does.
    connect(field, &QLineEdit::editingFinished, this, [this] {
        if (!refreshing_) Refresh();
    });
    return field;
}

void TraverseForm::AddPlanRows(QFormLayout* rows, PlanField east, PlanField north, bool closing) {
    const std::array<PlanField, 2> shown =
        east_first_ ? std::array{east, north} : std::array{north, east};
    // Made in the order shown, so that Tab walks them so.
    std::array<UEdit*, 2> fields{};
    for (std::size_t place = 0; place < shown.size(); ++place)
        fields[place] = Coordinate(shown[place].id, "COORDINATE", *shown[place].value);
    for (std::size_t place = 0; place < shown.size(); ++place) {
        UEdit* field = fields[place];
        rows->addRow(
            shown[place].id == east.id ? QStringLiteral("Easting") : QStringLiteral("Northing"),
            field);
        // The closing bearing follows the fixed and the closing coordinates.
        if (closing) {
            connect(field, &QLineEdit::textChanged, this,
                    [this, field] { Act([this] { dialog_.OnCoordinatesChanged(); }, field); });
        }
    }
}

void TraverseForm::AddCoordOrBearing(QFormLayout* rows, int coordId, int bearingId,
                                     const int& useCoord,
                                     const std::function<void(bool)>& clicked) {
    QButtonGroup* group = Maker().Radio(
        "RADIO,1", [coordId, bearingId, &useCoord] { return useCoord != 0 ? coordId : bearingId; },
        [coordId, &useCoord, clicked](int id) {
            // Its handler runs only when the choice changes.
            if ((useCoord != 0) != (id == coordId)) clicked(id == coordId);
        },
        {{coordId, QStringLiteral("Use Coord")}, {bearingId, QStringLiteral("Use Bearing")}});
    auto* choice = new QHBoxLayout();
    for (const int id : {coordId, bearingId}) {
        controls_[id] = group->button(id);
        choice->addWidget(group->button(id));
    }
    rows->addRow(QString(), choice);
}

QGroupBox* TraverseForm::StartGroup() {
    auto* group = new QGroupBox(QStringLiteral("Start Station"), this);
    auto* rows = new QFormLayout(group);
    rows->addRow(QStringLiteral("Start Pt."),
                 NameCombo(Dlg::kStartCombo,
                           [this](const std::wstring& name) { dialog_.OnStartChanged(name); }));
    AddPlanRows(rows, {kStartXField, &dialog_.StartX}, {kStartYField, &dialog_.StartY}, false);
    rows->addRow(QStringLiteral("Height"), Coordinate(kStartZField, "ELEVATION", dialog_.StartZ));
    rows->addRow(QStringLiteral("Backsight Pt."),
                 NameCombo(Dlg::kBackSightCombo,
                           [this](const std::wstring& name) { dialog_.OnBackSightChosen(name); }));
    AddCoordOrBearing(rows, Dlg::kUseBSCoordRadio, Dlg::kUseBSBearingRadio, dialog_.UseBSCoord,
                      [this](bool coord) { dialog_.OnOrientationClicked(coord); });
    AddPlanRows(rows, {Dlg::kBSXField, &dialog_.BSX}, {Dlg::kBSYField, &dialog_.BSY}, false);
    rows->addRow(QStringLiteral("Bearing"),
                 Coordinate(Dlg::kStartBearingField, "BEARING", dialog_.StartBearing));
    return group;
}

QGroupBox* TraverseForm::EndGroup() {
    auto* group = new QGroupBox(QStringLiteral("End Station"), this);
    auto* rows = new QFormLayout(group);
    rows->addRow(
        QStringLiteral("End Pt."),
        NameCombo(
            Dlg::kEndCombo, [this](const std::wstring& name) { dialog_.OnEndChosen(name); },
            [this](const std::wstring& text) { dialog_.OnEndTyped(text); }));
    rows->addRow(QStringLiteral("Fixed Pt."),
                 PointField(Dlg::kFixedPtField, dialog_.FixedPt,
                            [this](const std::wstring& text) { dialog_.OnFixedPtChanged(text); }));
    AddPlanRows(rows, {Dlg::kFixedXField, &dialog_.FixedX}, {Dlg::kFixedYField, &dialog_.FixedY},
                true);
    rows->addRow(QStringLiteral("Height"),
                 Coordinate(Dlg::kFixedZField, "ELEVATION", dialog_.FixedZ));
    return group;
}

QGroupBox* TraverseForm::AngleGroup() {
    auto* group = new QGroupBox(QStringLiteral("Angle Adjustment"), this);
    auto* rows = new QFormLayout(group);
    QCheckBox* adjust = Maker().Check(
        "CHECK,0", QStringLiteral("Adjust Angle"), [this] { return dialog_.AdjustAngle != 0; },
        [this](bool on) {
            // Its handler proposes the check afresh, so it runs only when the box changes.
            if ((dialog_.AdjustAngle != 0) != on) dialog_.OnAdjustAngleClicked(on);
        });
    controls_[Dlg::kAdjustAngleBox] = adjust;
    rows->addRow(adjust);
    rows->addRow(
        QStringLiteral("Close Pt."),
        NameCombo(
            Dlg::kCheckCombo, [this](const std::wstring& name) { dialog_.OnCheckPtChosen(name); },
            [this](const std::wstring& text) { dialog_.OnCheckPtTyped(text); }));
    AddCoordOrBearing(rows, Dlg::kUseCloseCoordRadio, Dlg::kUseCloseBearingRadio,
                      dialog_.UseCloseCoord,
                      [this](bool coord) { dialog_.OnCloseModeClicked(coord); });
    rows->addRow(QStringLiteral("Fixed Pt."),
                 PointField(Dlg::kClosePtField, dialog_.ClosePt,
                            [this](const std::wstring& text) { dialog_.OnClosePtChanged(text); }));
    AddPlanRows(rows, {Dlg::kCloseXField, &dialog_.CloseX}, {Dlg::kCloseYField, &dialog_.CloseY},
                true);
    rows->addRow(QStringLiteral("Bearing"),
                 Coordinate(Dlg::kCloseBearingField, "BEARING", dialog_.CloseBearing));
    return group;
}

QGroupBox* TraverseForm::RuleGroup() {
    QButtonGroup* rule = Maker().Radio(
        "RADIO,1", [this] { return dialog_.Transit != 0 ? kTransitRadio : kCompassRadio; },
        [this](int id) {
            dialog_.Transit = id == kTransitRadio ? 1 : 0;
            dialog_.Compass = 1 - dialog_.Transit;
        },
        {{kCompassRadio, QStringLiteral("Compass/Bowditch Method")},
         {kTransitRadio, QStringLiteral("Transit Method")}});
    for (const int id : {kCompassRadio, kTransitRadio}) controls_[id] = rule->button(id);
    return UDlgMaker::RadioBox(QStringLiteral("Adjustment"), rule, this);
}

void TraverseForm::Act(const std::function<void()>& act, const QObject* typing) {
    if (refreshing_) return;
    act();
    Refresh(typing);
}

void TraverseForm::FillRoutes() {
    const std::vector<Dlg::RouteRow>& rows = dialog_.GetRouteRows();
    const QSignalBlocker quiet(routes_);
    if (routes_->count() != static_cast<int>(rows.size())) {
        routes_->clear();
        for (const Dlg::RouteRow& row : rows) routes_->addItem(QString::fromStdWString(row.Text));
    }
    routes_->setCurrentRow(dialog_.GetSelectedRow());
}

void TraverseForm::Refresh(const QObject* typing) {
    refreshing_ = true;
    Maker().UpdateData(false, typing);
    FillRoutes();
    Fill(Combo(Dlg::kStartCombo), dialog_.GetStartNames(), dialog_.Start);
    Fill(Combo(Dlg::kBackSightCombo), dialog_.GetBackSightNames(), dialog_.BSName);
    const auto fill_unless_typed = [this, typing](int id, const std::vector<std::wstring>& names,
                                                  const std::wstring& current) {
        QComboBox* combo = Combo(id);
        // The name being typed stays as the user has it.
        if (typing != combo) Fill(combo, names, current);
    };
    fill_unless_typed(Dlg::kEndCombo, dialog_.GetEndNames(), dialog_.GetEndText());
    fill_unless_typed(Dlg::kCheckCombo, dialog_.GetCheckNames(), dialog_.ChkPt);
    for (const auto& [id, control] : controls_) control->setEnabled(dialog_.IsEnabled(id));
    preview_->SetRoute(NamesOf(dialog_.GetRouteSel()), dialog_.Start, dialog_.EndStn);
    refreshing_ = false;
}

void TraverseForm::Refused() {
    // A route carried on to an observed point joins the list; the values stay as they are.
    Refresh();
}

}  // namespace nedit
