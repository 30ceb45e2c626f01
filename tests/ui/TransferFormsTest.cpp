// The questions of Save To Survey in their forms: each bound to its logic object, with its
// enabling, and ended by its buttons, Enter and Escape through the dialog host.

#include <QCheckBox>
#include <QLabel>
#include <QPushButton>
#include <QtTest>

#include "UiTestSupport.h"
#include "codes/UNeditPt.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/UOverridePolyDlg.h"
#include "transfer/UToSvyDlg.h"
#include "ui/forms/DuplicatePointForm.h"
#include "ui/forms/OverrideStringForm.h"
#include "ui/forms/PointCodeForm.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using nedit::test::ConfigDirectory;
using nedit::test::ScriptedHost;

namespace {

const QString kDuplicate = QStringLiteral("Coordinate Change To Existing Point In Database");

}  // namespace

class TransferFormsTest : public QObject {
    Q_OBJECT
  private slots:
    void duplicatePointEnablesTheEditOfItsChoice();
    void duplicatePointEndsWithTheCodeOfTheChoice();
    void overrideStringAnswersWithItsButtons();
    void pointCodeKeepsTheChoicesOnOkOnly();
};

void TransferFormsTest::duplicatePointEnablesTheEditOfItsChoice() {
    const std::vector<UNeditPt> points = {UNeditPt(L"12", 100.0, 200.0, 10.0, L"FC", 0)};
    DuplicatePtsDlg dialog(nullptr, points, 0, nullptr);
    dialog.Message = L"Point 12's reduced coordinates are different.\n";
    dialog.Mode = DuplicatePtsDlg::kPrefix;
    dialog.Prefix = L"N";
    dialog.NewNumber = L"500";
    DuplicatePointForm form(dialog, {}, nullptr);
    // It opens on the choice it was given, with that choice's edit alone open.
    QVERIFY(form.ChoiceButton(DuplicatePtsDlg::kPrefix)->isChecked());
    QCOMPARE(form.PrefixField()->text(), QStringLiteral("N"));
    QCOMPARE(form.NumberField()->text(), QStringLiteral("500"));
    QVERIFY(form.PrefixField()->isEnabled());
    QVERIFY(!form.NumberField()->isEnabled());
    QVERIFY(form.findChild<QLabel*>()->text().startsWith(QStringLiteral("Point 12's")));

    form.ChoiceButton(DuplicatePtsDlg::kNewNumber)->click();
    QCOMPARE(dialog.Mode, static_cast<int>(DuplicatePtsDlg::kNewNumber));
    QVERIFY(form.NumberField()->isEnabled());
    QVERIFY(!form.PrefixField()->isEnabled());
    form.NumberField()->setText(QStringLiteral("501"));
    QCOMPARE(dialog.NewNumber, std::wstring(L"501"));
    form.ChoiceButton(DuplicatePtsDlg::kOverwrite)->click();
    QVERIFY(!form.NumberField()->isEnabled());
    QVERIFY(!form.PrefixField()->isEnabled());
    form.ApplyAllBox()->click();
    QVERIFY(dialog.ApplyAll);
}

void TransferFormsTest::duplicatePointEndsWithTheCodeOfTheChoice() {
    const std::vector<UNeditPt> points = {UNeditPt(L"12", 100.0, 200.0, 10.0, L"FC", 0)};
    ScriptedHost host;
    host.SetFormScript(kDuplicate, [](QDialog& dialog) {
        auto& form = static_cast<DuplicatePointForm&>(dialog);
        form.ChoiceButton(DuplicatePtsDlg::kPrefix)->click();
        form.PrefixField()->setText(QStringLiteral(" X "));
        form.show();
        QTest::keyClick(&form, Qt::Key_Return);
        return form.result();
    });
    DuplicatePtsDlg prefixed(nullptr, points, 0, &host);
    QCOMPARE(host.Run(prefixed), DuplicatePtsDlg::kPrefixEnd);
    QCOMPARE(prefixed.Prefix, std::wstring(L"X"));  // trimmed by the dialog's OK

    // "Abort", as Escape, stops the transfer whatever was chosen.
    host.SetFormScript(kDuplicate, [](QDialog& dialog) {
        auto& form = static_cast<DuplicatePointForm&>(dialog);
        form.ChoiceButton(DuplicatePtsDlg::kNewNumber)->click();
        QTest::keyClick(&form, Qt::Key_Escape);
        return form.result();
    });
    DuplicatePtsDlg aborted(nullptr, points, 0, &host);
    QCOMPARE(host.Run(aborted), static_cast<int>(mb::IdCancel));
    // Overwrite ends with the plain OK.
    host.SetFormScript(kDuplicate, [](QDialog& form) {
        form.accept();
        return form.result();
    });
    DuplicatePtsDlg overwritten(nullptr, points, 0, &host);
    QCOMPARE(host.Run(overwritten), static_cast<int>(mb::IdOk));
}

void TransferFormsTest::overrideStringAnswersWithItsButtons() {
    ScriptedHost host;
    const QString title = QStringLiteral("Override String");
    host.SetFormScript(title, [](QDialog& dialog) {
        auto& form = static_cast<OverrideStringForm&>(dialog);
        if (form.findChild<QLabel*>()->text() !=
            QStringLiteral("String FENCE is in the database, do you want to override it?"))
            return 0;
        form.ApplyAllBox()->click();
        form.YesButton()->click();
        return form.result();
    });
    UOverridePolyDlg replaced(L"FENCE");
    QCOMPARE(host.Run(replaced), static_cast<int>(mb::IdYes));
    QVERIFY(replaced.ApplyAll);

    // Enter takes the default, No; Escape answers No too.
    for (const Qt::Key key : {Qt::Key_Return, Qt::Key_Escape}) {
        host.SetFormScript(title, [key](QDialog& form) {
            form.show();
            QTest::keyClick(&form, key);
            return form.result();
        });
        UOverridePolyDlg kept(L"FENCE");
        QCOMPARE(host.Run(kept), static_cast<int>(mb::IdNo));
        QVERIFY(!kept.ApplyAll);
    }
}

void TransferFormsTest::pointCodeKeepsTheChoicesOnOkOnly() {
    ConfigDirectory config;
    const StringTransferSettings defaults = GetStringTransferSettings();
    {
        UToSvyDlg dialog(defaults);
        PointCodeForm form(dialog, nullptr);
        QCOMPARE(form.Box(QStringLiteral("Include String Numbers"))->isChecked(),
                 defaults.IncludeStringNumbers != 0);
        QCOMPARE(form.Box(QStringLiteral("Feature Code"))->isChecked(),
                 defaults.SaveFeatureCode != 0);
        form.Box(QStringLiteral("Include Comments"))->click();
        QCOMPARE(dialog.Settings.IncludeComments, 1 - defaults.IncludeComments);
        form.reject();
    }
    QVERIFY(GetStringTransferSettings() == defaults);
    {
        UToSvyDlg dialog(defaults);
        PointCodeForm form(dialog, nullptr);
        form.Box(QStringLiteral("Locked"))->click();
        form.accept();
        QCOMPARE(form.result(), static_cast<int>(QDialog::Accepted));
    }
    QCOMPARE(GetStringTransferSettings().Locked, 1 - defaults.Locked);
}

QTEST_MAIN(TransferFormsTest)
#include "TransferFormsTest.moc"
