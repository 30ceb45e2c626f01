#include "records/RecordDefinition.h"

#include <algorithm>
#include <sstream>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace {

bool ParseKind(const std::wstring& word, FieldKind& kind) {
    static const std::unordered_map<std::wstring, FieldKind> kKinds = {
        {L"text", FieldKind::Text},       {L"angle", FieldKind::Angle},
        {L"length", FieldKind::Length},   {L"number", FieldKind::Number},
        {L"integer", FieldKind::Integer},
    };
    const auto found = kKinds.find(word);
    if (found == kKinds.end()) return false;
    kind = found->second;
    return true;
}

bool ParseId(const std::wstring& word, int& id) {
    id = nedit::TextToInt(word);
    return id > 0 && std::to_wstring(id) == word;
}

}  // namespace

bool RecordDefinitionTable::Parse(const std::wstring& text, std::wstring& error) {
    Clear();
    std::wistringstream lines(text);
    std::wstring line;
    int line_number = 0;
    while (std::getline(lines, line)) {
        ++line_number;
        std::wistringstream split(line);
        std::vector<std::wstring> words;
        for (std::wstring word; split >> word;) words.push_back(word);
        if (words.empty() || words[0][0] == L'#') continue;
        if (!ParseLine(words, error)) {
            error = L"line " + std::to_wstring(line_number) + L": " + error;
            Clear();
            return false;
        }
    }
    if (records_.empty()) {
        error = L"no records are defined";
        return false;
    }
    return true;
}

bool RecordDefinitionTable::ParseLine(const std::vector<std::wstring>& words, std::wstring& error) {
    const std::wstring& what = words[0];
    if (what == L"FIELD") {
        FieldDefinition field;
        if (words.size() != 4 || !ParseId(words[1], field.id) || !ParseKind(words[3], field.kind)) {
            error = L"expected FIELD id key kind";
            return false;
        }
        field.key = nedit::ToUpper(words[2]);
        AddField(field);
        return true;
    }
    RecordDefinition record;
    if ((what != L"RECORD" && what != L"SINGLE") || words.size() < 3 ||
        !ParseId(words[1], record.type)) {
        error = L"expected FIELD, RECORD or SINGLE with an id and a key";
        return false;
    }
    record.key = nedit::ToUpper(words[2]);
    if (what == L"SINGLE") {
        record.single_field = true;
        record.stands_for = record.type;
        if (words.size() < 4 || words.size() > 5 || !ParseKind(words[3], record.single_kind) ||
            (words.size() == 5 && !ParseId(words[4], record.stands_for))) {
            error = L"expected SINGLE type key kind [field-id]";
            return false;
        }
        AddField({record.type, record.key, record.single_kind, 0});
    } else {
        for (std::size_t i = 3; i < words.size(); ++i) {
            int id = 0;
            if (!ParseId(words[i], id) || FieldById(id) == nullptr) {
                error = L"unknown field " + words[i] + L" (fields are defined before records)";
                return false;
            }
            record.fields.push_back(id);
        }
    }
    record_types_by_key_[record.key] = record.type;
    record_types_by_utf8_key_.Set(nedit::ToUtf8(record.key), record.type);
    records_[record.type] = std::move(record);
    return true;
}

void RecordDefinitionTable::AddField(FieldDefinition field) {
    const auto known = fields_.find(field.id);
    field.slot = known != fields_.end() ? known->second.slot : static_cast<int>(fields_.size());
    field_ids_by_key_[field.key] = field.id;
    field_ids_by_utf8_key_.Set(nedit::ToUtf8(field.key), field.id);
    fields_[field.id] = std::move(field);
}

void RecordDefinitionTable::Clear() {
    records_.clear();
    record_types_by_key_.clear();
    record_types_by_utf8_key_.Clear();
    fields_.clear();
    field_ids_by_key_.clear();
    field_ids_by_utf8_key_.Clear();
}

const RecordDefinition* RecordDefinitionTable::RecordByType(int type) const {
    const auto found = records_.find(type);
    return found == records_.end() ? nullptr : &found->second;
}

const RecordDefinition* RecordDefinitionTable::RecordByKey(const std::wstring& key) const {
    const auto found = record_types_by_key_.find(key);
    return found == record_types_by_key_.end() ? nullptr : RecordByType(found->second);
}

const RecordDefinition* RecordDefinitionTable::RecordByKeyUtf8(std::string_view key) const {
    const int type = record_types_by_utf8_key_.Find(key);
    return type < 0 ? nullptr : RecordByType(type);
}

const FieldDefinition* RecordDefinitionTable::FieldById(int id) const {
    const auto found = fields_.find(id);
    return found == fields_.end() ? nullptr : &found->second;
}

const FieldDefinition* RecordDefinitionTable::FieldByKey(const std::wstring& key) const {
    const auto found = field_ids_by_key_.find(key);
    return found == field_ids_by_key_.end() ? nullptr : FieldById(found->second);
}

const FieldDefinition* RecordDefinitionTable::FieldByKeyUtf8(std::string_view key) const {
    const int id = field_ids_by_utf8_key_.Find(key);
    return id < 0 ? nullptr : FieldById(id);
}

namespace {

std::size_t HashOfKey(std::string_view key) {
    std::size_t hash = 14695981039346656037ull;  // FNV-1a
    for (const char c : key) hash = (hash ^ static_cast<unsigned char>(c)) * 1099511628211ull;
    return hash;
}

}  // namespace

void RecordDefinitionTable::Utf8Keys::Set(const std::string& key, int value) {
    if (4 * (used_ + 1) > slots_.size()) {
        std::vector<Slot> old = std::move(slots_);
        slots_.assign(std::max<std::size_t>(64, 2 * old.size()), Slot());
        used_ = 0;
        for (const Slot& slot : old) {
            if (slot.value >= 0) Set(slot.key, slot.value);
        }
    }
    const std::size_t mask = slots_.size() - 1;
    for (std::size_t i = HashOfKey(key) & mask;; i = (i + 1) & mask) {
        Slot& slot = slots_[i];
        if (slot.value < 0 || slot.key == key) {
            if (slot.value < 0) ++used_;
            slot.key = key;
            slot.value = value;
            return;
        }
    }
}

int RecordDefinitionTable::Utf8Keys::Find(std::string_view key) const {
    if (slots_.empty()) return -1;
    const std::size_t mask = slots_.size() - 1;
    for (std::size_t i = HashOfKey(key) & mask;; i = (i + 1) & mask) {
        const Slot& slot = slots_[i];
        if (slot.value < 0) return -1;
        if (slot.key == key) return slot.value;
    }
}

void RecordDefinitionTable::Utf8Keys::Clear() {
    slots_.clear();
    used_ = 0;
}
