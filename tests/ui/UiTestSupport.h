#pragma once
// Shared by the desktop's tests: a private configuration directory, a job made from the
// bundled example, and a dialog host that answers without a screen.

#include <QString>
#include <QTemporaryDir>
#include <deque>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include "ui/QtDialogHost.h"
#include "ui/UNeditMainWindow.h"

class UListCtrl;

class QDialog;
class QMessageBox;

namespace nedit {
class CNeditViewPane;
class DownloadForm;
class UNeditGraphView;
}  // namespace nedit

namespace nedit::test {

/// Points $SXNEDIT_CONFIG at a fresh temporary directory for the life of the object.
class ConfigDirectory {
  public:
    ConfigDirectory();
    QString Path() const { return dir_.path(); }
    /// A path inside the directory.
    QString File(const QString& name) const { return dir_.filePath(name); }

  private:
    QTemporaryDir dir_;
};

/// The bundled example survey.
QString ExampleFile();

/// Fills "Download Parameters" for a fake instrument on COM1: Leica GSI, no raw file kept.
void ChooseGsiOnCom1(DownloadForm& form);

/// A host that shows nothing: message boxes take queued answers (else their default
/// button), forms are filled by a script for their dialog name (else accepted as they are).
class ScriptedHost : public QtDialogHost {
  public:
    using FormScript = std::function<int(QDialog&)>;

    void QueueAnswer(int answer) { answers_.push_back(answer); }
    void SetFormScript(const QString& dialog, FormScript script) {
        scripts_[dialog] = std::move(script);
    }
    const std::vector<QString>& Messages() const { return messages_; }
    const std::vector<QString>& FormsShown() const { return forms_; }

  protected:
    int ExecForm(QDialog& form) override;
    int ExecMessage(QMessageBox& box) override;

  private:
    std::deque<int> answers_;
    std::map<QString, FormScript> scripts_;
    std::vector<QString> messages_;
    std::vector<QString> forms_;
};

/// A window on a copy of the bundled example, opened as a neutral file (so as a document
/// of the job beside the copy), with a scripted host and a private configuration.
class ExampleWindow {
  public:
    /// `prepare` runs before the example is opened, to script the host.
    explicit ExampleWindow(const std::function<void(ScriptedHost&)>& prepare = {});
    ~ExampleWindow();

    UNeditMainWindow& Window() { return *window_; }
    ScriptedHost& Host() { return *host_; }
    CNeditViewPane& Pane();
    UListCtrl& List();
    UNeditGraphView& Plan();
    /// The copy of the example, and the job beside it.
    QString Neutral() const { return work_.filePath(QStringLiteral("boundary.neu")); }
    QString Job() const { return work_.filePath(QStringLiteral("boundary.job")); }
    QString WorkFile(const QString& name) const { return work_.filePath(name); }
    /// The row texts of the list.
    QStringList Rows();
    /// Where a world point is on the plan widget.
    QPoint OnPlan(double east, double north);
    /// The middle of a row of the list's viewport.
    QPoint OnRow(int row);

  private:
    ConfigDirectory config_;
    QTemporaryDir work_;
    ScriptedHost* host_;
    std::unique_ptr<UNeditMainWindow> window_;
};

}  // namespace nedit::test
