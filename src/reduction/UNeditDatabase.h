#pragma once
// The reduction engine of one raw-data document. It reads the record list into stations,
// targets and measurements, averages them, reduces them to East, North, Height, and keeps
// the points, lines and arcs that result. Its operations live in the source files of the
// stage they belong to: PrepareList.cpp, Averaging.cpp, CoordLookup.cpp, ProcessCoord.cpp,
// the run in UNeditDatabase.cpp. The stores of reduced geometry are classes of codes/
// (PointStore, LineStore, ArcStore) which the engine owns and forwards to (EngineStores.cpp).
//
// A run stays linear in its rows and lean in memory: every name is given a number once, when
// its row is read (NameTable), and whatever belongs to a name (its nodes, its point, its
// coordinate record) is found by that number; nodes live in blocks, not one heap block each;
// the rows are read as UTF-8 views; and the rows are indexed by name once per run (RowIndex)
// for the look-ups that once read every row again.

#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "codes/ArcStore.h"
#include "codes/CodeGeometryHost.h"
#include "codes/LineStore.h"
#include "codes/PointStore.h"
#include "codes/StringAssembly.h"
#include "codes/StringFiling.h"
#include "codes/UCircleCommandMgr.h"
#include "codes/UNeditCircle.h"
#include "codes/USvyCodeCtrl.h"
#include "platform/geometry/UWCircle.h"
#include "platform/geometry/UWRect.h"
#include "platform/text/NameTable.h"
#include "platform/text/TextLines.h"
#include "records/RecordFields.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/CError.h"
#include "reduction/CheckResult.h"
#include "reduction/ObservationModel.h"
#include "reduction/RowIndex.h"
#include "reduction/RunRows.h"
#include "reduction/RunStage.h"
#include "reduction/StationList.h"

class UNeditReport;
class USurveyDoc;

namespace nedit {
class DialogHost;
class ProgressSink;
class RowSource;
}  // namespace nedit

/// Coordinates of a point given by an Xyz record.
struct KnownCoord {
    double East = 0.0;
    double North = 0.0;
    double Height = kNoHeight;
};

/// Instrument height of the last Insht record. It belongs to no engine: it starts at 0 and
/// lives on from one run and one document to the next, as field software has always kept it.
extern double CurInstHt;

class UNeditDatabase : private nedit::CodeGeometryHost {
  public:
    /// The engine of a document: its format service, rows (the record list), job and dialog
    /// host, each of which may be null. `chkCode` is the check code, "*CHK" when empty.
    UNeditDatabase(UNeutralFileFormat* format, nedit::RowSource* rows, USurveyDoc* job,
                   nedit::DialogHost* host, nedit::ProgressSink* progress = nullptr,
                   const std::wstring& chkCode = L"");
    virtual ~UNeditDatabase();
    UNeditDatabase(const UNeditDatabase&) = delete;
    UNeditDatabase& operator=(const UNeditDatabase&) = delete;

    // ---- The run ----------------------------------------------------------------------
    /// A full run. 1 when it reached its end; 0 otherwise.
    int Process();
    /// A quiet re-run on the same engine, without report.
    void Regenerate();
    /// A re-run from given rows, with report output on.
    void Generate(const std::vector<std::wstring>& rows, bool findRoutes);
    /// Keeps a copy of the rows that count as content; IsContentModified compares with it.
    void CreateContent();
    bool IsContentModified() const;
    /// The last error code; when it is not 0 its message is shown first.
    int GetError();
    void SetError(int code) { ErrorCode = code; }
    /// The last error code, without showing its message.
    int GetErrorCode() const { return ErrorCode; }
    void UpdateProgress(unsigned percent, std::wstring_view text);

    /// Adds a stage of a higher room to every run of this engine, after those added before.
    /// The stage must outlive the engine.
    void AddStage(nedit::RunStage* stage) { Stages.push_back(stage); }

    void SetOutput(bool output) { Output = output; }
    bool GetOutput() const { return Output; }
    void SetListCtrlPtr(nedit::RowSource* rows) {
        Rows = rows;
        RowIndexes.clear();
    }
    /// The rows a run reads: while Generate runs, the rows it was given; otherwise those of
    /// the record list. Empty without either.
    nedit::RunRows GetRunRows() const;
    void SetReportPtr(UNeditReport* report) { Report = report; }
    UNeditReport* GetReport() const { return Report; }
    void SetFileName(const std::wstring& name) { FileName = name; }
    const std::wstring& GetFileName() const { return FileName; }
    void InitHeadList();
    void SetMaxMin(const UWRect& extents);
    /// The extents of the last run's points, or of the last good run.
    UWRect GetDocExtents() const { return DocRect; }

    /// Reads a neutral text file (UTF-8 path) into the rows, clearing them first.
    /// Gives 1 when there is at least one row afterwards, else 0. Shows
    /// "Failed to open {1}." or "Neutral file header not found." when it cannot read.
    int LoadNeFile(const std::wstring& path);
    /// The angle type of the current angular unit letter: 1 decimal degrees, 2 gons, else 0.
    int GetAngleType() const;
    /// The pane, when there is one, learns the angle type of each unit record read.
    void SetAngleTypeHandler(std::function<void(int)> handler) {
        AngleTypeHandler = std::move(handler);
    }

    // ---- List preparation -------------------------------------------------------------
    int PrepareList();
    int PrepareList(const std::vector<std::wstring>& rows);
    int ProcessRecord(int type, const std::wstring& row, int recordNo);
    /// The field from the record in hand, or its current value when absent or empty.
    /// Valid until the next record is parsed. A record is in hand only while the rows are
    /// read; after that every field gives its current value.
    const std::wstring& GetValue(int id) const;
    /// Appends `station`, a node of this engine's (the station in hand, or one this engine
    /// made), to the list, with the current modes and units.
    int InsertStn(STNSTRUCT* station, int makeCurrent);
    /// Files `target` with `measurement` under the station in hand: a target of that name in
    /// the list takes over its code and record number and gains the measurement; a new name
    /// is appended. 0 without a station in hand.
    int InsertSSMS(const SSSTRUCT& target, const MEASSTRUCT& measurement, int isBackSight);
    int CopySS(const SSSTRUCT& from, SSSTRUCT& to) const;
    int DummyStn(const STNSTRUCT& station) const;
    int AddToFSptr(STNSTRUCT* station, SSSTRUCT* target);
    int AddReverseFSptr(STNSTRUCT* station, SSSTRUCT* target);
    int PrepareForwardNoBS();
    int PrepareForwardWithBS();
    int AddForwPtr(const std::wstring& name);
    int AddNewStn(const std::wstring& name);
    int DeleteForwPtr();
    int DeleteList();
    int GetListCount(int& stations, int& sideShots, int& forward) const;
    /// The first station of that exact name that is not a point-only node, or null.
    STNSTRUCT* searchSTN(std::wstring_view name) const;
    /// All such stations, the names compared without regard to case.
    int SearchSTN(const std::wstring& name, std::vector<STNSTRUCT*>& out) const;
    void InitUnitsAndAngleModes();
    double GetStnScaleFactor(const std::wstring& name) const;

    /// The station list, point-only nodes included, in its order.
    StationList GetStations() const {
        return StationList(Setups, PointNodes, Nodes, Names, Codes, ModeSets);
    }
    STNSTRUCT* GetCurStn() const { return CurStn; }
    SSSTRUCT* GetCurrentSS() const { return CurSS; }
    wchar_t GetHMode() const { return HMode; }
    wchar_t GetVMode() const { return VMode; }
    wchar_t GetAngleUnit() const { return AngleUnit; }
    wchar_t GetLengthUnit() const { return LengthUnit; }
    USurveyDoc* GetSurveyDoc() const { return SurveyDoc; }
    void SetCurHMode(wchar_t mode) { HMode = mode; }
    void SetTravFlag(int flag) { TravFlag = flag; }
    /// The text that marks a check shot in a code; empty while no code settings are loaded.
    const std::wstring& GetChkShotCode() const { return ChkShotCode; }
    const std::wstring& GetDateText() const { return DateText; }

    // ---- Averaging --------------------------------------------------------------------
    int ProcessAverageMeas();
    int ProcessAverageAngle();
    int FindAverageMeas(const MeasurementList& measurements, double& hAng, double& vAng,
                        double& sDist, double& htTarget) const;
    static int CheckFace(double zenith);
    static double chgface(double hAng);
    static double chgVaface(double zenith);
    static double AngleDiff(double from, double to);
    static double chgDeg(double dddmmss);

    // ---- Coordinate lookup and bearing store ------------------------------------------
    int findCoord(const std::wstring& name, double& e, double& n, double& z, std::wstring& code,
                  int fix, bool askUser);
    int getCoord(const std::wstring& name, double* e, double* n, double* z, std::wstring& code,
                 int clear, bool showDialog);
    /// setCoord's `flags`: write over the stations of that name whose coordinates are known
    /// already; without it such a station keeps them and only the point is saved.
    static constexpr int kSetCoordOverwrite = 8;
    int setCoord(const std::wstring& name, double e, double n, double z, const std::wstring& code,
                 int flags, int fix, int ptFlag);
    int GetCoordFromStnList(const std::wstring& name, double& e, double& n, double& z,
                            std::wstring& code) const;
    /// 1 when the job has the point and it loads, with its values and code.
    int GetCoordFromSvyDoc(const std::wstring& name, double& e, double& n, double& z,
                           std::wstring& code) const;
    /// The names for which the user took the job's coordinates in this run.
    const std::set<std::wstring, std::less<>>& GetDbCoordNames() const { return DbCoordNames; }
    /// The job has a point of that name (whether or not it loads).
    bool JobHasPoint(const std::wstring& name) const;
    /// Coordinates are shown Easting first: the job's setting, and so without a job.
    bool CoordsOrderXY() const;
    int GetPointFromPtList(const std::wstring& name, double& e, double& n, double& z,
                           std::wstring& code, unsigned mode) const;
    /// The first Xyz or Yxz row of that name in the engine's rows, its values in `e`, `n`,
    /// `z`; gives the row, or -1.
    int FindXYZ(const std::wstring& name, double& e, double& n, double& z);
    /// The same in other rows.
    int FindXYZ(const nedit::RowSource& rows, const std::wstring& name, double& e, double& n,
                double& z);
    int FindRecord(int type, const std::wstring& name);
    std::wstring FormatXYZRecord(const std::wstring& name, double e, double n, double z) const;
    std::wstring FormatBKBRecord(const std::wstring& name, double reading, double bearing) const;
    double GetBearingFromArray(std::wstring from, std::wstring to) const;
    int GetBearingArray(const std::wstring& from, const std::wstring& to, int& direction) const;
    int InsertBearingArray(std::wstring from, std::wstring to, double bearing);
    int LoadBearingArray();
    int SaveBearingArray() const;
    int DeleteBearingArray();
    /// The bearing store's file: the neutral file's name with ".$BR" for its extension.
    std::wstring BearingFileName() const;
    const std::vector<ULINEBEAR_STRUCT>& GetLineBearings() const { return LineBearings; }

    // ---- Reduction --------------------------------------------------------------------
    /// ProcessCoord's passes, bits that may be combined: the forward observations, which
    /// position later stations, and the side shots. A run makes both.
    static constexpr int kForwardPass = 2;
    static constexpr int kSideShotPass = 4;
    static constexpr int kAllPasses = kForwardPass | kSideShotPass;
    int ProcessCoord(int passes, int report, int fixedOnly, std::vector<std::wstring>* records);
    /// A station has side shots, points or check shots whose lines the report prints.
    bool HaveSideshotsToReport(const STNSTRUCT* station,
                               const std::vector<std::wstring>* records) const;
    static void geo_coord(double e, double n, double bearing, double dist, double* eOut,
                          double* nOut);
    static void ApplyOffsets(double& e, double& n, double& z, double along, double right, double up,
                             double bearing);

    // ---- Point, line and arc stores ---------------------------------------------------
    /// SavePoint's `flags`: the caller is a PT record.
    static constexpr unsigned kSaveFromPTRecord = 2u;
    unsigned SavePoint(const std::wstring& name, double x, double y, double z, std::wstring code,
                       int ptFlag, unsigned flags, int derived);
    unsigned SaveTravPoint(const std::wstring& name, double x, double y, double z,
                           const std::wstring& code, int additionFlag);
    int SaveLine(unsigned from, unsigned to, int stationLine);
    int SaveArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third, ArcType type);
    void DeleteTopoLines();
    void SetMinMaxCoord();

    int GetPointIdx(const std::wstring& name) const;
    int GetAddPointIdx(const std::wstring& name) const;
    int GetTravPointIdx(const std::wstring& name) const;
    UNeditPt* SearchPt(const std::wstring& name);
    UNeditPt* GetLastPoint();
    bool GetPtNameAt(int index, std::wstring& name) const;
    int GetLineIdx(const std::wstring& a, const std::wstring& b) const;
    int Check_In_LnList(const std::wstring& name) const;
    int SearchArc(const std::wstring& a, const std::wstring& b, const std::wstring& third,
                  ArcType type) const;

    // ---- Images, attributes and notes (Attachments.cpp) ---------------------------------
    /// The walks below that the rows have records for; Process calls it last.
    void ProcessAttachments();
    int ProcessImages();
    int ProcessPointAttributes();
    int ProcessPointNotes();

    // ---- Derived points back into the rows --------------------------------------------
    /// Writes the adjusted points as XYZ rows behind the marker row, making the marker when
    /// there is none. 1 when rows were written.
    int SaveAdjustedPt2CtrlList(nedit::RowSource* list);
    /// Writes the addition points (coordinates the user or the job gave) as XYZ rows in the
    /// file's unit above the marker, replacing a row of the same name whose values differ.
    int SaveAdditionPt2CtrlList(nedit::RowSource* list);
    /// Forgets the adjusted points and deletes the rows from the lowest marker down.
    void DelAdjPts();
    void ClearAddPtList();
    /// The positions of the last adjusted route become the traverse points, which the
    /// re-reduction of side shots leaves where the adjustment put them. Null forgets them.
    void UpdateTraversePoints(const std::vector<UNeditPt>* route);
    /// The name is one of the traverse points, compared without regard to case.
    bool IsTraversePoint(std::wstring_view name) const;
    /// When `point`'s name is a traverse point: `point` becomes it (its name, position, no
    /// code, no flags) and true is given.
    bool GetTraversePoint(UNeditPt& point) const;

    const std::vector<UNeditPt>& GetPointList() const { return PointList.Items(); }
    const std::vector<UNeditPt>& GetAddPtList() const { return AddPtList.Items(); }
    const std::vector<UNeditLine>& GetLineList() const { return LineList.Items(); }
    const std::vector<UNeditArc>& GetArcList() const { return ArcList.Items(); }
    const std::vector<UNeditCircle>& GetCircleList() const { return CircleList; }

    // ---- Field codes: strings, shapes, circles (EngineCodes.cpp) -----------------------
    /// Takes the code grammar from the job's settings (the defaults without a job) and the
    /// check code from it.
    int LoadSvyCodeCtrl();
    const USvyCodeCtrl& GetSvyCodeCtrl() const { return SvyCodeCtrl; }
    /// Files a reduced point under every group of its code.
    void Arrange_SS_String(const std::wstring& code, const std::wstring& name);
    /// Files the points of PT records, by name, under their codes.
    void Arrange_PT_String(const std::vector<std::wstring>& names) {
        ArrangePtNames(names.data(), names.data() + names.size());
    }
    /// Turns the strings into lines and arcs.
    void ProcessString();
    /// Offers a saved point to the circle commands.
    void ProcessCircle(unsigned index, const std::wstring& code);
    void ResetCircleData();
    /// Offsets written in a target's code ("@along,right,up") replace the record's, each only
    /// when it is not zero. 1, as the code control is always there.
    int Process_Code_Offsets(SSSTRUCT& target) const;
    /// Prints the codes that no library defines.
    void PrintUnDefineCode();
    /// The name of the known point written behind the check code ("*CHK P12" gives P12);
    /// false, leaving `name` alone, when there is none.
    bool GetChkPtName(const std::wstring& code, std::wstring& name) const;
    /// The check shots of the last run with a report, in the order they were printed.
    const std::vector<CheckResult>& GetChecks() const { return CheckResults; }
    const std::vector<CStrNoList>& GetStrings() const { return Strings.Strings(); }
    const std::map<std::wstring, int>& GetUndefinedCodes() const {
        return Strings.UndefinedCodes();
    }
    /// Codes the run could not turn into the geometry they ask for, in the order met.
    const std::vector<std::wstring>& GetCodeNotices() const { return CodeNotices; }

    /// The messages of the coordinate dialogs go to this host; null answers by default.
    nedit::DialogHost* GetDialogHost() const { return Host; }

  private:
    // The engine's side of the string filing and assembly (EngineCodes.cpp).
    int PointIndex(const std::wstring& name) const override;
    const UNeditPt& PointAt(unsigned index) const override;
    unsigned SaveDerivedPoint(const std::wstring& name, double x, double y,
                              const std::wstring& code) override;
    int SaveStringLine(unsigned from, unsigned to, const std::wstring& code,
                       const std::wstring& stringName) override;
    void SaveStringArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                       ArcType type) override;
    double CodeDistance(double value) const override;
    bool StopRequested() const override { return AbortRequested(); }
    void StringProgress(unsigned percent) override;
    void CodeNotice(const std::wstring& text) override;
    void ArrangePtNames(const std::wstring* first, const std::wstring* last);
    /// One message naming every code the run could not turn into its geometry.
    void ShowCodeNotices(bool printing);
    /// The feature code and the string name a line or arc of a point's code takes.
    void CodeOfLinework(const std::wstring& pointCode, std::wstring& code,
                        std::wstring& stringName) const;
    /// Layer, colour, line type and thickness of a code, from the job's library.
    void ApplyCodeLook(const std::wstring& code, UNeditLinework& linework) const;

    /// Calls take(type, false) for each row with a record type: true asks for the record to
    /// be parsed, and take(type, true) follows with its fields in hand.
    template <typename Take>
    void EachRecord(Take take);
    // Check shots (CheckShots.cpp).
    bool IsCheckShot(int type, std::wstring_view code) const;
    void TakeCheckShot(const SSSTRUCT& target, const MEASSTRUCT& measurement);

    bool AbortRequested() const;
    void RunStages(nedit::RunStep step);
    void ResetForRerun();
    void ResetPassValues();
    template <typename RowAt>
    int PrepareRows(std::size_t count, RowAt rowAt);
    int ReadRecord(int type, std::string_view row, int recordNo);
    /// The value of a field of the record in hand, or its current value when absent or
    /// empty; and the record's own value alone (empty when absent), for names, codes and the
    /// fields whose emptiness a record type gives a meaning to.
    RecordValue Value(int id) const;
    RecordValue OwnValue(int id) const;
    double Number(int id) const { return Value(id).Number(); }
    /// The id of a name or code given in a record.
    NameId NameOf(const RecordValue& value);
    NameId NameOf(std::wstring_view name) { return Names.Intern(name); }
    /// The same for codes, which have a table of their own: few and often repeated.
    NameId CodeOf(const RecordValue& value);
    NameId CodeOf(std::wstring_view code) { return Codes.Intern(code); }
    std::wstring_view CodeText(NameId id) const {
        return id == kNoName ? std::wstring_view() : Codes.Name(id);
    }
    void ProcessPtRecord();
    void ProcessStnRecord();
    void ProcessBkbRecord();
    void ProcessObservation(int type, int recordNo);
    void ApplyDistanceCorrection(MEASSTRUCT& measurement) const;
    double StnScaleFactor(NameId station) const;

    // The nodes: stations and reverse nodes in Setups, point-only nodes in PointNodes, and
    // the list's order in Nodes, each entry with the next node of its name.
    STNSTRUCT& NewSetup();
    SSSTRUCT& NewTarget();
    MeasurementList* NewMeasurements();
    void AppendNode(std::uint32_t ref, NameId name);
    void AppendSetup(STNSTRUCT& station);
    void AppendPointNode(NameId name, double e, double n, double z, NameId code);
    /// The number of the set of the modes and units in force now.
    std::uint32_t ModesNow();
    /// The first node of that name in the list, or NodeEntry::kNone.
    std::uint32_t FirstNodeOf(NameId name) const;
    STNSTRUCT* FirstSetupOf(NameId name) const;
    std::vector<STNSTRUCT*> OccupiedStations(NameId name, const STNSTRUCT* observer) const;
    /// The coordinates of a node that knows them, its code and fix value; for a node that
    /// does not, only its code, and false.
    bool NodeCoordinates(std::uint32_t node, double& e, double& n, double& z, std::wstring& code,
                         int& fixed) const;
    void AppendForward(STNSTRUCT& station, const SSSTRUCT& target);

    // The coordinate sources by name id (CoordLookup.cpp).
    int FindCoordOf(NameId name, double& e, double& n, double& z, std::wstring& code, int fix,
                    bool askUser);
    int GetCoordOf(NameId name, double* e, double* n, double* z, std::wstring& code, int clear,
                   bool showDialog);
    int SetCoordOf(NameId name, double e, double n, double z, std::wstring_view code, int flags,
                   int fix, int ptFlag);
    int PointOf(NameId name) const;
    int PointFromPtList(NameId name, double& e, double& n, double& z, std::wstring& code,
                        unsigned mode) const;
    const KnownCoord* KnownCoordOf(NameId name) const;
    unsigned SavePointOf(NameId name, double x, double y, double z, std::wstring_view code,
                         unsigned flags, int derived);
    /// Indexes the point list by name id again, after it was thinned.
    void IndexPoints();
    /// The text of a code as the points of that code share it.
    const std::shared_ptr<const std::wstring>& SharedCode(NameId code);

    // The rows by name (RowIndex), kept true as the engine writes rows. The index of the
    // coordinate types Xyz and Yxz goes by kCoordinateRows, the others by their type.
    static constexpr int kCoordinateRows = 0;
    RowIndex& IndexOf(const nedit::RowSource& rows, int type);
    /// Indexes of rows other than the engine's own are kept only for one operation.
    void ForgetOtherRows();
    int FindCoordinateRow(const nedit::RowSource& rows, const std::wstring& name, int type,
                          double* e, double* n, double* z);
    int AppendRow(nedit::RowSource& rows, const std::wstring& text);
    int InsertRow(nedit::RowSource& rows, int row, const std::wstring& text);
    void ReplaceRow(nedit::RowSource& rows, int row, const std::wstring& text);
    void RowsWritten(const nedit::RowSource& rows);
    nedit::TextLines ContentRows() const;

    // Reduction of one station, and of one target with its printing (ProcessCoord.cpp).
    struct StationWork;
    /// Results of PositionStation.
    enum { kPositionFound, kPositionNotFound, kStationLeftOut, kPositionFailed };
    int PositionStation(STNSTRUCT& station, StationWork& work, int report, int fixedOnly);
    int OrientByCoordinates(STNSTRUCT& station, StationWork& work);
    void AskBackStation(const STNSTRUCT& station, StationWork& work, const UWPoint& here);
    void ReduceTarget(const STNSTRUCT& station, SSSTRUCT& target, const StationWork& work,
                      double& e, double& n, double& z) const;
    int ForwardPass(STNSTRUCT& station, StationWork& work, int report);
    int SideShotPass(STNSTRUCT& station, StationWork& work, int report);
    bool IsSelfObservation(const STNSTRUCT& station, const SSSTRUCT& target) const;
    // The report's part of the walk; called only with a report and reporting on.
    void ProcessChkShot(const SparseList<SSCheck>& checks, const STNSTRUCT& station,
                        const StationWork& work);
    void PrintChkShot(const STNSTRUCT& station, const StationWork& work, const SSCheck& check);
    void PrintRunHead();
    void PrintStationBlock(const STNSTRUCT& station, const StationWork& work);
    void PrintTarget(const STNSTRUCT& station, const SSSTRUCT& target, double e, double n, double z,
                     bool forward);

    // Collaborators.
    UNeutralFileFormat* Doc;
    UNeditReport* Report = nullptr;
    nedit::RowSource* Rows;
    USurveyDoc* SurveyDoc;
    nedit::DialogHost* Host;
    nedit::ProgressSink* Progress;
    CError ErrorSink;
    std::function<void(int)> AngleTypeHandler;
    std::vector<nedit::RunStage*> Stages;
    std::wstring FileName;

    // Running values of a pass.
    wchar_t HMode = L'A';
    wchar_t VMode = L'Z';
    wchar_t AngleUnit = L'S';
    wchar_t LengthUnit = L'M';
    int TravFlag = 0;
    RecordFields Fields;             // of the record in hand
    mutable std::wstring ValueText;  // GetValue's text
    std::wstring NameBuffer;         // a name on its way into the table
    double ScaleFactor = 1.0;
    double PrismConst = 0.0;
    double FirstSwing = 0.0;
    double CurSwing = 0.0;
    double HCorr = 0.0;
    double VCorr = 0.0;
    std::wstring DateText;
    double Refraction = 0.0;
    double EarthRadius = 0.0;
    bool CorrectDist = false;
    std::wstring ChkShotCode;
    std::wstring ChkCode;
    bool Output = false;
    int ErrorCode = 0;
    nedit::TextLines ContentLines;
    const std::vector<std::wstring>* GivenRows = nullptr;  // Generate's rows, while it runs

    // The observation model. Names and codes keep their ids for the life of the engine.
    nedit::NameTable Names;
    nedit::NameTable Codes;
    std::deque<STNSTRUCT> Setups;
    std::vector<PointNode> PointNodes;
    std::vector<ModeSet> ModeSets;
    std::vector<NodeEntry> Nodes;
    std::vector<std::uint32_t> FirstNodeOfName;  // by name id, into Nodes
    std::vector<std::uint32_t> LastNodeOfName;
    std::deque<SSSTRUCT> Targets;
    std::deque<MeasurementList> Measurements;
    // Where the station in hand filed a target of a name, by name id: the station's number in
    // the pass and the target; so a repeated observation finds its target at once.
    struct FiledTarget {
        std::uint32_t Station = NodeEntry::kNone;
        SSSTRUCT* Target = nullptr;
    };
    std::vector<FiledTarget> FiledBackSights;
    std::vector<FiledTarget> FiledSideShots;
    std::uint32_t StationsOpened = 0;
    bool Filing = false;          // the rows are being read
    STNSTRUCT* CurStn = nullptr;  // the station being filled, or the last one of a pass
    bool CurStnPending = false;   // CurStn is not in the list yet
    SSSTRUCT* CurSS = nullptr;
    std::unique_ptr<std::vector<std::wstring>> CurPtNames;
    std::unique_ptr<std::vector<SSCheck>> CurChkList;
    std::unordered_map<NameId, KnownCoord> KnownCoordMap;
    std::unordered_map<NameId, double> StnScaleMap;

    // Coordinate sources and the bearing store.
    std::set<std::wstring, std::less<>> DbCoordNames;
    std::set<std::wstring, std::less<>> LocalCoordNames;
    bool UseForAll = false;
    std::vector<ULINEBEAR_STRUCT> LineBearings;
    std::unordered_map<std::wstring, std::size_t> BearingIndex;  // "from\x1fto" as stored

    // The rows by name, for the record types looked up in them (one index for Xyz and Yxz).
    std::map<int, RowIndex> RowIndexes;
    std::map<int, RowIndex> OtherRowIndexes;  // of rows other than the engine's own
    const nedit::RowSource* OtherRows = nullptr;

    // Stores of reduced geometry, the points also by name id.
    nedit::PointStore PointList;
    std::vector<std::int32_t> PointOfName;
    std::vector<std::shared_ptr<const std::wstring>> CodeTexts;  // by code id
    nedit::PointStore AddPtList;
    nedit::PointStore TravPtList;
    // The last adjusted route's points, and their names upper-cased for the look-up.
    std::vector<UNeditPt> TravPtNames;
    std::unordered_set<std::wstring> TravPtKeys;
    nedit::LineStore LineList;
    nedit::ArcStore ArcList;
    std::vector<UNeditCircle> CircleList;

    // Field codes.
    USvyCodeCtrl SvyCodeCtrl;
    nedit::StringFiling Strings{SvyCodeCtrl, SurveyDoc, *this};
    nedit::StringAssembly Assembly{SvyCodeCtrl, *this};
    UCircleCommandMgr CircleMgr;
    std::unordered_set<int> CirclePoints;
    std::vector<std::wstring> CodeNotices;
    std::vector<CheckResult> CheckResults;
    double XMin = -1e12, YMin = -1e12, XMax = -1e12, YMax = -1e12;
    unsigned LastPercent = 1000;  // none reported yet
    std::wstring LastProgressText;
    UWRect DocRect{0.0, 0.0, 100.0, 100.0};
};
