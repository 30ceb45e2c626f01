#pragma once
// The desktop's window on one job: the menus and both toolbars of the command table, the
// list of the job's raw-data documents, a tab per open document (its pane), and a status
// bar with the progress of long work, its Abort button, the plan's scale and the
// coordinates under the cursor. It keeps its placement and the list's width in
// sxnedit.ini, remembers the jobs opened last, and takes neutral files dropped on it.
//
// Decisions:
// - A neutral file dropped on the window becomes a new document of the open job (the job
//   beside the file when none is open); it never overwrites a document's rows.
// - A raw instrument file needs the instrument drivers: the window says so and reads
//   nothing.

#include <QMainWindow>
#include <QStringList>
#include <QUrl>
#include <memory>
#include <string>

#include "ui/CNeditViewPane.h"
#include "ui/JobSession.h"
#include "ui/QtDialogHost.h"

class QDockWidget;
class QLabel;
class QListWidget;
class QStackedWidget;
class QTabWidget;

namespace nedit {

class CommandActions;
class QtProgressSink;
class StartPage;

class UNeditMainWindow : public QMainWindow {
    Q_OBJECT
  public:
    static constexpr int kRecentLimit = 8;

    /// A window whose messages and dialogs go to `host` (a QtDialogHost on the window when
    /// none is given).
    explicit UNeditMainWindow(std::unique_ptr<QtDialogHost> host = nullptr,
                              QWidget* parent = nullptr);
    ~UNeditMainWindow() override;

    /// Opens what the command line names: a job file, or a neutral file as a document of
    /// the job beside it. False, with a message, when it cannot be opened.
    bool OpenPath(const QString& path);
    bool OpenJob(const QString& path);
    bool NewJob(const QString& path);
    /// Files dropped on the window: a job is opened, a neutral file becomes a document.
    void OpenDropped(const QList<QUrl>& urls);
    /// The pane of the document of that name, opened (loaded and reduced) when it is not.
    CNeditViewPane* OpenDocument(const std::wstring& name);

    /// Carries out a command of the window or of the current pane; false when it is not
    /// enabled or not known.
    bool RunCommand(int id);
    bool IsCommandEnabled(int id) const;
    /// Sets every action's enabling from the state of the window and the pane.
    void UpdateActions();

    CNeditViewPane* CurrentPane() const;
    QList<CNeditViewPane*> Panes() const;
    JobSession& Session() { return session_; }
    QtDialogHost& Host() { return *host_; }
    CommandActions& Actions() { return *actions_; }
    QListWidget* DocumentList() const { return documents_; }
    QLabel* CoordinateLabel() const { return coordinates_; }
    QTabWidget* Tabs() const { return tabs_; }
    QStringList RecentJobs() const;
    /// Where file dialogs of the window and of new panes come from; tests give their own.
    void SetFileChooser(CNeditViewPane::FileChooser chooser);

  protected:
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

  private:
    void BuildStatusBar();
    void BuildDocumentList();
    void RefreshDocuments();
    void RefreshRecent();
    void AddRecent(const QString& path);
    void UpdateTitle();
    void ShowCentral();
    bool ClosePane(CNeditViewPane* pane);
    bool CloseJob();
    /// Opens (or with `create` makes) a job and its first document.
    bool StartJob(const QString& path, bool create);
    void OpenFile(const QString& path);
    void ShowCoordinates(double east, double north);
    void RestorePlacement();
    /// Writes the window state, with the splitters of `pane` when there is one.
    void SavePlacement(const CNeditViewPane* pane) const;
    bool Busy() const;
    void ShowError(const std::wstring& text);

    JobSession session_;
    std::unique_ptr<QtDialogHost> host_;
    QtProgressSink* progress_ = nullptr;
    CommandActions* actions_;
    QStackedWidget* central_;
    StartPage* start_;
    QTabWidget* tabs_;
    QListWidget* documents_ = nullptr;
    QDockWidget* documents_dock_ = nullptr;
    QLabel* coordinates_ = nullptr;
    QLabel* scale_ = nullptr;
    QString beside_;  // the title's word on the neutral file the job stands beside
    CNeditViewPane::FileChooser choose_file_;
};

}  // namespace nedit
