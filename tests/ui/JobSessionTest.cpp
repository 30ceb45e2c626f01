// The job behind the window: where the job of a neutral file lies, what counts as a
// neutral file, and how a file becomes a document of its job once.

#include <QFile>
#include <QtTest>

#include "UiTestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "ui/JobSession.h"

using nedit::JobSession;

namespace {

void Write(const QString& path, const QByteArray& bytes) {
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(bytes);
}

}  // namespace

class JobSessionTest : public QObject {
    Q_OBJECT
  private slots:
    void theJobOfANeutralFileLiesBesideIt();
    void neutralFilesAreKnownByTheirHeader();
    void aFileBecomesADocumentOnce();
    void aFileThatIsNoJobIsRefusedWithItsReason();
};

void JobSessionTest::theJobOfANeutralFileLiesBesideIt() {
    QCOMPARE(JobSession::JobBeside("/data/lot 12/day1.neu"), std::string("/data/lot 12/day1.job"));
    QCOMPARE(JobSession::JobBeside("day1"), std::string("day1.job"));
    QCOMPARE(JobSession::JobBeside("/data/v1.2/day1.NEU"), std::string("/data/v1.2/day1.job"));
}

void JobSessionTest::neutralFilesAreKnownByTheirHeader() {
    nedit::test::ConfigDirectory dir;
    const QString plain = dir.File(QStringLiteral("a.txt"));
    Write(plain, "#VERSION-1.0 NEUTRAL FILE\r\nSTN ID=A\r\n");
    QVERIFY(JobSession::IsNeutralFile(plain.toStdString()));
    const QString marked = dir.File(QStringLiteral("b.neu"));
    Write(marked, "\xEF\xBB\xBF  #version-1.0 neutral file\nSTN ID=A\n");
    QVERIFY(JobSession::IsNeutralFile(marked.toStdString()));
    const QString raw = dir.File(QStringLiteral("c.neu"));
    Write(raw, "*110001+0000000000000A01\n");
    QVERIFY(!JobSession::IsNeutralFile(raw.toStdString()));
    QVERIFY(!JobSession::IsNeutralFile(dir.File(QStringLiteral("missing.neu")).toStdString()));
}

void JobSessionTest::aFileBecomesADocumentOnce() {
    nedit::test::ConfigDirectory dir;
    const QString neutral = dir.File(QStringLiteral("day1.neu"));
    Write(neutral, "#VERSION-1.0 NEUTRAL FILE\nSTN ID=A,HI=1.5\n\nSS ID=P1,HA=10,VA=90,SD=5\n");
    JobSession session;
    std::wstring error;
    QVERIFY(session.Create(dir.File(QStringLiteral("site.job")).toStdString(), error));
    bool imported = false;
    UNeditDoc* doc = session.DocumentOf(neutral.toStdString(), error, imported);
    QVERIFY(doc != nullptr);
    QVERIFY(imported);
    QCOMPARE(doc->GetName(), std::wstring(L"day1"));
    // The blank line of the file is left out, so the side shot is kept.
    QCOMPARE(doc->OpenList().GetItemCount(), 3);
    // The same file again finds the document instead of importing a second copy.
    UNeditDoc* again = session.DocumentOf(neutral.toStdString(), error, imported);
    QCOMPARE(again, doc);
    QVERIFY(!imported);
    QCOMPARE(session.Container()->GetDocumentNames().size(), std::size_t{1});
}

void JobSessionTest::aFileThatIsNoJobIsRefusedWithItsReason() {
    nedit::test::ConfigDirectory dir;
    const QString text = dir.File(QStringLiteral("notes.job"));
    Write(text, "not a database");
    JobSession session;
    std::wstring error;
    QVERIFY(!session.Open(text.toStdString(), error));
    QVERIFY(!error.empty());
    QVERIFY(!session.IsOpen());
}

QTEST_MAIN(JobSessionTest)
#include "JobSessionTest.moc"
