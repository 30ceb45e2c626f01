// The pane of the bundled example: picks in the plan and rows in the list find each
// other, commands run by number and from the menus, rows change and come back with undo,
// the report, the record dialogs, printing, export and import, and the plan's picture.

#include <QAction>
#include <QCheckBox>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QPdfWriter>
#include <QPrinter>
#include <QRadioButton>
#include <QUndoStack>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandActions.h"
#include "ui/CommandIds.h"
#include "ui/FindRecordDialog.h"
#include "ui/PlanStyle.h"
#include "ui/SXTView.h"
#include "ui/UNeditDlgView.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditView.h"
#include "ui/UReportView.h"
#include "ui/forms/EditRecordForm.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ExampleWindow;

namespace {

// Worked out by hand from station A (1000, 2000), oriented on D at 358 06 23.9: the side
// shot to P1 turns 72 46 45.4 at a horizontal distance of 31.886 sin(89 10 11.3), and B
// lies on 69 35 23.3 at 91.131 sin(89 12 19.0).
constexpr double kEastP1 = 1030.1249;
constexpr double kNorthP1 = 2010.4400;
constexpr double kEastB = 1085.4016;
constexpr double kNorthB = 2031.7779;
constexpr double kEastA = 1000.0;
constexpr double kNorthA = 2000.0;

constexpr int kRowP1 = 11;
constexpr int kRowB = 13;

/// The menu entry of that text, searched through every menu of the window.
QAction* MenuEntry(QMainWindow& window, const QString& text) {
    for (QMenu* menu : window.menuBar()->findChildren<QMenu*>()) {
        for (QAction* action : menu->actions()) {
            if (action->text() == text) return action;
        }
    }
    return nullptr;
}

}  // namespace

class DesktopPaneTest : public QObject {
    Q_OBJECT
  private slots:
    void aPickInThePlanSelectsItsRow();
    void aPickOnALineSelectsTheRowOfItsEnd();
    void aSelectedRowFliesThePlanToItsPoint();
    void keysStepTheSelectionAndThePlanFollows();
    void insertCommandsRunByNumberAndFromTheMenus();
    void commentUncommentTurnsAMixedSelectionBack();
    void pasteAndDeleteAreUndoneAndRedone();
    void typingInTheFormIsOneStepOfUndo();
    void aDoubleClickedRowOpensItsRecordDialog();
    void aDoubleClickedPointShowsWhatIsKnownOfIt();
    void regenerateAsksAboutTheReportAndShowsIt();
    void saveToSurveyWritesTheReducedSurveyIntoTheJob();
    void findSelectsTheNextMatchingRow();
    void exportWritesEveryRowAndImportReplacesThem();
    void saveAsKeepsWhatWasSavedUnderTheOldName();
    void draggingRowsMovesThemAndUndoBringsThemBack();
    void printingMakesPagesOfTheRows();
    void thePlanDrawsPointsAndLinesWhereTheyLie();
    void zoomCommandsWalkTheHistory();
    void displaySettingsLabelThePlan();
    void routePreviewDrawsTheChosenPartInRed();
};

void DesktopPaneTest::aPickInThePlanSelectsItsRow() {
    ExampleWindow example;
    QTest::mouseClick(&example.Plan(), Qt::LeftButton, {}, example.OnPlan(kEastB, kNorthB));
    QCOMPARE(example.Plan().Selected().kind, PlanPick::Kind::Point);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowB});
    QCOMPARE(example.List().GetFocusRow(), kRowB);
    QCOMPARE(example.List().GetHeaderText(), std::wstring(L"Rec.No:13"));
    QCOMPARE(example.Pane().GetDlgView()->RecordLabel(), QStringLiteral("SS"));
    QCOMPARE(example.Pane().GetDlgView()->FieldEdit(0)->text(), QStringLiteral("B"));
    // A click on empty ground picks nothing and leaves the rows alone.
    QTest::mouseClick(&example.Plan(), Qt::LeftButton, {}, example.OnPlan(1040.0, 2090.0));
    QCOMPARE(example.Plan().Selected().kind, PlanPick::Kind::None);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowB});
}

void DesktopPaneTest::aPickOnALineSelectsTheRowOfItsEnd() {
    ExampleWindow example;
    const auto& lines = example.Pane().GetDocument()->GetDatabase()->GetLineList();
    QVERIFY(!lines.empty());
    const UNeditLine& line = lines.front();
    const UWPoint middle = line.MidPt();
    QTest::mouseClick(&example.Plan(), Qt::LeftButton, {}, example.OnPlan(middle.x, middle.y));
    QCOMPARE(example.Plan().Selected().kind, PlanPick::Kind::Line);
    const int row = example.Pane().SearchList(line.GetToPt());
    QVERIFY(row > 0);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{row});
    // The line stays the plan's selection.
    QCOMPARE(example.Plan().Selected().kind, PlanPick::Kind::Line);
}

void DesktopPaneTest::aSelectedRowFliesThePlanToItsPoint() {
    ExampleWindow example;
    // The plan looks somewhere else entirely.
    example.Plan().Transform().SetWindow(UWPoint(5000.0, 5000.0), 4.0);
    QTest::mouseClick(example.Pane().GetNeditView()->viewport(), Qt::LeftButton, {},
                      example.OnRow(kRowP1));
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowP1});
    QCOMPARE(example.Plan().Selected().kind, PlanPick::Kind::Point);
    const UWPoint centre = example.Plan().Transform().Centre();
    QVERIFY2(std::fabs(centre.x - kEastP1) < 0.001 && std::fabs(centre.y - kNorthP1) < 0.001,
             qPrintable(QStringLiteral("%1 %2").arg(centre.x).arg(centre.y)));
    QVERIFY(example.Plan().CanZoomPrevious());
    // A point already in view is not moved to.
    example.Plan().RunCommand(cmd::ZoomAll);
    const UWPoint before = example.Plan().Transform().Centre();
    QTest::mouseClick(example.Pane().GetNeditView()->viewport(), Qt::LeftButton, {},
                      example.OnRow(kRowB));
    QCOMPARE(example.Plan().Transform().Centre().x, before.x);
}

void DesktopPaneTest::keysStepTheSelectionAndThePlanFollows() {
    ExampleWindow example;
    UNeditView* view = example.Pane().GetNeditView();
    view->setFocus();
    example.List().SelectRow(kRowP1);
    QTest::keyClick(view, Qt::Key_Down);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{12});
    const UNeditPt& p2 =
        example.Pane().GetDocument()->GetDatabase()->GetPointList()[static_cast<std::size_t>(
            example.Plan().Selected().index)];
    QCOMPARE(p2.GetID(), std::wstring(L"P2"));
    QTest::keyClick(view, Qt::Key_Down, Qt::ShiftModifier);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>({12, 13}));
    // Next of the same type goes from the side shot to the next side shot.
    example.List().SelectRow(kRowB);
    QVERIFY(example.Window().RunCommand(cmd::NextRecord));
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{17});
}

void DesktopPaneTest::insertCommandsRunByNumberAndFromTheMenus() {
    ExampleWindow example;
    example.List().SelectRow(kRowB);
    QVERIFY(example.Window().RunCommand(cmd::InsSs));
    // The new record stands before the row that was selected, and is selected.
    QCOMPARE(example.Rows().at(kRowB), QStringLiteral("SS        ID=,HA=,VA=,SD=,HT=,CO="));
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowB});
    QCOMPARE(example.List().GetItemCount(), 31);
    QAction* backsight = MenuEntry(example.Window(), QStringLiteral("Back Sight"));
    QVERIFY(backsight != nullptr);
    backsight->trigger();
    QCOMPARE(example.Rows().at(kRowB), QStringLiteral("BS        ID=,HA=,VA=,SD=,HT=,CO="));
    QCOMPARE(example.List().GetItemCount(), 32);
    // Each insert is one step of the undo history.
    QCOMPARE(example.Pane().GetUndoStack()->count(), 2);
    MenuEntry(example.Window(), QStringLiteral("Undo Insert Record"))->trigger();
    QCOMPARE(example.List().GetItemCount(), 31);
}

void DesktopPaneTest::commentUncommentTurnsAMixedSelectionBack() {
    ExampleWindow example;
    const QString p1 = example.Rows().at(kRowP1);
    example.List().SetSelection({kRowP1});
    example.Window().RunCommand(cmd::CommentRecord);
    QCOMPARE(example.Rows().at(kRowP1), QStringLiteral("#") + p1);
    // A selection with one comment in it: every row is uncommented.
    example.List().SetSelection({kRowP1, 12});
    example.Window().RunCommand(cmd::CommentRecord);
    QCOMPARE(example.Rows().at(kRowP1), p1);
    QVERIFY(example.Rows().at(12).startsWith(QStringLiteral("SS ")));
}

void DesktopPaneTest::pasteAndDeleteAreUndoneAndRedone() {
    ExampleWindow example;
    const QStringList original = example.Rows();
    example.List().SetSelection({kRowP1, 12});
    QVERIFY(example.Window().RunCommand(cmd::EditCopy));
    example.List().SetSelection({20});
    QVERIFY(example.Window().RunCommand(cmd::EditPaste));
    QCOMPARE(example.List().GetItemCount(), 32);
    QCOMPARE(example.Rows().mid(20, 2), original.mid(kRowP1, 2));
    // The pasted rows join the selection of the row they went in before.
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>({20, 21, 22}));
    example.Host().QueueAnswer(mb::IdOk);  // "Confirm Delete Record"
    QTest::keyClick(example.Pane().GetNeditView(), Qt::Key_Delete);
    QCOMPARE(example.Host().Messages().back(), QStringLiteral("Confirm Delete Record"));
    QCOMPARE(example.List().GetItemCount(), 29);
    QUndoStack* undo = example.Pane().GetUndoStack();
    QCOMPARE(undo->undoText(), QStringLiteral("Delete"));
    undo->undo();
    undo->undo();
    QCOMPARE(example.Rows(), original);
    undo->redo();
    QCOMPARE(example.List().GetItemCount(), 32);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>({20, 21}));
    undo->redo();
    QCOMPARE(example.List().GetItemCount(), 29);
    QVERIFY(!undo->canRedo());
}

void DesktopPaneTest::typingInTheFormIsOneStepOfUndo() {
    ExampleWindow example;
    example.List().SelectRow(kRowP1);
    QLineEdit* id = example.Pane().GetDlgView()->FieldEdit(0);
    QCOMPARE(id->text(), QStringLiteral("P1"));
    id->setFocus();
    id->selectAll();
    QTest::keyClicks(id, QStringLiteral("p10"));
    QCOMPARE(example.Rows().at(kRowP1),
             QStringLiteral("SS        ID=P10,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FC01"));
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("*")));
    QCOMPARE(example.Pane().GetUndoStack()->count(), 1);
    example.Window().RunCommand(cmd::Undo);
    QCOMPARE(example.Rows().at(kRowP1),
             QStringLiteral("SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FC01"));
}

void DesktopPaneTest::aDoubleClickedRowOpensItsRecordDialog() {
    ExampleWindow example;
    example.Host().SetFormScript(QStringLiteral("Edit Record Data"), [](QDialog& form) {
        auto& record = static_cast<EditRecordForm&>(form);
        record.FieldEdit(5)->setText(QStringLiteral("fence"));
        form.accept();
        return form.result();
    });
    QTest::mouseDClick(example.Pane().GetNeditView()->viewport(), Qt::LeftButton, {},
                       example.OnRow(kRowP1));
    QCOMPARE(example.Host().FormsShown().back(), QStringLiteral("Edit Record Data"));
    QCOMPARE(example.Rows().at(kRowP1),
             QStringLiteral("SS        ID=P1,HA=72.46454,VA=89.10113,SD=31.886,HT=1.600,CO=FENCE"));
    QCOMPARE(example.Pane().GetUndoStack()->undoText(), QStringLiteral("Edit Record Data"));
}

void DesktopPaneTest::aDoubleClickedPointShowsWhatIsKnownOfIt() {
    ExampleWindow example;
    QString easting;
    QString code;
    example.Host().SetFormScript(QStringLiteral("Edit Point"), [&](QDialog& form) {
        const QList<QLineEdit*> values = form.findChildren<QLineEdit*>();
        code = values.at(1)->text();
        easting = values.at(2)->text();
        form.accept();
        return form.result();
    });
    QTest::mouseDClick(&example.Plan(), Qt::LeftButton, {}, example.OnPlan(kEastB, kNorthB));
    QCOMPARE(example.Host().FormsShown().back(), QStringLiteral("Edit Point"));
    QCOMPARE(easting, QStringLiteral("1085.402"));
    QCOMPARE(code, QStringLiteral("STN"));
}

void DesktopPaneTest::regenerateAsksAboutTheReportAndShowsIt() {
    ExampleWindow example;
    example.Host().QueueAnswer(mb::IdYes);
    QVERIFY(example.Window().RunCommand(cmd::Regenerate));
    QCOMPARE(example.Host().Messages().back(),
             QStringLiteral("Would you like to OVERWRITE the reduction REPORT ?"));
    QVERIFY(example.Window().RunCommand(cmd::ViewReport));
    UReportView* report = example.Pane().GetReportView();
    QVERIFY(report != nullptr && report->isVisible());
    QVERIFY(report->windowTitle().endsWith(QStringLiteral("Raw Data Reduction Report - boundary")));
    // The report of the one run: B's coordinates stand in its side shot line and in its
    // station block. Without overwriting, the next run's report follows it.
    QCOMPARE(report->Text().count(QStringLiteral("1085.402")), 2);
    example.Host().QueueAnswer(mb::IdNo);
    QVERIFY(example.Window().RunCommand(cmd::Regenerate));
    QCOMPARE(report->Text().count(QStringLiteral("1085.402")), 4);
    const QString saved = example.WorkFile(QStringLiteral("report.txt"));
    QVERIFY(report->SaveAsText(saved));
    QVERIFY(QFileInfo(saved).size() > 100);
}

void DesktopPaneTest::saveToSurveyWritesTheReducedSurveyIntoTheJob() {
    ExampleWindow example;
    USurveyDoc* job = example.Pane().GetSurveyDoc();
    QVERIFY(job != nullptr);
    QVERIFY(example.Window().IsCommandEnabled(cmd::Transfer));
    QVERIFY(example.Window().RunCommand(cmd::Transfer));
    // The point code settings are asked, then the ten points go in, with the four station
    // lines and the three lines of the string FC01 (P1, P2, P4, P5).
    QCOMPARE(example.Host().FormsShown().back(), QStringLiteral("Point Code"));
    auto count = [job](const char* table) {
        auto query = job->Database().Query(std::string("SELECT count(*) FROM ") + table);
        return query->Step() ? query->Int(0) : -1;
    };
    QCOMPARE(count("point"), 10);
    QCOMPARE(count("line"), 7);
    QCOMPARE(example.Pane().GetDocument()->GetTransferReport().End, TransferEnd::Finished);
    // A second transfer finds every point equal and writes them again without a question.
    QVERIFY(example.Window().RunCommand(cmd::Transfer));
    QCOMPARE(count("point"), 10);
    QCOMPARE(example.Pane().GetDocument()->GetTransferReport().PointsUpdated, 10);
}

void DesktopPaneTest::findSelectsTheNextMatchingRow() {
    ExampleWindow example;
    QVERIFY(example.Window().RunCommand(cmd::FindRecord));
    FindRecordDialog* find = example.Pane().GetFindDialog();
    QVERIFY(find != nullptr && find->isVisible());
    find->TextField()->setText(QStringLiteral("fc01"));
    QTest::keyClick(find->TextField(), Qt::Key_Return);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowP1});
    QTest::keyClick(find->TextField(), Qt::Key_Return);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{12});
    find->MatchCaseBox()->setChecked(true);
    QTest::keyClick(find->TextField(), Qt::Key_Return);
    QCOMPARE(example.Host().Messages().back(), QStringLiteral("fc01 not found."));
}

void DesktopPaneTest::exportWritesEveryRowAndImportReplacesThem() {
    ExampleWindow example;
    const QString exported = example.WorkFile(QStringLiteral("checked"));
    example.Pane().SetFileChooser(
        [&](bool, const QString&, const QString&, const QString&) { return exported; });
    QVERIFY(example.Window().RunCommand(cmd::ExportNeutral));
    QFile file(exported + QStringLiteral(".neu"));
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(QString::fromUtf8(file.readAll()),
             example.Rows().join(QLatin1Char('\n')) + QLatin1Char('\n'));
    // An import asks before it overwrites, then the rows are the file's.
    const QString other = example.WorkFile(QStringLiteral("short.neu"));
    QFile short_file(other);
    QVERIFY(short_file.open(QIODevice::WriteOnly));
    short_file.write("#VERSION-1.0 NEUTRAL FILE\nSTN ID=X,HI=1.5\nXYZ ID=X,E=10,N=20,H=5\n");
    short_file.close();
    example.Pane().SetFileChooser(
        [&](bool, const QString&, const QString&, const QString&) { return other; });
    example.Host().QueueAnswer(mb::IdYes);
    QVERIFY(example.Window().RunCommand(cmd::ImportNeutral));
    QCOMPARE(example.Host().Messages().front(), QStringLiteral("Overwrite Existing Data?"));
    QCOMPARE(example.List().GetItemCount(), 3);
    QCOMPARE(example.Rows().at(1), QStringLiteral("STN       ID=X,HI=1.5"));
    QCOMPARE(example.Pane().GetUndoStack()->count(), 0);
    // The plan draws the new run.
    QVERIFY(example.Plan().Scene().Database() == example.Pane().GetDocument()->GetDatabase());
}

void DesktopPaneTest::saveAsKeepsWhatWasSavedUnderTheOldName() {
    ExampleWindow example;
    QVERIFY(example.Window().RunCommand(cmd::SaveDocument));
    example.List().SetSelection({kRowP1});
    example.Window().RunCommand(cmd::CommentRecord);
    example.Host().SetFormScript(QStringLiteral("Save Raw Data As"), [](QDialog& form) {
        form.findChild<QLineEdit*>()->setText(QStringLiteral("lot12-checked"));
        form.accept();
        return form.result();
    });
    QVERIFY(example.Window().RunCommand(cmd::FileSaveAs));
    // The window goes on under the new name, with the comment; the old name holds the rows
    // as they were saved.
    QCOMPARE(example.Pane().GetDocument()->GetName(), std::wstring(L"lot12-checked"));
    QVERIFY(!example.Window().windowTitle().endsWith(QStringLiteral("*")));
    UNeditMainWindow again(std::make_unique<nedit::test::ScriptedHost>());
    QVERIFY(again.OpenJob(example.Job()));
    UNeditDoc* old = again.Session().Container()->GetNeditDoc(L"boundary");
    UNeditDoc* renamed = again.Session().Container()->GetNeditDoc(L"lot12-checked");
    QVERIFY(old != nullptr && renamed != nullptr);
    QVERIFY(old->OpenList().GetItemText(kRowP1).rfind(L"SS", 0) == 0);
    QVERIFY(renamed->OpenList().GetItemText(kRowP1).rfind(L"#SS", 0) == 0);
}

void DesktopPaneTest::draggingRowsMovesThemAndUndoBringsThemBack() {
    ExampleWindow example;
    const QStringList original = example.Rows();
    UNeditView* view = example.Pane().GetNeditView();
    QWidget* rows = view->viewport();
    example.List().SetSelection({kRowP1, 12});
    // Press on the selection, move past the drag distance, release over row 20.
    const QPoint from = example.OnRow(kRowP1);
    const QPoint to = example.OnRow(20);
    QTest::mousePress(rows, Qt::LeftButton, {}, from);
    QMouseEvent move(QEvent::MouseMove, QPointF(from + QPoint(0, 12)),
                     rows->mapToGlobal(QPointF(from)), Qt::NoButton, Qt::LeftButton,
                     Qt::NoModifier);
    QCoreApplication::sendEvent(rows, &move);
    QVERIFY(example.List().IsDragging());
    QMouseEvent over(QEvent::MouseMove, QPointF(to), rows->mapToGlobal(QPointF(to)), Qt::NoButton,
                     Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(rows, &over);
    QTest::mouseRelease(rows, Qt::LeftButton, {}, to);
    // The two side shots now stand before what was row 20.
    QCOMPARE(example.List().GetItemCount(), 30);
    QCOMPARE(example.Rows().mid(18, 2), original.mid(kRowP1, 2));
    QCOMPARE(example.Rows().at(20), original.at(20));
    QCOMPARE(example.Pane().GetUndoStack()->undoText(), QStringLiteral("Move Rows"));
    example.Pane().GetUndoStack()->undo();
    QCOMPARE(example.Rows(), original);
}

void DesktopPaneTest::printingMakesPagesOfTheRows() {
    ExampleWindow example;
    const QString pdf = example.WorkFile(QStringLiteral("rows.pdf"));
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setOutputFileName(pdf);
    example.Pane().PrintList(printer);
    QFile file(pdf);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray bytes = file.readAll();
    // 30 rows at 55 a page: one page.
    QCOMPARE(
        bytes.count("/Type /Page\n") + bytes.count("/Type /Page\r") + bytes.count("/Type /Page "),
        1);
}

void DesktopPaneTest::thePlanDrawsPointsAndLinesWhereTheyLie() {
    ExampleWindow example;
    UNeditGraphView& plan = example.Plan();
    const QImage image = plan.Render();
    const double density = image.devicePixelRatio();
    const QColor background = PlanStyle().background;
    auto ink_near = [&](double east, double north) {
        const QPoint at = example.OnPlan(east, north);
        for (int dx = -1; dx <= 1; ++dx) {
            for (int dy = -1; dy <= 1; ++dy) {
                const QPointF pixel((at.x() + dx) * density, (at.y() + dy) * density);
                if (image.pixelColor(pixel.toPoint()) != background) return true;
            }
        }
        return false;
    };
    QVERIFY(ink_near(kEastB, kNorthB));
    QVERIFY(ink_near(kEastP1, kNorthP1));
    QVERIFY(ink_near(kEastA, kNorthA));
    // The line from A to B, half way along.
    QVERIFY(ink_near((kEastA + kEastB) / 2.0, (kNorthA + kNorthB) / 2.0));
    // Inside the lot, away from every point and line, the ground is bare.
    QVERIFY(!ink_near(1045.0, 2045.0));
}

void DesktopPaneTest::zoomCommandsWalkTheHistory() {
    ExampleWindow example;
    UNeditGraphView& plan = example.Plan();
    const double all = plan.Transform().Scale();
    QVERIFY(example.Window().RunCommand(cmd::ZoomIn));
    QCOMPARE(plan.Transform().Scale(), all * 2.0);
    QVERIFY(example.Window().RunCommand(cmd::ZoomIn));
    QVERIFY(example.Window().RunCommand(cmd::ZoomPrevious));
    QCOMPARE(plan.Transform().Scale(), all * 2.0);
    QVERIFY(example.Window().RunCommand(cmd::ZoomNext));
    QCOMPARE(plan.Transform().Scale(), all * 4.0);
    QVERIFY(example.Window().RunCommand(cmd::ZoomAll));
    QCOMPARE(plan.Transform().Scale(), all);
    // Zoom a Point to B at 1:200.
    QVERIFY(plan.ZoomToPoint(L"B", 200.0));
    QVERIFY(std::fabs(plan.Transform().Centre().x - kEastB) < 0.001);
    QVERIFY(std::fabs(plan.CurrentScale() - 200.0) < 1e-6);
    QCOMPARE(example.List().GetSelectedRows(), std::vector<int>{kRowB});
    QVERIFY(!plan.ZoomToPoint(L"NONE", 200.0));
}

void DesktopPaneTest::displaySettingsLabelThePlan() {
    ExampleWindow example;
    bool only_labels_editable = true;
    example.Host().SetFormScript(QStringLiteral("Display Settings"), [&](QDialog& form) {
        for (QCheckBox* box : form.findChildren<QCheckBox*>()) {
            if (box->text() == QStringLiteral("Point Numbers")) box->setChecked(true);
            if (box->isEnabled() != box->text().startsWith(QStringLiteral("Point ")))
                only_labels_editable = false;
        }
        form.accept();
        return form.result();
    });
    const QImage bare = example.Plan().Render();
    QVERIFY(example.Window().RunCommand(cmd::DisplaySettings));
    QVERIFY(only_labels_editable);
    QCOMPARE(example.Pane().GetDocument()->GetNeditSettings().Get(UNeditSettings::ShowPointNumbers),
             1);
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("*")));
    // Labels stand to the upper right of B.
    const QImage labelled = example.Plan().Render();
    const QPoint b = example.OnPlan(kEastB, kNorthB);
    const QRect label(b + QPoint(6, -8), QSize(10, 10));
    int changed = 0;
    const double density = labelled.devicePixelRatio();
    for (int x = label.left(); x <= label.right(); ++x) {
        for (int y = label.top(); y <= label.bottom(); ++y) {
            const QPoint pixel = (QPointF(x, y) * density).toPoint();
            if (labelled.pixelColor(pixel) != bare.pixelColor(pixel)) ++changed;
        }
    }
    QVERIFY(changed > 5);
}

void DesktopPaneTest::routePreviewDrawsTheChosenPartInRed() {
    ExampleWindow example;
    const UNeditDatabase* engine = example.Pane().GetDocument()->GetDatabase();
    SXTView preview(engine->GetDocExtents());
    preview.SetDatabase(engine);
    const SXTView::Route loop = {L"A", L"B", L"C", L"D", L"A"};
    preview.SetAllRoutes({loop});
    preview.SetRoute(loop, L"B", L"D");
    QCOMPARE(preview.ChosenPart(), std::vector<std::size_t>({1, 2, 3}));
    // A closed route from A back to A takes the whole loop; a start found after its end
    // takes nothing.
    preview.SetRoute(loop, L"A", L"A");
    QCOMPARE(preview.ChosenPart().size(), std::size_t{5});
    preview.SetRoute(loop, L"C", L"B");
    QVERIFY(preview.ChosenPart().empty());
    // The larger side of the extents spans 30000 units.
    const UWRect extents = engine->GetDocExtents();
    QCOMPARE(preview.DrawScale(), 30000.0 / std::max(extents.Width(), extents.Height()));
    preview.SetRoute(loop, L"B", L"D");
    preview.resize(300, 300);
    const QImage image = preview.grab().toImage();
    int red = 0;
    int blue = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            const QColor colour = image.pixelColor(x, y);
            if (colour.red() > 200 && colour.green() < 60 && colour.blue() < 60) ++red;
            if (colour.blue() > 200 && colour.red() < 60 && colour.green() < 60) ++blue;
        }
    }
    QVERIFY(red > 100);
    QVERIFY(blue > 20);
}

QTEST_MAIN(DesktopPaneTest)
#include "DesktopPaneTest.moc"
