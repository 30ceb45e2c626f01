// "Edit Record Data": a record's fields in the job's units, read in the units its row is kept
// in and written back in them; the unit and mode records as choices; the form and the double
// click that opens it.

#include <QAbstractButton>
#include <QButtonGroup>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "ui/CNeditViewPane.h"
#include "ui/UNeditView.h"
#include "ui/dialogs/FileUnits.h"
#include "ui/dialogs/UEditRecordDlg.h"
#include "ui/forms/EditRecordForm.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ExampleWindow;
using Control = UEditRecordDlg::Control;

namespace {

/// A file kept in feet and decimal degrees, with vertical angles above the horizon, under a
/// job in metres and ddd.mmss.
const std::vector<std::wstring> kFeetFile = {
    L"#VERSION-1.0 NEUTRAL FILE",
    L"UNIT      UL=F,UA=D",
    L"AMODE     HM=A,VM=A",
    L"SS        ID=P1,HA=45.50000,VA=2.25000,SD=100.000,HT=5.000,CO=FC01",
};
/// The same observation in a file kept as the job is.
const std::vector<std::wstring> kMetreFile = {
    L"#VERSION-1.0 NEUTRAL FILE",
    L"UNIT      UL=M,UA=S",
    L"SS        ID=P1,HA=45.3000,VA=87.4500,SD=30.480,HT=1.524,CO=FC01",
};

struct Format {
    Format() { format.LoadNeutralFileDefinition(FromUtf8(DataDirectory())); }
    UEditRecordDlg Dialog(const std::vector<std::wstring>& rows) {
        return UEditRecordDlg(
            format, &job, FileUnits::AtRow(format, &job, rows, static_cast<int>(rows.size()) - 1));
    }
    UJobSettings job;
    UNeutralFileFormat format{&job};
};

QStringList Shown(EditRecordForm& form) {
    QStringList texts;
    for (int i = 0; form.FieldEdit(i) != nullptr; ++i) texts << form.FieldEdit(i)->text();
    return texts;
}

}  // namespace

class EditRecordDialogTest : public QObject {
    Q_OBJECT
  private slots:
    void fieldsGetTheControlsOfTheirKind();
    void unitsInForceAtARowComeFromTheRowsAbove();
    void twoFilesOfOneObservationShowAlike();
    void aChangedValueGoesBackInTheRowsUnits();
    void refusedRecordsOpenNothing();
    void unitAndModeRecordsShowChoices();
    void aWrongNumberIsSaidAndKeepsTheFormOpen();
    void aDoubleClickEditsTheRow();
};

void EditRecordDialogTest::fieldsGetTheControlsOfTheirKind() {
    QCOMPARE(UEditRecordDlg::ControlOf(800), Control::PointName);
    QCOMPARE(UEditRecordDlg::ControlOf(801), Control::Angle);
    QCOMPARE(UEditRecordDlg::ControlOf(802), Control::VAngle);
    QCOMPARE(UEditRecordDlg::ControlOf(803), Control::Distance);
    QCOMPARE(UEditRecordDlg::ControlOf(806), Control::Length);
    QCOMPARE(UEditRecordDlg::ControlOf(808), Control::Code);
    QCOMPARE(UEditRecordDlg::ControlOf(810), Control::Coord);
    QCOMPARE(UEditRecordDlg::ControlOf(811), Control::Elevation);
    QCOMPARE(UEditRecordDlg::ControlOf(823), Control::Bear);
    QCOMPARE(UEditRecordDlg::ControlOf(839), Control::Long);
    QCOMPARE(UEditRecordDlg::ControlOf(841), Control::Plain);
}

void EditRecordDialogTest::unitsInForceAtARowComeFromTheRowsAbove() {
    Format f;
    const FileUnits at_start = FileUnits::AtRow(f.format, &f.job, kFeetFile, 1);
    QCOMPARE(at_start.length, LengthUnit::Metres);
    QCOMPARE(at_start.verticalMode, L'Z');
    const FileUnits at_ss = FileUnits::AtRow(f.format, &f.job, kFeetFile, 3);
    QCOMPARE(at_ss.length, LengthUnit::Feet);
    QCOMPARE(at_ss.angle, AngleUnit::Degrees);
    QCOMPARE(at_ss.verticalMode, L'A');
    // Bare values stand in the places of the layout.
    QCOMPARE(FieldValueOf(L"UNIT      U,G", L"UA", 1), std::wstring(L"G"));
    QCOMPARE(FieldValueOf(L"AMODE     VM=n,HM=b", L"VM", 1), std::wstring(L"N"));
}

void EditRecordDialogTest::twoFilesOfOneObservationShowAlike() {
    // 45.5 degrees are 45 30 00; 2.25 degrees above the horizon are 87.75 from the zenith, 87
    // 45 00; 100 ft are 30.480 m and 5 ft 1.524 m.
    Format f;
    const QStringList expected = {QStringLiteral("P1"),      QStringLiteral("45.3000"),
                                  QStringLiteral("87.4500"), QStringLiteral("30.480"),
                                  QStringLiteral("1.524"),   QStringLiteral("FC01")};
    for (const auto* rows : {&kFeetFile, &kMetreFile}) {
        UEditRecordDlg dialog = f.Dialog(*rows);
        QVERIFY(dialog.LoadRecord(rows->back()));
        EditRecordForm form(dialog, {&f.job, nullptr}, nullptr);
        QCOMPARE(form.windowTitle(), QStringLiteral("Edit SS Record"));
        QCOMPARE(Shown(form), expected);
        QCOMPARE(form.FieldEdit(3)->Unit(), QStringLiteral("m"));
        // OK without a change gives the row back as it was, to the last digit.
        form.accept();
        QCOMPARE(QString::fromStdWString(dialog.GetRecordText()),
                 QString::fromStdWString(rows->back()));
    }
}

void EditRecordDialogTest::aChangedValueGoesBackInTheRowsUnits() {
    Format f;
    UEditRecordDlg dialog = f.Dialog(kFeetFile);
    QVERIFY(dialog.LoadRecord(kFeetFile.back()));
    EditRecordForm form(dialog, {&f.job, nullptr}, nullptr);
    // 30 m are 98.4252 ft; a zenith angle of 88 degrees is 2 degrees above the horizon.
    form.FieldEdit(3)->setText(QStringLiteral("30.000"));
    form.FieldEdit(2)->setText(QStringLiteral("88.0000"));
    form.FieldEdit(5)->setText(QStringLiteral("fence"));
    QCOMPARE(dialog.Windows[3].Number, 30.0);
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
    QCOMPARE(dialog.GetRecordText(),
             std::wstring(L"SS        ID=P1,HA=45.50000,VA=2.0000,SD=98.425,HT=5.000,CO=FENCE"));
}

void EditRecordDialogTest::refusedRecordsOpenNothing() {
    Format f;
    UEditRecordDlg dialog = f.Dialog(kMetreFile);
    QVERIFY(!dialog.LoadRecord(L"# A COMMENT"));
    QVERIFY(!dialog.LoadRecord(L"   "));
    QVERIFY(!dialog.LoadRecord(L"WHATEVER  A=1"));
    // One field, named by its key; an empty value opens empty, and comes back as the key.
    QVERIFY(dialog.LoadRecord(L"INSHT"));
    dialog.OnInitDialog();
    QCOMPARE(static_cast<int>(dialog.Windows.size()), 1);
    QCOMPARE(dialog.Windows[0].Name, std::wstring(L"INSHT"));
    QCOMPARE(dialog.Windows[0].Edit, Control::Length);
    dialog.OnOK();
    QCOMPARE(dialog.GetRecordText(), std::wstring(L"INSHT     "));
}

void EditRecordDialogTest::unitAndModeRecordsShowChoices() {
    Format f;
    UEditRecordDlg units = f.Dialog(kMetreFile);
    QVERIFY(units.LoadRecord(L"UNIT      UL=1,UA=G"));
    EditRecordForm unit_form(units, {}, nullptr);
    QVERIFY(unit_form.FieldEdit(0) == nullptr);
    QCOMPARE(unit_form.FirstChoice()->checkedButton()->text(), QStringLiteral("Feet"));
    QCOMPARE(unit_form.SecondChoice()->checkedButton()->text(), QStringLiteral("Gon"));
    unit_form.SecondChoice()->button(1)->setChecked(true);
    QCOMPARE(units.AngularChoice, 1);
    unit_form.accept();
    // A choice not touched keeps the record's own letter.
    QCOMPARE(units.GetRecordText(), std::wstring(L"UNIT      UL=1,UA=D"));

    UEditRecordDlg modes = f.Dialog(kMetreFile);
    QVERIFY(modes.LoadRecord(L"AMODE     HM=A,VM=A"));
    EditRecordForm mode_form(modes, {}, nullptr);
    QCOMPARE(mode_form.SecondChoice()->checkedButton()->text(), QStringLiteral("Vertical"));
    QCOMPARE(modes.VerticalChoice, 4);
    mode_form.SecondChoice()->button(3)->setChecked(true);  // nadir
    mode_form.FirstChoice()->button(1)->setChecked(true);   // south azimuth
    mode_form.accept();
    QCOMPARE(modes.GetRecordText(), std::wstring(L"AMODE     HM=B,VM=N"));
    // Cancel leaves the record alone.
    UEditRecordDlg cancelled = f.Dialog(kMetreFile);
    QVERIFY(cancelled.LoadRecord(L"AMODE     HM=A,VM=Z"));
    EditRecordForm cancel_form(cancelled, {}, nullptr);
    cancel_form.SecondChoice()->button(3)->setChecked(true);
    cancel_form.reject();
    QCOMPARE(cancelled.GetRecordText(), std::wstring(L"AMODE     HM=A,VM=Z"));
}

void EditRecordDialogTest::aWrongNumberIsSaidAndKeepsTheFormOpen() {
    Format f;
    test::ScriptedHost host;
    UEditRecordDlg dialog = f.Dialog(kMetreFile);
    QVERIFY(dialog.LoadRecord(kMetreFile.back()));
    EditRecordForm form(dialog, {&f.job, &host}, nullptr);
    form.FieldEdit(1)->setText(QStringLiteral("45.7000"));  // 70 minutes
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Rejected));
    QVERIFY(host.Messages().back().contains(QStringLiteral("minutes and seconds")));
    form.FieldEdit(1)->setText(QStringLiteral("45.1000"));
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
    QCOMPARE(dialog.Fields[1].Value, std::wstring(L"45.1000"));
}

void EditRecordDialogTest::aDoubleClickEditsTheRow() {
    ExampleWindow example;
    QString title;
    example.Host().SetFormScript(QStringLiteral("Edit Record Data"), [&title](QDialog& form) {
        auto& record = static_cast<EditRecordForm&>(form);
        title = form.windowTitle();
        record.FieldEdit(1)->setText(QStringLiteral("2.500"));  // HI
        form.accept();
        return form.result();
    });
    constexpr int kRowStationB = 14;
    QTest::mouseDClick(example.Pane().GetNeditView()->viewport(), Qt::LeftButton, {},
                       example.OnRow(kRowStationB));
    QCOMPARE(title, QStringLiteral("Edit STN Record"));
    QCOMPARE(example.Rows().at(kRowStationB), QStringLiteral("STN       ID=B,HI=2.500,CO=STN"));
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("*")));
}

QTEST_MAIN(EditRecordDialogTest)
#include "EditRecordDialogTest.moc"
