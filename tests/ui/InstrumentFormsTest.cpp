// The faces of the instrument dialogs: download parameters, the raw file's instrument, port
// settings, the upload selection and the file dialog; then a raw import and a download end
// to end through the window's commands, a fake instrument playing a GSI file down a
// pseudo-terminal.

#include <QApplication>
#include <QButtonGroup>
#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTimer>
#include <QUndoStack>
#include <QtTest>
#include <algorithm>
#include <chrono>

#include "../support/FakeInstrument.h"
#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/PortStores.h"
#include "instruments/UDeviceManager.h"
#include "platform/text/WideText.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/forms/DownloadForm.h"
#include "ui/forms/DownloadProgressWindow.h"
#include "ui/forms/FileDialogForm.h"
#include "ui/forms/LoadRawForm.h"
#include "ui/forms/PortSettingsForm.h"
#include "ui/forms/UEdit.h"
#include "ui/forms/UploadSelectionForm.h"

using namespace nedit;
using namespace std::chrono_literals;
using nedit::test::ConfigDirectory;
using nedit::test::ExampleWindow;
using nedit::test::ScriptedHost;

namespace {

QString RawFixture(const char* name) {
    return QStringLiteral(SXNEDIT_TEST_DATA "/raw/") + QString::fromLatin1(name);
}

std::string ReadAll(const QString& path) {
    QFile file(path);
    file.open(QIODevice::ReadOnly);
    return file.readAll().toStdString();
}

class Layers : public ULayerSource {
  public:
    std::vector<std::wstring> GetLayerList() const override {
        return {L"BOUNDARY", L"FENCE", L"", L"NEVER SHOWN"};
    }
};

}  // namespace

class InstrumentFormsTest : public QObject {
    Q_OBJECT
  private slots:
    void downloadParametersFollowTheInstrument();
    void aBaudRateOfSixCharactersIsRefused();
    void theRawFileDialogEndsWithItsButton();
    void portSettingsShowThePortChosen();
    void theUploadSelectionEnablesItsRanges();
    void fileFiltersBecomeNameFilters();
    void aRawFileIsImportedFromTheMenu();
    void aDownloadShowsItsProgressAndStopsAtAbort();
};

void InstrumentFormsTest::downloadParametersFollowTheInstrument() {
    ConfigDirectory config;
    // A download has been made before: the last choice, and the settings of an instrument.
    InstrumentProfile().WriteCurrent({L"Leica GSI", L"COM2", 0, 1});
    InstrumentProfile().WritePortSettings(L"Carlson RW5", L"COM3,2400,e,7,1,x");
    ScriptedHost host;
    UDeviceManager manager(L"", 0, false);
    UNEDownload dialog(&host, &manager);
    DownloadForm form(dialog, {nullptr, &host}, nullptr);
    QComboBox* instruments = form.List(UNEDownload::kInstrumentList);
    QVERIFY(instruments->findText(QStringLiteral("Leica GSI")) >= 0);
    QCOMPARE(form.List(UNEDownload::kPortList)->count(), 8);
    QVERIFY(form.SaveRawBox()->isChecked());
    QVERIFY(!form.AckNakBox()->isVisible());
    QCOMPARE(instruments->currentText(), QStringLiteral("Leica GSI"));
    QCOMPARE(form.List(UNEDownload::kPortList)->currentText(), QStringLiteral("COM2"));
    form.List(UNEDownload::kBaudList)->setCurrentText(QStringLiteral("4800"));
    QCOMPARE(dialog.Baud, std::wstring(L"4800"));
    // Another instrument: the one before keeps its settings, the new one shows its own.
    instruments->setCurrentText(QStringLiteral("Carlson RW5"));
    QCOMPARE(InstrumentProfile().ReadPortSettings(L"Leica GSI").value_or(L""),
             std::wstring(L"COM2,4800,n,8,2, "));
    QCOMPARE(form.List(UNEDownload::kPortList)->currentText(), QStringLiteral("COM3"));
    QCOMPARE(form.List(UNEDownload::kBaudList)->currentText(), QStringLiteral("2400"));
    QCOMPARE(form.List(UNEDownload::kParityList)->currentText(), QStringLiteral("EVEN"));
    QCOMPARE(form.List(UNEDownload::kDataBitList)->currentText(), QStringLiteral("7"));
    QCOMPARE(form.List(UNEDownload::kStopBitList)->currentText(), QStringLiteral("1"));
    QCOMPARE(form.List(UNEDownload::kFlowList)->currentText(), QStringLiteral("XON/XOFF"));
    QCOMPARE(form.DeviceLabel()->text(), QStringLiteral("(/dev/ttyS2)"));
    form.SaveRawBox()->setChecked(false);
    QCOMPARE(dialog.SaveRaw, 0);
    // Cancel writes nothing of the last choice; OK writes it.
    form.reject();
    QCOMPARE(InstrumentProfile().ReadCurrent().instrument, std::wstring(L"Leica GSI"));
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
    const InstrumentProfile::Current current = InstrumentProfile().ReadCurrent();
    QCOMPARE(current.instrument, std::wstring(L"Carlson RW5"));
    QCOMPARE(current.comm, std::wstring(L"COM3"));
    QCOMPARE(current.saveRaw.value_or(-1), 0);
}

void InstrumentFormsTest::aBaudRateOfSixCharactersIsRefused() {
    ConfigDirectory config;
    ScriptedHost host;
    UDeviceManager manager(L"", 0, false);
    UNEDownload dialog(&host, &manager);
    DownloadForm form(dialog, {nullptr, &host}, nullptr);
    form.show();
    QComboBox* baud = form.List(UNEDownload::kBaudList);
    baud->setCurrentText(QStringLiteral("115200"));
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Rejected));
    QCOMPARE(host.Messages().back(), QStringLiteral("No more than 5 characters please"));
    QVERIFY(QTest::qWaitFor([baud] { return baud->hasFocus(); }));
    baud->setCurrentText(QStringLiteral("57600"));
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
}

void InstrumentFormsTest::theRawFileDialogEndsWithItsButton() {
    ConfigDirectory config;
    ScriptedHost host;
    UDeviceManager manager(L"", 0, false);
    QString details;
    host.SetFormScript(QStringLiteral("Load Raw File Entry"), [&details](QDialog& dialog) {
        auto& form = static_cast<LoadRawForm&>(dialog);
        // Without an instrument chosen Import waits for one.
        form.InstrumentList()->setCurrentRow(-1);
        if (form.ImportButton()->isEnabled()) return int(QDialog::Rejected);
        const QList<QListWidgetItem*> found =
            form.InstrumentList()->findItems(QStringLiteral("Leica GSI"), Qt::MatchExactly);
        form.InstrumentList()->setCurrentItem(found.front());
        details = form.DetailsBox()->toPlainText();
        // Enter does nothing here.
        QTest::keyClick(&form, Qt::Key_Return);
        if (form.result() == QDialog::Accepted) return int(QDialog::Accepted);
        form.ImportButton()->click();
        return form.result();
    });
    ULoadRawDlg choice(&manager);
    QCOMPARE(host.Run(choice), ULoadRawDlg::kImport);
    QCOMPARE(choice.Device, std::wstring(L"Leica GSI"));
    QVERIFY(!details.isEmpty());
    QCOMPARE(QString::fromStdWString(choice.GetDetails()), details);
    // The next dialog starts on the instrument chosen last; Cancel ends it so.
    host.SetFormScript(QStringLiteral("Load Raw File Entry"), [](QDialog& dialog) {
        auto& form = static_cast<LoadRawForm&>(dialog);
        if (form.InstrumentList()->currentItem()->text() != QStringLiteral("Leica GSI"))
            return int(QDialog::Accepted);
        form.reject();
        return form.result();
    });
    ULoadRawDlg again(&manager);
    QCOMPARE(host.Run(again), int(mb::IdCancel));
}

void InstrumentFormsTest::portSettingsShowThePortChosen() {
    ConfigDirectory config;
    PortsStore().WriteEntry(L"COM2", L"4800,o,7,1,p");
    ScriptedHost host;
    USetComm dialog(&host);
    PortSettingsForm form(dialog, {nullptr, &host}, nullptr);
    QCOMPARE(form.List(USetComm::kPortList)->count(), 4);
    QCOMPARE(form.List(USetComm::kBaudList)->currentText(), QStringLiteral("9600"));  // default
    QCOMPARE(form.List(USetComm::kStopBitList)->currentText(), QStringLiteral("2"));
    form.List(USetComm::kPortList)->setCurrentText(QStringLiteral("COM2"));
    QCOMPARE(dialog.GetPort(), std::wstring(L"COM2"));
    QCOMPARE(form.List(USetComm::kBaudList)->currentText(), QStringLiteral("4800"));
    QCOMPARE(form.List(USetComm::kParityList)->currentText(), QStringLiteral("ODD"));
    QCOMPARE(form.List(USetComm::kFlowList)->currentText(), QStringLiteral("HARDWARE"));
    QCOMPARE(form.DeviceLabel()->text(), QStringLiteral("(/dev/ttyS1)"));
    form.List(USetComm::kBaudList)->setCurrentText(QStringLiteral("19200"));
    form.List(USetComm::kFlowList)->setCurrentText(QStringLiteral("NONE"));
    QCOMPARE(dialog.Baud, std::wstring(L"19200"));
    form.accept();
    QCOMPARE(form.result(), int(QDialog::Accepted));
    QCOMPARE(PortsStore().ReadEntry(L"COM2"), std::wstring(L"19200,o,7,1, "));
}

void InstrumentFormsTest::theUploadSelectionEnablesItsRanges() {
    UJobSettings job;
    job.SetLengthUnit(LengthUnit::USFeet);
    Layers layers;
    ScriptedHost host;
    host.SetFormScript(QStringLiteral("Selection Screen Entry"), [](QDialog& dialog) {
        auto& form = static_cast<UploadSelectionForm&>(dialog);
        form.SourceGroup()->button(UUploadSource::kFile)->setChecked(true);
        form.LayerGroup()->button(UUploadSource::kLayersOff)->setChecked(true);
        form.Box(1025)->setChecked(true);
        static_cast<UEdit*>(form.From(1025))->setText(QStringLiteral("10"));
        static_cast<UEdit*>(form.To(1025))->setText(QStringLiteral("-5"));
        form.accept();
        return form.result();
    });
    UUploadSource dialog(&host, &layers);
    {
        UploadSelectionForm form(dialog, {&job, &host}, nullptr);
        auto* layer_from = static_cast<QComboBox*>(form.From(1123));
        QCOMPARE(layer_from->count(), 2);  // the list ends at its first empty name
        QCOMPARE(layer_from->itemText(1), QStringLiteral("FENCE"));
        QVERIFY(!layer_from->isEnabled());
        form.Box(1123)->setChecked(true);
        QCOMPARE(dialog.ByLayer, 1);
        QVERIFY(layer_from->isEnabled());
        auto* height = static_cast<UEdit*>(form.From(1025));
        QCOMPARE(height->text(), QStringLiteral("-100.000"));
        QCOMPARE(height->Unit(), QStringLiteral("usft"));
        QCOMPARE(static_cast<UEdit*>(form.From(1122))->text(), QStringLiteral("1"));
        QVERIFY(form.SourceGroup()->button(UUploadSource::kDatabase)->isChecked());
        form.reject();
    }
    dialog.ByLayer = 0;
    QCOMPARE(dialog.Create_Dlg(), 1);
    QCOMPARE(dialog.GetSource(), UUploadSource::kFile);
    QCOMPARE(dialog.GetAllLayer(), UUploadSource::kLayersOff);
    double from = 0.0;
    double to = 0.0;
    QCOMPARE(dialog.GetByHeight(from, to), 1);
    QCOMPARE(from, -5.0);
    QCOMPARE(to, 10.0);
}

void InstrumentFormsTest::fileFiltersBecomeNameFilters() {
    QCOMPARE(FileDialogForm::NameFilters(
                 L"Leica GSI Raw Data Files (*.gsi;*.gs8)|*.gsi;*.gs8|All Files (*.*)|*.*||"),
             QStringList({QStringLiteral("Leica GSI Raw Data Files (*.gsi *.gs8)"),
                          QStringLiteral("All Files (*)")}));
    QCOMPARE(FileDialogForm::NameFilters(L"Strandix Raw Data File(*.rw5)|*.rw5|"),
             QStringList({QStringLiteral("Strandix Raw Data File (*.rw5)")}));
    UFileDialog cancelled(UFileDialog::Mode::Save, L"All Files (*.*)|*.*||");
    FileDialogForm form(cancelled, nullptr);
    QCOMPARE(form.acceptMode(), QFileDialog::AcceptSave);
    form.reject();
    QVERIFY(cancelled.PathName.empty());
}

void InstrumentFormsTest::aRawFileIsImportedFromTheMenu() {
    ExampleWindow example([](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Load Raw File Entry"), [](QDialog& dialog) {
            auto& form = static_cast<LoadRawForm&>(dialog);
            form.InstrumentList()->setCurrentItem(
                form.InstrumentList()
                    ->findItems(QStringLiteral("Leica GSI"), Qt::MatchExactly)
                    .front());
            form.Press(ULoadRawDlg::kImport);
            return form.result();
        });
        host.SetFormScript(QStringLiteral("Open File"), [](QDialog& dialog) {
            auto& files = static_cast<FileDialogForm&>(dialog);
            files.selectFile(RawFixture("RILIEVO.gsi"));
            files.accept();
            return files.result();
        });
    });
    QVERIFY(example.Window().RunCommand(cmd::ImportRawfile));
    const std::vector<QString>& messages = example.Host().Messages();
    QVERIFY(std::find(messages.begin(), messages.end(),
                      QStringLiteral("Overwrite Existing Data?")) != messages.end());
    QCOMPARE(example.List().GetItemCount(), 25);
    QCOMPARE(example.Rows().at(4),
             QStringLiteral("SS        ID=102,HA=119.132604,VA=93.241368,SD=5.165,CO=,HD=5.156"));
    // The rows are the document's now: the old ones cannot be undone into them.
    QVERIFY(!example.Pane().GetUndoStack()->canUndo());
    QVERIFY(!example.Pane().IsBusy());
    QVERIFY(example.Window().windowTitle().endsWith(QStringLiteral("*")));
}

void InstrumentFormsTest::aDownloadShowsItsProgressAndStopsAtAbort() {
    QTemporaryDir temporary;
    qputenv("TMPDIR", temporary.path().toUtf8());
    FakeInstrument instrument;
    QVERIFY(!instrument.Port().empty());
    const std::string rilievo = ReadAll(RawFixture("RILIEVO.gsi"));
    ExampleWindow example([&instrument](ScriptedHost& host) {
        PortsStore().SetDevicePath(L"COM1", instrument.Port());
        host.SetFormScript(QStringLiteral("Download Parameters"), [](QDialog& dialog) {
            auto& form = static_cast<DownloadForm&>(dialog);
            test::ChooseGsiOnCom1(form);
            form.accept();
            return form.result();
        });
    });
    int seen = 0;
    bool modal = false;
    bool playing = false;
    QTimer watcher;
    connect(&watcher, &QTimer::timeout, [&] {
        auto* window = example.Pane().findChild<DownloadProgressWindow*>();
        if (window == nullptr || !window->isVisible()) return;
        modal = QApplication::activeModalWidget() == window;
        // Once the download listens, a slow link: a block each 40 ms, so that the window
        // sees records come and Abort lands long before the end.
        if (!playing) {
            playing = true;
            instrument.Play([&rilievo](FakeInstrument& link) { link.SendLines(rilievo, 40ms); });
        }
        seen = window->RecordsLabel()->text().toInt();
        if (seen >= 5) window->AbortButton()->click();
    });
    watcher.start(20);
    QVERIFY(example.Window().RunCommand(cmd::Download));
    watcher.stop();
    instrument.Join();
    QVERIFY(modal);
    QVERIFY(seen >= 5);
    const int rows = example.List().GetItemCount();
    QVERIFY2(rows >= 5 && rows < 25, qPrintable(QString::number(rows)));
    QCOMPARE(example.Rows().at(4),
             QStringLiteral("SS        ID=102,HA=119.132604,VA=93.241368,SD=5.165,CO=,HD=5.156"));
    // Stopped, and stopped for good: the window is gone and the commands are back.
    QVERIFY(!example.Pane().IsBusy());
    QVERIFY(example.Window().IsCommandEnabled(cmd::Download));
    QVERIFY(!example.Pane().GetDocument()->GetAbortProcessOn());
    QVERIFY(example.Pane().GetDocument()->GetDatabase() != nullptr);
}

QTEST_MAIN(InstrumentFormsTest)
#include "InstrumentFormsTest.moc"
