#include "records/UNeutralFileFormat.h"

#include <algorithm>
#include <fstream>
#include <sstream>

#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordLayout.h"
#include "records/RecordTypes.h"

namespace {

constexpr const wchar_t* kDefinitionFileName = L"NeutralRecords.def";

bool IsControl(wchar_t c) {
    return (c >= 0 && c < 0x20) || c == 0x7F;
}

// The key of a record: its text up to the first blank or comma, in upper case.
std::wstring KeyOf(std::wstring_view text) {
    return nedit::ToUpper(text.substr(0, std::min(text.find_first_of(L" ,"), text.size())));
}

using nedit::layout::KeyEnd;

int WinTypeOf(FieldKind kind) {
    switch (kind) {
        case FieldKind::Integer:
            return 1;
        case FieldKind::Length:
        case FieldKind::Number:
            return 3;
        case FieldKind::Angle:
            return 7;
        default:
            return 6;
    }
}

// Characters as they are.
struct Unchanged {
    template <typename Char>
    Char operator()(Char c) const {
        return c;
    }
};

}  // namespace

UNeutralFileFormat::UNeutralFileFormat(const UJobSettings* settings) : settings_(settings) {}

UNeutralFileFormat::~UNeutralFileFormat() = default;

void UNeutralFileFormat::InitMaps() {
    ResetCurrentValues();
}

void UNeutralFileFormat::ClearMaps() {
    definition_.Clear();
    StartCurrentValues();
}

void UNeutralFileFormat::StartCurrentValues() {
    current_.assign(definition_.FieldCount(), CurrentValue());
    other_current_.clear();
    // Field ids are small numbers; their slots are found by index, not by a hash.
    constexpr int kIndexedIds = 1024;
    slot_of_id_.assign(kIndexedIds, -1);
    for (int id = 0; id < kIndexedIds; ++id) {
        if (const FieldDefinition* field = definition_.FieldById(id)) slot_of_id_[id] = field->slot;
    }
}

bool UNeutralFileFormat::LoadNeutralFileDefinition(const std::wstring& dir) {
    std::string path = nedit::ToUtf8(dir);
    if (!path.empty() && path.back() != '/' && path.back() != '\\') path += '/';
    path += nedit::ToUtf8(kDefinitionFileName);
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        definition_error_ = L"cannot read " + nedit::FromUtf8(path);
        return false;
    }
    std::ostringstream bytes;
    bytes << file.rdbuf();
    return LoadDefinitionText(nedit::FromUtf8(bytes.str()));
}

bool UNeutralFileFormat::LoadDefinitionText(const std::wstring& text) {
    definition_error_.clear();
    const bool loaded = definition_.Parse(text, definition_error_);
    StartCurrentValues();
    return loaded;
}

bool UNeutralFileFormat::IsFileHeader(const std::wstring& line) const {
    const std::wstring text = nedit::ToUpper(nedit::Trim(line));
    return nedit::StartsWith(text, L"#VERSION-") && nedit::EndsWith(text, L" NEUTRAL FILE");
}

int UNeutralFileFormat::ExtractRecord(const std::wstring& line, std::wstring& record) const {
    std::wstring text = line;
    for (wchar_t& c : text) {
        if (IsControl(c)) c = L' ';
    }
    text = nedit::Trim(text);
    if (text.empty()) return 0;
    record = std::move(text);
    return 1;
}

int UNeutralFileFormat::GetRecordType(const std::wstring& line) const {
    const std::wstring_view text = nedit::TrimLeftView(line);
    if (text.empty()) return rec::None;
    if (text[0] == L'#') return rec::Comment;
    const RecordDefinition* record = definition_.RecordByKey(KeyOf(text));
    return record == nullptr ? rec::None : record->type;
}

int UNeutralFileFormat::GetRecordTypeUtf8(std::string_view line) const {
    const std::string_view text = nedit::TrimLeftView(line);
    if (text.empty()) return rec::None;
    if (text[0] == '#') return rec::Comment;
    const std::string_view key = text.substr(0, KeyEnd(text));
    if (!nedit::IsAscii(key)) return GetRecordType(nedit::FromUtf8(text));
    char upper[64];
    if (key.size() > sizeof upper) return rec::None;  // longer than any key of a definition
    for (std::size_t i = 0; i < key.size(); ++i)
        upper[i] = key[i] >= 'a' && key[i] <= 'z' ? static_cast<char>(key[i] - 32) : key[i];
    const RecordDefinition* record = definition_.RecordByKeyUtf8({upper, key.size()});
    return record == nullptr ? rec::None : record->type;
}

int UNeutralFileFormat::FindRecordKeyUtf8(std::string_view key, int& type) const {
    const int found = definition_.RecordTypeByKeyUtf8(key);
    if (found < 0) return 0;
    type = found;
    return 1;
}

int UNeutralFileFormat::FindRecordKey(int type, std::wstring& key) const {
    const RecordDefinition* record = definition_.RecordByType(type);
    if (record == nullptr) return 0;
    key = record->key;
    return 1;
}

int UNeutralFileFormat::FindRecordKey(const std::wstring& key, int& type) const {
    const RecordDefinition* record = definition_.RecordByKey(key);
    if (record == nullptr) return 0;
    type = record->type;
    return 1;
}

int UNeutralFileFormat::FindRecordField(int id, std::wstring& key) const {
    const FieldDefinition* field = definition_.FieldById(id);
    if (field == nullptr) return 0;
    key = field->key;
    return 1;
}

int UNeutralFileFormat::FindRecordField(const std::wstring& key, int& id) const {
    const FieldDefinition* field = definition_.FieldByKey(key);
    if (field == nullptr) return 0;
    id = field->id;
    return 1;
}

int UNeutralFileFormat::FindFieldWinType(const std::wstring& key, int& type) const {
    const FieldDefinition* field = definition_.FieldByKey(key);
    if (field == nullptr) return 0;
    type = WinTypeOf(field->kind);
    return 1;
}

int UNeutralFileFormat::FindFieldsArray(int type) const {
    const RecordDefinition* record = definition_.RecordByType(type);
    if (record == nullptr) return 0;
    return record->single_field ? 1 : static_cast<int>(record->fields.size());
}

bool UNeutralFileFormat::IsKeyOfSingleField(int type) const {
    const RecordDefinition* record = definition_.RecordByType(type);
    return record != nullptr && record->single_field;
}

int UNeutralFileFormat::GetFieldId(int type) const {
    const RecordDefinition* record = definition_.RecordByType(type);
    return record != nullptr && record->single_field ? record->stands_for : 0;
}

bool UNeutralFileFormat::GetRecordTemplate(int type, std::wstring& text) const {
    const RecordDefinition* record = definition_.RecordByType(type);
    if (record == nullptr) return false;
    text.clear();
    for (const int id : record->fields) {
        const FieldDefinition* field = definition_.FieldById(id);
        if (field == nullptr) continue;
        if (!text.empty()) text += L',';
        text += field->key + L"=";
    }
    return true;
}

template <typename Char, typename Store>
int UNeutralFileFormat::WalkFields(int type, std::basic_string_view<Char> line, Store store) const {
    using View = std::basic_string_view<Char>;
    const RecordDefinition* record = definition_.RecordByType(type);
    if (record == nullptr || (!record->single_field && record->fields.empty())) return 0;
    const View text = nedit::TrimView(line);
    const View body = nedit::TrimView(text.substr(KeyEnd(text)));
    if (record->single_field) {
        store(record->type, record->single_kind, body);
        return 1;
    }
    std::size_t position = 0;
    for (std::size_t start = 0; start <= body.size(); ++position) {
        const std::size_t comma = std::min(body.find(Char(','), start), body.size());
        const View token = nedit::TrimView(body.substr(start, comma - start));
        start = comma + 1;
        const std::size_t equals = token.find(Char('='));
        const FieldDefinition* field = nullptr;
        View value = token;
        if (equals != View::npos) {
            // A key that the definition does not know is passed over, not guessed at.
            field = FieldOfKey(nedit::TrimView(token.substr(0, equals)));
            value = nedit::TrimView(token.substr(equals + 1));
        } else if (position < record->fields.size() && !token.empty()) {
            field = definition_.FieldById(record->fields[position]);
        }
        if (field != nullptr) store(field->id, field->kind, value);
    }
    return 1;
}

const FieldDefinition* UNeutralFileFormat::FieldOfKey(std::wstring_view key) const {
    return definition_.FieldByKey(nedit::ToUpper(key));
}

const FieldDefinition* UNeutralFileFormat::FieldOfKey(std::string_view key) const {
    char upper[64];
    if (!nedit::IsAscii(key) || key.size() > sizeof upper)
        return definition_.FieldByKey(nedit::ToUpper(nedit::FromUtf8(key)));
    for (std::size_t i = 0; i < key.size(); ++i)
        upper[i] = key[i] >= 'a' && key[i] <= 'z' ? static_cast<char>(key[i] - 32) : key[i];
    return definition_.FieldByKeyUtf8({upper, key.size()});
}

int UNeutralFileFormat::ProcessRecord(int type, const std::wstring& line, FieldMap& fields) {
    fields.clear();
    return WalkFields(type, std::wstring_view(line),
                      [&](int id, FieldKind kind, std::wstring_view value) {
                          StoreField(id, kind, value, fields);
                      });
}

int UNeutralFileFormat::ReadRecord(int type, std::string_view line, RecordFields& fields) {
    fields.clear();
    return WalkFields(type, line, [&](int id, FieldKind kind, std::string_view value) {
        StoreField(id, kind, value, fields);
    });
}

void UNeutralFileFormat::StoreField(int id, FieldKind kind, std::wstring_view text,
                                    FieldMap& fields) {
    std::wstring& value = fields[id];
    ReadValue(kind, text, value);
    if (!value.empty()) SetCurrentValue(id, value);
}

int UNeutralFileFormat::PeekRecord(int type, std::string_view line, RecordFields& fields) const {
    fields.clear();
    return WalkFields(type, line, [&](int id, FieldKind kind, std::string_view value) {
        fields[id] = ValueOf(kind, value);
    });
}

void UNeutralFileFormat::StoreField(int id, FieldKind kind, std::string_view text,
                                    RecordFields& fields) {
    RecordValue& value = fields[id];
    value = ValueOf(kind, text);
    if (!value.empty()) SetCurrentValue(id, value);
}

RecordValue UNeutralFileFormat::ValueOf(FieldKind kind, std::string_view text) const {
    RecordValue value;
    if (Converts(kind, text.empty())) {
        value.converted = true;
        value.number = Converted(kind, nedit::TextToDouble(text));
    } else {
        value.text = text;
    }
    return value;
}

bool UNeutralFileFormat::Converts(FieldKind kind, bool empty) const {
    return !empty && ((kind == FieldKind::Angle && FileAngleUnit() != nedit::AngleUnit::Degrees) ||
                      (kind == FieldKind::Length && FileLengthUnit() != WorkingLengthUnit()));
}

double UNeutralFileFormat::Converted(FieldKind kind, double value) const {
    return kind == FieldKind::Angle ? ConvertAngle(value) : ConvertDist(value, false);
}

void UNeutralFileFormat::ReadValue(FieldKind kind, std::wstring_view text,
                                   std::wstring& value) const {
    if (Converts(kind, text.empty())) {
        value = nedit::DoubleToText(Converted(kind, nedit::TextToDouble(text)));
    } else {
        value.assign(text);
    }
}

std::wstring UNeutralFileFormat::FormatRecord(int /*type*/, const std::wstring& line) const {
    std::wstring out;
    nedit::layout::LayOut(std::wstring_view(line), out, Unchanged());
    return out;
}

std::string UNeutralFileFormat::FormatRecordUtf8(std::string_view line) const {
    std::string out;
    nedit::layout::LayOut(line, out, Unchanged());
    return out;
}

std::wstring UNeutralFileFormat::ReformatRecord(const std::wstring& record,
                                                const std::wstring& id) const {
    const std::size_t comma = record.find(L',');
    if (comma == std::wstring::npos) return record;
    const std::size_t first_blank = record.find(L' ');
    const std::wstring key =
        nedit::ToUpper(nedit::Trim(std::wstring_view(record).substr(0, first_blank)));
    const std::size_t last_blank = record.rfind(L' ', comma);
    const std::size_t rest = last_blank == std::wstring::npos ? 0 : last_blank + 1;
    return nedit::Format(L"%-10s%s,%s", key, id, std::wstring_view(record).substr(rest));
}

std::string UNeutralFileFormat::ReformatRecordUtf8(std::string_view record,
                                                   std::string_view id) const {
    const std::size_t comma = record.find(',');
    if (comma == std::string_view::npos) return std::string(record);
    const std::string_view key = nedit::TrimView(record.substr(0, record.find(' ')));
    const std::size_t last_blank = record.rfind(' ', comma);
    const std::size_t rest = last_blank == std::string_view::npos ? 0 : last_blank + 1;
    // "%-10s%s,%s": the key, upper-cased and padded to ten places, the name, the fields.
    std::string out;
    out.reserve(std::max<std::size_t>(key.size(), 10) + id.size() + 1 + record.size() - rest);
    for (const char c : key) out += c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c;
    if (key.size() < 10) out.append(10 - key.size(), ' ');
    out.append(id);
    out += ',';
    out.append(record.substr(rest));
    return out;
}

std::wstring UNeutralFileFormat::MakeUpperCaseString(const std::wstring& text) const {
    return nedit::ToUpper(text);
}

int UNeutralFileFormat::GetStringCount(const std::wstring& text, wchar_t c) const {
    return nedit::CountOf(text, c);
}

int UNeutralFileFormat::SlotOf(int id) const {
    int slot = -1;
    if (id >= 0 && static_cast<std::size_t>(id) < slot_of_id_.size()) {
        slot = slot_of_id_[static_cast<std::size_t>(id)];
    } else if (const FieldDefinition* field = definition_.FieldById(id)) {
        slot = field->slot;
    }
    return slot >= 0 && static_cast<std::size_t>(slot) < current_.size() ? slot : -1;
}

UNeutralFileFormat::CurrentValue* UNeutralFileFormat::CurrentOf(int id) {
    const int slot = SlotOf(id);
    return slot >= 0 ? &current_[static_cast<std::size_t>(slot)] : &other_current_[id];
}

const UNeutralFileFormat::CurrentValue* UNeutralFileFormat::CurrentOf(int id) const {
    const int slot = SlotOf(id);
    if (slot >= 0) return &current_[static_cast<std::size_t>(slot)];
    const auto found = other_current_.find(id);
    return found == other_current_.end() ? nullptr : &found->second;
}

const std::wstring& UNeutralFileFormat::GetCurrentValue(int id) const {
    static const std::wstring kNone;
    const CurrentValue* current = CurrentOf(id);
    if (current == nullptr) return kNone;
    if (!current->wide_made) {
        current->wide = current->converted ? nedit::DoubleToText(current->number)
                                           : nedit::FromUtf8(current->text);
        current->wide_made = true;
    }
    return current->wide;
}

void UNeutralFileFormat::SetCurrentValue(int id, const std::wstring& value) {
    CurrentValue* current = CurrentOf(id);
    current->text.clear();
    nedit::AppendUtf8(current->text, value);
    current->converted = false;
    current->wide = value;
    current->wide_made = true;
}

RecordValue UNeutralFileFormat::CurrentValueOf(int id) const {
    RecordValue value;
    if (const CurrentValue* current = CurrentOf(id)) {
        value.text = current->text;
        value.number = current->number;
        value.converted = current->converted;
    }
    return value;
}

void UNeutralFileFormat::SetCurrentValue(int id, const RecordValue& value) {
    CurrentValue* current = CurrentOf(id);
    current->text.assign(value.text);
    current->number = value.number;
    current->converted = value.converted;
    current->wide_made = false;
}

void UNeutralFileFormat::ResetCurrentValues() {
    for (CurrentValue& current : current_) {
        current.text.clear();
        current.converted = false;
        current.wide_made = false;
    }
    other_current_.clear();
}

void UNeutralFileFormat::InitUnitsAndAngleModes(wchar_t& angle, wchar_t& length, wchar_t& hmode,
                                                wchar_t& vmode) const {
    angle = nedit::LetterOf(settings_ ? settings_->GetAngleUnit() : nedit::AngleUnit::DegMinSec);
    length = nedit::LetterOf(WorkingLengthUnit());
    hmode = L'A';
    vmode = L'Z';
}

double UNeutralFileFormat::ConvertToZenithVA(double reading) const {
    switch (CurrentLetter(fld::VMode, L'Z')) {
        case L'N':
            return 180.0 - reading;
        case L'A':
            return 90.0 - reading;
        default:
            return reading;
    }
}

double UNeutralFileFormat::ConvertDist(double value, bool to_file) const {
    return to_file ? nedit::ConvertLength(value, WorkingLengthUnit(), FileLengthUnit())
                   : nedit::ConvertLength(value, FileLengthUnit(), WorkingLengthUnit());
}

double UNeutralFileFormat::ConvertAngle(double value) const {
    return nedit::ToDegrees(value, FileAngleUnit());
}

double UNeutralFileFormat::ConvertToAngleDisplayUnit(double degrees) const {
    return nedit::FromDegrees(degrees,
                              settings_ ? settings_->GetAngleUnit() : nedit::AngleUnit::DegMinSec);
}

nedit::LengthUnit UNeutralFileFormat::WorkingLengthUnit() const {
    return settings_ ? settings_->GetLengthUnit() : nedit::LengthUnit::Metres;
}

nedit::LengthUnit UNeutralFileFormat::FileLengthUnit() const {
    return nedit::LengthUnitFromLetter(
        CurrentLetter(fld::UL, nedit::LetterOf(WorkingLengthUnit())));
}

nedit::AngleUnit UNeutralFileFormat::FileAngleUnit() const {
    const wchar_t job =
        nedit::LetterOf(settings_ ? settings_->GetAngleUnit() : nedit::AngleUnit::DegMinSec);
    return nedit::AngleUnitFromLetter(CurrentLetter(fld::UA, job));
}

wchar_t UNeutralFileFormat::CurrentLetter(int id, wchar_t fallback) const {
    const CurrentValue* current = CurrentOf(id);
    if (current == nullptr || (!current->converted && current->text.empty())) return fallback;
    if (!current->converted && static_cast<unsigned char>(current->text[0]) < 0x80) {
        const char first = current->text[0];
        return first >= 'a' && first <= 'z' ? static_cast<wchar_t>(first - 32) : first;
    }
    return nedit::ToUpper(GetCurrentValue(id).substr(0, 1))[0];
}
