// The pane's commands: what each command number does to the document, the list, the plan
// or a dialog.

#include <QFileInfo>
#include <QFontDatabase>
#include <QPainter>
#include <QPrintDialog>
#include <QPrinter>
#include <QUndoStack>

#include "document/ProfileStore.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "document/URawDataContainer.h"
#include "instruments/PortStores.h"
#include "instruments/USetComm.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/settings/IniFile.h"
#include "platform/storage/UStreamFile.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"
#include "report/UOutputParamDlg.h"
#include "ui/CNeditViewPane.h"
#include "ui/CommandIds.h"
#include "ui/CommandTable.h"
#include "ui/FindRecordDialog.h"
#include "ui/QtDialogHost.h"
#include "ui/QtProgressSink.h"
#include "ui/RecordListModel.h"
#include "ui/RowEditRecorder.h"
#include "ui/UNeditDlgView.h"
#include "ui/UNeditGraphView.h"
#include "ui/UNeditView.h"
#include "ui/UReportView.h"
#include "ui/dialogs/FileUnits.h"
#include "ui/dialogs/NEdit_Global_Edit.h"
#include "ui/dialogs/ObjectInfoDialogs.h"
#include "ui/dialogs/UDisplaySettingsDlg.h"
#include "ui/dialogs/UEditRecordDlg.h"
#include "ui/dialogs/UGetNameDlg.h"
#include "ui/forms/DownloadProgressWindow.h"

namespace nedit {

namespace {

constexpr const wchar_t* kLastDirectoryKey = L"LastOpenDirectoryNeutral";

IniFile Profile() {
    return IniFile(ProfileStore().Path());
}

QString LastDirectory() {
    return QString::fromStdWString(
        Profile().ReadString(ProfileStore::kDefaultSection, kLastDirectoryKey));
}

void SetLastDirectory(const QString& path) {
    Profile().WriteString(ProfileStore::kDefaultSection, kLastDirectoryKey,
                          QFileInfo(path).absolutePath().toStdWString());
}

/// The text of a step of the undo history: the command's menu text.
QString StepText(int id) {
    const CommandInfo* info = FindCommand(id);
    return QString::fromLatin1(info != nullptr ? info->text : "Edit Records");
}

}  // namespace

bool CNeditViewPane::OnCommand(int id) {
    if (!IsCommandEnabled(id)) return false;
    if (GraphView->RunCommand(id)) return true;
    const CommandInfo* info = FindCommand(id);
    if (info->recordType != 0) {
        RowEditStep step(Recorder, tr("Insert Record"));
        Insert_Record(info->recordType);
        return true;
    }
    RowEditStep step(Recorder, StepText(id));
    switch (id) {
        case cmd::FileSave:
        case cmd::SaveDocument:
            Save();
            break;
        case cmd::FileSaveAs:
            OnFileSaveAs();
            break;
        case cmd::ImportNeutral:
            OnImportNeutral();
            break;
        case cmd::ExportNeutral:
            OnExportNeutral();
            break;
        case cmd::FilePrint:
            OnFilePrint();
            break;
        case cmd::Exit:
            emit closeRequested();
            break;
        case cmd::EditCut:
        case cmd::EditCutStandard:
            OnEditCut();
            break;
        case cmd::EditCopy:
        case cmd::EditCopyStandard:
            OnEditCopy();
            break;
        case cmd::EditPaste:
        case cmd::EditPasteStandard:
            OnEditPaste();
            break;
        case cmd::FindRecord:
            OnNeditFindrecord();
            break;
        case cmd::NextRecord:
            ListCtrl->NextOfType();
            break;
        case cmd::PreRecord:
            ListCtrl->PreviousOfType();
            break;
        case cmd::CommentRecord:
            OnCommentRecord();
            break;
        case cmd::Comment:
            ListCtrl->CommentRow();
            break;
        case cmd::Uncomment:
            ListCtrl->UncommentRow();
            break;
        case cmd::OutputParam:
            OnNeditOutputparam();
            break;
        case cmd::AbortProcess:
        case cmd::AbortProcessing:
            Document->SetAbortProcess(true);
            break;
        case cmd::GlobalEdit:
            NeditGlobalEdit();
            break;
        case cmd::ImportRawfile:
            Instruments->OnImportRawfile();
            break;
        case cmd::Download:
            Instruments->OnNeditDownload();
            break;
        case cmd::DownloadAbort:
            Instruments->OnNeditDownloadAbort();
            break;
        case cmd::Setcomm:
            OnSetcomm();
            break;
        case cmd::Regenerate:
            OnNeditRegenerate();
            break;
        case cmd::Transfer:
            OnNeditTransfer();
            break;
        case cmd::ViewReport:
            OnNeditViewReport();
            break;
        case cmd::DelAdjpts:
            OnNeditDelAdjpts();
            break;
        case cmd::DisplaySettings:
            OnDisplaySettings();
            break;
        case cmd::Undo:
            UndoStack->undo();
            break;
        case cmd::Redo:
            UndoStack->redo();
            break;
        default:
            return false;
    }
    emit stateChanged();
    return true;
}

// ---- Files ---------------------------------------------------------------------------------

QString CNeditViewPane::AskFile(bool save, const QString& title) const {
    return ChooseFile(save, title, QString::fromLatin1(kNeutralFilter), LastDirectory());
}

bool CNeditViewPane::Save() {
    if (!Document->SaveDocument()) {
        AppMessageBox(
            Host,
            Translate(L"The records of {1} could not be saved in the job.", {Document->GetName()}),
            mb::IconStop);
        return false;
    }
    Document->UpdateNReportTitle();
    UndoStack->setClean();
    ClearModified();
    return true;
}

void CNeditViewPane::OnFileSaveAs() {
    auto* container = dynamic_cast<URawDataContainer*>(Document->GetParentDocument());
    if (container == nullptr) return;
    UGetNameDlg dialog(UGetNameDlg::Mode::Save, container->GetDocumentNames(), Document->GetName());
    if (Host->Run(dialog) != mb::IdOk) return;
    const std::wstring old_name = Document->GetName();
    if (EqualsIgnoreCase(dialog.Name, old_name)) return;
    if (container->GetNeditDoc(dialog.Name) != nullptr) {
        AppMessageBox(Host, Translate(L"The job has a document {1} already.", {dialog.Name}),
                      mb::IconExclamation);
        return;
    }
    // What was last saved under the old name stays there.
    std::string saved_rows;
    std::string saved_settings;
    const bool had_rows =
        Document->GetStorage()->ReadStream(UNeditDoc::kNeutralDataStream, saved_rows);
    Document->GetStorage()->ReadStream(UNeditDoc::kSettingsStream, saved_settings);
    if (!Document->SaveAsDocument(dialog.Name)) {
        AppMessageBox(Host, Translate(L"The records could not be saved as {1}.", {dialog.Name}),
                      mb::IconStop);
        return;
    }
    if (had_rows) {
        if (UNeditDoc* old = container->CreateNeditDoc(old_name)) {
            for (const auto& [stream, bytes] :
                 {std::pair{UNeditDoc::kNeutralDataStream, &saved_rows},
                  std::pair{UNeditDoc::kSettingsStream, &saved_settings}}) {
                UStreamFile file;
                if (!file.CreateStream(*old->GetStorage(), stream, UNeditDoc::kCreateMode))
                    continue;
                file.Write(bytes->data(), bytes->size());
                file.Close();
            }
            old->Commit();
            old->SetModified(0);
        }
    }
    Document->UpdateNReportTitle();
    UndoStack->setClean();
    ClearModified();
}

void CNeditViewPane::OnImportNeutral() {
    if (ListCtrl->GetItemCount() > 0) {
        if (AppMessageBox(Host, Translate(L"Overwrite Existing Data?"), mb::YesNo) != mb::IdYes)
            return;
        DlgView->SetModified();
    }
    DlgView->ClearFields();
    const QString path = AskFile(false, tr("Import Neutral File"));
    if (path.isEmpty()) return;
    SetLastDirectory(path);
    ImportNeutralFile(path);
}

bool CNeditViewPane::ImportNeutralFile(const QString& path) {
    RecordListModel* model = ListView->Model();
    model->BeginBulkChange();
    ListCtrl->DeleteAllItems();
    if (UNeditReport* report = Document->GetNReport()) report->Clear();
    Document->SetNeuFileName(path.toStdWString());
    const int result = Reduce(tr("Importing %1").arg(QFileInfo(path).fileName()),
                              [&] { return Document->SetupDataBase(path.toStdWString()); });
    model->EndBulkChange();
    Recorder->Close();
    if (result) {
        MarkModified();
        GraphView->ResetExtents();
    }
    emit stateChanged();
    return result != 0;
}

void CNeditViewPane::OnExportNeutral() {
    QString path = AskFile(true, tr("Export Neutral File"));
    if (path.isEmpty()) return;
    SetLastDirectory(path);
    if (!QFileInfo(path).fileName().contains(QLatin1Char('.'))) path += QStringLiteral(".neu");
    ExportNeutralFile(path);
}

bool CNeditViewPane::ExportNeutralFile(const QString& path) {
    if (Document->Save(path.toStdWString(), ListCtrl)) {
        emit statusMessage(tr("Exported %1 records to %2").arg(ListCtrl->GetItemCount()).arg(path));
        return true;
    }
    AppMessageBox(Host, Translate(L"{1} cannot be written.", {path.toStdWString()}), mb::IconStop);
    return false;
}

void CNeditViewPane::PrintList(QPrinter& printer) const {
    const int page_size = Document->GetPageSize();
    const int pages = ListCtrl->OnPreparePrinting(page_size);
    QPainter painter(&printer);
    QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setPointSize(9);
    // The page's lines (the heading, two blank lines and the rows) fill the printed page.
    const int lines = std::max(page_size, 1) + ListPage::kFirstRowLine;
    const QRect area = painter.viewport();
    const double fits =
        static_cast<double>(area.height()) / (QFontMetricsF(font, &printer).lineSpacing() * lines);
    if (fits < 1.0) font.setPointSizeF(font.pointSizeF() * fits);
    painter.setFont(font);
    const QFontMetrics metrics(font, &printer);
    for (int page = 1; page <= pages; ++page) {
        if (page > 1) printer.newPage();
        int y = metrics.ascent();
        for (const std::wstring& line : ListCtrl->PrintPage(page, page_size).Lines()) {
            painter.drawText(0, y, QString::fromStdWString(line));
            y += metrics.lineSpacing();
        }
    }
}

void CNeditViewPane::OnFilePrint() {
    QPrinter printer;
    QPrintDialog dialog(&printer, this);
    if (dialog.exec() == QDialog::Accepted) PrintList(printer);
}

bool CNeditViewPane::CanClosePane() {
    if (Busy) {
        Document->SetAbortProcess(true);
        return false;
    }
    if (!Document->GetModified() && !GetModifiedFlag()) return true;
    switch (AppMessageBox(Host, Translate(L"Save changes to {1}?", {Document->GetName()}),
                          mb::YesNoCancel | mb::IconExclamation)) {
        case mb::IdYes:
            return Save();
        case mb::IdNo:
            return true;
        default:
            return false;
    }
}

// ---- Editing -------------------------------------------------------------------------------

void CNeditViewPane::OnEditCut() {
    ListCtrl->CopyRows();
    ListCtrl->DeleteRows();
}

void CNeditViewPane::OnEditCopy() {
    ListCtrl->CopyRows();
}

void CNeditViewPane::OnEditPaste() {
    ListCtrl->PasteRows();
}

void CNeditViewPane::OnNeditFindrecord() {
    if (FindDlg) {
        FindDlg->raise();
        FindDlg->activateWindow();
        return;
    }
    FindDlg = new FindRecordDialog(this);
    connect(FindDlg, &FindRecordDialog::findNext, this,
            [this](const QString& text, bool down, bool match_case, bool whole_word) {
                if (ListCtrl != nullptr && !Busy)
                    ListCtrl->FindText(text.toStdWString(), down, match_case, whole_word);
            });
    FindDlg->show();
}

void CNeditViewPane::OnCommentRecord() {
    const std::vector<int> rows = ListCtrl->GetSelectedRows();
    if (rows.empty()) return;
    const bool uncomment = std::any_of(rows.begin(), rows.end(), [this](int row) {
        return StartsWith(TrimLeftView(ListCtrl->GetItemText(row)), L"#");
    });
    for (const int row : rows) {
        const std::wstring text = ListCtrl->GetItemText(row);
        ListCtrl->SetRecord(row, uncomment ? TrimChars(TrimLeftView(text), L"#") : L"#" + text);
    }
    ListCtrl->ShowRecord(ListCtrl->GetItemText(rows.back()), rows.back());
}

void CNeditViewPane::OnNeditOutputparam() {
    UOutputParamDlg dialog(Document->GetOutputParameters());
    if (Host->Run(dialog) == mb::IdOk) Document->GetOutputParameters() = dialog.GetParameters();
}

void CNeditViewPane::OnNeditDelAdjpts() {
    if (UNeditDatabase* database = Document->GetDatabase()) database->DelAdjPts();
}

void CNeditViewPane::OnEditRecordData(const QString& text, int row) {
    const FileUnits units =
        FileUnits::AtRow(*Document, &Document->GetSettings(), ListCtrl->GetRows(), row);
    UEditRecordDlg dialog(*Document, &Document->GetSettings(), units);
    if (!dialog.LoadRecord(text.toStdWString())) return;
    if (Host->Run(dialog) != mb::IdOk || dialog.Fields.empty()) return;
    RowEditStep step(Recorder, tr("Edit Record Data"));
    if (ListCtrl->SetRecord(row, dialog.GetRecordText()) >= 0)
        ListCtrl->ShowRecord(ListCtrl->GetItemText(row), row);
}

int CNeditViewPane::UpdateRecord(std::wstring& record, int mask, const std::wstring& values) const {
    return NEdit_Global_Edit::UpdateRecord(record, Document->GetRecordType(record), mask, values);
}

void CNeditViewPane::NeditGlobalEdit() {
    const std::vector<int> rows = ListCtrl->GetSelectedRows();
    if (rows.empty()) return;
    int mask = 0;
    for (const int row : rows) {
        mask |= NEdit_Global_Edit::MaskOf(Document->GetRecordType(ListCtrl->GetItemText(row)));
        if (mask == (NEdit_Global_Edit::kStationRows | NEdit_Global_Edit::kTargetRows)) break;
    }
    NEdit_Global_Edit dialog(mask, Document->GetSettings().GetLengthUnit());
    if (Host->Run(dialog) != mb::IdOk) return;
    std::wstring values;
    if (dialog.GetValues(values) == 0) return;
    // Heights go into each row in the unit its file is kept in there.
    FileUnits units = FileUnits::OfJob(&Document->GetSettings());
    int next = 0;
    for (const int row : rows) {
        for (; next < row; ++next) {
            const std::wstring& text = ListCtrl->GetRows()[static_cast<std::size_t>(next)];
            units.Take(text, Document->GetRecordType(text));
        }
        std::wstring record = ListCtrl->GetItemText(row);
        const int changes = dialog.GetValues(values, units.length);
        if (UpdateRecord(record, changes, values) != 0) ListCtrl->SetRecord(row, record);
    }
    DlgView->SetModified();
    ListCtrl->ShowRecord(ListCtrl->GetItemText(rows.back()), rows.back());
}

void CNeditViewPane::OnSetcomm() {
    Instruments->StopDownload();
    USetComm dialog(Host);
    Host->Run(dialog);
}

// ---- Instruments ---------------------------------------------------------------------------

void CNeditViewPane::BlockMouse(bool block) {
    GraphView->SetMouseClickFlag(!block);
}

void CNeditViewPane::ClearForm() {
    DlgView->ClearFields();
}

void CNeditViewPane::ShowNewData() {
    GraphView->ResetSelectedLine();
    GraphView->ResetExtents();
}

int CNeditViewPane::Transfer(bool download, const std::function<int()>& transfer) {
    // Rows arrive one by one; the form is not rebuilt for each of them.
    ListCtrl->SetRecordForm(nullptr);
    int result = 0;
    if (download) {
        result = RunDownload(transfer);
    } else {
        RecordListModel* model = ListView->Model();
        model->BeginBulkChange();
        result = RunLong(tr("Importing"), transfer);
        model->EndBulkChange();
    }
    ListCtrl->SetRecordForm(DlgView);
    return result;
}

int CNeditViewPane::RunDownload(const std::function<int()>& transfer) {
    const InstrumentProfile::Current current = InstrumentProfile().ReadCurrent();
    const QString source =
        QStringLiteral("%1 on %2 (%3)")
            .arg(QString::fromStdWString(current.instrument), QString::fromStdWString(current.comm),
                 QString::fromStdString(PortsStore().DevicePath(current.comm)));
    DownloadProgressWindow window(*ListCtrl, *Document->GetDeviceManager(), source, this);
    Busy = true;
    emit stateChanged();
    Document->SetProgressSink(&window);
    window.show();
    const int result = transfer();
    Document->SetProgressSink(Progress);
    window.hide();
    Busy = false;
    emit stateChanged();
    return result;
}

int CNeditViewPane::Reduction(const std::function<int()>& reduce) {
    return Reduce(tr("Reducing"), reduce);
}

// ---- Views ---------------------------------------------------------------------------------

void CNeditViewPane::OnNeditRegenerate() {
    const int result = Reduce(tr("Reducing"), [this] {
        Document->Regenerate(ListCtrl);
        return Document->GetDatabase() != nullptr ? 1 : 0;
    });
    DlgView->ClearModified();
    if (result) {
        GraphView->ResetSelectedLine();
        GraphView->ResetExtents();
    }
}

void CNeditViewPane::OnNeditTransfer() {
    const UNeditDatabase* engine = Document->GetDatabase();
    if (engine != nullptr && engine->IsContentModified() &&
        AppMessageBox(Host, Translate(L"Data has been edited. Regenerate before transferring?"),
                      mb::YesNo | mb::IconQuestion) == mb::IdYes) {
        OnNeditRegenerate();
    }
    if (RunLong(tr("Saving to the survey"), [this] { return Document->TransferToJob(); }) == 0)
        return;
    if (SurveyDocument != nullptr) SurveyDocument->UpdateAllViews(nullptr, USurveyDoc::kZoomAll);
}

void CNeditViewPane::OnNeditViewReport() {
    if (!ReportView) {
        ReportView = new UReportView(this);
        ReportView->SetReport(Document->GetNReport());
    } else {
        ReportView->UpdateReport();
    }
    ReportView->show();
    ReportView->raise();
    ReportView->activateWindow();
}

void CNeditViewPane::OnDisplaySettings() {
    UDisplaySettingsDlg dialog(Document->GetNeditSettings());
    if (Host->Run(dialog) != mb::IdOk || !dialog.HasChanged()) return;
    Document->SetModified(1);
    emit titleChanged();
    GraphView->UpdateStyle();
}

void CNeditViewPane::OnObjectInfo(const PlanPick& pick) {
    const UNeditDatabase* database = GraphView->Scene().Database();
    if (database == nullptr) return;
    const InfoContext context{&Document->GetSettings(), SurveyDocument};
    const auto index = static_cast<std::size_t>(pick.index);
    switch (pick.kind) {
        case PlanPick::Kind::Point: {
            POINTDLG dialog(database->GetPointList()[index], context);
            Host->Run(dialog);
            break;
        }
        case PlanPick::Kind::Line: {
            LINEDLG dialog(database->GetLineList()[index], context);
            Host->Run(dialog);
            break;
        }
        case PlanPick::Kind::Arc: {
            ARCDLG dialog(database->GetArcList()[index], context);
            Host->Run(dialog);
            break;
        }
        default:
            break;
    }
    GraphView->setFocus();
}

}  // namespace nedit
