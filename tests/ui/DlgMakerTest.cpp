// The binding that every form makes its controls with: link texts to controls, values shown
// and typed in the job's units, members and controls following each other both ways.

#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QRadioButton>
#include <QWidget>
#include <QtTest>
#include <stdexcept>

#include "platform/geometry/UWPoint.h"
#include "platform/job/UJobSettings.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

using namespace nedit;

class DlgMakerTest : public QObject {
    Q_OBJECT
  private slots:
    void linkTextsNameTheirControls();
    void lengthsShowTheJobsUnitAndFollowTheirMember();
    void anUntouchedNumberKeepsItsPlaces();
    void anglesAreShownAndReadInTheJobsUnit();
    void fieldsSayWhatIsWrongWithTheirText();
    void checkBoxesRadiosAndListsFollowTheirMembers();
};

void DlgMakerTest::linkTextsNameTheirControls() {
    QCOMPARE(UDlgMaker::KindOf("COORDINATE"), UEdit::Kind::Coordinate);
    QCOMPARE(UDlgMaker::KindOf("POINTNAME,NEDT,,4"), UEdit::Kind::PointName);
    QCOMPARE(UDlgMaker::KindOf("TEXT,COM2"), UEdit::Kind::Text);
    QCOMPARE(UDlgMaker::KindOf("LONG"), UEdit::Kind::Long);
    QVERIFY_THROWS_EXCEPTION(std::invalid_argument, UDlgMaker::KindOf("CHECK,1"));
    QVERIFY_THROWS_EXCEPTION(std::invalid_argument, UDlgMaker::KindOf("COORD"));
    QWidget form;
    UDlgMaker maker(nullptr, &form);
    std::wstring text;
    double number = 0.0;
    int flag = 0;
    // A link text that does not fit its member is a mistake of the form, said at once.
    QVERIFY_THROWS_EXCEPTION(std::invalid_argument, maker.Edit("LENGTH", text));
    QVERIFY_THROWS_EXCEPTION(std::invalid_argument, maker.Edit("TEXT", number));
    QVERIFY_THROWS_EXCEPTION(std::invalid_argument, maker.Check("RADIO,1,", "x", flag));
}

void DlgMakerTest::lengthsShowTheJobsUnitAndFollowTheirMember() {
    UJobSettings job;
    job.SetLengthUnit(LengthUnit::Feet);
    job.SetLengthDecimals(2);
    QWidget form;
    UDlgMaker maker(&job, &form);
    double height = 5.25;
    double elevation = UWPoint::kNoHeight;
    int changes = 0;
    connect(&maker, &UDlgMaker::changed, &form, [&changes] { ++changes; });
    UEdit* field = maker.Edit("LENGTH", height);
    UEdit* level = maker.Edit("ELEVATION", elevation);
    QCOMPARE(field->text(), QStringLiteral("5.25"));
    QCOMPARE(field->Unit(), QStringLiteral("ft"));
    QCOMPARE(level->text(), QString());  // no height
    QCOMPARE(changes, 0);
    // A control changed: its member follows at once.
    field->setText(QStringLiteral("6.5"));
    QCOMPARE(height, 6.5);
    level->setText(QStringLiteral("-2.125"));
    QCOMPARE(elevation, -2.125);
    level->clear();
    QCOMPARE(elevation, UWPoint::kNoHeight);
    QCOMPARE(changes, 3);
    // A member changed by the logic: the control follows on UpdateData(false), unheard.
    height = 1.0 / 3.0;
    maker.UpdateData(false);
    QCOMPARE(field->text(), QStringLiteral("0.33"));
    QCOMPARE(changes, 3);
}

void DlgMakerTest::anUntouchedNumberKeepsItsPlaces() {
    QWidget form;
    UDlgMaker maker(nullptr, &form);
    double east = 1030.124987;
    UEdit* field = maker.Edit("COORDINATE", east);
    QCOMPARE(field->text(), QStringLiteral("1030.125"));
    maker.UpdateData(true);
    QCOMPARE(east, 1030.124987);
}

void DlgMakerTest::anglesAreShownAndReadInTheJobsUnit() {
    UJobSettings job;
    job.SetAngleUnit(AngleUnit::Gons);
    QWidget form;
    UDlgMaker maker(&job, &form);
    double bearing = -90.0;  // a bearing is shown within one turn
    UEdit* field = maker.Edit("BEARING", bearing);
    QCOMPARE(field->text(), QStringLiteral("300.0000"));
    QCOMPARE(field->Unit(), QStringLiteral("gon"));
    field->setText(QStringLiteral("50"));
    QCOMPARE(bearing, 45.0);
    // In ddd.mmss 123.4530 is 123 degrees 45 minutes 30 seconds.
    UEdit dms(UEdit::Kind::Angle, nullptr);
    dms.setText(QStringLiteral("123.4530"));
    QVERIFY(std::fabs(dms.Value() - (123.0 + 45.0 / 60.0 + 30.0 / 3600.0)) < 1e-12);
    QCOMPARE(dms.Unit(), QStringLiteral("dms"));
    dms.SetValue(72.0 + 46.0 / 60.0 + 45.4 / 3600.0);
    QCOMPARE(dms.text(), QStringLiteral("72.4645"));
}

void DlgMakerTest::fieldsSayWhatIsWrongWithTheirText() {
    UEdit angle(UEdit::Kind::Angle, nullptr);
    angle.setText(QStringLiteral("123.6000"));
    QVERIFY(angle.Problem().contains(QStringLiteral("minutes and seconds")));
    angle.setText(QStringLiteral("123.5959"));
    QVERIFY(angle.Problem().isEmpty());
    angle.setText(QStringLiteral("12,5"));
    QCOMPARE(angle.Problem(), QStringLiteral("\"12,5\" is not a number."));
    UEdit whole(UEdit::Kind::Long, nullptr);
    whole.setText(QStringLiteral("4.5"));
    QCOMPARE(whole.Problem(), QStringLiteral("\"4.5\" is not a whole number."));
    UEdit length(UEdit::Kind::Length, nullptr);
    QVERIFY(length.Problem().isEmpty());  // blank reads as 0
    length.setText(QStringLiteral("-1.5e2"));
    QVERIFY(length.Problem().isEmpty());
    QCOMPARE(length.Value(), -150.0);
    UEdit code(UEdit::Kind::PointCode, nullptr);
    code.setText(QStringLiteral("FENCE,1"));
    QVERIFY(code.Problem().contains(QStringLiteral("comma")));
}

void DlgMakerTest::checkBoxesRadiosAndListsFollowTheirMembers() {
    QWidget form;
    UDlgMaker maker(nullptr, &form);
    int save_raw = 1;
    bool apply = false;
    int source = 1116;
    std::wstring parity = L"even";
    std::wstring baud = L"1200";
    QCheckBox* save = maker.Check("CHECK,1", QStringLiteral("Save Raw Data File"), save_raw);
    QCheckBox* apply_box = maker.Check("CHECK,0", QStringLiteral("Apply"), apply);
    QButtonGroup* sources = maker.Radio(
        "RADIO,1,", source, {{1115, QStringLiteral("Database")}, {1116, QStringLiteral("File")}});
    QComboBox* parities = maker.List("TEXT", parity, {L"NONE", L"ODD", L"EVEN"}, false);
    QComboBox* bauds = maker.List("TEXT", baud, {L"9600", L"19200"}, true);
    QVERIFY(save->isChecked());
    QVERIFY(!apply_box->isChecked());
    QCOMPARE(sources->checkedId(), 1116);
    QCOMPARE(parities->currentText(), QStringLiteral("EVEN"));  // found whatever its case
    QCOMPARE(bauds->currentText(), QStringLiteral("1200"));     // typed, not in the list
    save->setChecked(false);
    apply_box->setChecked(true);
    sources->button(1115)->setChecked(true);
    parities->setCurrentIndex(1);
    bauds->setCurrentIndex(1);
    QCOMPARE(save_raw, 0);
    QVERIFY(apply);
    QCOMPARE(source, 1115);
    QCOMPARE(parity, std::wstring(L"ODD"));
    QCOMPARE(baud, std::wstring(L"19200"));
    save_raw = 1;
    source = 1116;
    parity = L"NONE";
    maker.UpdateData(false);
    QVERIFY(save->isChecked());
    QVERIFY(sources->button(1116)->isChecked());
    QCOMPARE(parities->currentText(), QStringLiteral("NONE"));
}

QTEST_MAIN(DlgMakerTest)
#include "DlgMakerTest.moc"
