// The record form beneath the list: a record split into its fields, each keystroke joined
// into the row again, and the form's keys.

#include <QLineEdit>
#include <QUndoStack>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/UNeditDlgView.h"
#include "ui/UNeditView.h"
#include "ui/dialogs/URecordDlg.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ExampleWindow;

namespace {

constexpr int kRowUnit = 4;
constexpr int kRowScale = 6;
constexpr int kRowP1 = 11;
constexpr int kRowP2 = 12;

/// A list of its own with the record definition, for the form's logic alone.
struct Records {
    Records() {
        format.LoadNeutralFileDefinition(FromUtf8(DataDirectory()));
        form.SetList(&list);
    }
    int Show(const std::wstring& text) {
        list.DeleteAllItems();
        list.AddRecord(0, text);
        return form.ShowRecord(list.GetItemText(0), 0);
    }
    std::wstring Row() const { return list.GetItemText(0); }

    UJobSettings job;
    UNeutralFileFormat format{&job};
    UListCtrl list{&format};
    URecordDlg form{format};
};

}  // namespace

class RecordEntryTest : public QObject {
    Q_OBJECT
  private slots:
    void namedFieldsRewriteTheirRow();
    void bareValuesKeepTheirPlaces();
    void aRecordOfOneFieldIsItsKeyAndValue();
    void commentsShowOnlyWhenTheyAskTo();
    void aLongRecordKeepsWhatItDoesNotShow();
    void aUnitRecordTypedInChangesTheAngleType();
    void theFormTypesIntoTheSelectedRow();
    void escapePutsTheFieldBackAndEnterGoesToTheList();
    void walkingRecordsOfOneKindKeepsTheFields();
};

void RecordEntryTest::namedFieldsRewriteTheirRow() {
    Records records;
    QCOMPARE(records.Show(L"SS ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FC01"), 1);
    const std::vector<URecordDlg::EDITFLDPTR>& fields = records.form.GetFields();
    QCOMPARE(records.form.GetLabel(), std::wstring(L"SS"));
    QCOMPARE(static_cast<int>(fields.size()), 6);
    QCOMPARE(fields[1].Caption, std::wstring(L"HA"));
    QCOMPARE(fields[1].Kind, URecordDlg::kAngle);
    QCOMPARE(fields[3].Kind, URecordDlg::kRealNumber);
    QCOMPARE(fields[5].Kind, URecordDlg::kPlainText);
    QCOMPARE(records.form.GetModifiedFlag(), 0);
    records.form.OnFieldChanged(5, L"fence");
    QCOMPARE(records.Row(),
             std::wstring(L"SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FENCE"));
    QCOMPARE(records.form.GetModifiedFlag(), 1);
    // Escape's text is the one first shown, whatever was typed since.
    QCOMPARE(records.form.RememberedText(5), std::wstring(L"FC01"));
    records.form.ClearModified();
    QCOMPARE(records.form.GetModifiedFlag(), 0);
}

void RecordEntryTest::bareValuesKeepTheirPlaces() {
    Records records;
    QCOMPARE(records.Show(L"STN A,1.550"), 1);
    const std::vector<URecordDlg::EDITFLDPTR>& fields = records.form.GetFields();
    QCOMPARE(static_cast<int>(fields.size()), 2);
    // Captioned by the layout of a station record: ID, HI.
    QCOMPARE(fields[0].Caption, std::wstring(L"ID"));
    QCOMPARE(fields[1].Caption, std::wstring(L"HI"));
    QCOMPARE(fields[1].Name, std::wstring());
    records.form.OnFieldChanged(1, L"1.600");
    QCOMPARE(records.Row(), std::wstring(L"STN       A,1.600"));
}

void RecordEntryTest::aRecordOfOneFieldIsItsKeyAndValue() {
    Records records;
    QCOMPARE(records.Show(L"SCALE 1.000000"), 1);
    QCOMPARE(records.form.GetLabel(), std::wstring(L"SCALE"));
    QCOMPARE(records.form.GetFields().front().Caption, std::wstring(L"SCALE"));
    records.form.OnFieldChanged(0, L"0.99960");
    QCOMPARE(records.Row(), std::wstring(L"SCALE     0.99960"));
    // An empty value is a field too.
    QCOMPARE(records.Show(L"NOTE"), 1);
    QCOMPARE(records.form.GetFields().front().Value, std::wstring());
}

void RecordEntryTest::commentsShowOnlyWhenTheyAskTo() {
    Records records;
    QCOMPARE(records.Show(L"# A NOTE OF THE CREW"), 0);
    QVERIFY(records.form.GetFields().empty());
    QCOMPARE(records.form.GetRow(), -1);
    QCOMPARE(records.Show(L"#VERSION-1.0 NEUTRAL FILE"), 0);
    QVERIFY(records.form.GetFields().empty());
    // "#!" and "#?" lines show whole, under no label; what is typed becomes the row.
    QCOMPARE(records.Show(L"#! CHECK THE PRISM"), 0);
    QCOMPARE(records.form.GetLabel(), std::wstring());
    QCOMPARE(records.form.GetFields().front().Value, std::wstring(L"#! CHECK THE PRISM"));
    records.form.OnFieldChanged(0, L"PRISM 0.030");
    QCOMPARE(records.Row(), std::wstring(L"PRISM     0.030"));
}

void RecordEntryTest::aLongRecordKeepsWhatItDoesNotShow() {
    Records records;
    std::wstring text = L"SS        ID=P1";
    for (int i = 2; i <= 25; ++i) text += L"," + std::to_wstring(i);
    records.form.ShowRecord(text, -1);
    const std::vector<URecordDlg::EDITFLDPTR>& fields = records.form.GetFields();
    QCOMPARE(static_cast<int>(fields.size()), URecordDlg::kMaxFields);
    QVERIFY(fields[11].Linked);
    QVERIFY(!fields[12].Linked);
    records.form.OnFieldChanged(12, L"X");  // not linked: nothing changes
    QCOMPARE(records.form.JoinFields(), text);
    records.form.OnFieldChanged(0, L"P9");
    std::wstring expected = L"SS        ID=P9";
    for (int i = 2; i <= 25; ++i) expected += L"," + std::to_wstring(i);
    QCOMPARE(records.form.JoinFields(), expected);
}

void RecordEntryTest::aUnitRecordTypedInChangesTheAngleType() {
    Records records;
    QCOMPARE(records.Show(L"UNIT UL=M,UA=S"), 1);
    QCOMPARE(records.form.GetAngType(), 0);
    records.form.OnFieldChanged(1, L"G");
    QCOMPARE(records.Row(), std::wstring(L"UNIT      UL=M,UA=G"));
    QCOMPARE(records.form.GetAngType(), 2);
}

void RecordEntryTest::theFormTypesIntoTheSelectedRow() {
    ExampleWindow example;
    UNeditDlgView* form = example.Pane().GetDlgView();
    example.List().SelectRow(kRowP1);
    QCOMPARE(form->RecordLabel(), QStringLiteral("SS"));
    QCOMPARE(form->FieldCaption(3), QStringLiteral("SD"));
    // The file is in ddd.mmss: its angle fields say so.
    auto* angle = static_cast<UEdit*>(form->FieldEdit(1));
    QCOMPARE(angle->Unit(), QStringLiteral("dms"));
    QLineEdit* distance = form->FieldEdit(3);
    distance->setFocus();
    distance->selectAll();
    QTest::keyClicks(distance, QStringLiteral("31.9"));
    QCOMPARE(example.Rows().at(kRowP1),
             QStringLiteral("SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.9,HT=1.600,CO=FC01"));
    QVERIFY(form->GetModifiedFlag());
    // A regeneration clears the form's flag.
    example.Window().RunCommand(cmd::Regenerate);
    QVERIFY(!form->GetModifiedFlag());
}

void RecordEntryTest::escapePutsTheFieldBackAndEnterGoesToTheList() {
    ExampleWindow example;
    UNeditDlgView* form = example.Pane().GetDlgView();
    example.List().SelectRow(kRowP1);
    QLineEdit* code = form->FieldEdit(5);
    code->setFocus();
    code->selectAll();
    QTest::keyClicks(code, QStringLiteral("TREE"));
    QCOMPARE(example.Rows().at(kRowP1).right(7), QStringLiteral("CO=TREE"));
    QTest::keyClick(code, Qt::Key_Escape);
    QCOMPARE(code->text(), QStringLiteral("FC01"));
    QCOMPARE(example.Rows().at(kRowP1).right(7), QStringLiteral("CO=FC01"));
    QVERIFY(form->isVisible());
    QTest::keyClick(code, Qt::Key_Return);
    QVERIFY(example.Pane().GetNeditView()->hasFocus());
    // The unit record and the scale show as well.
    example.List().SelectRow(kRowUnit);
    QCOMPARE(form->RecordLabel(), QStringLiteral("UNIT"));
    example.List().SelectRow(kRowScale);
    QCOMPARE(form->FieldEdit(0)->text(), QStringLiteral("1.000000"));
}

void RecordEntryTest::walkingRecordsOfOneKindKeepsTheFields() {
    ExampleWindow example;
    UNeditDlgView* form = example.Pane().GetDlgView();
    example.List().SelectRow(kRowP1);
    QLineEdit* id = form->FieldEdit(0);
    example.List().SelectRow(kRowP2);
    QCOMPARE(form->FieldEdit(0), id);
    QCOMPARE(id->text(), QStringLiteral("P2"));
    QCOMPARE(form->Row(), kRowP2);
    example.List().SelectRow(0);  // the header line: nothing to show
    QCOMPARE(form->FieldCount(), 0);
    QCOMPARE(form->RecordLabel(), QString());
}

QTEST_MAIN(RecordEntryTest)
#include "RecordEntryTest.moc"
