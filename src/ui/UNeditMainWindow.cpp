#include "ui/UNeditMainWindow.h"

#include <QAction>
#include <QCloseEvent>
#include <QCoreApplication>
#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QLabel>
#include <QListWidget>
#include <QMenu>
#include <QMessageBox>
#include <QMimeData>
#include <QProgressBar>
#include <QStackedWidget>
#include <QStatusBar>
#include <QTabWidget>
#include <QTimer>
#include <QToolButton>
#include <QUndoStack>

#include "document/ProfileStore.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/settings/IniFile.h"
#include "platform/text/Format.h"
#include "report/NeditIni.h"
#include "ui/CommandActions.h"
#include "ui/CommandIds.h"
#include "ui/CommandTable.h"
#include "ui/QtDialogHost.h"
#include "ui/QtProgressSink.h"
#include "ui/StartPage.h"
#include "ui/UNeditGraphView.h"
#include "ui/dialogs/UGetNameDlg.h"

namespace nedit {

namespace {

constexpr const wchar_t* kRecentSection = L"Recent Jobs";
constexpr const char* kJobFilter = "SXNedit Jobs (*.job);;All Files (*)";
constexpr int kMaximised = 3;  // the show command of a maximised window

IniFile Profile() {
    return IniFile(ProfileStore().Path());
}

std::wstring RecentKey(int index) {
    return Format(L"File%d", index + 1);
}

}  // namespace

UNeditMainWindow::UNeditMainWindow(std::unique_ptr<QtDialogHost> host, QWidget* parent)
    : QMainWindow(parent),
      host_(host ? std::move(host) : std::make_unique<QtDialogHost>()),
      actions_(new CommandActions(this)),
      central_(new QStackedWidget(this)),
      start_(new StartPage(central_)),
      tabs_(new QTabWidget(central_)) {
    setObjectName(QStringLiteral("SXNeditWindow"));
    host_->SetParent(this);
    setAcceptDrops(true);
    actions_->BuildMenus(this);
    actions_->BuildToolbars(this);
    BuildStatusBar();
    BuildDocumentList();
    tabs_->setDocumentMode(true);
    tabs_->setTabsClosable(true);
    tabs_->setMovable(true);
    central_->addWidget(start_);
    central_->addWidget(tabs_);
    setCentralWidget(central_);
    choose_file_ = [this](bool save, const QString& title, const QString& filter,
                          const QString& directory) {
        return save ? QFileDialog::getSaveFileName(this, title, directory, filter)
                    : QFileDialog::getOpenFileName(this, title, directory, filter);
    };
    connect(actions_, &CommandActions::commandTriggered, this, [this](int id) { RunCommand(id); });
    connect(start_, &StartPage::commandWanted, this, [this](int id) { RunCommand(id); });
    connect(start_, &StartPage::recentJobWanted, this,
            [this](const QString& path) { OpenJob(path); });
    connect(tabs_, &QTabWidget::currentChanged, this, [this] {
        CNeditViewPane* pane = CurrentPane();
        host_->SetJobSettings(pane != nullptr ? &pane->GetDocument()->GetSettings() : nullptr);
        UpdateTitle();
        UpdateActions();
    });
    connect(tabs_, &QTabWidget::tabCloseRequested, this,
            [this](int index) { ClosePane(qobject_cast<CNeditViewPane*>(tabs_->widget(index))); });
    resize(1280, 800);
    RestorePlacement();
    RefreshRecent();
    RefreshDocuments();
    ShowCentral();
    UpdateTitle();
    UpdateActions();
}

UNeditMainWindow::~UNeditMainWindow() {
    // Panes hold the documents of the job: they go before it.
    while (tabs_->count() > 0) delete tabs_->widget(0);
}

void UNeditMainWindow::BuildStatusBar() {
    auto* stage = new QLabel(this);
    auto* bar = new QProgressBar(this);
    bar->setMaximumWidth(200);
    bar->setTextVisible(true);
    auto* abort = new QToolButton(this);
    abort->setObjectName(QStringLiteral("AbortButton"));
    abort->setText(QStringLiteral("Abort"));
    abort->setToolTip(QStringLiteral("Stop the work that is running"));
    progress_ = new QtProgressSink(stage, bar, abort, this);
    scale_ = new QLabel(this);
    scale_->setMinimumWidth(90);
    coordinates_ = new QLabel(this);
    coordinates_->setObjectName(QStringLiteral("Coordinates"));
    coordinates_->setMinimumWidth(coordinates_->fontMetrics().horizontalAdvance(
        QStringLiteral("E 0000000.000   N 0000000.000")));
    statusBar()->addPermanentWidget(stage);
    statusBar()->addPermanentWidget(bar);
    statusBar()->addPermanentWidget(abort);
    statusBar()->addPermanentWidget(scale_);
    statusBar()->addPermanentWidget(coordinates_);
}

void UNeditMainWindow::BuildDocumentList() {
    auto* dock = new QDockWidget(QStringLiteral("Raw Data"), this);
    documents_dock_ = dock;
    dock->setObjectName(QStringLiteral("RawDataDock"));
    dock->setFeatures(QDockWidget::DockWidgetMovable | QDockWidget::DockWidgetClosable);
    documents_ = new QListWidget(dock);
    documents_->setObjectName(QStringLiteral("RawDataList"));
    documents_->setToolTip(
        QStringLiteral("The raw-data documents of the job; double click to open"));
    dock->setWidget(documents_);
    dock->setMinimumWidth(110);
    addDockWidget(Qt::LeftDockWidgetArea, dock);
    resizeDocks({dock}, {120}, Qt::Horizontal);
    connect(documents_, &QListWidget::itemActivated, this,
            [this](QListWidgetItem* item) { OpenDocument(item->text().toStdWString()); });
}

// ---- Jobs ----------------------------------------------------------------------------------

void UNeditMainWindow::ShowError(const std::wstring& text) {
    AppMessageBox(host_.get(), text, mb::IconStop);
}

bool UNeditMainWindow::CloseJob() {
    while (tabs_->count() > 0) {
        if (!ClosePane(qobject_cast<CNeditViewPane*>(tabs_->widget(0)))) return false;
    }
    session_.Close();
    beside_.clear();
    return true;
}

bool UNeditMainWindow::OpenJob(const QString& path) {
    return StartJob(path, false);
}

bool UNeditMainWindow::NewJob(const QString& path) {
    return StartJob(path, true);
}

bool UNeditMainWindow::StartJob(const QString& path, bool create) {
    if (!CloseJob()) return false;
    std::wstring error;
    const std::string file = path.toStdString();
    const bool started = create ? session_.Create(file, error) : session_.Open(file, error);
    if (started) {
        AddRecent(QFileInfo(path).absoluteFilePath());
    } else {
        ShowError(error);
    }
    RefreshDocuments();
    if (started) {
        const std::vector<std::wstring> names = session_.Container()->GetDocumentNames();
        if (!names.empty()) OpenDocument(names.front());
    }
    ShowCentral();
    UpdateTitle();
    UpdateActions();
    return started;
}

bool UNeditMainWindow::OpenPath(const QString& path) {
    const QFileInfo file(path);
    if (!file.exists()) {
        ShowError(Translate(L"{1} does not exist.", {path.toStdWString()}));
        return false;
    }
    if (!JobSession::IsNeutralFile(path.toStdString())) return OpenJob(path);
    QString job = QString::fromStdString(JobSession::JobBeside(path.toStdString()));
    if (!QFileInfo::exists(job) && !QFileInfo(QFileInfo(job).absolutePath()).isWritable()) {
        // No job can be made beside the file: the user says where it goes.
        job = choose_file_(true, tr("New Job for %1").arg(file.fileName()),
                           QString::fromLatin1(kJobFilter), QFileInfo(job).fileName());
        if (job.isEmpty()) return false;
    }
    const bool made = !QFileInfo::exists(job);
    if (!(made ? NewJob(job) : OpenJob(job))) return false;
    beside_ = (made ? QStringLiteral("new job beside ") : QStringLiteral("job beside ")) +
              file.fileName();
    OpenFile(path);
    return true;
}

void UNeditMainWindow::OpenFile(const QString& path) {
    if (!session_.IsOpen()) {
        OpenPath(path);
        return;
    }
    if (!JobSession::IsNeutralFile(path.toStdString())) {
        ShowError(
            Translate(L"{1} is no neutral file. Raw instrument files are read through the "
                      L"instrument drivers, which this build does not have.",
                      {path.toStdWString()}));
        return;
    }
    std::wstring error;
    bool imported = false;
    UNeditDoc* doc = session_.DocumentOf(path.toStdString(), error, imported);
    if (doc == nullptr) {
        ShowError(error);
        return;
    }
    RefreshDocuments();
    OpenDocument(doc->GetName());
    statusBar()->showMessage(
        imported ? tr("%1 brought into the job as %2")
                       .arg(QFileInfo(path).fileName(), QString::fromStdWString(doc->GetName()))
                 : tr("The job holds %1 already; its stored records are shown")
                       .arg(QString::fromStdWString(doc->GetName())),
        8000);
    UpdateTitle();
}

CNeditViewPane* UNeditMainWindow::OpenDocument(const std::wstring& name) {
    for (CNeditViewPane* pane : Panes()) {
        if (pane->GetDocument()->GetName() == name) {
            tabs_->setCurrentWidget(pane);
            return pane;
        }
    }
    UNeditDoc* doc = session_.IsOpen() ? session_.Container()->GetNeditDoc(name) : nullptr;
    if (doc == nullptr) return nullptr;
    auto* pane = new CNeditViewPane(doc, host_.get(), progress_, tabs_);
    pane->SetFileChooser(choose_file_);
    tabs_->addTab(pane, pane->Title());
    tabs_->setCurrentWidget(pane);
    ShowCentral();
    connect(pane, &CNeditViewPane::stateChanged, this, &UNeditMainWindow::UpdateActions);
    connect(pane, &CNeditViewPane::titleChanged, this, [this, pane] {
        tabs_->setTabText(tabs_->indexOf(pane), pane->Title());
        UpdateTitle();
    });
    connect(pane, &CNeditViewPane::closeRequested, this, [this, pane] { ClosePane(pane); });
    connect(pane, &CNeditViewPane::statusMessage, this,
            [this](const QString& text) { statusBar()->showMessage(text, 8000); });
    connect(pane, &CNeditViewPane::contextMenuWanted, this, [this](const QPoint& at) {
        QMenu* menu = actions_->BuildContextMenu(this);
        menu->setAttribute(Qt::WA_DeleteOnClose);
        menu->popup(at);
    });
    UNeditGraphView* plan = pane->GetGraphView();
    connect(plan, &UNeditGraphView::cursorMoved, this, &UNeditMainWindow::ShowCoordinates);
    connect(plan, &UNeditGraphView::cursorLeft, coordinates_, &QLabel::clear);
    connect(plan, &UNeditGraphView::scaleChanged, this, [this](double scale) {
        scale_->setText(QStringLiteral("1:%1").arg(std::round(scale), 0, 'f', 0));
    });
    pane->setInitialPaneSizes(ProfileStore(), isMaximized());
    pane->Start();
    RefreshDocuments();
    UpdateActions();
    return pane;
}

bool UNeditMainWindow::ClosePane(CNeditViewPane* pane) {
    if (pane == nullptr || !pane->CanClosePane()) return false;
    SavePlacement(pane);
    tabs_->removeTab(tabs_->indexOf(pane));
    // The pane may be in the middle of its own command (Close): it goes when that is done.
    pane->Detach();
    pane->deleteLater();
    RefreshDocuments();
    ShowCentral();
    UpdateTitle();
    UpdateActions();
    return true;
}

// ---- Commands ------------------------------------------------------------------------------

bool UNeditMainWindow::Busy() const {
    const QList<CNeditViewPane*> panes = Panes();
    return std::any_of(panes.begin(), panes.end(), [](CNeditViewPane* p) { return p->IsBusy(); });
}

bool UNeditMainWindow::IsCommandEnabled(int id) const {
    const CommandInfo* info = FindCommand(id);
    if (info == nullptr || !info->available) return false;
    if (!info->needsDocument) {
        if (Busy()) return false;
        if (id == cmd::FileNew || id == cmd::FileOpen) return session_.IsOpen();
        return true;
    }
    CNeditViewPane* pane = CurrentPane();
    return pane != nullptr && pane->IsCommandEnabled(id);
}

void UNeditMainWindow::UpdateActions() {
    for (const auto& [id, action] : actions_->All()) action->setEnabled(IsCommandEnabled(id));
    CNeditViewPane* pane = CurrentPane();
    QUndoStack* stack = pane != nullptr ? pane->GetUndoStack() : nullptr;
    actions_->Action(cmd::Undo)->setText(stack != nullptr && stack->canUndo()
                                             ? QStringLiteral("Undo ") + stack->undoText()
                                             : QStringLiteral("Undo"));
    actions_->Action(cmd::Redo)->setText(stack != nullptr && stack->canRedo()
                                             ? QStringLiteral("Redo ") + stack->redoText()
                                             : QStringLiteral("Redo"));
}

bool UNeditMainWindow::RunCommand(int id) {
    if (!IsCommandEnabled(id)) return false;
    const QString job_filter = QString::fromLatin1(kJobFilter);
    switch (id) {
        case cmd::NewJob: {
            QString path = choose_file_(true, tr("New Job"), job_filter, {});
            if (path.isEmpty()) return true;
            if (QFileInfo(path).suffix().isEmpty()) path += QStringLiteral(".job");
            NewJob(path);
            return true;
        }
        case cmd::OpenJob: {
            const QString path = choose_file_(false, tr("Open Job"), job_filter, {});
            if (!path.isEmpty()) OpenJob(path);
            return true;
        }
        case cmd::FileNew: {
            UNeditDoc* doc = session_.Container()->CreateNeditDoc();
            if (doc == nullptr) {
                ShowError(L"No new document can be made in the job.");
                return true;
            }
            RefreshDocuments();
            OpenDocument(doc->GetName());
            doc->SetModified(1);
            if (CNeditViewPane* pane = CurrentPane()) emit pane->titleChanged();
            return true;
        }
        case cmd::FileOpen: {
            UGetNameDlg dialog(UGetNameDlg::Mode::Open, session_.Container()->GetDocumentNames());
            if (host_->Run(dialog) == mb::IdOk) OpenDocument(dialog.Name);
            return true;
        }
        case cmd::AppExit:
            close();
            return true;
        case cmd::About:
            QMessageBox::about(this, QStringLiteral("About SXNedit"),
                               QStringLiteral("<b>SXNedit %1</b><p>The raw-data module: field "
                                              "records, their reduction, the report and the "
                                              "plan.</p>")
                                   .arg(QCoreApplication::applicationVersion()));
            return true;
        default:
            break;
    }
    CNeditViewPane* pane = CurrentPane();
    const bool done = pane != nullptr && pane->OnCommand(id);
    UpdateActions();
    return done;
}

// ---- Views of the window -------------------------------------------------------------------

CNeditViewPane* UNeditMainWindow::CurrentPane() const {
    return qobject_cast<CNeditViewPane*>(tabs_->currentWidget());
}

QList<CNeditViewPane*> UNeditMainWindow::Panes() const {
    QList<CNeditViewPane*> panes;
    for (int i = 0; i < tabs_->count(); ++i) {
        if (auto* pane = qobject_cast<CNeditViewPane*>(tabs_->widget(i))) panes << pane;
    }
    return panes;
}

void UNeditMainWindow::SetFileChooser(CNeditViewPane::FileChooser chooser) {
    choose_file_ = std::move(chooser);
    for (CNeditViewPane* pane : Panes()) pane->SetFileChooser(choose_file_);
}

void UNeditMainWindow::ShowCentral() {
    if (tabs_->count() > 0) {
        central_->setCurrentWidget(tabs_);
        return;
    }
    start_->Show(session_.IsOpen() ? QString::fromStdString(session_.Path()) : QString(),
                 RecentJobs());
    central_->setCurrentWidget(start_);
}

void UNeditMainWindow::RefreshDocuments() {
    documents_->clear();
    // Without a job there are no documents to list.
    documents_dock_->setVisible(session_.IsOpen());
    if (!session_.IsOpen()) return;
    for (const std::wstring& name : session_.Container()->GetDocumentNames()) {
        auto* item = new QListWidgetItem(QString::fromStdWString(name), documents_);
        for (CNeditViewPane* pane : Panes()) {
            if (pane->GetDocument()->GetName() != name) continue;
            QFont bold = item->font();
            bold.setBold(true);
            item->setFont(bold);
        }
    }
}

void UNeditMainWindow::UpdateTitle() {
    QString title = QStringLiteral("SXNedit");
    if (session_.IsOpen()) {
        title +=
            QStringLiteral(" - ") + QFileInfo(QString::fromStdString(session_.Path())).fileName();
        if (!beside_.isEmpty()) title += QStringLiteral(" (%1)").arg(beside_);
    }
    if (CNeditViewPane* pane = CurrentPane()) title += QStringLiteral(" - ") + pane->Title();
    setWindowTitle(title);
}

void UNeditMainWindow::ShowCoordinates(double east, double north) {
    CNeditViewPane* pane = CurrentPane();
    if (pane == nullptr) return;
    const UJobSettings& settings = pane->GetDocument()->GetSettings();
    const int decimals = settings.GetLengthDecimals();
    const QString e = QStringLiteral("E %1").arg(east, 0, 'f', decimals);
    const QString n = QStringLiteral("N %1").arg(north, 0, 'f', decimals);
    coordinates_->setText(pane->GetDocument()->IsENOrder() ? e + QStringLiteral("   ") + n
                                                           : n + QStringLiteral("   ") + e);
}

// ---- Recent jobs and placement -------------------------------------------------------------

QStringList UNeditMainWindow::RecentJobs() const {
    QStringList paths;
    const IniFile profile = Profile();
    for (int i = 0; i < kRecentLimit; ++i) {
        const QString path =
            QString::fromStdWString(profile.ReadString(kRecentSection, RecentKey(i)));
        if (!path.isEmpty()) paths << path;
    }
    return paths;
}

void UNeditMainWindow::AddRecent(const QString& path) {
    QStringList paths = RecentJobs();
    paths.removeAll(path);
    paths.prepend(path);
    const IniFile profile = Profile();
    for (int i = 0; i < kRecentLimit; ++i) {
        profile.WriteString(kRecentSection, RecentKey(i),
                            i < paths.size() ? paths[i].toStdWString() : std::wstring());
    }
    RefreshRecent();
}

void UNeditMainWindow::RefreshRecent() {
    QMenu* menu = actions_->RecentJobsMenu();
    menu->clear();
    const QStringList paths = RecentJobs();
    for (const QString& path : paths) {
        menu->addAction(QFileInfo(path).fileName() + QStringLiteral("  (") +
                            QFileInfo(path).absolutePath() + QStringLiteral(")"),
                        this, [this, path] { OpenJob(path); });
    }
    menu->setEnabled(!paths.isEmpty());
}

void UNeditMainWindow::RestorePlacement() {
    const std::vector<int> values = ParseWindowState(ProfileStore().ReadWindowStateText());
    if (values.size() < 6) return;
    const QRect normal(QPoint(values[2], values[3]), QPoint(values[4], values[5]));
    if (normal.width() > 200 && normal.height() > 150) setGeometry(normal.normalized());
    if (values[1] == kMaximised) setWindowState(windowState() | Qt::WindowMaximized);
}

void UNeditMainWindow::SavePlacement(const CNeditViewPane* pane) const {
    WindowState state;
    const QRect normal = normalGeometry();
    state.showCommand = isMaximized() ? kMaximised : 1;
    state.left = normal.left();
    state.top = normal.top();
    state.right = normal.right();
    state.bottom = normal.bottom();
    ProfileStore profile;
    if (pane != nullptr) {
        pane->GetSplitterState(state);
        pane->SaveListWidth(profile);
    } else {
        const std::vector<int> values = ParseWindowState(profile.ReadWindowStateText());
        if (values.size() >= 10) {
            state.rowHeight = values[6];
            state.rowMinimum = values[7];
            state.columnWidth = values[8];
            state.columnMinimum = values[9];
        }
    }
    profile.WriteWindowState(state);
    const QRect frame = centralWidget()->geometry();
    WriteFramePos(frame.left(), frame.top(), frame.right(), frame.bottom());
}

// ---- Closing and dropping ------------------------------------------------------------------

void UNeditMainWindow::closeEvent(QCloseEvent* event) {
    if (Busy()) {
        // Long work ends first: it is asked to stop, and the window stays.
        for (CNeditViewPane* pane : Panes()) pane->OnCommand(cmd::AbortProcess);
        event->ignore();
        return;
    }
    SavePlacement(CurrentPane());
    if (!CloseJob()) {
        event->ignore();
        return;
    }
    event->accept();
}

void UNeditMainWindow::dragEnterEvent(QDragEnterEvent* event) {
    if (event->mimeData()->hasUrls() && !Busy()) event->acceptProposedAction();
}

void UNeditMainWindow::dropEvent(QDropEvent* event) {
    OpenDropped(event->mimeData()->urls());
    event->acceptProposedAction();
}

void UNeditMainWindow::OpenDropped(const QList<QUrl>& urls) {
    for (const QUrl& url : urls) {
        if (!url.isLocalFile()) continue;
        const QString path = url.toLocalFile();
        if (QFileInfo(path).suffix().compare(QStringLiteral("job"), Qt::CaseInsensitive) == 0) {
            OpenJob(path);
        } else {
            OpenFile(path);
        }
    }
}

}  // namespace nedit
