#include "platform/job/USurveyDoc.h"

#include <sys/stat.h>

#include "platform/geometry/UWPoint.h"
#include "platform/job/JobSettingsStore.h"
#include "platform/job/SettingsTable.h"
#include "platform/job/USVSelectionList.h"
#include "platform/settings/ConfigDirectory.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {

int ObjectKindOf(long id) {
    const int kind = static_cast<int>((static_cast<unsigned long>(id) >> 26) & 0x3f);
    if (kind >= 12 && kind <= 15) return kPointKind;
    if (kind == 18 || kind == 20 || kind == 21 || kind == 22) return kPolylineKind;
    return kind;
}

std::string DefaultSharedCodeLibraryPath() {
    return ConfigFile("SurveyCodes.csv");
}

}  // namespace nedit

namespace {

const wchar_t* const kJobSection = L"job";
const wchar_t* const kCurrentPointKey = L"current_point_number";
// Coordinates closer than this in plan are one place, for the enumeration at a point.
constexpr double kSamePlace = 1e-6;

// The name that follows `name` in a point number sequence.
std::wstring Increment(const std::wstring& name) {
    if (name.empty()) return L"1";
    std::size_t start = name.size();
    while (start > 0 && name[start - 1] >= L'0' && name[start - 1] <= L'9') --start;
    if (start == name.size()) return name + L"1";
    std::wstring digits = name.substr(start);
    int i = static_cast<int>(digits.size()) - 1;
    for (; i >= 0; --i) {
        if (digits[static_cast<std::size_t>(i)] == L'9') {
            digits[static_cast<std::size_t>(i)] = L'0';
        } else {
            ++digits[static_cast<std::size_t>(i)];
            break;
        }
    }
    if (i < 0) digits.insert(digits.begin(), L'1');
    return name.substr(0, start) + digits;
}

}  // namespace

USurveyDoc::USurveyDoc(nedit::JobDatabase job)
    : job_(std::move(job)), shared_path_(nedit::DefaultSharedCodeLibraryPath()) {
    storage_.OpenRoot(job_, job_.IsReadOnly() ? nedit::stgm::Read : nedit::stgm::ReadWrite);
    name_ = nedit::FromUtf8(job_.Path());
    settings_ = nedit::LoadJobSettings(job_);
    code_settings_ = nedit::LoadCodeSettings(job_);
}

USurveyDoc::~USurveyDoc() {
    storage_.Release();
}

std::unique_ptr<USurveyDoc> USurveyDoc::CreateJob(const std::string& path,
                                                  const USvyCodeLib* codes) {
    nedit::JobDatabase job = nedit::JobDatabase::Create(path, [codes](nedit::JobDatabase& created) {
        nedit::SaveJobSettings(created, UJobSettings());
        nedit::SaveCodeSettings(created, nedit::CodeSettings());
        if (codes != nullptr) codes->SaveJob(created);
    });
    return std::make_unique<USurveyDoc>(std::move(job));
}

std::unique_ptr<USurveyDoc> USurveyDoc::OpenJob(const std::string& path,
                                                const nedit::JobOpenOptions& options) {
    return std::make_unique<USurveyDoc>(nedit::JobDatabase::Open(path, options));
}

// ---- Points ----------------------------------------------------------------------------

long USurveyDoc::GetPointId(const UPointNumber& name) {
    if (name.IsEmpty()) return 0;
    auto query = job_.Query("SELECT id FROM point WHERE name = ?");
    query->Bind(1, name.GetName());
    return query->Step() ? static_cast<long>(query->Int(0)) : 0;
}

std::wstring USurveyDoc::GetNextPointNumber(const std::wstring& after) {
    std::wstring candidate = Increment(after.empty() ? GetCurrentPointNumber() : after);
    while (GetPointId(UPointNumber(candidate)) != 0) candidate = Increment(candidate);
    return candidate;
}

void USurveyDoc::SetCurrentPointNumber(const std::wstring& number) {
    nedit::WriteSettings(job_, kJobSection, {{kCurrentPointKey, number}});
}

std::wstring USurveyDoc::GetCurrentPointNumber() {
    return nedit::ReadSetting(job_, kJobSection, kCurrentPointKey);
}

// ---- Layers ----------------------------------------------------------------------------

long USurveyDoc::GetLayerId(const std::wstring& name) {
    auto query = job_.Query("SELECT id FROM layer WHERE name = ?");
    query->Bind(1, name);
    return query->Step() ? static_cast<long>(query->Int(0)) : 0;
}

bool USurveyDoc::SetLayerActive(long id) {
    job_.RequireWritable();
    auto update = job_.Query("UPDATE layer SET active = 1 WHERE id = ?");
    update->Bind(1, id).Run();
    return job_.Changes() > 0;
}

bool USurveyDoc::IsLayerLocked(long id) {
    auto query = job_.Query("SELECT locked FROM layer WHERE id = ?");
    query->Bind(1, id);
    return query->Step() && query->Int(0) != 0;
}

bool USurveyDoc::ClearLayerLocked(long id) {
    job_.RequireWritable();
    auto update = job_.Query("UPDATE layer SET locked = 0 WHERE id = ?");
    update->Bind(1, id).Run();
    return job_.Changes() > 0;
}

bool USurveyDoc::SetLayerLocked(long id) {
    job_.RequireWritable();
    auto update = job_.Query("UPDATE layer SET locked = 1 WHERE id = ?");
    update->Bind(1, id).Run();
    return job_.Changes() > 0;
}

bool USurveyDoc::CanSaveLayer(long id) {
    auto query = job_.Query("SELECT locked FROM layer WHERE id = ?");
    query->Bind(1, id);
    return query->Step() && query->Int(0) == 0;
}

// ---- Settings --------------------------------------------------------------------------

void USurveyDoc::SaveSettings() {
    nedit::SaveJobSettings(job_, settings_);
}

void USurveyDoc::SetCodeSettings(const nedit::CodeSettings& settings) {
    nedit::SaveCodeSettings(job_, settings);
    code_settings_ = settings;
}

// ---- Survey codes ----------------------------------------------------------------------

USvyCodeLib* USurveyDoc::GetSurveyCodeLibrary(bool reload) {
    if (shared_loaded_ && !reload) return shared_library_.get();
    shared_loaded_ = true;
    shared_library_.reset();
    shared_error_.clear();
    struct stat info {};
    if (shared_path_.empty() || stat(shared_path_.c_str(), &info) != 0) return nullptr;
    auto library = std::make_unique<USvyCodeLib>();
    if (!library->LoadFile(shared_path_, shared_error_)) return nullptr;
    shared_library_ = std::move(library);
    return shared_library_.get();
}

void USurveyDoc::SetSharedCodeLibraryPath(const std::string& path) {
    shared_path_ = path;
    shared_loaded_ = false;
    shared_library_.reset();
}

USvyCodeLib* USurveyDoc::GetJobCodeLibrary() {
    if (!job_library_) {
        job_library_ = std::make_unique<USvyCodeLib>();
        job_library_->LoadJob(job_);
    }
    return job_library_.get();
}

const USvyCode* USurveyDoc::FindDefinition(std::wstring_view code, int& answer) {
    if (const USvyCode* found = GetJobCodeLibrary()->GetSvyCode(code)) {
        answer = kCodeFromJob;
        return found;
    }
    if (USvyCodeLib* shared = GetSurveyCodeLibrary()) {
        if (const USvyCode* found = shared->GetSvyCode(code)) {
            answer = kCodeFromShared;
            return found;
        }
    }
    answer = kCodeUndefined;
    return nullptr;
}

USvyCode USurveyDoc::DefaultDefinition() {
    int answer = 0;
    if (const USvyCode* found = FindDefinition(USvyCode::kDefaultCode, answer)) return *found;
    USvyCode builtIn;
    builtIn.Code = USvyCode::kDefaultCode;
    builtIn.Layer = USvyCode::kDefaultCode;
    builtIn.PointColour = L"15";
    builtIn.LineColour = L"15";
    builtIn.Description = L"Default";
    return builtIn;
}

USvyCode USurveyDoc::GetSurveyCodeEx(const wchar_t* code, int& answer, bool create, bool useDefault,
                                     bool /*ask*/, const wchar_t* layer) {
    const std::wstring text = nedit::Trim(code != nullptr ? code : L"");
    if (!text.empty()) {
        if (const USvyCode* found = FindDefinition(text, answer)) return *found;
    }
    answer = kCodeUndefined;
    if (create && !text.empty()) {
        USvyCode added = DefaultDefinition();
        added.Code = text;
        if (layer != nullptr && *layer != L'\0') added.Layer = layer;
        if (text != USvyCode::kDefaultCode) added.Description.clear();
        GetJobCodeLibrary()->SetSvyCode(added);
        answer = kCodeAdded;
        return added;
    }
    if (useDefault) return DefaultDefinition();
    USvyCode bare;
    bare.Code = text;
    return bare;
}

USvyCode USurveyDoc::DefinitionOfField(const wchar_t* code) {
    const std::wstring text = nedit::Trim(code != nullptr ? code : L"");
    int answer = 0;
    if (!text.empty()) {
        if (const USvyCode* found = FindDefinition(text, answer)) return *found;
    }
    // The feature code: the first token, up to the comment mark, digits (string and contour
    // numbers) left out.
    std::wstring token = text;
    const std::wstring& separator = code_settings_.CodeSeparator;
    if (!separator.empty()) token = token.substr(0, token.find(separator[0]));
    const std::wstring& comment = code_settings_.CommentMark;
    if (!comment.empty()) token = token.substr(0, token.find(comment[0]));
    std::wstring feature;
    for (const wchar_t c : token) {
        if (c < L'0' || c > L'9') feature += c;
    }
    feature = nedit::Trim(feature);
    if (!feature.empty() && feature != text) {
        if (const USvyCode* found = FindDefinition(feature, answer)) return *found;
    }
    return DefaultDefinition();
}

int USurveyDoc::GetPenColourBySvyCode(const wchar_t* code, bool forPoint, bool layerColour) {
    const USvyCode definition = DefinitionOfField(code);
    const std::wstring& colour = forPoint ? definition.PointColour : definition.LineColour;
    if (!nedit::Trim(colour).empty()) return nedit::TextToInt(colour);
    if (layerColour) {
        auto query = job_.Query("SELECT colour FROM layer WHERE name = ?");
        query->Bind(1, definition.Layer);
        if (query->Step()) return static_cast<int>(query->Int(0));
    }
    return 15;
}

int USurveyDoc::GetPointMarkBySvyCode(const wchar_t* code) {
    return nedit::TextToInt(DefinitionOfField(code).PointMark);
}

int USurveyDoc::GetLineTypeBySvyCode(const wchar_t* code) {
    return LineTypeIndex(DefinitionOfField(code).LineType);
}

int USurveyDoc::GetLineThicknessBySvyCode(const wchar_t* code) {
    return LineThicknessIndex(DefinitionOfField(code).Thickness);
}

// ---- Tables ----------------------------------------------------------------------------

int USurveyDoc::NameIndex(const char* table, const std::wstring& name) {
    const std::wstring key = nedit::Trim(name);
    if (key.empty()) return 0;
    const std::string select = std::string("SELECT id FROM ") + table + " WHERE name = ?";
    {
        auto query = job_.Query(select);
        query->Bind(1, key);
        if (query->Step()) return static_cast<int>(query->Int(0));
    }
    if (job_.IsReadOnly()) return 0;
    auto insert = job_.Query(std::string("INSERT INTO ") + table + " (name) VALUES (?)");
    insert->Bind(1, key).Run();
    return static_cast<int>(job_.LastInsertId());
}

std::wstring USurveyDoc::NameAt(const char* table, int index) {
    if (index <= 0) return {};
    auto query = job_.Query(std::string("SELECT name FROM ") + table + " WHERE id = ?");
    query->Bind(1, index);
    return query->Step() ? query->Text(0) : std::wstring();
}

int USurveyDoc::SymbolIndex(const std::wstring& name, long /*layer*/) {
    return NameIndex("symbol", name);
}

int USurveyDoc::LineTypeIndex(const std::wstring& name, long /*layer*/) {
    if (nedit::ToUpper(nedit::Trim(name)) == L"SOLID") return 0;
    return NameIndex("line_type", name);
}

int USurveyDoc::LineThicknessIndex(const std::wstring& name, long /*layer*/) {
    return NameIndex("thickness", name);
}

std::wstring USurveyDoc::SymbolName(int index) {
    return NameAt("symbol", index);
}
std::wstring USurveyDoc::LineTypeName(int index) {
    return NameAt("line_type", index);
}
std::wstring USurveyDoc::LineThicknessName(int index) {
    return NameAt("thickness", index);
}

// ---- Enumeration -----------------------------------------------------------------------

int USurveyDoc::EnumerateAt(const char* sql, USVSelectionList& list, const UWPoint& point) {
    auto query = job_.Query(sql);
    query->Bind(1, point.x - kSamePlace).Bind(2, point.x + kSamePlace);
    query->Bind(3, point.y - kSamePlace).Bind(4, point.y + kSamePlace);
    int added = 0;
    while (query->Step()) {
        if (list.Add(static_cast<long>(query->Int(0)))) ++added;
    }
    return added;
}

int USurveyDoc::EnumerateLines(UWorldDC* /*dc*/, USVSelectionList& list, const UWPoint& point,
                               USVSelectionList* /*points*/, unsigned /*mask*/) {
    return EnumerateAt(
        "WITH here AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 AND "
        "?4) "
        "SELECT id FROM line WHERE start_id IN here UNION "
        "SELECT id FROM line WHERE end_id IN here ORDER BY 1",
        list, point);
}

int USurveyDoc::EnumerateArcs(UWorldDC* /*dc*/, USVSelectionList& list, const UWPoint& point,
                              USVSelectionList* /*points*/, unsigned /*mask*/) {
    return EnumerateAt(
        "WITH here AS (SELECT id FROM point WHERE east BETWEEN ?1 AND ?2 AND north BETWEEN ?3 AND "
        "?4) "
        "SELECT id FROM arc WHERE start_id IN here UNION "
        "SELECT id FROM arc WHERE end_id IN here ORDER BY 1",
        list, point);
}

long USurveyDoc::GetLineBetween(long a, long b) {
    auto query = job_.Query(
        "SELECT id FROM line WHERE (start_id = ?1 AND end_id = ?2) OR (start_id = ?2 AND end_id = "
        "?1) ORDER BY id LIMIT 1");
    query->Bind(1, a).Bind(2, b);
    return query->Step() ? static_cast<long>(query->Int(0)) : 0;
}

long USurveyDoc::GetArcOn(long a, long b, long third) {
    auto query = job_.Query(
        "SELECT id FROM arc WHERE ((start_id = ?1 AND end_id = ?2) OR (start_id = ?2 AND end_id = "
        "?1)) AND third_id = ?3 ORDER BY id LIMIT 1");
    query->Bind(1, a).Bind(2, b).Bind(3, third);
    return query->Step() ? static_cast<long>(query->Int(0)) : 0;
}

void USurveyDoc::Regen() {
    settings_ = nedit::LoadJobSettings(job_);
    code_settings_ = nedit::LoadCodeSettings(job_);
    UpdateAllViews(nullptr, 0);
}
