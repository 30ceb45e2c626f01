// The command table: every command once, with the numbers and texts the system has always
// had, and the menus, toolbars and context menu made from it.

#include <QAction>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QToolBar>
#include <QtTest>
#include <set>

#include "records/RecordTypes.h"
#include "ui/CommandActions.h"
#include "ui/CommandIds.h"
#include "ui/CommandTable.h"

using namespace nedit;

class CommandTableTest : public QObject {
    Q_OBJECT
  private slots:
    void everyCommandIsThereOnce();
    void menuTexts_data();
    void menuTexts();
    void toolbarsAndContextMenuNameKnownCommands();
    void insertCommandsInsertTheirRecordType();
    void menusAreBuiltInTableOrder();
};

void CommandTableTest::everyCommandIsThereOnce() {
    std::set<int> ids;
    for (const CommandInfo& info : Commands()) {
        if (info.id == 0) {
            QVERIFY(info.menu != nullptr);  // a separator belongs to a menu
            continue;
        }
        QVERIFY2(ids.insert(info.id).second, qPrintable(QString::number(info.id)));
        QCOMPARE(FindCommand(info.id), &info);
        if (!info.available)
            QCOMPARE(QString::fromLatin1(info.tip), QString::fromLatin1(kNotAvailableTip));
    }
    QVERIFY(FindCommand(12345) == nullptr);
}

void CommandTableTest::menuTexts_data() {
    QTest::addColumn<int>("id");
    QTest::addColumn<QString>("menu");
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("available");
    const auto row = [](int id, const char* menu, const char* text, bool available) {
        QTest::addRow("%d", id) << id << QString::fromLatin1(menu) << QString::fromLatin1(text)
                                << available;
    };
    row(cmd::FileNew, "File", "New", true);
    row(cmd::FileOpen, "File", "Open...", true);
    row(cmd::FileSaveAs, "File", "Save Data As...", true);
    row(cmd::Transfer, "File", "Save To Survey", true);
    row(cmd::Download, "File", "Download Raw Data...", true);
    row(cmd::ImportRawfile, "File", "Import Raw Data File...", true);
    row(cmd::ImportNeutral, "File", "Import Neutral File...", true);
    row(cmd::ExportNeutral, "File", "Export Neutral File...", true);
    row(cmd::FilePrint, "File", "Print...", true);
    row(cmd::Exit, "File", "Close", true);
    row(cmd::EditCut, "Edit", "Cut", true);
    row(cmd::FindRecord, "Edit", "Find", true);
    row(cmd::NextRecord, "Edit", "Next", true);
    row(cmd::PreRecord, "Edit", "Previous", true);
    row(cmd::CommentRecord, "Edit", "Comment/Uncomment", true);
    row(cmd::GlobalEdit, "Edit", "Edit Selected Records", true);
    row(cmd::OutputParam, "Edit", "Report Parameters", true);
    row(cmd::InsAtmos, "Insert/Header Record", "Temperature & Pressure", true);
    row(cmd::InsBkb, "Insert/Station Record", "Back Sight Station", true);
    row(cmd::InsPt, "Insert", "Point Record", true);
    row(cmd::InsOffset, "Insert/Measurement Record", "Offsets", true);
    row(cmd::AdjPtsRecord, "Insert/Miscellaneous", "Adjusted Point Header", true);
    row(cmd::Regenerate, "View", "Regenerate View", true);
    row(cmd::ViewReport, "View", "Report", true);
    row(cmd::ActivateSurveyView, "View", "Survey", false);
    row(cmd::Traverse, "Tools", "Traverse Adjustment", false);
    row(cmd::DelAdjpts, "Tools", "Delete Adjusted Pts", true);
    row(cmd::Setcomm, "Tools", "Port Settings...", true);
    row(cmd::SurveyCode, "Library", "Survey Codes", false);
    row(cmd::SurveyCodeSettings, "Library", "Code Settings", false);
}

void CommandTableTest::menuTexts() {
    QFETCH(int, id);
    QFETCH(QString, menu);
    QFETCH(QString, text);
    QFETCH(bool, available);
    const CommandInfo* info = FindCommand(id);
    QVERIFY(info != nullptr);
    QCOMPARE(QString::fromLatin1(info->menu), menu);
    QCOMPARE(QString::fromUtf8(info->text), text);
    QCOMPARE(info->available, available);
}

void CommandTableTest::toolbarsAndContextMenuNameKnownCommands() {
    // The two toolbars as the system has always laid them out, separators and all.
    QCOMPARE(CommonToolbar(), std::vector<int>({34609, 34610, 34612, 0,     57607, 0,     34661,
                                                34660, 34662, 0,     55000, 55001, 55002, 55013,
                                                55004, 55005, 55006, 55003, 0,     34615}));
    QCOMPARE(RawDataToolbar(),
             std::vector<int>({34603, 8011, 34606, 0, 34633, 34760, 34635, 34638, 34637, 34636,
                               34639, 34640, 0, 34663, 34706, 34705, 34652}));
    for (const std::vector<int>* list : {&CommonToolbar(), &RawDataToolbar(), &ContextMenu()}) {
        for (const int id : *list) QVERIFY(id == 0 || FindCommand(id) != nullptr);
    }
    QCOMPARE(QString::fromLatin1(FindCommand(ContextMenu().at(4))->text),
             QStringLiteral("Comment Record"));
    QCOMPARE(QString::fromLatin1(FindCommand(cmd::Uncomment)->text),
             QStringLiteral("UnComment Record"));
}

void CommandTableTest::insertCommandsInsertTheirRecordType() {
    QCOMPARE(FindCommand(cmd::InsStn)->recordType, rec::Stn);
    QCOMPARE(FindCommand(cmd::InsSs)->recordType, rec::Ss);
    QCOMPARE(FindCommand(cmd::InsYxz)->recordType, rec::Yxz);
    QVERIFY(FindCommand(cmd::InsYxz)->menu == nullptr);
    QCOMPARE(FindCommand(cmd::AdjPtsRecord)->recordType, rec::AdjPts);
    // Point Record is always enabled; the other inserts wait for an idle plan.
    QCOMPARE(FindCommand(cmd::InsPt)->enabling, Enabling::Always);
    QCOMPARE(FindCommand(cmd::InsBs)->enabling, Enabling::WhenIdle);
    QCOMPARE(FindCommand(cmd::GlobalEdit)->enabling, Enabling::WhenSelection);
    QCOMPARE(FindCommand(cmd::ExportNeutral)->enabling, Enabling::Always);
}

void CommandTableTest::menusAreBuiltInTableOrder() {
    QMainWindow window;
    CommandActions actions(&window);
    actions.BuildMenus(&window);
    actions.BuildToolbars(&window);
    const QList<QAction*> top = window.menuBar()->actions();
    QCOMPARE(top.size(), 7);
    QCOMPARE(top.at(2)->text(), QStringLiteral("&Insert"));
    QMenu* insert = top.at(2)->menu();
    QStringList entries;
    for (QAction* action : insert->actions()) entries << action->text();
    QCOMPARE(entries,
             QStringList({QStringLiteral("Comment"), QStringLiteral("Header Record"),
                          QStringLiteral("Station Record"), QStringLiteral("Point Record"),
                          QStringLiteral("Measurement Record"), QStringLiteral("Miscellaneous")}));
    // The record buttons show their keys.
    QCOMPARE(actions.Action(cmd::InsStn)->iconText(), QStringLiteral("STN"));
    QCOMPARE(actions.RawDataBar()->actions().size(), static_cast<int>(RawDataToolbar().size()));
    QSignalSpy triggered(&actions, &CommandActions::commandTriggered);
    actions.Action(cmd::Regenerate)->trigger();
    QCOMPARE(triggered.takeFirst().at(0).toInt(), cmd::Regenerate);
}

QTEST_MAIN(CommandTableTest)
#include "CommandTableTest.moc"
