// File, Export... through the window: the form over the export's logic object, an export of
// the example's job as LandXML with the open document's observations, and the job itself
// refused as the file, the form kept open.

#include <QCheckBox>
#include <QComboBox>
#include <QFile>
#include <QLineEdit>
#include <QListWidget>
#include <QtTest>
#include <algorithm>

#include "UiTestSupport.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/forms/ExportForm.h"

using namespace nedit;
using nedit::test::ExampleWindow;
using nedit::test::ScriptedHost;

class ExportFormTest : public QObject {
    Q_OBJECT
  private slots:
    void theJobGoesOutAsLandXmlWithTheDocument();
    void theJobItselfIsRefusedAsTheFile();
};

namespace {

// Fills the form as a user would and presses OK.
void Fill(ExportForm& form, const QString& format, const QString& file) {
    form.FormatList()->setCurrentText(format);
    form.FileField()->setText(file);
    form.accept();
}

}  // namespace

void ExportFormTest::theJobGoesOutAsLandXmlWithTheDocument() {
    QString file;
    bool document_enabled = false;
    ExampleWindow example([&](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Export"), [&](QDialog& dialog) {
            auto& form = static_cast<ExportForm&>(dialog);
            Fill(form, QStringLiteral("LandXML"), file);
            document_enabled = form.DocumentBox()->isEnabled();
            return form.result();
        });
    });
    file = example.WorkFile(QStringLiteral("boundary.xml"));
    QVERIFY(example.Window().RunCommand(cmd::Export));
    QVERIFY(document_enabled);
    QFile written(file);
    QVERIFY(written.open(QIODevice::ReadOnly));
    const QByteArray xml = written.readAll();
    QVERIFY(xml.contains("<LandXML xmlns=\"http://www.landxml.org/schema/LandXML-1.2\""));
    // The example's set-ups A, B, C and D, each with its observations.
    QCOMPARE(xml.count("<InstrumentSetup "), 4);
    QVERIFY(xml.count("<RawObservation ") > 4);
}

void ExportFormTest::theJobItselfIsRefusedAsTheFile() {
    QString job;
    bool stayed_open = false;
    ExampleWindow example([&](ScriptedHost& host) {
        host.SetFormScript(QStringLiteral("Export"), [&](QDialog& dialog) {
            auto& form = static_cast<ExportForm&>(dialog);
            Fill(form, QStringLiteral("CSV"), job);
            stayed_open = form.result() != QDialog::Accepted;
            form.reject();
            return form.result();
        });
    });
    job = example.Job();
    QVERIFY(example.Window().RunCommand(cmd::Export));
    QVERIFY(stayed_open);
    const std::vector<QString>& messages = example.Host().Messages();
    const QString refusal = QStringLiteral("cannot write %1: it is the job itself").arg(job);
    QVERIFY(std::find(messages.begin(), messages.end(), refusal) != messages.end());
}

QTEST_MAIN(ExportFormTest)
#include "ExportFormTest.moc"
