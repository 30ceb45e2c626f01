#include "ui/CommandTable.h"

#include <algorithm>
#include <unordered_map>

#include "records/RecordTypes.h"
#include "ui/CommandIds.h"

namespace nedit {

namespace {

constexpr Enabling kAlways = Enabling::Always;
constexpr Enabling kIdle = Enabling::WhenIdle;

CommandInfo Separator(const char* menu) {
    CommandInfo info;
    info.menu = menu;
    return info;
}

CommandInfo Command(int id, const char* menu, const char* text, Enabling enabling, const char* tip,
                    const char* shortcut = nullptr) {
    CommandInfo info;
    info.id = id;
    info.menu = menu;
    info.text = text;
    info.enabling = enabling;
    info.tip = tip;
    info.shortcut = shortcut;
    return info;
}

CommandInfo Insert(int id, const char* menu, const char* text, int type, const char* toolText,
                   Enabling enabling = kIdle) {
    CommandInfo info = Command(id, menu, text, enabling,
                               "Insert a record of this kind before the "
                               "selected row");
    info.recordType = type;
    info.toolText = toolText;
    return info;
}

CommandInfo Unbuilt(CommandInfo info) {
    info.available = false;
    info.tip = kNotAvailableTip;
    return info;
}

CommandInfo Job(CommandInfo info) {
    info.needsDocument = false;
    return info;
}

std::vector<CommandInfo> MakeCommands() {
    using namespace cmd;
    const char* const kFile = "File";
    const char* const kEdit = "Edit";
    const char* const kInsert = "Insert";
    const char* const kHeader = "Insert/Header Record";
    const char* const kStation = "Insert/Station Record";
    const char* const kMeasurement = "Insert/Measurement Record";
    const char* const kMisc = "Insert/Miscellaneous";
    const char* const kView = "View";
    const char* const kTools = "Tools";
    const char* const kLibrary = "Library";
    const char* const kHelp = "Help";
    return {
        Job(Command(NewJob, kFile, "New Job...", kAlways, "Make a new job file", "Ctrl+Shift+N")),
        Job(Command(OpenJob, kFile, "Open Job...", kAlways, "Open a job file", "Ctrl+O")),
        Separator(kFile),
        Job(Command(FileNew, kFile, "New", kAlways, "Make a new raw-data document in the job",
                    "Ctrl+N")),
        Job(Command(FileOpen, kFile, "Open...", kIdle, "Open a raw-data document of the job")),
        Command(SaveDocument, kFile, "Save", kAlways, "Save the document's records in the job",
                "Ctrl+S"),
        Command(FileSaveAs, kFile, "Save Data As...", kAlways,
                "Save the document under another name in the job"),
        Separator(kFile),
        Command(Transfer, kFile, "Save To Survey", kIdle,
                "Write the reduced points, lines, arcs and strings into the job"),
        Separator(kFile),
        Command(Download, kFile, "Download Raw Data...", kIdle,
                "Receive the records of a total station or data recorder over a serial port"),
        Command(ImportRawfile, kFile, "Import Raw Data File...", kIdle,
                "Read an instrument's raw file into the document, replacing its records"),
        Command(ImportNeutral, kFile, "Import Neutral File...", kIdle,
                "Read a neutral file into the document, replacing its records", "Ctrl+I"),
        Command(ExportNeutral, kFile, "Export Neutral File...", kAlways,
                "Write the document's records to a neutral file", "Ctrl+E"),
        Separator(kFile),
        Command(FilePrint, kFile, "Print...", kAlways, "Print the records", "Ctrl+P"),
        Separator(kFile),
        Command(Exit, kFile, "Close", kIdle, "Close the document", "Ctrl+W"),
        Job(Command(AppExit, kFile, "Exit", kAlways, "Close the job and leave the program",
                    "Ctrl+Q")),

        Command(Undo, kEdit, "Undo", kAlways, "Undo the last change to the records", "Ctrl+Z"),
        Command(Redo, kEdit, "Redo", kAlways, "Redo the change undone last", "Ctrl+Shift+Z"),
        Separator(kEdit),
        Command(EditCut, kEdit, "Cut", kIdle, "Move the selected rows to the clipboard", "Ctrl+X"),
        Command(EditCopy, kEdit, "Copy", kIdle, "Copy the selected rows to the clipboard",
                "Ctrl+C"),
        Command(EditPaste, kEdit, "Paste", kIdle, "Insert the copied rows before the selected row",
                "Ctrl+V"),
        Separator(kEdit),
        Command(FindRecord, kEdit, "Find", kIdle, "Find text in the records", "Ctrl+F"),
        Command(NextRecord, kEdit, "Next", kIdle, "Select the next record of the same type",
                "Ctrl+Down"),
        Command(PreRecord, kEdit, "Previous", kIdle, "Select the previous record of the same type",
                "Ctrl+Up"),
        Command(CommentRecord, kEdit, "Comment/Uncomment", kIdle,
                "Comment out the selected records, or take the comment away", "Ctrl+/"),
        Separator(kEdit),
        Command(GlobalEdit, kEdit, "Edit Selected Records", Enabling::WhenSelection,
                "Change the code or height of every selected record at once"),
        Command(OutputParam, kEdit, "Report Parameters", kIdle,
                "Choose the units and columns of the reduction report"),

        Insert(InsComment, kInsert, "Comment", rec::Comment, nullptr),
        Insert(InsJob, kHeader, "Job", rec::Job, nullptr),
        Insert(InsNote, kHeader, "Note", rec::Note, nullptr),
        Insert(InsDate, kHeader, "Date", rec::Date, nullptr),
        Insert(InsName, kHeader, "Name", rec::Name, nullptr),
        Insert(InsUnit, kHeader, "Unit", rec::Unit, nullptr),
        Insert(InsAmode, kHeader, "Angular Mode", rec::Amode, nullptr),
        Insert(InsAtmos, kHeader, "Temperature & Pressure", rec::Atmos, nullptr),
        Insert(InsInstru, kHeader, "Instrument ID", rec::Instru, nullptr),
        Insert(InsStn, kStation, "Station Name", rec::Stn, "STN"),
        Insert(InsInsht, kStation, "Instrument Height", rec::Insht, "HI"),
        Insert(InsBkb, kStation, "Back Sight Station", rec::Bkb, "BKB"),
        Insert(InsPt, kInsert, "Point Record", rec::Pt, "PT", kAlways),
        Insert(InsBs, kMeasurement, "Back Sight", rec::Bs, "BS"),
        Insert(InsSs, kMeasurement, "Side Shot", rec::Ss, "SS"),
        Insert(InsTargetht, kMeasurement, "Target Height", rec::Targetht, "HT"),
        Insert(InsOffset, kMeasurement, "Offsets", rec::Offset, "OFS"),
        Insert(InsDcorr, kMisc, "Distance Correction", rec::Dcorr, nullptr),
        Insert(InsAcorr, kMisc, "Angular Correction", rec::Acorr, nullptr),
        Insert(InsScale, kMisc, "Scale Factor", rec::Scale, nullptr),
        Insert(InsDrec, kMisc, "Data Recorder Type", rec::Drec, nullptr),
        Insert(InsSwing, kMisc, "Swing Angle", rec::Swing, nullptr),
        Insert(InsPrism, kMisc, "Prism Constant", rec::Prism, nullptr),
        Insert(InsEdm, kMisc, "EDM Type", rec::Edm, nullptr),
        Insert(InsEdmConst, kMisc, "EDM Constant", rec::EdmConst, nullptr),
        Insert(InsRadius, kMisc, "Radius", rec::Radius, nullptr),
        Insert(AdjPtsRecord, kMisc, "Adjusted Point Header", rec::AdjPts, nullptr),
        Insert(InsImage, kMisc, "Image", rec::Image, nullptr),
        Insert(InsSmode, nullptr, "Insert Record", rec::Smode, nullptr),
        Insert(InsXyz, nullptr, "Insert Record", rec::Xyz, nullptr),
        Insert(InsYxz, nullptr, "Insert Record", rec::Yxz, nullptr),
        Insert(InsPSX, nullptr, "Insert Record", rec::PSX, nullptr),
        Insert(InsPSN, nullptr, "Insert Record", rec::PSN, nullptr),

        Command(Regenerate, kView, "Regenerate View", kIdle,
                "Reduce the records again and redraw the plan", "F5"),
        Command(ViewReport, kView, "Report", kIdle, "Show the reduction report", "F6"),
        Unbuilt(Command(ActivateSurveyView, kView, "Survey", kAlways, "")),
        Separator(kView),
        Command(ZoomAll, kView, "Zoom All", kAlways, "Show the whole survey", "Home"),
        Command(ZoomIn, kView, "Zoom In", kAlways, "Zoom in on the middle of the plan", "Ctrl++"),
        Command(ZoomOut, kView, "Zoom Out", kAlways, "Zoom out from the middle of the plan",
                "Ctrl+-"),
        Command(ZoomWindow, kView, "Zoom Window", kAlways,
                "Drag a rectangle on the plan to zoom into it"),
        Command(ZoomPrevious, kView, "Zoom Previous", kAlways, "Go back to the view before"),
        Command(ZoomNext, kView, "Zoom Next", kAlways, "Go forward to the view after"),
        Command(Pan, kView, "Pan", kAlways, "Drag the plan with the left button"),
        Command(ZoomPoint, kView, "Zoom a Point", kAlways,
                "Zoom to a point, picked or by its number, at a scale"),
        Command(ZoomSelection, kView, "Zoom Selected", kAlways,
                "Bring the selected point, line or arc into the middle of the plan"),
        Command(Redraw, kView, "Redraw", kAlways, "Draw the plan again"),
        Separator(kView),
        Command(DisplaySettings, kView, "Display Settings...", kAlways,
                "Choose the labels and text size of the plan"),

        Unbuilt(Command(Traverse, kTools, "Traverse Adjustment", kIdle, "")),
        Command(DelAdjpts, kTools, "Delete Adjusted Pts", kIdle,
                "Delete the adjusted points from the records"),
        // The port settings have no menu of their own in the raw-data window; the desktop
        // gives them one here, where the instrument's other settings are looked for.
        Separator(kTools),
        Command(Setcomm, kTools, "Port Settings...", kIdle,
                "Set the baud rate, data bits, stop bits, parity and flow control of a port"),
        Unbuilt(Command(SurveyCode, kLibrary, "Survey Codes", kAlways, "")),
        Unbuilt(Command(SurveyCodeSettings, kLibrary, "Code Settings", kAlways, "")),
        Job(Command(About, kHelp, "About SXNedit", kAlways, "The program and its version")),

        Command(Comment, nullptr, "Comment Record", kIdle, "Comment out the selected record"),
        Command(Uncomment, nullptr, "UnComment Record", kIdle,
                "Take the comment off the selected record"),
        Command(DownloadAbort, nullptr, "Abort Download", kAlways,
                "Let go of the instrument's driver after a download"),
        Command(AbortProcessing, nullptr, "Abort Processing", kAlways,
                "Stop the reduction, import or download that is running"),
        Command(AbortProcess, nullptr, "Abort", kAlways,
                "Stop the reduction, import or download that is running"),
        Command(FileSave, nullptr, "Save", kAlways, "Save the document's records in the job"),
        Command(EditCutStandard, nullptr, "Cut", kAlways, "", "Shift+Del"),
        Command(EditCopyStandard, nullptr, "Copy", kAlways, "", "Ctrl+Ins"),
        Command(EditPasteStandard, nullptr, "Paste", kAlways, "", "Shift+Ins"),
    };
}

}  // namespace

const std::vector<CommandInfo>& Commands() {
    static const std::vector<CommandInfo> commands = MakeCommands();
    return commands;
}

const CommandInfo* FindCommand(int id) {
    static const std::unordered_map<int, const CommandInfo*> by_id = [] {
        std::unordered_map<int, const CommandInfo*> map;
        for (const CommandInfo& info : Commands()) {
            if (info.id != 0) map.emplace(info.id, &info);
        }
        return map;
    }();
    const auto found = by_id.find(id);
    return found == by_id.end() ? nullptr : found->second;
}

const std::vector<const char*>& MenuOrder() {
    static const std::vector<const char*> order = {"File",  "Edit",    "Insert", "View",
                                                   "Tools", "Library", "Help"};
    return order;
}

const std::vector<int>& CommonToolbar() {
    using namespace cmd;
    static const std::vector<int> buttons = {FileNew, FileOpen,  FileSave, 0,          FilePrint,
                                             0,       EditCut,   EditCopy, EditPaste,  0,
                                             ZoomAll, ZoomIn,    ZoomOut,  ZoomWindow, ZoomPrevious,
                                             Pan,     ZoomPoint, Redraw,   0,          Regenerate};
    return buttons;
}

const std::vector<int>& RawDataToolbar() {
    using namespace cmd;
    static const std::vector<int> buttons = {
        Download, Transfer,    Traverse,  0, InsStn,     InsPt,         InsInsht,  InsBkb,    InsBs,
        InsSs,    InsTargetht, InsOffset, 0, GlobalEdit, CommentRecord, PreRecord, NextRecord};
    return buttons;
}

const std::vector<int>& ContextMenu() {
    using namespace cmd;
    static const std::vector<int> entries = {
        EditCopy,      EditCut,         EditPaste, 0,          Comment, Uncomment, 0,
        DownloadAbort, AbortProcessing, 0,         Regenerate, 0,       NextRecord};
    return entries;
}

}  // namespace nedit
