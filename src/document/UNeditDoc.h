#pragma once
// A raw-data document: one set of field observations inside a job. It is the record service
// for its records, keeps their text in the "NeutralData" stream of its storage and its plan
// settings in "Settings", owns the engine of its last reduction and the report, and holds the
// report parameters: it is the report's context.
//
// Decisions:
// - A stored stream whose first line is no neutral-file header is still read row by row:
//   the stream was written by this program, and its rows are the user's data.
// - Reading a stream stops at its first empty line, as it always has; when text follows that
//   line the user is told how many lines were not read, so nothing goes unnoticed.

#include <chrono>
#include <memory>
#include <string>
#include <vector>

#include "document/InputStack.h"
#include "document/UNeditSettings.h"
#include "instruments/UDeviceManager.h"
#include "platform/job/UDocument.h"
#include "platform/job/UJobSettings.h"
#include "platform/messages/ProgressSink.h"
#include "platform/storage/UStorage.h"
#include "records/UNeutralFileFormat.h"
#include "report/NeditIni.h"
#include "report/OutParamStruct.h"
#include "report/ReportContext.h"
#include "transfer/PointCodeReader.h"
#include "transfer/TransferReport.h"
#include "traverse/TraverseRoutes.h"

class NamelessCoordinates;
class UListCtrl;
class UNeditDatabase;
class UNeditReport;
class USurveyDoc;

namespace nedit {
class DialogHost;
class RunStage;
}  // namespace nedit

class UNeditDoc : public UDocument, public UNeutralFileFormat, public nedit::ReportContext {
  public:
    static constexpr const wchar_t* kNeutralDataStream = L"NeutralData";
    static constexpr const wchar_t* kSettingsStream = L"Settings";
    /// Stream modes: exclusive read-write to read (18), create-exclusive-write to write (4113).
    static constexpr unsigned kReadMode = nedit::stgm::ShareExclusive | nedit::stgm::ReadWrite;
    static constexpr unsigned kCreateMode =
        nedit::stgm::Create | nedit::stgm::ShareExclusive | nedit::stgm::Write;

    /// A document of `job` (may be null: the defaults of a new job hold). Loads the record
    /// definition, reads the report's column flags from NEDIT.INI and takes the job's units.
    explicit UNeditDoc(USurveyDoc* job, UDocument* parent = nullptr);
    ~UNeditDoc() override;

    // ---- Storage --------------------------------------------------------------------------
    /// Makes the document's storage in `container`; with CreateReport set also its report.
    int CreateDocument(const std::wstring& name, UDocument* container) override;
    /// Opens the document's storage in `container`, or makes it when it is not there.
    int OpenDocument(const std::wstring& name, UDocument* container) override;
    /// Reads the stored rows into `list` through its gate, and the plan settings. 0 without
    /// a "NeutralData" stream, or when the settings cannot be read.
    int Load(UListCtrl* list);
    /// Writes the rows of `list` (or, without one, the text last read or written) into the
    /// streams; the engine's adjusted points, or with `additionPoints` its addition points,
    /// go into the list first. 0 when a stream cannot be written.
    int Save(UListCtrl* list, int additionPoints);
    /// The neutral export: every row and a line feed, UTF-8. 0 when the file cannot be written.
    int Save(const std::wstring& path, const UListCtrl* list) const;
    /// Saves the rows of the document's list, or its last text without one.
    int SaveData() override;
    /// Copies the stored text, read line by line as a file's lines are, and the plan settings
    /// into `target`.
    void CopyDocument(UNeditDoc& target);

    /// The list of the open document: made and loaded on first use.
    UListCtrl& OpenList();
    UListCtrl* GetList() const { return List.get(); }

    // ---- Reductions -------------------------------------------------------------------------
    /// A new engine runs over the rows of `list`; addition points go back into the rows.
    int SetupDataBase(UListCtrl* list);
    /// A new engine runs over a neutral file, read into the document's list.
    int SetupDataBase(const std::wstring& path);
    /// Adds a stage of a higher room (attachments) to every engine this document builds from
    /// now on, after its own route discovery. The stage must outlive the document.
    void AddRunStage(nedit::RunStage* stage) { RunStages.push_back(stage); }
    /// The traverse routes that the last run found, which every engine of the document finds.
    nedit::TraverseRoutes& GetTraverseRoutes() { return Routes; }
    /// Offers to clear the report, then SetupDataBase(list).
    void Regenerate(UListCtrl* list);
    UNeditDatabase* GetDatabase() const { return Database.get(); }
    /// The text of a new record of that type: its key and the fields of its layout.
    std::wstring FormRecBuf(int recordType) const;

    // ---- Save To Survey (UNeditDocTransfer.cpp) ---------------------------------------------
    // The transfer lies beside the engine, not beneath it, so the document hands it the
    // engine's stores: the transfer reads the points, lines and arcs and never the rows.
    /// The stores of the last reduction into the job, asking through the document's host,
    /// with its progress and abort flag. 0 without an engine or a job; else as
    /// nedit::TransferRun::TransferToJob.
    int TransferToJob();
    /// The same for the stores of `engine`, which need not be the document's own; `source`
    /// names them in the job's record of the transfer (empty: the document's name).
    int TransferToJob(const UNeditDatabase& engine, const std::wstring& source = L"");
    /// What the last transfer wrote and left out.
    const nedit::TransferReport& GetTransferReport() const { return LastTransfer; }
    /// How point codes are read for the transfer; the reader must outlive the document. Null
    /// (the default) reads them by the job's code grammar.
    void SetPointCodeReader(const nedit::PointCodeReader* reader) { CodeReader = reader; }

    // ---- Report and its parameters ------------------------------------------------------------
    int CreateNReport();
    void UpdateNReportTitle();
    UNeditReport* GetNReport() const { return NReport.get(); }
    void ClearReport();
    int GetCheckOn(int id) const { return ::GetCheckOn(OutputParameters, id); }
    OutParamStruct& GetOutputParameters() { return OutputParameters; }
    const OutParamStruct& GetOutputParameters() const override { return OutputParameters; }
    int GetPageSize() const { return OutputParameters.PageSize; }
    /// True when the job shows easting before northing.
    bool IsENOrder() const override {
        return Settings.GetCoordinateOrder() == UJobSettings::kEastNorth;
    }
    /// Takes the job's settings again, its units as output units, and tells the report.
    void UpdateDisplaySettings();

    // ---- Plain access ---------------------------------------------------------------------------
    USurveyDoc* GetSurveyDoc() const { return SurveyDoc; }
    UDocument* GetParent() const { return ParentDoc; }
    USurveyDoc* GetSurveyDocument() const override { return SurveyDoc; }
    const UJobSettings& GetSettings() const override { return Settings; }
    const UNeutralFileFormat& GetRecordFormat() const override { return *this; }
    UNeditSettings& GetNeditSettings() { return NeditSettings; }
    const std::wstring& GetNeuFileName() const { return NeuFileName; }
    void SetNeuFileName(const std::wstring& name) { NeuFileName = name; }
    /// The host of the document's messages, and of its list's.
    void SetDialogHost(nedit::DialogHost* host);
    nedit::DialogHost* GetDialogHost() const { return Host; }
    nedit::ProgressSink& GetProgress() { return *Progress; }
    /// Progress and the abort flag go to `sink` from now on (the desktop's progress bar);
    /// null gives the document its own silent sink back. The sink must outlive its use.
    void SetProgressSink(nedit::ProgressSink* sink) { Progress = sink ? sink : &OwnProgress; }
    bool GetAbortProcess() const { return Progress->AbortRequested(); }
    void SetAbortProcess(bool abort);
    bool GetAbortProcessOn() const { return AbortProcessOn; }
    void SetAbortProcessOn(bool on) { AbortProcessOn = on; }
    void SetCreateReport(bool create) { CreateReport = create; }

    // ---- Interactive inputs and the command table -------------------------------------------
    int Push(XInput* input);
    XInput* Pop();
    XInput* Top() const { return InputStack.empty() ? nullptr : InputStack.back(); }
    int SetOption(XInputOption* option);
    XInputOption* GetOption() const { return Option.get(); }
    XInputOption* RemoveOption() { return Option.release(); }
    int IsOptionActive() const { return Option != nullptr || Top() != nullptr; }
    void SetModalOptionActive(int active) { ModalOptionActive = active; }
    void OnAbortModalOption();
    /// Commands for the inputs, with code 0: 1 when handled here, 0 for the base to handle.
    /// `extra` carries a value in or out, as the command's kind says.
    int OnCmdMsg(unsigned id, int code, void* extra);

    // ---- Instruments (UNeditDocImport.cpp, UNeditDocDownload.cpp) ---------------------------
    /// The driver manager, made on first use with the profile's "Survey Code Control" entry.
    UDeviceManager* GetDeviceManager();
    /// Puts another driver manager in place (one that takes its drivers elsewhere).
    void SetDeviceManager(std::unique_ptr<UDeviceManager> manager);
    /// The import mode handed to the drivers: the job's angular unit in bits 0 to 2 (1 ddd.mmss,
    /// 2 degrees, 4 gons), its linear unit in bits 3 to 5 (8 metres, 16 feet, 32 US feet), or
    /// the mode set by SetImportMode.
    unsigned GetImportMode() const;
    /// 0 goes back to the job's units.
    void SetImportMode(unsigned mode) { ImportMode = mode; }
    /// Translates the raw file `path` through the loaded driver into `list`, from row 0 on,
    /// each record treated as a stored row is; the user's abort stops it with the rows read so
    /// far. What the driver says about the data is shown. 0 when the driver does not start.
    int Import(const std::wstring& path, UListCtrl* list);
    /// Receives from the instrument on the open port through the loaded driver into `list`,
    /// writing the raw bytes to `rawPath`, until the data end, the link closes, no record
    /// has come for the time-out period and the driver counts the link dead, or the user
    /// aborts. What arrived stays in the list and the document is marked modified in every
    /// case. 0 only when the driver does not start.
    int Download(const std::wstring& rawPath, UListCtrl* list);
    /// Stops a running transfer and closes the port.
    void AbortDownProcess();
    /// The time without a record after which the driver is asked whether the link is dead.
    static constexpr std::chrono::milliseconds kDownloadTimeOut{10000};
    void SetDownloadTimeOut(std::chrono::milliseconds period) { DownloadTimeOut = period; }

  private:
    /// A record of a driver enters the list at `row` as a stored row does.
    void AddTransferRecord(NamelessCoordinates& coordinates, const std::wstring& record,
                           UListCtrl* list, int row);
    /// What the driver and the link said during a transfer, shown one message each.
    void ShowTransferMessages();
    void TakeJobUnits();
    /// The lines of a stored "NeutralData" stream into `list`, as Load reads them.
    void LoadRows(std::string_view stored, UListCtrl* list);
    int WriteSettingsStream();
    void StartEngine(UListCtrl* list);
    std::unique_ptr<UListCtrl> MakeList();
    /// Process, then the rows that the run adds; CreateContent on success.
    int RunEngine(UListCtrl* list);

    UJobSettings Settings;  // the job's, copied; the record service reads its units here
    USurveyDoc* SurveyDoc;
    UDocument* ParentDoc;
    nedit::DialogHost* Host = nullptr;
    nedit::ProgressSink OwnProgress;
    nedit::ProgressSink* Progress = &OwnProgress;
    std::string NeuText;  // UTF-8; the text of a list other than the document's own
    /// The revision of the document's own list when the stream "NeutralData" held exactly
    /// its rows (read from it or written to it); a save of rows the stream holds writes
    /// nothing again.
    std::uint64_t StoredRevision = ~std::uint64_t{0};
    std::wstring NeuFileName;
    std::unique_ptr<UListCtrl> List;
    std::unique_ptr<UNeditDatabase> Database;
    nedit::TraverseRoutes Routes{*this};
    std::vector<nedit::RunStage*> RunStages;
    std::unique_ptr<UNeditReport> NReport;
    OutParamStruct OutputParameters;
    UNeditSettings NeditSettings;
    nedit::NeditIniGuard IniGuard;
    bool AbortProcessOn = false;
    bool CreateReport = true;
    std::unique_ptr<UDeviceManager> DeviceManager;
    unsigned ImportMode = 0;
    std::chrono::milliseconds DownloadTimeOut = kDownloadTimeOut;
    const nedit::PointCodeReader* CodeReader = nullptr;
    nedit::TransferReport LastTransfer;

    std::vector<XInput*> InputStack;
    std::unique_ptr<XInputOption> Option;
    int ModalOptionActive = 0;
    std::vector<unsigned> OptionIdsA;
    std::vector<unsigned> OptionIdsB;
    int OptionValueA = 0;
    int OptionValueB = 0;
};
