// sxnedit-gui: the desktop program of SXNedit, thin over the window of nedit_ui.

#include <QApplication>
#include <QCommandLineParser>
#include <QPixmap>
#include <QTimer>

#include "BuildInfo.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "ui/QtDialogHost.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditMainWindow.h"

int main(int argc, char* argv[]) {
    QGuiApplication::setHighDpiScaleFactorRoundingPolicy(
        Qt::HighDpiScaleFactorRoundingPolicy::PassThrough);
    QApplication app(argc, argv);
    QApplication::setApplicationName(QStringLiteral("SXNedit"));
    QApplication::setApplicationVersion(QStringLiteral(SXNEDIT_VERSION));

    QCommandLineParser parser;
    parser.setApplicationDescription(
        QStringLiteral("The desktop of SXNedit: a job's raw survey data, its record list, "
                       "the plan and every command."));
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addPositionalArgument(
        QStringLiteral("file"),
        QStringLiteral("A job file to open, or a neutral file (.neu) to open as a document of "
                       "the job beside it (made when it does not exist)."),
        QStringLiteral("[JOB | FILE.neu]"));
    const QCommandLineOption screenshot(
        QStringLiteral("screenshot"),
        QStringLiteral("Save a picture of the window to PNG once the file is open, and quit. "
                       "Questions on the way get their default answers, and the plan shows "
                       "point numbers and codes (for this picture only)."),
        QStringLiteral("PNG"));
    const QCommandLineOption select(
        QStringLiteral("select"),
        QStringLiteral("Select the record of this point once the file is open, as a click on "
                       "the point in the plan would."),
        QStringLiteral("POINT"));
    parser.addOption(screenshot);
    parser.addOption(select);
    parser.process(app);

    nedit::UNeditMainWindow window;
    window.show();
    const QStringList files = parser.positionalArguments();
    const QString picture = parser.value(screenshot);
    window.Host().SetUnattended(!picture.isEmpty());
    const QString point = parser.value(select);
    QTimer::singleShot(0, &window, [&window, &app, files, picture, point] {
        // Opened once the window is on the screen, so that loading shows its progress.
        if (!files.isEmpty()) window.OpenPath(files.front());
        nedit::CNeditViewPane* pane = window.CurrentPane();
        if (pane != nullptr && !point.isEmpty()) {
            const int row = pane->SearchList(point.toStdWString());
            if (row >= 0) pane->GetListCtrl()->SelectRow(row);
        }
        if (picture.isEmpty()) return;
        if (pane != nullptr) {
            UNeditSettings& settings = pane->GetDocument()->GetNeditSettings();
            settings.Set(UNeditSettings::ShowPointNumbers, 1);
            settings.Set(UNeditSettings::ShowPointCodes, 1);
            pane->GetGraphView()->UpdateStyle();
        }
        QTimer::singleShot(300, &window, [&window, &app, picture] {
            const bool saved = window.grab().save(picture, "PNG");
            app.exit(saved ? 0 : 1);
        });
    });
    return app.exec();
}
