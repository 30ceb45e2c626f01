#pragma once
// The job: its survey database (points, lines, arcs, circles, polylines, layers, tables of
// symbols, line types and thicknesses, survey codes, settings) and the structured storage
// of its raw-data documents, all in one SQLite file (see JobDatabase.h for the file and
// data/schema for the tables).
//
// Decisions:
// - Point names are unique in a job and compare exactly; GetPointId finds a point by its
//   name through the unique index.
// - Codes are looked up in the job's own library first, then in the shared library, without
//   regard to case. The shared library is an office-wide file (DefaultSharedCodeLibraryPath);
//   a new job starts with its own copy of a default library (CreateJob).
// - Reads on a job opened read-only work; every change throws nedit::JobError, except the
//   table look-ups that would add a name, which then give 0.

#include <memory>
#include <string>

#include "platform/job/CodeSettings.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/UDocument.h"
#include "platform/job/UJobSettings.h"
#include "platform/job/UPointNumber.h"
#include "platform/job/USvyCode.h"
#include "platform/job/USvyCodeLib.h"

class UWPoint;
class UWorldDC;
class USVSelectionList;

namespace nedit {

/// Object kinds: the top six bits of an identifier (id >> 26).
constexpr int kPointKind = 1;
constexpr int kLineKind = 2;
constexpr int kArcKind = 3;
constexpr int kCircleKind = 4;
constexpr int kPolylineKind = 16;
/// The kind of an object identifier. Kinds 12 to 15 count as points (1), and 18, 20, 21
/// and 22 as polylines (16), as other programs of the suite number their variants.
int ObjectKindOf(long id);

/// The office-wide survey code library: SurveyCodes.csv in the configuration directory
/// (ConfigDirectory.h): $SXNEDIT_CONFIG/SurveyCodes.csv when that variable is set, else
/// $XDG_CONFIG_HOME/sxnedit/SurveyCodes.csv, else ~/.config/sxnedit/SurveyCodes.csv.
std::string DefaultSharedCodeLibraryPath();

}  // namespace nedit

class USurveyDoc : public UDocument {
  public:
    /// Where GetSurveyCodeEx found a definition (its `answer`).
    static constexpr int kCodeUndefined = 0;  // the default definition, or an empty one
    static constexpr int kCodeFromJob = 1;
    static constexpr int kCodeFromShared = 2;
    static constexpr int kCodeAdded = 3;  // added to the job's own library just now

    /// The survey document of an open job; it owns the connection from now on.
    explicit USurveyDoc(nedit::JobDatabase job);
    ~USurveyDoc() override;

    /// Makes a new job file whose own code library is a copy of `codes` (none when null) and
    /// opens it. Throws nedit::JobError as JobDatabase::Create does.
    static std::unique_ptr<USurveyDoc> CreateJob(const std::string& path, const USvyCodeLib* codes);
    /// Opens a job file; throws nedit::JobError as JobDatabase::Open does.
    static std::unique_ptr<USurveyDoc> OpenJob(const std::string& path,
                                               const nedit::JobOpenOptions& options = {});

    nedit::JobDatabase& Database() { return job_; }
    const std::string& GetPathName() const { return job_.Path(); }
    USurveyDoc* GetSurveyDocument() const override { return const_cast<USurveyDoc*>(this); }

    // ---- Points ------------------------------------------------------------------------
    /// The identifier of the point of that name; 0 when the job has none.
    long GetPointId(const UPointNumber& name);
    /// The next free point number after `after`, or after the job's current point number
    /// when `after` is empty: the trailing digits count up, keeping their width ("P09" gives
    /// "P10"); a name without digits gets "1" appended; an empty counter starts at "1".
    /// Names taken in the job are passed over. The counter itself does not move.
    std::wstring GetNextPointNumber(const std::wstring& after = L"");
    /// Sets the job's current point number, which GetNextPointNumber counts on from.
    void SetCurrentPointNumber(const std::wstring& number);
    std::wstring GetCurrentPointNumber();

    // ---- Layers ------------------------------------------------------------------------
    /// The layer's identifier; 0 for an unknown name.
    long GetLayerId(const std::wstring& name);
    /// Switches the layer on; false for an unknown layer.
    bool SetLayerActive(long id);
    bool IsLayerLocked(long id);
    bool ClearLayerLocked(long id);
    bool SetLayerLocked(long id);
    /// True when objects may be saved on the layer: it exists and is not locked.
    bool CanSaveLayer(long id);

    // ---- Settings ----------------------------------------------------------------------
    UJobSettings& GetSettings() { return settings_; }
    /// Stores the settings in the job.
    void SaveSettings();
    /// True when the job shows East before North (coordinate order 0).
    bool CoordsOrderXY() const {
        return settings_.GetCoordinateOrder() == UJobSettings::kEastNorth;
    }
    const nedit::CodeSettings& GetCodeSettings() const { return code_settings_; }
    /// Takes and stores the settings of the code grammar.
    void SetCodeSettings(const nedit::CodeSettings& settings);

    // ---- Survey codes ------------------------------------------------------------------
    /// The shared library, read from its file on first use and again when `reload` is set;
    /// null when the file does not exist or cannot be read (SharedLibraryError tells why).
    USvyCodeLib* GetSurveyCodeLibrary(bool reload = false);
    void SetSharedCodeLibraryPath(const std::string& path);
    const std::wstring& SharedLibraryError() const { return shared_error_; }
    /// The job's own library, read from the job on first use. Changes stay in memory until
    /// its Save.
    USvyCodeLib* GetJobCodeLibrary();

    /// The definition of `code`: from the job's library, else the shared one. When neither
    /// has it: with `create`, a copy of the default definition under this code is added to
    /// the job's library (taking `layer` when given), for a later Save of that library; else
    /// with `useDefault`, the default definition ("$$DEFAULT" of the job or shared library,
    /// else a built-in one on layer "$$DEFAULT"); else a definition with only the code set.
    /// The default definition is asked for by its own code with `create` set, so a job
    /// always ends up holding one. `ask` is accepted for callers of the suite: this database
    /// never asks. `answer` receives where the definition came from (kCode... above).
    USvyCode GetSurveyCodeEx(const wchar_t* code, int& answer, bool create = false,
                             bool useDefault = true, bool ask = false,
                             const wchar_t* layer = nullptr);
    /// Display values of a code field, by the definition of its code (the whole text when a
    /// library defines it, else its feature code: the first token, up to the comment mark,
    /// without digits), or the default definition.
    /// Colour: the point colour with `forPoint`, else the line colour; when the definition
    /// gives none, the colour of its layer with `layerColour`, else 15.
    int GetPenColourBySvyCode(const wchar_t* code, bool forPoint, bool layerColour = false);
    int GetPointMarkBySvyCode(const wchar_t* code);
    int GetLineTypeBySvyCode(const wchar_t* code);
    int GetLineThicknessBySvyCode(const wchar_t* code);

    // ---- Tables of symbols, line types and thicknesses -----------------------------------
    /// The index of the name in its table, adding the name when it is new (on a read-only
    /// job a new name gives 0). An empty name gives 0, and so does "SOLID" (any case) for line
    /// types. Tables are job-wide: `layer` is accepted and changes nothing.
    int SymbolIndex(const std::wstring& name, long layer = 0);
    int LineTypeIndex(const std::wstring& name, long layer = 0);
    int LineThicknessIndex(const std::wstring& name, long layer = 0);
    /// The name at an index; empty for 0 or an unknown index.
    std::wstring SymbolName(int index);
    std::wstring LineTypeName(int index);
    std::wstring LineThicknessName(int index);

    // ---- Enumeration -------------------------------------------------------------------
    /// Adds to `list` the lines (EnumerateLines) or arcs (EnumerateArcs) that have an end
    /// point at `point` (within a micrometre in plan) and gives how many it added. The device
    /// context, the point list and the display mask of the suite's callers are accepted and
    /// change nothing.
    int EnumerateLines(UWorldDC* dc, USVSelectionList& list, const UWPoint& point,
                       USVSelectionList* points = nullptr, unsigned mask = 0);
    int EnumerateArcs(UWorldDC* dc, USVSelectionList& list, const UWPoint& point,
                      USVSelectionList* points = nullptr, unsigned mask = 0);

    /// The first line (by identifier) between the points `a` and `b`, in either direction: what
    /// EnumerateLines at `a` finds with those ends. 0 when there is none.
    long GetLineBetween(long a, long b);
    /// The first arc with the ends `a` and `b`, in either order, and the third point `third`;
    /// 0 when there is none.
    long GetArcOn(long a, long b, long third);

    /// Reads the job's settings again from the file and updates all views.
    void Regen();
    /// The hint of UpdateAllViews that asks the job's views to show all of the job, as after a
    /// transfer into it.
    static constexpr long kZoomAll = 1;

  private:
    const USvyCode* FindDefinition(std::wstring_view code, int& answer);
    USvyCode DefaultDefinition();
    USvyCode DefinitionOfField(const wchar_t* code);
    int NameIndex(const char* table, const std::wstring& name);
    std::wstring NameAt(const char* table, int index);
    int EnumerateAt(const char* sql, USVSelectionList& list, const UWPoint& point);

    nedit::JobDatabase job_;
    UJobSettings settings_;
    nedit::CodeSettings code_settings_;
    std::unique_ptr<USvyCodeLib> job_library_;
    std::unique_ptr<USvyCodeLib> shared_library_;
    bool shared_loaded_ = false;
    std::string shared_path_;
    std::wstring shared_error_;
};
