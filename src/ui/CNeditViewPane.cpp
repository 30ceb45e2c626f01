#include "ui/CNeditViewPane.h"

#include <QFileDialog>
#include <QLineEdit>
#include <QSplitter>
#include <QUndoStack>
#include <QVBoxLayout>

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "reduction/UNeditDatabase.h"
#include "ui/CommandIds.h"
#include "ui/CommandTable.h"
#include "ui/FindRecordDialog.h"
#include "ui/QtClipboard.h"
#include "ui/QtDialogHost.h"
#include "ui/QtProgressSink.h"
#include "ui/RecordListModel.h"
#include "ui/RowEditRecorder.h"
#include "ui/UNeditDlgView.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditView.h"
#include "ui/UReportView.h"

namespace nedit {

namespace {

constexpr int kFormLines = 6;

/// The name in a first field: the text after its '=' up to the first comma, trimmed.
std::wstring_view FirstFieldValue(std::wstring_view row) {
    const std::size_t blank = row.find(L' ');
    if (blank == std::wstring_view::npos) return {};
    const std::size_t comma = row.find(L',', blank);
    std::wstring_view token =
        row.substr(blank, comma == std::wstring_view::npos ? row.npos : comma - blank);
    const std::size_t equals = token.find(L'=');
    if (equals == std::wstring_view::npos) return {};
    return TrimView(token.substr(equals + 1));
}

}  // namespace

CNeditViewPane::CNeditViewPane(UNeditDoc* doc, QtDialogHost* host, QtProgressSink* progress,
                               QWidget* parent)
    : QWidget(parent),
      SurveyDocument(doc->GetSurveyDoc()),
      Document(doc),
      Host(host),
      Progress(progress),
      Rows(new QSplitter(Qt::Vertical, this)),
      Columns(new QSplitter(Qt::Horizontal, Rows)),
      ListView(new UNeditView(Columns)),
      GraphView(new UNeditGraphView(Columns)),
      DlgView(new UNeditDlgView(Rows)),
      UndoStack(new QUndoStack(this)),
      Recorder(new RowEditRecorder(UndoStack, this)),
      Clipboard(std::make_unique<QtClipboard>()) {
    setObjectName(QStringLiteral("NeditViewPane"));
    BuildLayout();
    // A document opened in a window has its report (a renamed copy may not have one yet).
    if (Document->GetNReport() == nullptr) Document->CreateNReport();
    Document->SetDialogHost(Host);
    Document->SetProgressSink(Progress);
    GraphView->SetDoc(Document);
    ChooseFile = [this](bool save, const QString& title, const QString& filter,
                        const QString& directory) {
        return save ? QFileDialog::getSaveFileName(this, title, directory, filter)
                    : QFileDialog::getOpenFileName(this, title, directory, filter);
    };
    Events.Add(ListView->Model());
    Events.Add(Recorder);
    ListView->SetRecorder(Recorder);
    DlgView->SetDoc(Document);
    DlgView->SetRecorder(Recorder);

    connect(Recorder, &RowEditRecorder::rowsChanged, this, &CNeditViewPane::MarkModified);
    connect(Recorder, &RowEditRecorder::rowShown, ListView, &UNeditView::ShowRow);
    connect(UndoStack, &QUndoStack::indexChanged, this, &CNeditViewPane::stateChanged);
    connect(UndoStack, &QUndoStack::cleanChanged, this, &CNeditViewPane::titleChanged);
    connect(ListView->Model(), &RecordListModel::selectionChanged, this,
            &CNeditViewPane::stateChanged);
    connect(ListView, &UNeditView::editRecordData, this, &CNeditViewPane::OnEditRecordData);
    connect(ListView, &UNeditView::displaySettingsRequested, this,
            &CNeditViewPane::OnDisplaySettings);
    connect(ListView, &UNeditView::contextMenuWanted, this, &CNeditViewPane::contextMenuWanted);
    connect(ListView, &UNeditView::focusFormRequested, this, [this] {
        if (QWidget* field = DlgView->FieldEdit(0)) field->setFocus();
    });
    connect(DlgView, &UNeditDlgView::listFocusWanted, ListView,
            [this] { ListView->setFocus(Qt::OtherFocusReason); });
    connect(GraphView, &UNeditGraphView::objectPicked, this,
            [this](const PlanPick& pick) { SetSelected(pick); });
    connect(GraphView, &UNeditGraphView::objectInfoRequested, this, &CNeditViewPane::OnObjectInfo);
    connect(GraphView, &UNeditGraphView::zoomHistoryChanged, this, &CNeditViewPane::stateChanged);
}

CNeditViewPane::~CNeditViewPane() {
    Detach();
}

void CNeditViewPane::Detach() {
    // The document may be gone by the time the pane is deleted: it is let go of once.
    if (Detached) return;
    Detached = true;
    // The window hears nothing more of a pane that is going.
    blockSignals(true);
    if (FindDlg) FindDlg->close();
    if (ReportView) ReportView->close();
    Instruments.reset();
    if (ListCtrl != nullptr) {
        ListCtrl->SetEvents(nullptr);
        ListCtrl->SetRecordForm(nullptr);
        ListCtrl->SetGraphicView(nullptr);
        ListCtrl->SetClipboard(nullptr);
        ListCtrl = nullptr;
        ListView->SetList(nullptr);
        DlgView->SetList(nullptr);
        Recorder->SetList(nullptr);
    }
    GraphView->SetDoc(nullptr);
    DlgView->SetDoc(nullptr);
    Document->SetProgressSink(nullptr);
}

void CNeditViewPane::BuildLayout() {
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(Rows);
    Rows->addWidget(Columns);
    Rows->addWidget(DlgView);
    Columns->addWidget(ListView);
    Columns->addWidget(GraphView);
    Rows->setChildrenCollapsible(false);
    Columns->setChildrenCollapsible(false);
    Rows->setStretchFactor(0, 1);
    Rows->setStretchFactor(1, 0);
    Columns->setStretchFactor(0, 0);
    Columns->setStretchFactor(1, 1);
    DlgView->setMinimumHeight(DlgView->HeightForLines(kFormLines));
}

void CNeditViewPane::WireList() {
    ListCtrl->SetRecordForm(DlgView);
    ListCtrl->SetGraphicView(GraphView);
    ListCtrl->SetClipboard(Clipboard.get());
    ListCtrl->SetDialogHost(Host);
    ListCtrl->SetEvents(&Events);
    ListView->SetList(ListCtrl);
    DlgView->SetList(ListCtrl);
    Recorder->SetList(ListCtrl);
    UTransferView* view = this;
    Instruments = std::make_unique<UInstrumentCommands>(*Document, *ListCtrl, Host, view);
}

void CNeditViewPane::Start() {
    RunLong(tr("Loading records"), [this] {
        ListCtrl = &Document->OpenList();
        return 1;
    });
    WireList();
    Reduce(tr("Reducing"), [this] { return Document->SetupDataBase(ListCtrl); });
    GraphView->ResetExtents();
    // Rows that the first run added (coordinates it was given) are the document's from now.
    Recorder->Close();
    UndoStack->clear();
}

// ---- State ---------------------------------------------------------------------------------

UReportView* CNeditViewPane::GetReportView() const {
    return ReportView;
}

FindRecordDialog* CNeditViewPane::GetFindDialog() const {
    return FindDlg;
}

int CNeditViewPane::GetModifiedFlag() const {
    if (ListModified) return 1;
    return DlgView->GetModifiedFlag() ? 1 : 0;
}

QString CNeditViewPane::Title() const {
    const QString title =
        QStringLiteral("Raw Data - %1").arg(QString::fromStdWString(Document->GetName()));
    return Document->GetModified() ? title + QStringLiteral(" *") : title;
}

void CNeditViewPane::MarkModified() {
    ListModified = 1;
    DlgView->SetModified();
    if (!Document->GetModified()) {
        Document->SetModified(1);
        emit titleChanged();
    }
}

void CNeditViewPane::ClearModified() {
    ListModified = 0;
    Document->SetModified(0);
    emit titleChanged();
}

int CNeditViewPane::RunLong(const QString& stage, const std::function<int()>& work) {
    Busy = true;
    ListView->SetBusy(true);
    GraphView->SetMouseClickFlag(false);
    Progress->Begin(stage);
    emit stateChanged();
    const int result = work();
    const bool aborted = Document->GetAbortProcess();
    Progress->End();
    Document->SetAbortProcess(false);
    GraphView->SetMouseClickFlag(true);
    ListView->SetBusy(false);
    Busy = false;
    emit stateChanged();
    if (aborted) emit statusMessage(tr("Stopped: the work was aborted."));
    return result;
}

int CNeditViewPane::Reduce(const QString& stage, const std::function<int()>& run) {
    GraphView->BeginReplace();
    const int result = RunLong(stage, run);
    GraphView->DatabaseReplaced();
    if (ReportView) ReportView->UpdateReport();
    // The form shows angles in the unit the run read last, as the file's records give it.
    const UNeditDatabase* database = Document->GetDatabase();
    DlgView->SetAngType(database != nullptr ? database->GetAngleType()
                                            : IndexOf(Document->GetSettings().GetAngleUnit()));
    return result;
}

// ---- Enabling ------------------------------------------------------------------------------

bool CNeditViewPane::IsCommandEnabled(int id) const {
    const CommandInfo* info = FindCommand(id);
    if (info == nullptr || !info->available) return false;
    if (id == cmd::AbortProcess || id == cmd::AbortProcessing) return Busy;
    if (Busy || ListCtrl == nullptr) return false;
    switch (id) {
        case cmd::Undo:
            return UndoStack->canUndo();
        case cmd::Redo:
            return UndoStack->canRedo();
        case cmd::ZoomPrevious:
            return GraphView->CanZoomPrevious();
        case cmd::ZoomNext:
            return GraphView->CanZoomNext();
        default:
            break;
    }
    switch (info->enabling) {
        case Enabling::WhenIdle:
            return GraphView->GetMouseClickFlag() && !Document->GetAbortProcessOn();
        case Enabling::WhenSelection:
            return ListCtrl->GetFirstSelected() >= 0;
        default:
            return true;
    }
}

// ---- Rows ----------------------------------------------------------------------------------

std::wstring CNeditViewPane::CheckCoordinateOrder(const std::wstring& record, int order) {
    if (order != 1) return record;
    const std::size_t e = record.find(L'E', 1);
    if (e == std::wstring::npos) return record;
    const std::size_t n = record.find(L'N', e + 1);
    if (n == std::wstring::npos) return record;
    const std::size_t h = record.find(L'H', n + 1);
    if (h == std::wstring::npos) return record;
    return record.substr(0, e) + record.substr(n, h - n) + record.substr(e, n - e) +
           record.substr(h);
}

int CNeditViewPane::Insert_Record(int type) {
    std::wstring text = Document->FormRecBuf(type);
    if (text.empty()) return 0;
    if (type == rec::Pt)
        text = CheckCoordinateOrder(text, Document->GetSettings().GetCoordinateOrder());
    const std::size_t bars = text.find(L"||", 1);
    if (bars != std::wstring::npos) text = TrimRight(std::wstring_view(text).substr(0, bars));
    int place = ListCtrl->GetFirstSelected();
    if (place >= 0) ListCtrl->SetSelected(place, false);
    if (place < 0) place = ListCtrl->GetItemCount();
    if (ListCtrl->GetItemCount() == 0) {
        ListCtrl->AddRecord(0, kNeutralFileHeader);
        place = 1;
    }
    const int row = ListCtrl->AddRecord(place, text);
    if (row < 0) return 0;
    ListCtrl->SetSelected(row, true);
    ListCtrl->SetFocusRow(row);
    ListView->ShowRow(row);
    ListCtrl->ShowRecord(ListCtrl->GetItemText(row), row);
    DlgView->SetModified();
    return 1;
}

int CNeditViewPane::SearchList(const std::wstring& name) const {
    if (ListCtrl == nullptr) return -1;
    const std::vector<std::wstring>& rows = ListCtrl->GetRows();
    for (std::size_t row = 0; row < rows.size(); ++row) {
        // Most rows do not hold the name at all; they are passed over before being parsed.
        if (rows[row].find(name) == std::wstring::npos) continue;
        const int type = Document->GetRecordType(rows[row]);
        if (type != rec::Pt && type != rec::Ss && type != rec::PSX && type != rec::PSN &&
            type != rec::Ss2) {
            continue;
        }
        if (FirstFieldValue(rows[row]) == name) return static_cast<int>(row);
    }
    return -1;
}

void CNeditViewPane::SetSelectList(int row) {
    ListCtrl->SetSelection({row});
    ListCtrl->SetFocusRow(row);
    ListView->ShowRow(row);
    ListCtrl->UpdateHeader();
    ListView->setFocus();
}

int CNeditViewPane::SetSelected(const PlanPick& pick) {
    const UNeditDatabase* database = GraphView->Scene().Database();
    if (database == nullptr || pick.kind == PlanPick::Kind::None) return 0;
    const auto index = static_cast<std::size_t>(pick.index);
    std::wstring name;
    switch (pick.kind) {
        case PlanPick::Kind::Point:
            name = database->GetPointList()[index].GetID();
            break;
        case PlanPick::Kind::Line:
            name = database->GetLineList()[index].GetToPt();
            break;
        default:
            name = database->GetArcList()[index].GetEndPt();
            break;
    }
    const int row = SearchList(RecordNameOf(name));
    if (row >= 0) SetSelectList(row);
    return 0;
}

std::wstring CNeditViewPane::RecordNameOf(const std::wstring& name) {
    if (const std::size_t rect = name.find(L"RECT-"); rect != std::wstring::npos)
        return name.substr(rect + 5);
    if (name.find(L"CENTER") != std::wstring::npos) return name.substr(name.find(L'-') + 1);
    return name;
}

// ---- Splitters -----------------------------------------------------------------------------

void CNeditViewPane::setInitialPaneSizes(const ProfileStore& profile, bool maximised) {
    StoredColumn = profile.ReadColumnSize(maximised);
    // A maximised window takes the list's own stored width instead.
    const long list_width = profile.ReadListWidth();
    if (!StoredColumn && list_width > 0)
        StoredColumn = SplitterColumn{static_cast<int>(list_width), ListView->minimumWidth()};
    SizesPending = true;
    if (height() > 0 && isVisible()) ApplyPaneSizes();
}

void CNeditViewPane::resizeEvent(QResizeEvent* event) {
    QWidget::resizeEvent(event);
    if (SizesPending && height() > 0) ApplyPaneSizes();
}

void CNeditViewPane::ApplyPaneSizes() {
    SizesPending = false;
    const int height = Rows->height();
    const int form = DlgView->HeightForLines(kFormLines);
    const int lower = form < height ? form : height / 5;
    Rows->setSizes({height - lower, lower});
    if (!StoredColumn) return;
    ListView->setMinimumWidth(StoredColumn->minimum);
    Columns->setSizes({StoredColumn->width, std::max(Columns->width() - StoredColumn->width, 1)});
}

void CNeditViewPane::SaveListWidth(const ProfileStore& profile) const {
    profile.WriteListWidth(ListView->width());
}

void CNeditViewPane::GetSplitterState(WindowState& state) const {
    const QList<int> rows = Rows->sizes();
    const QList<int> columns = Columns->sizes();
    state.rowHeight = rows.value(0);
    state.rowMinimum = Columns->minimumSizeHint().height();
    state.columnWidth = columns.value(0);
    state.columnMinimum = ListView->minimumWidth();
}

}  // namespace nedit
