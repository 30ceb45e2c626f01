// The desktop's dialogs: their logic objects, with values worked out by hand, and their
// forms bound to them through the dialog host.

#include <QCheckBox>
#include <QComboBox>
#include <QRadioButton>
#include <QtTest>

#include "UiTestSupport.h"
#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "codes/UNeditPt.h"
#include "platform/job/UJobSettings.h"
#include "reduction/UBKBCoordDlg.h"
#include "reduction/UCoordEntryDlg.h"
#include "report/NeditIni.h"
#include "report/UOutputParamDlg.h"
#include "ui/dialogs/ObjectInfoDialogs.h"
#include "ui/dialogs/UDisplaySettingsDlg.h"
#include "ui/dialogs/UGetNameDlg.h"
#include "ui/forms/BackBearingForm.h"
#include "ui/forms/CoordEntryForm.h"
#include "ui/forms/ReportParametersForm.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ScriptedHost;

namespace {

/// A dialog that no form knows.
class PlainDialog : public UDialogLogic {
  public:
    std::wstring DialogName() const override { return L"Plain"; }
    bool OnOK() override {
        ++accepted;
        return true;
    }
    int accepted = 0;
};

}  // namespace

class DialogsTest : public QObject {
    Q_OBJECT
  private slots:
    void displaySettingsStoreOnlyWhatChanged();
    void lineDialogGivesBearingAndDistance();
    void lineDialogFollowsTheJobsAngleUnit();
    void arcDialogGivesTheArcsMeasures();
    void pointDialogPutsNorthingFirstForOrderOne();
    void documentNamesAreChecked();
    void messageBoxesAnswerWithTheirButtons();
    void coordinateFormTakesTypedValues();
    void coordinateFormWithFixedCheckHidesApplyToAll();
    void coordinateFormWalksTheJobsCoordinateOrder();
    void backBearingFormReadsTheJobsAngleUnit();
    void reportParametersFormStoresTheColumns();
    void aDialogWithoutAFormTakesItsDefaults();
};

void DialogsTest::displaySettingsStoreOnlyWhatChanged() {
    UNeditSettings settings;
    UDisplaySettingsDlg dialog(settings);
    QVERIFY(dialog.OnOK());
    QVERIFY(!dialog.HasChanged());
    dialog.SetValue(UNeditSettings::ShowPointCodes, 1);
    dialog.SetValue(UNeditSettings::TextSize, 1);
    QVERIFY(dialog.OnOK());
    QVERIFY(dialog.HasChanged());
    QCOMPARE(settings.Get(UNeditSettings::ShowPointCodes), 1);
    QCOMPARE(settings.Get(UNeditSettings::TextSize), 1);
    QCOMPARE(settings.Get(UNeditSettings::ShowPoints), 1);
    QVERIFY(!UDisplaySettingsDlg::IsEditable(UNeditSettings::ShowLines));
    QVERIFY(UDisplaySettingsDlg::IsEditable(UNeditSettings::ShowPointNumbers));
    QCOMPARE(QString::fromWCharArray(UDisplaySettingsDlg::TextSizeEntry(1)),
             QStringLiteral("Large"));
}

void DialogsTest::lineDialogGivesBearingAndDistance() {
    // 3 east and 4 north: 5 long on atan(3/4) = 36.869898 degrees = 36 52 11.6.
    const UNeditPt from(L"A", 1000.0, 2000.0, 50.0, L"", 0);
    const UNeditPt to(L"B", 1003.0, 2004.0, 50.0, L"", 0);
    const LINEDLG dialog(UNeditLine(from, to), {});
    QCOMPARE(dialog.DialogName(), std::wstring(L"Edit Line"));
    QCOMPARE(dialog.GetHeading(), std::wstring(L"A -> B"));
    QCOMPARE(dialog.ValueOf(L"Bearing"), std::wstring(L"36.5212"));
    QCOMPARE(dialog.ValueOf(L"Distance"), std::wstring(L"5.000"));
    QCOMPARE(dialog.ValueOf(L"End point"), std::wstring(L"B"));
}

void DialogsTest::lineDialogFollowsTheJobsAngleUnit() {
    UJobSettings settings;
    settings.SetAngleUnit(AngleUnit::Gons);
    const UNeditPt from(L"A", 0.0, 0.0, 0.0, L"", 0);
    const UNeditPt to(L"B", 3.0, 4.0, 0.0, L"", 0);
    // 36.869898 degrees are 40.966553 gon.
    const LINEDLG dialog(UNeditLine(from, to), {&settings, nullptr});
    QCOMPARE(dialog.ValueOf(L"Bearing"), std::wstring(L"40.9666"));
}

void DialogsTest::arcDialogGivesTheArcsMeasures() {
    // A half circle of radius 10 from (40, 50) over (50, 60) to (60, 50): clockwise.
    const UNeditPt start(L"S", 40.0, 50.0, 0.0, L"", 0);
    const UNeditPt end(L"E", 60.0, 50.0, 0.0, L"", 0);
    const UNeditPt top(L"T", 50.0, 60.0, 0.0, L"", 0);
    const ARCDLG dialog(UNeditArc(start, end, top, UWArc::kThirdOnArc), {});
    QCOMPARE(dialog.ValueOf(L"Radius"), std::wstring(L"10.000"));
    QCOMPARE(dialog.ValueOf(L"Arc Length"), std::wstring(L"31.416"));  // 10 pi
    QCOMPARE(dialog.ValueOf(L"Internal Angle"), std::wstring(L"180.0000"));
    QCOMPARE(dialog.ValueOf(L"Sector Area"), std::wstring(L"157.080"));   // 100 pi / 2
    QCOMPARE(dialog.ValueOf(L"Start Bearing"), std::wstring(L"0.0000"));  // leaving north
    QCOMPARE(dialog.ValueOf(L"End Bearing"), std::wstring(L"180.0000"));
    QCOMPARE(dialog.ValueOf(L"Chord Bearing"), std::wstring(L"90.0000"));
    QCOMPARE(dialog.ValueOf(L"Chord Length"), std::wstring(L"20.000"));
    QCOMPARE(dialog.ValueOf(L"P3 Point"), std::wstring(L"T"));
}

void DialogsTest::pointDialogPutsNorthingFirstForOrderOne() {
    UJobSettings settings;
    settings.SetCoordinateOrder(1);
    const UNeditPt point(L"P1", 1030.1249, 2010.44, UWPoint::kNoHeight, L"FC01", 0);
    const POINTDLG north_first(point, {&settings, nullptr});
    QCOMPARE(north_first.GetRows().at(2).label, std::wstring(L"Northing"));
    QCOMPARE(north_first.GetRows().at(2).value, std::wstring(L"2010.440"));
    QCOMPARE(north_first.ValueOf(L"Elevation"), std::wstring());  // no height
    // Without a job there is no colour or mark to show.
    QCOMPARE(north_first.ValueOf(L"Color"), std::wstring());
    const POINTDLG east_first(point, {});
    QCOMPARE(east_first.GetRows().at(2).label, std::wstring(L"Easting"));
    QCOMPARE(east_first.ValueOf(L"Code"), std::wstring(L"FC01"));
}

void DialogsTest::documentNamesAreChecked() {
    UGetNameDlg open(UGetNameDlg::Mode::Open, {L"DAY1", L"DAY2"});
    open.Name = L" DAY2 ";
    QVERIFY(open.OnOK());
    QCOMPARE(open.Name, std::wstring(L"DAY2"));
    open.Name = L"DAY3";
    QVERIFY(!open.OnOK());
    UGetNameDlg save(UGetNameDlg::Mode::Save, {L"DAY1"}, L"DAY1");
    save.Name = L"LOT 12";
    QVERIFY(save.OnOK());
    save.Name = L"a/b";
    QVERIFY(!save.OnOK());
    save.Name = L"   ";
    QVERIFY(!save.OnOK());
}

void DialogsTest::messageBoxesAnswerWithTheirButtons() {
    ScriptedHost host;
    // Without an answer the default button decides: the second of Yes, No.
    QCOMPARE(AppMessageBox(&host, L"Replace?", mb::YesNo | mb::DefButton2), mb::IdNo);
    QCOMPARE(AppMessageBox(&host, L"Replace?", mb::YesNo), mb::IdYes);
    host.QueueAnswer(mb::IdCancel);
    QCOMPARE(AppMessageBox(&host, L"Save changes?", mb::YesNoCancel), mb::IdCancel);
    QCOMPARE(host.Messages().back(), QStringLiteral("Save changes?"));
    host.SetUnattended(true);
    QCOMPARE(AppMessageBox(&host, L"Unseen", mb::OkCancel | mb::DefButton2), mb::IdCancel);
    QCOMPARE(host.Messages().back(), QStringLiteral("Save changes?"));
}

void DialogsTest::coordinateFormTakesTypedValues() {
    ScriptedHost host;
    host.SetFormScript(QStringLiteral("Control Point Coordinate"), [](QDialog& dialog) {
        auto& form = static_cast<CoordEntryForm&>(dialog);
        // Only the typed row is offered besides the records' one, which is chosen first.
        if (!form.SourceButton(UCoordEntryDlg::Source::Field)->isChecked()) return 0;
        if (form.SourceButton(UCoordEntryDlg::Source::Database)->isEnabled()) return 0;
        form.SourceButton(UCoordEntryDlg::Source::Enter)->setChecked(true);
        form.EnteredField(0)->setText(QStringLiteral("1234.5"));
        form.EnteredField(1)->setText(QStringLiteral("6789.25"));
        form.EnteredField(2)->clear();  // no height
        form.ApplyToAllBox()->setChecked(true);
        form.accept();
        return form.result();
    });
    UCoordEntryDlg dialog(UCoordEntryDlg::kEastFirstId, &host);
    dialog.InitXYZLocal(1.0, 2.0, 3.0, L"STN");
    bool apply_all = false;
    QCOMPARE(dialog.process(L"A", apply_all), 1);
    QVERIFY(apply_all);
    QCOMPARE(dialog.GetChosenSource(), UCoordEntryDlg::Source::Enter);
    QCOMPARE(dialog.getEast(), 1234.5);
    QCOMPARE(dialog.getNorth(), 6789.25);
    QCOMPARE(dialog.getZ(), UWPoint::kNoHeight);
}

void DialogsTest::coordinateFormWithFixedCheckHidesApplyToAll() {
    UCoordEntryDlg dialog(UCoordEntryDlg::kNorthFirstId, nullptr);
    dialog.SetHasFixedPointCheck();
    CoordEntryForm form(dialog, {}, nullptr);
    QVERIFY(form.ApplyToAllBox() == nullptr);
    const QList<QCheckBox*> boxes = form.findChildren<QCheckBox*>();
    QCOMPARE(boxes.size(), 1);
    QCOMPARE(boxes.front()->text(), QStringLiteral("Fixed"));
    QVERIFY(boxes.front()->isChecked());
    // Cancel leaves the dialog's result alone.
    form.reject();
    QCOMPARE(dialog.getEast(), 0.0);
}

void DialogsTest::coordinateFormWalksTheJobsCoordinateOrder() {
    UJobSettings feet;
    feet.SetLengthUnit(LengthUnit::Feet);
    UCoordEntryDlg dialog(UCoordEntryDlg::kNorthFirstId, nullptr);
    dialog.InitXYZSvy(10.0, 20.0, UWPoint::kNoHeight, L"");
    CoordEntryForm form(dialog, {&feet, nullptr}, nullptr);
    // The job's point is offered and chosen: the typed row waits for its radio.
    QVERIFY(form.SourceButton(UCoordEntryDlg::Source::Database)->isChecked());
    QVERIFY(!form.EnteredField(0)->isEnabled());
    QCOMPARE(form.Field(UCoordEntryDlg::Source::Database, 1)->text(), QStringLiteral("20.000"));
    QCOMPARE(form.Field(UCoordEntryDlg::Source::Database, 2)->text(), QString());  // no height
    QCOMPARE(form.EnteredField(0)->Unit(), QStringLiteral("ft"));
    form.SourceButton(UCoordEntryDlg::Source::Enter)->setChecked(true);
    QCOMPARE(dialog.GetSelectedSource(), UCoordEntryDlg::Source::Enter);
    QVERIFY(form.EnteredField(0)->isEnabled());
    // Northing first: Tab goes from the northing to the easting, then to the height.
    const auto next = [](QWidget* widget) {
        do {
            widget = widget->nextInFocusChain();
        } while (!(widget->focusPolicy() & Qt::TabFocus) || !widget->isEnabled());
        return widget;
    };
    QCOMPARE(next(form.EnteredField(1)), form.EnteredField(0));
    QCOMPARE(next(form.EnteredField(0)), form.EnteredField(2));
    // Typed values go to the dialog at once; values the dialog is given show when told.
    form.EnteredField(1)->setText(QStringLiteral("2000.5"));
    QCOMPARE(dialog.RowOf(UCoordEntryDlg::Source::Enter).North, 2000.5);
    dialog.InitXYZ(1.0, 2.0, 3.0, L"");
    form.Maker().UpdateData(false);
    QCOMPARE(form.EnteredField(2)->text(), QStringLiteral("3.000"));
    form.accept();
    QCOMPARE(dialog.getZ(), 3.0);
    QCOMPARE(dialog.GetChosenSource(), UCoordEntryDlg::Source::Enter);
}

void DialogsTest::backBearingFormReadsTheJobsAngleUnit() {
    UJobSettings settings;  // ddd.mmss
    UBKBCoordDlg dialog(L"D");
    BackBearingForm form(dialog, {&settings, nullptr}, nullptr);
    QVERIFY(!form.BearingField()->isEnabled());
    form.ApplyBearingBox()->setChecked(true);
    QVERIFY(form.BearingField()->isEnabled());
    form.BearingField()->setText(QStringLiteral("358.0624"));  // 358 06 24
    form.accept();
    QVERIFY(dialog.ApplyBearing);
    QVERIFY(std::fabs(dialog.Bearing - (358.0 + 6.0 / 60.0 + 24.0 / 3600.0)) < 1e-9);
}

void DialogsTest::reportParametersFormStoresTheColumns() {
    test::ConfigDirectory config;
    OutParamStruct parameters;
    parameters.AngularUnit = 2;
    UOutputParamDlg dialog(parameters);
    ReportParametersForm form(dialog, {}, nullptr);
    const QList<QRadioButton*> radios = form.findChildren<QRadioButton*>();
    QVERIFY(radios.at(2)->isChecked());  // "Gon"
    form.ColumnBox(opt::LN)->setChecked(false);
    form.ColumnBox(opt::HD)->setChecked(false);
    radios.at(0)->setChecked(true);
    form.accept();
    QCOMPARE(dialog.GetParameters().AngularUnit, 0);
    QCOMPARE(dialog.GetParameters().OutLN, 0);
    QCOMPARE(dialog.GetParameters().OutHA, 1);
    QCOMPARE(ReadOrderKey(), std::wstring(L"ID HA VA SD VD HT CO EC NC HC "));
}

void DialogsTest::aDialogWithoutAFormTakesItsDefaults() {
    ScriptedHost host;
    PlainDialog dialog;
    QCOMPARE(host.Run(dialog), mb::IdOk);
    QCOMPARE(dialog.accepted, 1);
    QCOMPARE(host.FormsShown().back(), QStringLiteral("Plain"));
}

QTEST_MAIN(DialogsTest)
#include "DialogsTest.moc"
