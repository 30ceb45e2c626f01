// "Modified Selected Records": which changes the selection allows, the change as text and
// mask, the change applied to each kind of record, the form, and the command on the example.

#include <QCheckBox>
#include <QUndoStack>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "records/RecordTypes.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/UNeditDlgView.h"
#include "ui/dialogs/NEdit_Global_Edit.h"
#include "ui/forms/GlobalEditForm.h"
#include "ui/forms/UDlgMaker.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ExampleWindow;
using Edit = NEdit_Global_Edit;

class GlobalEditTest : public QObject {
    Q_OBJECT
  private slots:
    void theSelectionDecidesWhichBoxesCanBeTicked();
    void theChangeIsFourTokensAndAMask();
    void heightsAreWrittenInTheUnitOfTheirRow();
    void updateRecord_data();
    void updateRecord();
    void theFormFollowsItsBoxes();
    void theCommandChangesEverySelectedRowInOneStep();
};

void GlobalEditTest::theSelectionDecidesWhichBoxesCanBeTicked() {
    QCOMPARE(Edit::MaskOf(rec::Stn), Edit::kStationRows);
    QCOMPARE(Edit::MaskOf(rec::Ss2), Edit::kTargetRows);
    QCOMPARE(Edit::MaskOf(rec::PSX), 0);
    const Edit stations(Edit::kStationRows);
    QVERIFY(stations.IsBoxEnabled(Edit::kStnCodeBox));
    QVERIFY(stations.IsBoxEnabled(Edit::kInstHeightBox));
    QVERIFY(!stations.IsBoxEnabled(Edit::kTargetCodeBox));
    QVERIFY(!stations.IsBoxEnabled(Edit::kTargetHeightBox));
    const Edit targets(Edit::kTargetRows);
    QVERIFY(!targets.IsBoxEnabled(Edit::kStnCodeBox));
    QVERIFY(targets.IsBoxEnabled(Edit::kTargetHeightBox));
    // Rows of no kind it concerns: every box stays disabled, and OK changes nothing.
    Edit nothing(0);
    nothing.ModifyStnCode = 1;
    nothing.ModifyTargetHeight = 1;
    std::wstring values;
    QCOMPARE(nothing.GetValues(values), 0);
    QCOMPARE(values, std::wstring(L",,,"));
}

void GlobalEditTest::theChangeIsFourTokensAndAMask() {
    Edit both(Edit::kStationRows | Edit::kTargetRows);
    both.ModifyStnCode = 1;
    both.StnCode = L"CP";
    both.ModifyTargetHeight = 1;
    both.TargetHeight = 1.6;
    both.InstHeight = 9.9;  // its box is clear: it goes nowhere
    QVERIFY(both.IsValueEnabled(Edit::kStnCodeBox));
    QVERIFY(!both.IsValueEnabled(Edit::kInstHeightBox));
    std::wstring values;
    QCOMPARE(both.GetValues(values), Edit::kChangeStnCode | Edit::kChangeTargetHeight);
    QCOMPARE(values, std::wstring(L"CO=CP,,,HT=1.600"));
}

void GlobalEditTest::heightsAreWrittenInTheUnitOfTheirRow() {
    // 1.524 m are 5 ft exactly (0.3048 m to the foot).
    Edit edit(Edit::kStationRows, LengthUnit::Metres);
    edit.ModifyInstHeight = 1;
    edit.InstHeight = 1.524;
    std::wstring values;
    QCOMPARE(edit.GetValues(values, LengthUnit::Feet), Edit::kChangeInstHeight);
    QCOMPARE(values, std::wstring(L",HI=5.000,,"));
    edit.GetValues(values);
    QCOMPARE(values, std::wstring(L",HI=1.524,,"));
}

void GlobalEditTest::updateRecord_data() {
    QTest::addColumn<int>("type");
    QTest::addColumn<int>("mask");
    QTest::addColumn<QString>("record");
    QTest::addColumn<int>("result");
    QTest::addColumn<QString>("changed");
    // Each row changes by "CO=CP,HI=1.700,CO=TREE,HT=2.000" under its mask.
    QTest::newRow("station: height and code") << rec::Stn << 3 << "STN       ID=A,HI=1.550,CO=STN"
                                              << 1 << "STN       ID=A,HI=1.700,CO=CP";
    QTest::newRow("station: target bits change nothing")
        << rec::Stn << 12 << "STN       ID=A,HI=1.550,CO=STN" << 1
        << "STN       ID=A,HI=1.550,CO=STN";
    QTest::newRow("side shot: height and code")
        << rec::Ss << 12 << "SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FC01"
        << 1 << "SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=2.000,CO=TREE";
    QTest::newRow("back sight: the code alone")
        << rec::Bs << 4 << "BS        ID=D,HA=0.00000,VA=88.55499,SD=104.742,HT=1.600,CO=" << 1
        << "BS        ID=D,HA=0.00000,VA=88.55499,SD=104.742,HT=1.600,CO=TREE";
    QTest::newRow("fields missing at the end are put in their places")
        << rec::Ss << 12 << "SS        ID=P1,HA=1.0,VA=90.0,SD=10.0" << 1
        << "SS        ID=P1,HA=1.0,VA=90.0,SD=10.0,HT=2.000,CO=TREE";
    QTest::newRow("a field out of its place is found by its name")
        << rec::Ss << 4 << "SS        ID=P1,CO=FC01,HA=1.0" << 1
        << "SS        ID=P1,CO=TREE,HA=1.0";
    QTest::newRow("another field in the place: the change goes to the end")
        << rec::Ss << 8 << "SS        ID=P1,HA=1.0,VA=90.0,SD=10.0,CO=FC01" << 1
        << "SS        ID=P1,HA=1.0,VA=90.0,SD=10.0,CO=FC01,HT=2.000";
    QTest::newRow("a point on a string takes the code")
        << rec::PSX << 12 << "PSX       ID=7,E=1.0,N=2.0,H=3.0,CO=FC01" << 1
        << "PSX       ID=7,E=1.0,N=2.0,H=3.0,CO=TREE";
    QTest::newRow("a coordinate record is none of its business")
        << rec::Xyz << 15 << "XYZ       ID=A,E=1.0,N=2.0,H=3.0" << 0
        << "XYZ       ID=A,E=1.0,N=2.0,H=3.0";
}

void GlobalEditTest::updateRecord() {
    QFETCH(int, type);
    QFETCH(int, mask);
    QFETCH(QString, record);
    QFETCH(int, result);
    QFETCH(QString, changed);
    std::wstring text = record.toStdWString();
    QCOMPARE(Edit::UpdateRecord(text, type, mask, L"CO=CP,HI=1.700,CO=TREE,HT=2.000"), result);
    QCOMPARE(QString::fromStdWString(text), changed);
    // An empty token changes nothing.
    std::wstring same = record.toStdWString();
    Edit::UpdateRecord(same, type, mask, L",,,");
    QCOMPARE(QString::fromStdWString(same), record);
}

void GlobalEditTest::theFormFollowsItsBoxes() {
    Edit dialog(Edit::kTargetRows);
    GlobalEditForm form(dialog, {}, nullptr);
    QVERIFY(!form.Box(Edit::kStnCodeBox)->isEnabled());
    QVERIFY(!form.Box(Edit::kInstHeightBox)->isEnabled());
    QVERIFY(form.Box(Edit::kTargetCodeBox)->isEnabled());
    QVERIFY(!form.Value(Edit::kTargetCodeBox)->isEnabled());
    form.Box(Edit::kTargetCodeBox)->setChecked(true);
    QCOMPARE(dialog.ModifyTargetCode, 1);
    QVERIFY(form.Value(Edit::kTargetCodeBox)->isEnabled());
    form.Value(Edit::kTargetCodeBox)->setText(QStringLiteral("KERB"));
    QCOMPARE(dialog.TargetCode, std::wstring(L"KERB"));
    QCOMPARE(form.Value(Edit::kTargetHeightBox)->Unit(), QStringLiteral("m"));
    // A member changed by the logic shows when the form is told.
    dialog.ModifyTargetCode = 0;
    form.Maker().UpdateData(false);
    QVERIFY(!form.Box(Edit::kTargetCodeBox)->isChecked());
    form.Box(Edit::kTargetCodeBox)->setChecked(true);
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
    std::wstring values;
    QCOMPARE(dialog.GetValues(values), Edit::kChangeTargetCode);
    QCOMPARE(values, std::wstring(L",,CO=KERB,"));
}

void GlobalEditTest::theCommandChangesEverySelectedRowInOneStep() {
    ExampleWindow example;
    example.Host().SetFormScript(QStringLiteral("Modified Selected Records"), [](QDialog& dialog) {
        auto& form = static_cast<GlobalEditForm&>(dialog);
        // Station rows and side shots are selected: all four boxes can be ticked.
        if (!form.Box(Edit::kStnCodeBox)->isEnabled() ||
            !form.Box(Edit::kTargetHeightBox)->isEnabled())
            return int(QDialog::Rejected);
        form.Box(Edit::kInstHeightBox)->setChecked(true);
        form.Value(Edit::kInstHeightBox)->setText(QStringLiteral("1.5"));
        form.Box(Edit::kTargetHeightBox)->setChecked(true);
        form.Value(Edit::kTargetHeightBox)->setText(QStringLiteral("2"));
        form.accept();
        return form.result();
    });
    // The first set-up: STN A (row 7) to SS B (row 13).
    std::vector<int> rows;
    for (int row = 7; row <= 13; ++row) rows.push_back(row);
    example.List().SetSelection(rows);
    QVERIFY(example.Window().RunCommand(cmd::GlobalEdit));
    const QStringList after = example.Rows();
    QCOMPARE(after.at(7), QStringLiteral("STN       ID=A,HI=1.500,CO=STN"));
    QCOMPARE(after.at(8), QStringLiteral("XYZ       ID=A,E=1000.000,N=2000.000,H=50.000"));
    QCOMPARE(after.at(10),
             QStringLiteral("BS        ID=D,HA=0.00000,VA=88.55499,SD=104.742,HT=2.000,CO="));
    QCOMPARE(after.at(12),
             QStringLiteral("SS        ID=P2,HA=63.12070,VA=89.10486,SD=47.735,HT=2.000,CO=FC01"));
    // Rows beyond the selection keep theirs.
    QCOMPARE(after.at(14), QStringLiteral("STN       ID=B,HI=1.550,CO=STN"));
    // The last row selected is shown in the form; one Undo takes the whole change back.
    QCOMPARE(example.Pane().GetDlgView()->Row(), 13);
    QCOMPARE(example.Pane().GetUndoStack()->undoText(), QStringLiteral("Edit Selected Records"));
    example.Window().RunCommand(cmd::Undo);
    QCOMPARE(example.Rows().at(7), QStringLiteral("STN       ID=A,HI=1.550,CO=STN"));
    QCOMPARE(example.Rows().at(12),
             QStringLiteral("SS        ID=P2,HA=63.12070,VA=89.10486,SD=47.735,HT=1.600,CO=FC01"));
}

QTEST_MAIN(GlobalEditTest)
#include "GlobalEditTest.moc"
