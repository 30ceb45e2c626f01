// The record list's model and its undo history, over a list of its own, and the pane's
// rules for records that stand on their own.

#include <QUndoStack>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/MemoryClipboard.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "ui/CNeditViewPane.h"
#include "ui/ListEventFan.h"
#include "ui/RecordListModel.h"
#include "ui/RowEditRecorder.h"

using namespace nedit;

namespace {

/// A list of the example's kind, with its model and its undo history listening.
struct Rows {
    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    UListCtrl list{&format};
    MemoryClipboard clipboard;
    RecordListModel model;
    QUndoStack stack;
    RowEditRecorder recorder{&stack};
    ListEventFan fan;

    Rows() {
        format.LoadNeutralFileDefinition(FromUtf8(DataDirectory()));
        for (const wchar_t* row : {L"#VERSION-1.0 NEUTRAL FILE", L"STN ID=A,HI=1.5",
                                   L"SS ID=P1,HA=10,VA=90,SD=5", L"SS ID=P2,HA=20,VA=90,SD=6"})
            list.AddRecord(list.GetItemCount(), row);
        list.SetClipboard(&clipboard);
        model.SetList(&list);
        recorder.SetList(&list);
        fan.Add(&model);
        fan.Add(&recorder);
        list.SetEvents(&fan);
    }
};

}  // namespace

class RecordListModelTest : public QObject {
    Q_OBJECT
  private slots:
    void theModelReadsTheListsRows();
    void theModelFollowsInsertsAndRemovals();
    void aBulkChangeHoldsTheViewStill();
    void undoPutsRowsBackPastTheGate();
    void changesOutsideACommandAreOneStepPerEvent();
    void anImportStartsANewHistory();
    void coordinateTemplatesFollowTheJobsOrder();
    void derivedPointsGoByTheirRecordsName();
};

void RecordListModelTest::theModelReadsTheListsRows() {
    Rows rows;
    QCOMPARE(rows.model.rowCount(), 4);
    QCOMPARE(rows.model.columnCount(), 1);
    QCOMPARE(rows.model.data(rows.model.index(1, 0), Qt::DisplayRole).toString(),
             QStringLiteral("STN       ID=A,HI=1.5"));
    QCOMPARE(rows.model.headerData(0, Qt::Horizontal, Qt::DisplayRole).toString(),
             QStringLiteral("Neutral File Records"));
    QCOMPARE(rows.model.headerData(3, Qt::Vertical, Qt::DisplayRole).toInt(), 3);
    rows.list.OnLButtonDown(2);
    QVERIFY(rows.model.data(rows.model.index(2, 0), RecordListModel::SelectedRole).toBool());
    QVERIFY(rows.model.data(rows.model.index(2, 0), RecordListModel::FocusRole).toBool());
    QVERIFY(!rows.model.data(rows.model.index(1, 0), RecordListModel::SelectedRole).toBool());
    QCOMPARE(rows.model.headerData(0, Qt::Horizontal, Qt::DisplayRole).toString(),
             QStringLiteral("Rec.No:2"));
    // The list keeps the selection: the view cannot select on its own.
    QCOMPARE(rows.model.flags(rows.model.index(0, 0)), Qt::ItemIsEnabled);
}

void RecordListModelTest::theModelFollowsInsertsAndRemovals() {
    Rows rows;
    QSignalSpy inserted(&rows.model, &QAbstractItemModel::rowsInserted);
    QSignalSpy removed(&rows.model, &QAbstractItemModel::rowsRemoved);
    QSignalSpy changed(&rows.model, &QAbstractItemModel::dataChanged);
    rows.list.AddRecord(2, L"ss id=p9");
    QCOMPARE(inserted.count(), 1);
    QCOMPARE(inserted.first().at(1).toInt(), 2);
    QCOMPARE(rows.model.rowCount(), 5);
    rows.list.SetRecord(2, L"SS ID=P8");
    QCOMPARE(changed.count(), 1);
    rows.list.DeleteItem(2);
    QCOMPARE(removed.count(), 1);
    QCOMPARE(rows.model.rowCount(), 4);
}

void RecordListModelTest::aBulkChangeHoldsTheViewStill() {
    Rows rows;
    QSignalSpy inserted(&rows.model, &QAbstractItemModel::rowsInserted);
    QSignalSpy reset(&rows.model, &QAbstractItemModel::modelReset);
    rows.model.BeginBulkChange();
    rows.list.DeleteAllItems();
    for (int i = 0; i < 100; ++i) rows.list.AddRecord(i, L"SS ID=X,HA=1");
    QCOMPARE(rows.model.rowCount(), 4);  // as it was when the change began
    QVERIFY(!rows.model.data(rows.model.index(3, 0), Qt::DisplayRole).toString().isEmpty());
    rows.model.EndBulkChange();
    QCOMPARE(inserted.count(), 0);
    QCOMPARE(reset.count(), 1);
    QCOMPARE(rows.model.rowCount(), 100);
}

void RecordListModelTest::undoPutsRowsBackPastTheGate() {
    Rows rows;
    // Pasted text goes in as it is, lower case and all; undo and redo keep it so.
    rows.list.SetSelection({1});
    rows.list.CopyRows();
    rows.clipboard.SetText(L"ss id=p5,ha=5\r\n");
    {
        RowEditStep step(&rows.recorder, QStringLiteral("Paste"));
        rows.list.PasteRows();
    }
    QCOMPARE(rows.list.GetItemText(1), std::wstring(L"ss id=p5,ha=5"));
    {
        RowEditStep step(&rows.recorder, QStringLiteral("Comment"));
        rows.list.SetSelection({1});
        rows.list.CommentRow();
    }
    QCOMPARE(rows.list.GetItemText(1), std::wstring(L"#SS ID=P5,HA=5"));
    QCOMPARE(rows.stack.count(), 2);
    rows.stack.undo();
    QCOMPARE(rows.list.GetItemText(1), std::wstring(L"ss id=p5,ha=5"));
    rows.stack.undo();
    QCOMPARE(rows.list.GetItemCount(), 4);
    QCOMPARE(rows.list.GetItemText(1), std::wstring(L"STN       ID=A,HI=1.5"));
    rows.stack.redo();
    QCOMPARE(rows.list.GetItemText(1), std::wstring(L"ss id=p5,ha=5"));
    QCOMPARE(rows.list.GetSelectedRows(), std::vector<int>{1});
}

void RecordListModelTest::changesOutsideACommandAreOneStepPerEvent() {
    Rows rows;
    rows.list.SetRecord(2, L"SS ID=P1,HA=11,VA=90,SD=5");
    rows.list.SetRecord(3, L"SS ID=P2,HA=21,VA=90,SD=6");
    QCOMPARE(rows.stack.count(), 0);  // still open until the event is done
    QCoreApplication::processEvents();
    QCOMPARE(rows.stack.count(), 1);
    QCOMPARE(rows.stack.undoText(), QStringLiteral("Edit Records"));
    rows.stack.undo();
    QCOMPARE(rows.list.GetItemText(3), std::wstring(L"SS        ID=P2,HA=20,VA=90,SD=6"));
    // Typing in one row merges into one step.
    for (const wchar_t* text : {L"SS ID=P", L"SS ID=P7", L"SS ID=P77"}) {
        RowEditStep step(&rows.recorder, QStringLiteral("Typing"), true);
        rows.list.SetRecord(2, text);
    }
    QCOMPARE(rows.stack.count(), 1);
    rows.stack.undo();
    QCOMPARE(rows.list.GetItemText(2), std::wstring(L"SS        ID=P1,HA=10,VA=90,SD=5"));
}

void RecordListModelTest::anImportStartsANewHistory() {
    Rows rows;
    {
        RowEditStep step(&rows.recorder, QStringLiteral("Insert Record"));
        rows.list.AddRecord(1, L"NOTE HELLO");
    }
    QCOMPARE(rows.stack.count(), 1);
    {
        RowEditStep step(&rows.recorder, QStringLiteral("Import Neutral File..."));
        rows.list.DeleteAllItems();
        rows.list.AddRecord(0, L"#VERSION-1.0 NEUTRAL FILE");
    }
    QCOMPARE(rows.stack.count(), 0);
}

void RecordListModelTest::coordinateTemplatesFollowTheJobsOrder() {
    const std::wstring point = L"PT        ID=,E=,N=,H=,CO=";
    QCOMPARE(CNeditViewPane::CheckCoordinateOrder(point, 0), point);
    QCOMPARE(CNeditViewPane::CheckCoordinateOrder(point, 1),
             std::wstring(L"PT        ID=,N=,E=,H=,CO="));
    // Without all three letters the text stays as it is.
    QCOMPARE(CNeditViewPane::CheckCoordinateOrder(L"PT        ID=,E=,N=", 1),
             std::wstring(L"PT        ID=,E=,N="));
}

void RecordListModelTest::derivedPointsGoByTheirRecordsName() {
    QCOMPARE(CNeditViewPane::RecordNameOf(L"P12"), std::wstring(L"P12"));
    QCOMPARE(CNeditViewPane::RecordNameOf(L"RECT-P12"), std::wstring(L"P12"));
    QCOMPARE(CNeditViewPane::RecordNameOf(L"CENTER-C4"), std::wstring(L"C4"));
}

QTEST_MAIN(RecordListModelTest)
#include "RecordListModelTest.moc"
