// Takes the README's pictures of the desktop's dialogs, on the bundled example: the record
// dialog, the global edit, the download parameters and a download under way (a fake
// instrument playing a GSI file down a pseudo-terminal). Run by scripts/screenshot-dialogs
// under a virtual X server; not a test. Usage: ui_dialog_shots OUT_DIRECTORY

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QDir>
#include <QFile>
#include <QLabel>
#include <QPushButton>
#include <QTimer>
#include <QtTest>
#include <chrono>

#include "../support/FakeInstrument.h"
#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/PortStores.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/UNeditView.h"
#include "ui/dialogs/NEdit_Global_Edit.h"
#include "ui/forms/DownloadForm.h"
#include "ui/forms/DownloadProgressWindow.h"
#include "ui/forms/GlobalEditForm.h"
#include "ui/forms/UEdit.h"

using namespace nedit;
using namespace std::chrono_literals;
using nedit::test::ExampleWindow;
using nedit::test::ScriptedHost;

namespace {

QString g_directory;

/// Shows `widget` as the user would see it and saves its picture as `name`.
bool Photograph(QWidget& widget, const QString& name) {
    widget.show();
    widget.raise();
    widget.activateWindow();
    QTest::qWait(400);
    const QString path = QDir(g_directory).filePath(name);
    const bool saved = widget.grab().save(path, "PNG");
    qInfo("%s %s", saved ? "Saved" : "Could not save", qPrintable(path));
    return saved;
}

/// A script that photographs the form and then cancels it.
ScriptedHost::FormScript Shot(const QString& name, std::function<void(QDialog&)> prepare = {}) {
    return [name, prepare](QDialog& form) {
        if (prepare) prepare(form);
        Photograph(form, name);
        form.reject();
        return int(QDialog::Rejected);
    };
}

void RecordDialog() {
    ExampleWindow example([](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Edit Record Data"),
                           Shot(QStringLiteral("record-dialog.png")));
    });
    constexpr int kRowP1 = 11;
    QTest::mouseDClick(example.Pane().GetNeditView()->viewport(), Qt::LeftButton, {},
                       example.OnRow(kRowP1));
}

void GlobalEdit() {
    ExampleWindow example([](ScriptedHost& host) {
        host.SetFormScript(
            QStringLiteral("Modified Selected Records"),
            Shot(QStringLiteral("global-edit.png"), [](QDialog& dialog) {
                auto& form = static_cast<GlobalEditForm&>(dialog);
                form.Box(NEdit_Global_Edit::kTargetHeightBox)->setChecked(true);
                form.Value(NEdit_Global_Edit::kTargetHeightBox)->setText(QStringLiteral("1.750"));
            }));
    });
    std::vector<int> rows;
    for (int row = 7; row <= 13; ++row) rows.push_back(row);
    example.List().SetSelection(rows);
    example.Window().RunCommand(cmd::GlobalEdit);
}

void Download() {
    FakeInstrument instrument;
    QFile raw(QStringLiteral(SXNEDIT_TEST_DATA "/raw/RILIEVO.gsi"));
    raw.open(QIODevice::ReadOnly);
    const std::string rilievo = raw.readAll().toStdString();
    ExampleWindow example([&instrument](ScriptedHost& host) {
        PortsStore().SetDevicePath(L"COM1", instrument.Port());
        host.SetFormScript(QStringLiteral("Download Parameters"), [](QDialog& dialog) {
            auto& form = static_cast<DownloadForm&>(dialog);
            test::ChooseGsiOnCom1(form);
            Photograph(form, QStringLiteral("download-parameters.png"));
            form.accept();
            return form.result();
        });
    });
    bool playing = false;
    bool taken = false;
    QTimer watcher;
    QObject::connect(&watcher, &QTimer::timeout, [&] {
        auto* window = example.Pane().findChild<DownloadProgressWindow*>();
        if (window == nullptr || !window->isVisible()) return;
        if (!playing) {
            playing = true;
            instrument.Play([&rilievo](FakeInstrument& link) { link.SendLines(rilievo, 150ms); });
        }
        if (!taken && window->RecordsLabel()->text().toInt() >= 9) {
            taken = true;
            watcher.stop();
            Photograph(*window, QStringLiteral("download-progress.png"));
            window->AbortButton()->click();
        }
    });
    watcher.start(50);
    example.Window().RunCommand(cmd::Download);
    instrument.Join();
}

}  // namespace

int main(int argc, char* argv[]) {
    QApplication app(argc, argv);
    if (argc < 2) {
        qCritical("usage: ui_dialog_shots OUT_DIRECTORY");
        return 64;
    }
    g_directory = QString::fromLocal8Bit(argv[1]);
    QTemporaryDir temporary;
    qputenv("TMPDIR", temporary.path().toUtf8());
    RecordDialog();
    GlobalEdit();
    Download();
    return 0;
}
