// The traverse in the desktop: the route dialog's form bound to its logic, and the bundled
// example adjusted from the menu as a user would, checked against figures worked out by hand.

#include <QCheckBox>
#include <QComboBox>
#include <QListWidget>
#include <QPushButton>
#include <QRadioButton>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/job/UJobSettings.h"
#include "reduction/UNeditDatabase.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/SXTView.h"
#include "ui/forms/MiscloseReportForm.h"
#include "ui/forms/TraverseForm.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ExampleWindow;
using Dlg = USelRouteDlg;

namespace {

// The loop A, B, C, D, A of the example, reduced leg by leg from A (1000, 2000, 50) oriented
// on D at 358 06 23.9 (horizontal distance SD sin VA, height HI + SD cos VA - HT), misses A
// by E 0.00014, N 0.00094 over 360.1864 m; the Compass rule gives each point its share of
// the length run so far (a short python3 calculation):
struct Adjusted {
    const wchar_t* name;
    double east;
    double north;
    double height;  // left alone: "Adjust Elevations" is not ticked
};
constexpr Adjusted kAdjusted[] = {
    {L"B", 1085.4016, 2031.7781, 51.2140},
    {L"C", 1072.1187, 2118.3049, 52.8800},
    {L"D", 996.5399, 2104.6671, 51.9050},
};
constexpr double kTolerance = 2e-4;

int RowOf(const QListWidget& routes, const QString& text) {
    const QList<QListWidgetItem*> found = routes.findItems(text, Qt::MatchExactly);
    return found.isEmpty() ? -1 : routes.row(found.front());
}

void Type(UEdit* field, const QString& text) {
    field->selectAll();
    QTest::keyClicks(field, text);
}

}  // namespace

class TraverseFormTest : public QObject {
    Q_OBJECT
  private slots:
    void controlsAndMembersFollowEachOther();
    void groupsEnableAsTheDialogSays();
    void northFirstPutsNorthingAboveEasting();
    void cancelComputesNothing();
    void theExampleIsAdjustedFromTheMenu();
};

void TraverseFormTest::controlsAndMembersFollowEachOther() {
    ExampleWindow example;
    UNeditDoc* doc = example.Pane().GetDocument();
    Dlg dialog(doc->GetDatabase(), &doc->GetTraverseRoutes(), Dlg::kEastFirstId, nullptr);
    TraverseForm form(dialog, {&doc->GetSettings(), &example.Host()}, nullptr);
    // Opened on the first route, closing on its start.
    QCOMPARE(form.Routes()->count(), static_cast<int>(dialog.GetRouteRows().size()));
    QCOMPARE(form.Routes()->currentRow(), 0);
    QCOMPARE(form.Combo(Dlg::kStartCombo)->currentText(), QString::fromStdWString(dialog.Start));
    QCOMPARE(form.Field(Dlg::kFixedPtField)->text(), QString::fromStdWString(dialog.Start));

    // A route chosen in the list: the start, the end and the plan follow.
    const int loop = RowOf(*form.Routes(), QStringLiteral("A,B,C,D,A,"));
    QVERIFY(loop >= 0);
    form.Routes()->setCurrentRow(loop);
    QCOMPARE(dialog.GetSelectedRow(), loop);
    QCOMPARE(dialog.Start, std::wstring(L"A"));
    QCOMPARE(form.Combo(Dlg::kEndCombo)->currentText(), QStringLiteral("A"));
    QCOMPARE(form.Combo(Dlg::kBackSightCombo)->currentText(), QStringLiteral("D"));
    QCOMPARE(form.Preview()->ChosenPart().size(), std::size_t{5});

    // Typed values reach the members, in the job's units.
    Type(form.Field(TraverseForm::kStartXField), QStringLiteral("1234.5"));
    QCOMPARE(dialog.StartX, 1234.5);
    form.Field(Dlg::kFixedZField)->clear();
    QCOMPARE(dialog.FixedZ, UWPoint::kNoHeight);
    form.Button(TraverseForm::kTransitRadio)->click();
    QCOMPARE(dialog.Transit, 1);
    QCOMPARE(dialog.Compass, 0);
    // The fixed point typed is looked up: B's reduced place comes into its fields.
    Type(form.Field(Dlg::kFixedPtField), QStringLiteral("B"));
    QCOMPARE(dialog.FixedPt, std::wstring(L"B"));
    QVERIFY(qAbs(form.Field(Dlg::kFixedXField)->Value() - 1085.4016) < 5e-4);
    QCOMPARE(form.Field(Dlg::kFixedXField)->Unit(), QStringLiteral("m"));
    // The closing bearing follows typed closing coordinates: due east of B.
    form.Button(Dlg::kAdjustAngleBox)->click();
    Type(form.Field(Dlg::kCloseXField), QStringLiteral("1185.4016"));
    Type(form.Field(Dlg::kCloseYField), QString::number(dialog.FixedY, 'f', 4));
    QVERIFY(qAbs(dialog.CloseBearing - 90.0) < 1e-3);
    QVERIFY(qAbs(form.Field(Dlg::kCloseBearingField)->Value() - 90.0) < 1e-3);
}

void TraverseFormTest::groupsEnableAsTheDialogSays() {
    ExampleWindow example;
    UNeditDoc* doc = example.Pane().GetDocument();
    Dlg dialog(doc->GetDatabase(), &doc->GetTraverseRoutes(), Dlg::kEastFirstId, nullptr);
    TraverseForm form(dialog, {&doc->GetSettings(), &example.Host()}, nullptr);
    form.Routes()->setCurrentRow(RowOf(*form.Routes(), QStringLiteral("A,B,C,D,A,")));
    // Without an angle check its group waits; A's back sight has coordinates, so the start
    // bearing comes from them.
    QVERIFY(!form.Combo(Dlg::kCheckCombo)->isEnabled());
    QVERIFY(!form.Field(Dlg::kCloseXField)->isEnabled());
    QVERIFY(form.Field(Dlg::kBSXField)->isEnabled());
    QVERIFY(!form.Field(Dlg::kStartBearingField)->isEnabled());
    form.Button(Dlg::kUseBSBearingRadio)->click();
    QVERIFY(!form.Field(Dlg::kBSXField)->isEnabled());
    QVERIFY(form.Field(Dlg::kStartBearingField)->isEnabled());

    form.Button(Dlg::kAdjustAngleBox)->click();
    QCOMPARE(dialog.AdjustAngle, 1);
    QVERIFY(form.Combo(Dlg::kCheckCombo)->isEnabled());
    QVERIFY(form.Combo(Dlg::kCheckCombo)->count() > 0);
    QVERIFY(form.Field(Dlg::kCloseXField)->isEnabled());
    QVERIFY(!form.Field(Dlg::kCloseBearingField)->isEnabled());
    form.Button(Dlg::kUseCloseBearingRadio)->click();
    QVERIFY(!form.Field(Dlg::kCloseXField)->isEnabled());
    QVERIFY(form.Field(Dlg::kCloseBearingField)->isEnabled());

    // An end typed that no set-up is: no angle check, and the fixed point stays open to a
    // point of the run; a name that is no point closes the fixed point's fields too.
    QLineEdit* end = form.Combo(Dlg::kEndCombo)->lineEdit();
    end->selectAll();
    QTest::keyClicks(end, QStringLiteral("P1"));
    QCOMPARE(dialog.EndStn, std::wstring(L"P1"));
    QVERIFY(!form.Button(Dlg::kAdjustAngleBox)->isEnabled());
    QVERIFY(!form.Combo(Dlg::kCheckCombo)->isEnabled());
    QVERIFY(form.Field(Dlg::kFixedPtField)->isEnabled());
    QCOMPARE(end->text(), QStringLiteral("P1"));
    QTest::keyClicks(end, QStringLiteral("X"));
    QVERIFY(!form.Field(Dlg::kFixedPtField)->isEnabled());

    // No fixed point, no computation.
    form.Field(Dlg::kFixedPtField)->setEnabled(true);
    form.Field(Dlg::kFixedPtField)->clear();
    QVERIFY(!form.Button(Dlg::kComputeButton)->isEnabled());
}

void TraverseFormTest::northFirstPutsNorthingAboveEasting() {
    ExampleWindow example;
    UNeditDoc* doc = example.Pane().GetDocument();
    Dlg dialog(doc->GetDatabase(), &doc->GetTraverseRoutes(), Dlg::kNorthFirstId, nullptr);
    TraverseForm form(dialog, {&doc->GetSettings(), &example.Host()}, nullptr);
    form.show();
    QVERIFY(QTest::qWaitForWindowExposed(&form));
    for (const auto& [north, east] :
         {std::pair{TraverseForm::kStartYField, TraverseForm::kStartXField},
          std::pair{Dlg::kFixedYField, Dlg::kFixedXField},
          std::pair{Dlg::kCloseYField, Dlg::kCloseXField}}) {
        QVERIFY(form.Field(north)->y() < form.Field(east)->y());
        // Tab walks them as they stand.
        QCOMPARE(form.Field(north)->nextInFocusChain(), form.Field(east));
    }
}

void TraverseFormTest::cancelComputesNothing() {
    ExampleWindow example;
    UNeditDoc* doc = example.Pane().GetDocument();
    const QStringList rows = example.Rows();
    example.Host().SetFormScript(QStringLiteral("Traverse Adjustment"), [](QDialog& form) {
        QTest::keyClick(&form, Qt::Key_Escape);
        return form.result();
    });
    QVERIFY(example.Window().RunCommand(cmd::Traverse));
    QCOMPARE(example.Host().FormsShown().back(), QStringLiteral("Traverse Adjustment"));
    QCOMPARE(example.Rows(), rows);
    QVERIFY(!doc->GetDatabase()->IsTraversePoint(L"B"));
    QCOMPARE(example.Pane().GetModifiedFlag(), 0);
}

void TraverseFormTest::theExampleIsAdjustedFromTheMenu() {
    ExampleWindow example;
    const QStringList rows = example.Rows();
    // What the misclose report showed: before and after "Coordinates".
    QStringList shown;
    bool angles_offered = true;
    example.Host().SetFormScript(QStringLiteral("Traverse Adjustment"), [](QDialog& dialog) {
        auto& form = static_cast<TraverseForm&>(dialog);
        test::ChooseExampleLoop(form);  // closed on A's known place
        form.show();
        QTest::keyClick(&form, Qt::Key_Return);  // Compute, the default button
        return form.result();
    });
    example.Host().SetFormScript(QStringLiteral("Traverse Misclose Report"), [&](QDialog& dialog) {
        auto& form = static_cast<MiscloseReportForm&>(dialog);
        angles_offered = form.AnglesButton()->isEnabled();
        const auto note = [&form, &shown] {
            shown << form.windowTitle();
            for (const char* figure : {"North Diff", "Traverse Length", "Accuracy", "No of Setup",
                                       "Angular Error", "Enclosed Area"})
                shown << form.Figure(QString::fromLatin1(figure))->text();
        };
        note();
        form.CoordinatesButton()->click();
        note();
        shown << form.Figure(QStringLiteral("Enclosed Area"))->Unit();
        form.accept();  // OK
        return form.result();
    });
    QVERIFY(example.Window().RunCommand(cmd::Traverse));
    QVERIFY(!angles_offered);  // no angle check was asked for
    // Misclose N 0.00094 over 360.1864: 1 in 379421. Afterwards the angular figures are
    // blank and the area is that of the adjusted A, B, C, D.
    const QStringList expected = {QStringLiteral("Unadjusted traverse"),
                                  QStringLiteral("0.001"),
                                  QStringLiteral("360.186"),
                                  QStringLiteral("1:379421"),
                                  QStringLiteral("4"),
                                  shown.value(5),
                                  shown.value(6),
                                  QStringLiteral("Results after coordinate adjustment"),
                                  QStringLiteral("0.000"),
                                  QStringLiteral("360.186"),
                                  shown.value(10),
                                  QStringLiteral("4"),
                                  QString(),
                                  QStringLiteral("7884.718"),
                                  QStringLiteral("m\u00b2")};
    QCOMPARE(shown, expected);
    QVERIFY(!shown.value(5).isEmpty());

    const UNeditDatabase* engine = example.Pane().GetDocument()->GetDatabase();
    for (const Adjusted& point : kAdjusted) {
        double e = 0.0, n = 0.0, h = 0.0;
        std::wstring code;
        QVERIFY(engine->GetPointFromPtList(point.name, e, n, h, code, 1));
        QVERIFY2(qAbs(e - point.east) < kTolerance,
                 qPrintable(QString::fromWCharArray(point.name)));
        QVERIFY(qAbs(n - point.north) < kTolerance);
        QVERIFY(qAbs(h - point.height) < kTolerance);
        QVERIFY(engine->IsTraversePoint(point.name));
    }
    // The adjustment marks the document changed; the example lists no points behind the
    // adjusted-points line, so saving adds no row.
    QCOMPARE(example.Pane().GetModifiedFlag(), 1);
    QCOMPARE(example.Rows(), rows);
}

QTEST_MAIN(TraverseFormTest)
#include "TraverseFormTest.moc"
