#pragma once
// The window of one open raw-data document and the receiver of its commands. The record
// list and the plan stand side by side above the record form, in splitters: the upper row
// takes four fifths of the height, or all but six lines of text when six fit beneath; the
// list's width comes from the stored window state. Every command of the command table
// that concerns the document arrives here by its number (OnCommand) and turns into a call
// on the document, the list, the plan or a dialog; IsCommandEnabled gives its enabling.
//
// Long work (loading, reduction, import) runs on the main thread with its progress and an
// Abort button in the status bar; meanwhile every command but Abort is disabled and the
// list and the plan ignore the mouse.
//
// Decisions:
// - Every change to the rows can be undone (Ctrl+Z) and redone (Ctrl+Shift+Z), one step
//   per command; an import that replaces all rows starts a new history.
// - A document is named when it is made, so Save stores it under that name and never asks.
// - "Save Data As..." moves the document to the new name with its present rows; the old
//   name keeps what was last saved under it, as a document of its own.
// - A pick in the plan selects the row of the point (a line's end point, an arc's end
//   point) and leaves the picked line or arc selected in the plan.

#include <QPointer>
#include <QString>
#include <QWidget>
#include <functional>
#include <optional>
#include <string>

#include "document/ProfileStore.h"
#include "document/UInstrumentCommands.h"
#include "ui/ListEventFan.h"
#include "ui/PlanScene.h"

class QPrinter;
class QSplitter;
class QUndoStack;
class UListCtrl;
class UNeditDoc;
class USurveyDoc;

namespace nedit {

class FindRecordDialog;
class QtClipboard;
class QtDialogHost;
class QtProgressSink;
class RowEditRecorder;
class UNeditDlgView;
class UNeditGraphView;
class UNeditView;
class UReportView;

class CNeditViewPane : public QWidget, private UTransferView {
    Q_OBJECT
  public:
    /// Asks for a file: to open one (`save` false) or to write one, with a title, a filter
    /// and a starting directory; an empty answer is Cancel. Tests replace the dialog.
    using FileChooser = std::function<QString(bool save, const QString& title,
                                              const QString& filter, const QString& directory)>;
    static constexpr const char* kNeutralFilter =
        "Strandix Neutral Data File(*.neu);;All Files (*)";

    /// A pane on `doc`, whose messages go to `host` and progress to `progress`. Nothing is
    /// loaded until Start.
    CNeditViewPane(UNeditDoc* doc, QtDialogHost* host, QtProgressSink* progress,
                   QWidget* parent = nullptr);
    ~CNeditViewPane() override;

    /// Loads the rows and runs the first reduction, then shows all of the plan.
    void Start();

    UNeditDoc* GetDocument() const { return Document; }
    USurveyDoc* GetSurveyDoc() const { return SurveyDocument; }
    UListCtrl* GetListCtrl() const { return ListCtrl; }
    UNeditView* GetNeditView() const { return ListView; }
    UNeditGraphView* GetGraphView() const { return GraphView; }
    UNeditDlgView* GetDlgView() const { return DlgView; }
    QUndoStack* GetUndoStack() const { return UndoStack; }
    UReportView* GetReportView() const;
    FindRecordDialog* GetFindDialog() const;
    QSplitter* RowSplitter() const { return Rows; }
    QSplitter* ColumnSplitter() const { return Columns; }
    void SetFileChooser(FileChooser chooser) { ChooseFile = std::move(chooser); }

    /// 1 when the pane changed records since the last save or the form did, else 0.
    int GetModifiedFlag() const;
    /// "Raw Data - NAME", with a star while there are unsaved changes.
    QString Title() const;
    bool IsBusy() const { return Busy; }

    /// Carries out a command of the document; false for a command it does not know or
    /// that is disabled.
    bool OnCommand(int id);
    bool IsCommandEnabled(int id) const;

    /// Inserts a record of that type from its template before the first selected row (at
    /// the end without one; after a header line in an empty list), selects it and shows it
    /// in the form. 0 when the definition has no template for the type.
    int Insert_Record(int type);
    /// The first row of a point, side shot or coordinate record named `name`; -1 for none.
    int SearchList(const std::wstring& name) const;
    /// Only `row` selected and focused, in view, shown in the form; the list takes the focus.
    void SetSelectList(int row);
    /// The row of a picked object becomes the selection: the row of its point's name (a
    /// line's end point, an arc's end point) as RecordNameOf gives it. Always 0.
    int SetSelected(const PlanPick& pick);
    /// The name a derived point's record goes by: what follows "RECT-" in a rectangle's
    /// corner, what follows the first '-' of a "CENTER" name, else the name itself.
    static std::wstring RecordNameOf(const std::wstring& name);
    /// With the job's coordinate order 1, the E, N and H parts of a template change places so
    /// that northing comes first; with order 0 the text is given back as it is.
    static std::wstring CheckCoordinateOrder(const std::wstring& record, int order);
    /// Applies the change of "Modified Selected Records" (NEdit_Global_Edit::GetValues) to
    /// `record`; 1 for a record of a type it concerns, else 0.
    int UpdateRecord(std::wstring& record, int mask, const std::wstring& values) const;
    /// The instrument commands of the document; null before the rows are loaded.
    UInstrumentCommands* GetInstrumentCommands() const { return Instruments.get(); }

    /// Imports a neutral file into the document, replacing its rows (the user has agreed).
    bool ImportNeutralFile(const QString& path);
    bool ExportNeutralFile(const QString& path);
    /// Saves the rows into the job; false, with a message, when they cannot be written.
    bool Save();
    /// Prints the rows, page by page as the document's page size says.
    void PrintList(QPrinter& printer) const;
    /// Offers to save unsaved changes; false when the user cancels the close.
    bool CanClosePane();
    /// Lets go of the document and its list, before the pane is deleted: the document may
    /// have a new pane before this one is gone.
    void Detach();

    /// Sizes the splitters as the stored state says, once the pane has its size; a maximised
    /// window keeps the list's width as it is.
    void setInitialPaneSizes(const ProfileStore& profile, bool maximised);
    /// Stores the width of the record list, which a maximised window takes again.
    void SaveListWidth(const ProfileStore& profile) const;
    /// The splitter values of the window state: row 0 height and minimum, column 0 width and
    /// minimum.
    void GetSplitterState(WindowState& state) const;

  signals:
    /// The enabling of some commands may have changed.
    void stateChanged();
    void titleChanged();
    /// "Close": the window should close this pane.
    void closeRequested();
    void contextMenuWanted(const QPoint& global);
    void statusMessage(const QString& text);

  protected:
    void resizeEvent(QResizeEvent* event) override;

  private:
    void ApplyPaneSizes();
    // Commands (PaneCommands.cpp).
    void OnFileSaveAs();
    void OnImportNeutral();
    void OnExportNeutral();
    void OnFilePrint();
    void OnEditCut();
    void OnEditCopy();
    void OnEditPaste();
    void OnNeditFindrecord();
    void OnCommentRecord();
    void OnNeditOutputparam();
    void OnNeditRegenerate();
    /// "Save To Survey": regenerates first when the user wants the edited records, then
    /// writes the stores into the job and tells the job's views to show all of it.
    void OnNeditTransfer();
    void OnNeditViewReport();
    void OnNeditDelAdjpts();
    void OnDisplaySettings();
    void OnEditRecordData(const QString& text, int row);
    void NeditGlobalEdit();
    void OnSetcomm();
    void OnObjectInfo(const PlanPick& pick);

    // What the instrument commands do to the window (UTransferView).
    void BlockMouse(bool block) override;
    void ClearForm() override;
    void ShowNewData() override;
    int Transfer(bool download, const std::function<int()>& transfer) override;
    int Reduction(const std::function<int()>& reduce) override;
    /// The download, with its own window of progress and abort.
    int RunDownload(const std::function<int()>& transfer);

    void BuildLayout();
    void WireList();
    /// Runs long work with progress and abort; gives what the work gives.
    int RunLong(const QString& stage, const std::function<int()>& work);
    /// A run of the engine as long work, with the plan and the report told before and after.
    int Reduce(const QString& stage, const std::function<int()>& run);
    void MarkModified();
    void ClearModified();
    QString AskFile(bool save, const QString& title) const;

    USurveyDoc* SurveyDocument;
    UNeditDoc* Document;
    UListCtrl* ListCtrl = nullptr;
    QtDialogHost* Host;
    QtProgressSink* Progress;
    int ListModified = 0;
    bool Busy = false;
    bool Detached = false;
    /// The stored column of setInitialPaneSizes, until the pane has a size to apply it to.
    std::optional<SplitterColumn> StoredColumn;
    bool SizesPending = false;

    QSplitter* Rows;
    QSplitter* Columns;
    UNeditView* ListView;
    UNeditGraphView* GraphView;
    UNeditDlgView* DlgView;
    QPointer<UReportView> ReportView;
    QPointer<FindRecordDialog> FindDlg;
    QUndoStack* UndoStack;
    RowEditRecorder* Recorder;
    ListEventFan Events;
    std::unique_ptr<QtClipboard> Clipboard;
    std::unique_ptr<UInstrumentCommands> Instruments;
    FileChooser ChooseFile;
};

}  // namespace nedit
