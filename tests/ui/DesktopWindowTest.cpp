// The window on a job as a user meets it: opening the bundled example, the documents of
// the job, the enabling of commands, long work with its progress and abort, the window's
// layout, dropped files, recent jobs and the coordinates under the cursor.

#include <QAction>
#include <QLabel>
#include <QListWidget>
#include <QMenu>
#include <QProgressBar>
#include <QSplitter>
#include <QToolButton>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "reduction/UNeditDatabase.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandActions.h"
#include "ui/CommandIds.h"
#include "ui/CommandTable.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditView.h"
#include "ui/forms/CoordEntryForm.h"

using namespace nedit;
using nedit::test::ExampleWindow;
using nedit::test::ScriptedHost;

namespace {

// Station B of the example, worked out by hand from station A (1000, 2000) and the
// orientation on D: bearing 358 06 23.9 + 71 28 59.4, horizontal distance
// 91.131 sin(89 12 19.0).
constexpr double kEastB = 1085.4016;
constexpr double kNorthB = 2031.7779;

}  // namespace

class DesktopWindowTest : public QObject {
    Q_OBJECT
  private slots:
    void openingANeutralFileMakesAJobBesideIt();
    void reopeningTheFileShowsTheStoredDocument();
    void theFirstReductionAsksForTheStationAndDrawsThePlan();
    void withoutAJobOnlyTheJobCommandsAreEnabled();
    void commandsAreEnabledByTheirRules();
    void whileAReductionRunsOnlyAbortIsEnabled();
    void abortStopsTheReduction();
    void splittersAreSizedAsTheStoredStateSays();
    void theStatusBarShowsTheCoordinatesUnderTheCursor();
    void aDroppedNeutralFileBecomesANewDocument();
    void aDroppedRawFileIsRefusedWithAMessage();
    void recentJobsAreRemembered();
    void newAndOpenMakeAndOpenDocumentsOfTheJob();
    void closingAskToSaveChanges();
};

void DesktopWindowTest::openingANeutralFileMakesAJobBesideIt() {
    ExampleWindow example;
    QVERIFY(QFileInfo::exists(example.Job()));
    QCOMPARE(example.Window().Panes().size(), 1);
    QCOMPARE(example.List().GetItemCount(), 30);
    QCOMPARE(example.Rows().at(7), QStringLiteral("STN       ID=A,HI=1.550,CO=STN"));
    QVERIFY(example.Window().windowTitle().contains(
        QStringLiteral("boundary.job (new job beside boundary.neu)")));
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("Raw Data - boundary")));
    QCOMPARE(example.Window().DocumentList()->count(), 1);
    QCOMPARE(example.Window().DocumentList()->item(0)->text(), QStringLiteral("boundary"));
}

void DesktopWindowTest::reopeningTheFileShowsTheStoredDocument() {
    ExampleWindow example;
    // An edit, saved: opening the neutral file again must show it, not a second import.
    example.List().SelectRow(1);
    example.Window().RunCommand(cmd::InsNote);
    QVERIFY(example.Window().RunCommand(cmd::SaveDocument));
    UNeditMainWindow again(std::make_unique<ScriptedHost>());
    QVERIFY(again.OpenPath(example.Neutral()));
    QCOMPARE(again.Session().Container()->GetDocumentNames().size(), std::size_t{1});
    QCOMPARE(again.CurrentPane()->GetListCtrl()->GetItemCount(), 31);
}

void DesktopWindowTest::theFirstReductionAsksForTheStationAndDrawsThePlan() {
    ExampleWindow example;
    // Station A is known only from its XYZ record: the user confirms it once.
    QCOMPARE(example.Host().FormsShown().front(), QStringLiteral("Control Point Coordinate"));
    const UNeditDatabase* engine = example.Pane().GetDocument()->GetDatabase();
    QVERIFY(engine != nullptr);
    QCOMPARE(static_cast<int>(engine->GetPointList().size()), 10);
    const UNeditPt* b = const_cast<UNeditDatabase*>(engine)->SearchPt(L"B");
    QVERIFY(std::fabs(b->x - kEastB) < 0.001 && std::fabs(b->y - kNorthB) < 0.001);
    // The plan shows all of the survey.
    const UWRect seen = example.Plan().Transform().VisibleWorld();
    QVERIFY(seen.Contains(*b));
    QVERIFY(seen.Contains(UWPoint(996.540, 2104.666)));  // D
}

void DesktopWindowTest::withoutAJobOnlyTheJobCommandsAreEnabled() {
    nedit::test::ConfigDirectory config;
    UNeditMainWindow window(std::make_unique<ScriptedHost>());
    window.show();
    QVERIFY(window.Actions().Action(cmd::NewJob)->isEnabled());
    QVERIFY(window.Actions().Action(cmd::OpenJob)->isEnabled());
    for (const int id : {cmd::FileNew, cmd::FileOpen, cmd::ZoomAll, cmd::EditCopy, cmd::InsPt,
                         cmd::Regenerate, cmd::SaveDocument}) {
        QVERIFY2(!window.Actions().Action(id)->isEnabled(), qPrintable(QString::number(id)));
    }
    QVERIFY(!window.DocumentList()->isVisible());
}

void DesktopWindowTest::commandsAreEnabledByTheirRules() {
    ExampleWindow example;
    UNeditMainWindow& window = example.Window();
    QVERIFY(window.IsCommandEnabled(cmd::EditCopy));
    QVERIFY(window.IsCommandEnabled(cmd::Regenerate));
    QVERIFY(window.IsCommandEnabled(cmd::InsPt));
    QVERIFY(!window.IsCommandEnabled(cmd::AbortProcess));
    QVERIFY(!window.IsCommandEnabled(cmd::Undo));
    QVERIFY(window.IsCommandEnabled(cmd::Download));
    QVERIFY(window.IsCommandEnabled(cmd::ImportRawfile));
    QVERIFY(window.IsCommandEnabled(cmd::Setcomm));
    // Edit Selected Records wants rows to work on.
    example.List().ClearSelection();
    QVERIFY(!window.IsCommandEnabled(cmd::GlobalEdit));
    example.List().SelectRow(3);
    QVERIFY(window.IsCommandEnabled(cmd::GlobalEdit));
    // Not built: shown, disabled, and the tip says why.
    for (const int id : {cmd::Traverse, cmd::SurveyCode}) {
        QAction* action = window.Actions().Action(id);
        QVERIFY(action != nullptr);
        QVERIFY(!action->isEnabled());
        QCOMPARE(action->statusTip(), QString::fromLatin1(kNotAvailableTip));
    }
    QCOMPARE(window.Actions().Action(cmd::Transfer)->text(), QStringLiteral("Save To Survey"));
    // While the plan takes no clicks (an input runs), the idle commands wait; Point Record
    // and Export do not.
    example.Plan().SetMouseClickFlag(false);
    QVERIFY(!window.IsCommandEnabled(cmd::EditPaste));
    QVERIFY(!window.IsCommandEnabled(cmd::InsSs));
    QVERIFY(window.IsCommandEnabled(cmd::InsPt));
    QVERIFY(window.IsCommandEnabled(cmd::ExportNeutral));
    example.Plan().SetMouseClickFlag(true);
    // A change can be undone.
    example.List().SelectRow(11);
    window.RunCommand(cmd::CommentRecord);
    window.UpdateActions();
    QVERIFY(window.Actions().Action(cmd::Undo)->isEnabled());
    QCOMPARE(window.Actions().Action(cmd::Undo)->text(), QStringLiteral("Undo Comment/Uncomment"));
}

void DesktopWindowTest::whileAReductionRunsOnlyAbortIsEnabled() {
    bool regenerate = true;
    bool abort = false;
    bool progress_shown = false;
    UNeditMainWindow* seen = nullptr;
    ExampleWindow example([&](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Control Point Coordinate"), [&](QDialog& form) {
            // The question comes in the middle of the run.
            if (seen != nullptr) {
                regenerate = seen->IsCommandEnabled(cmd::Regenerate);
                abort = seen->IsCommandEnabled(cmd::AbortProcess);
                progress_shown = seen->findChild<QProgressBar*>()->isVisible();
            }
            form.accept();
            return form.result();
        });
    });
    seen = &example.Window();
    example.Host().QueueAnswer(mb::IdNo);  // keep the report
    QVERIFY(example.Window().RunCommand(cmd::Regenerate));
    QVERIFY(!regenerate);
    QVERIFY(abort);
    QVERIFY(progress_shown);
    // Afterwards the window is idle again, the bar gone.
    QVERIFY(example.Window().IsCommandEnabled(cmd::Regenerate));
    QVERIFY(!example.Window().findChild<QProgressBar*>()->isVisible());
}

void DesktopWindowTest::abortStopsTheReduction() {
    UNeditMainWindow* seen = nullptr;
    ExampleWindow example([&](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Control Point Coordinate"), [&](QDialog& form) {
            if (seen != nullptr)
                seen->findChild<QToolButton*>(QStringLiteral("AbortButton"))->click();
            form.accept();
            return form.result();
        });
    });
    seen = &example.Window();
    example.Host().QueueAnswer(mb::IdNo);
    example.Window().RunCommand(cmd::Regenerate);
    // The run stopped after the first station: the later points are not there.
    UNeditDatabase* engine = example.Pane().GetDocument()->GetDatabase();
    QVERIFY(engine != nullptr);
    QVERIFY(engine->SearchPt(L"P6") == nullptr);
    QVERIFY(!example.Pane().IsBusy());
    QVERIFY(!example.Pane().GetDocument()->GetAbortProcess());
    // The rows are as they were, and the next run goes to its end.
    QCOMPARE(example.List().GetItemCount(), 30);
    example.Host().QueueAnswer(mb::IdNo);
    seen = nullptr;
    example.Window().RunCommand(cmd::Regenerate);
    QVERIFY(example.Pane().GetDocument()->GetDatabase()->SearchPt(L"P6") != nullptr);
}

void DesktopWindowTest::splittersAreSizedAsTheStoredStateSays() {
    ExampleWindow example;
    CNeditViewPane& pane = example.Pane();
    // No stored state: the default's column of 697, and six lines of form beneath.
    QCOMPARE(pane.ColumnSplitter()->sizes().at(0), 697);
    const int form = pane.RowSplitter()->sizes().at(1);
    QCOMPARE(form, pane.fontMetrics().lineSpacing() * 6);
    // Closing the pane stores the sizes; a state of nine values gives 32.
    pane.ColumnSplitter()->setSizes({500, 400});
    QVERIFY(example.Window().RunCommand(cmd::Exit));
    const std::vector<int> stored = ParseWindowState(ProfileStore().ReadWindowStateText());
    QCOMPARE(stored.size(), std::size_t{10});
    QCOMPARE(stored[8], 500);
    QCOMPARE(ProfileStore().ReadListWidth(), 500L);
    QCOMPARE(ColumnFromWindowState({0, 1, 2, 3, 4, 5, 6, 7, 8}).width, 32);
}

void DesktopWindowTest::theStatusBarShowsTheCoordinatesUnderTheCursor() {
    ExampleWindow example;
    const QPoint at = example.OnPlan(kEastB, kNorthB);
    QTest::mouseMove(&example.Plan(), at);
    const QString text = example.Window().CoordinateLabel()->text();
    // Within a pixel of B.
    const QStringList parts = text.split(QLatin1Char(' '), Qt::SkipEmptyParts);
    QCOMPARE(parts.size(), 4);
    QCOMPARE(parts[0], QStringLiteral("E"));
    QCOMPARE(parts[2], QStringLiteral("N"));
    const double pixel = example.Plan().Transform().ToWorldLength(1.0);
    QVERIFY(std::fabs(parts[1].toDouble() - kEastB) <= pixel);
    QVERIFY(std::fabs(parts[3].toDouble() - kNorthB) <= pixel);
    QCOMPARE(parts[1].section(QLatin1Char('.'), 1).size(), 3);
}

void DesktopWindowTest::aDroppedNeutralFileBecomesANewDocument() {
    ExampleWindow example;
    const QString copy = example.WorkFile(QStringLiteral("lot12.neu"));
    QFile::copy(example.Neutral(), copy);
    example.Window().OpenDropped({QUrl::fromLocalFile(copy)});
    const std::vector<std::wstring> names =
        example.Window().Session().Container()->GetDocumentNames();
    QCOMPARE(names.size(), std::size_t{2});
    QCOMPARE(example.Window().Panes().size(), 2);
    QCOMPARE(example.Pane().GetDocument()->GetName(), std::wstring(L"lot12"));
    QCOMPARE(example.List().GetItemCount(), 30);
}

void DesktopWindowTest::aDroppedRawFileIsRefusedWithAMessage() {
    ExampleWindow example;
    const QString raw = example.WorkFile(QStringLiteral("day1.gsi"));
    QFile file(raw);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("*110001+0000000000000A01 21.324+0000000000000000\n");
    file.close();
    example.Window().OpenDropped({QUrl::fromLocalFile(raw)});
    QVERIFY(example.Host().Messages().back().contains(QStringLiteral("is no neutral file")));
    QCOMPARE(example.Window().Session().Container()->GetDocumentNames().size(), std::size_t{1});
}

void DesktopWindowTest::recentJobsAreRemembered() {
    ExampleWindow example;
    QCOMPARE(example.Window().RecentJobs().front(), QFileInfo(example.Job()).absoluteFilePath());
    const QMenu* recent = example.Window().Actions().RecentJobsMenu();
    QCOMPARE(recent->actions().size(), 1);
    QVERIFY(recent->actions().front()->text().startsWith(QStringLiteral("boundary.job")));
}

void DesktopWindowTest::newAndOpenMakeAndOpenDocumentsOfTheJob() {
    ExampleWindow example;
    QVERIFY(example.Window().RunCommand(cmd::FileNew));
    QCOMPARE(example.Pane().GetDocument()->GetName(), std::wstring(L"Data1"));
    QCOMPARE(example.List().GetItemCount(), 0);
    // The first record of a new document comes after the header line.
    QVERIFY(example.Window().RunCommand(cmd::InsStn));
    QCOMPARE(example.Rows(), QStringList({QStringLiteral("#VERSION-1.0 NEUTRAL FILE"),
                                          QStringLiteral("STN       ID=,HI=,CO=")}));
    // Open... lists the documents; the example is brought to the front.
    example.Host().SetFormScript(QStringLiteral("Open Raw Data"), [](QDialog& form) {
        form.findChild<QListWidget*>()->setCurrentRow(0);
        form.accept();
        return form.result();
    });
    QVERIFY(example.Window().RunCommand(cmd::FileOpen));
    QCOMPARE(example.Pane().GetDocument()->GetName(), std::wstring(L"boundary"));
    QCOMPARE(example.Window().Panes().size(), 2);
}

void DesktopWindowTest::closingAskToSaveChanges() {
    ExampleWindow example;
    example.List().SelectRow(11);
    example.Window().RunCommand(cmd::CommentRecord);
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("*")));
    example.Host().QueueAnswer(mb::IdCancel);
    QVERIFY(!example.Window().close());
    QCOMPARE(example.Host().Messages().back(), QStringLiteral("Save changes to boundary?"));
    example.Host().QueueAnswer(mb::IdYes);
    QVERIFY(example.Window().close());
    // The change was saved into the job.
    UNeditMainWindow again(std::make_unique<ScriptedHost>());
    QVERIFY(again.OpenJob(example.Job()));
    QVERIFY(again.CurrentPane()->GetListCtrl()->GetItemText(11).rfind(L"#SS", 0) == 0);
}

QTEST_MAIN(DesktopWindowTest)
#include "DesktopWindowTest.moc"
