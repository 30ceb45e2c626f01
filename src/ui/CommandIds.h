#pragma once
// The numbered commands of the raw-data window. The numbers are the ones the system has
// always used, so a toolbar layout, a test or a macro that names a command by its number
// keeps working; the desktop's own commands (the job, undo, the window) take the numbers
// the framework has always given them.

namespace nedit::cmd {

// ---- Inserting a record from its template.
constexpr int InsComment = 34623;
constexpr int InsJob = 34617;
constexpr int InsNote = 34618;
constexpr int InsDate = 34619;
constexpr int InsName = 34620;
constexpr int InsUnit = 34621;
constexpr int InsAmode = 34622;
constexpr int InsAtmos = 34625;
constexpr int InsInstru = 34626;
constexpr int InsStn = 34633;
constexpr int InsInsht = 34635;
constexpr int InsBkb = 34638;
constexpr int InsPt = 34760;
constexpr int InsBs = 34637;
constexpr int InsSs = 34636;
constexpr int InsTargetht = 34639;
constexpr int InsOffset = 34640;
constexpr int InsDcorr = 34629;
constexpr int InsAcorr = 34631;
constexpr int InsScale = 34641;
constexpr int InsDrec = 34642;
constexpr int InsSwing = 34643;
constexpr int InsPrism = 34627;
constexpr int InsEdm = 34628;
constexpr int InsEdmConst = 34630;
constexpr int InsRadius = 34645;
constexpr int AdjPtsRecord = 34653;
constexpr int InsImage = 34714;
constexpr int InsSmode = 34644;
constexpr int InsXyz = 34634;
constexpr int InsYxz = 34655;
constexpr int InsPSX = 34656;
constexpr int InsPSN = 34657;

// ---- The document, the job and the files.
constexpr int FileNew = 34609;
constexpr int FileOpen = 34610;
constexpr int FileSave = 34612;
constexpr int FileSaveAs = 34611;
constexpr int Transfer = 8011;
constexpr int Download = 34603;
constexpr int ImportRawfile = 34651;
constexpr int ImportNeutral = 34601;
constexpr int ExportNeutral = 34602;
constexpr int FilePrint = 57607;
constexpr int Exit = 34608;

// ---- Editing the rows.
constexpr int EditCut = 34661;
constexpr int EditCopy = 34660;
constexpr int EditPaste = 34662;
constexpr int EditCutStandard = 57635;
constexpr int EditCopyStandard = 57634;
constexpr int EditPasteStandard = 57637;
constexpr int FindRecord = 34696;
constexpr int NextRecord = 34652;
constexpr int PreRecord = 34705;
constexpr int CommentRecord = 34706;
constexpr int Comment = 34647;
constexpr int Uncomment = 34648;
constexpr int GlobalEdit = 34663;
constexpr int OutputParam = 34605;
constexpr int AbortProcess = 33300;
constexpr int DownloadAbort = 34649;
constexpr int AbortProcessing = 34670;
constexpr int CancelButton = 1201;

// ---- Views and tools.
constexpr int Regenerate = 34615;
constexpr int ViewReport = 34616;
constexpr int ActivateSurveyView = 34687;
constexpr int Traverse = 34606;
constexpr int DelAdjpts = 34654;
constexpr int SurveyCode = 33208;
constexpr int SurveyCodeSettings = 33209;
constexpr int Setcomm = 34607;
/// The display settings of the plan, the list view's message 0x8096 given a menu entry.
constexpr int DisplaySettings = 0x8096;

// ---- The plan's zoom commands.
constexpr int ZoomAll = 55000;
constexpr int ZoomIn = 55001;
constexpr int ZoomOut = 55002;
constexpr int Redraw = 55003;
constexpr int ZoomPrevious = 55004;
constexpr int Pan = 55005;
constexpr int ZoomPoint = 55006;
constexpr int ZoomWindow = 55013;
constexpr int ZoomNext = 55038;
constexpr int ZoomSelection = 55039;

// ---- The desktop's own commands: the job, the document's save, undo, the window.
constexpr int NewJob = 57600;
constexpr int OpenJob = 57601;
constexpr int SaveDocument = 57603;
constexpr int Undo = 57643;
constexpr int Redo = 57644;
constexpr int About = 57664;
constexpr int AppExit = 57665;

}  // namespace nedit::cmd
