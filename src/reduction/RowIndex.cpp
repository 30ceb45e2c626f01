#include "reduction/RowIndex.h"

#include <algorithm>

#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "records/UNeutralFileFormat.h"

namespace {

// A row as the look-ups read it: trimmed and in upper case. Rows that came through the gate
// are so already and are read in place.
std::string_view Normalised(std::string_view text, std::string& buffer) {
    const std::string_view trimmed = nedit::TrimView(text);
    const bool ready =
        nedit::IsAscii(trimmed) &&
        std::none_of(trimmed.begin(), trimmed.end(), [](char c) { return c >= 'a' && c <= 'z'; });
    if (ready) return trimmed;
    nedit::ToUpperUtf8(trimmed, buffer);
    return buffer;
}

bool HasUnitField(const std::vector<int>& named) {
    return std::any_of(named.begin(), named.end(),
                       [](int id) { return id == fld::UL || id == fld::UA; });
}

// The ID in force: a record's own, else the current one.
bool IdIs(const RecordFields& fields, const UNeutralFileFormat& format, std::string_view wanted) {
    const RecordValue* own = fields.find(fld::ID);
    const RecordValue value =
        own != nullptr && !own->empty() ? *own : format.CurrentValueOf(fld::ID);
    return value.converted ? value.Text() == wanted : value.text == wanted;
}

}  // namespace

RowIndex::RowIndex(UNeutralFileFormat& format, nedit::NameTable& names, std::vector<int> types)
    : Format(format), Names(names), Types(std::move(types)) {}

bool RowIndex::InSync(const nedit::RowSource& rows, std::uint64_t revision) const {
    return Made && Source == &rows && Revision == revision;
}

int RowIndex::Classify(std::string_view text, std::string& buffer, std::string_view& row) const {
    row = Normalised(text, buffer);
    const int type = Format.GetRecordTypeUtf8(row);
    return std::find(Types.begin(), Types.end(), type) != Types.end() ? type : rec::None;
}

bool RowIndex::Peek(std::string_view text, std::vector<int>& named, nedit::NameTable::Id& name) {
    std::string_view row;
    const int type = Classify(text, Buffer, row);
    if (type == rec::None) return false;
    Format.PeekRecord(type, row, Scratch);
    named.clear();
    name = nedit::NameTable::kNone;
    for (const auto& [id, value] : Scratch) {
        if (value.empty()) continue;
        named.push_back(id);
        if (id == fld::ID) name = Names.Intern(nedit::FromUtf8(value.text));
    }
    return true;
}

void RowIndex::Add(std::size_t position, std::uint32_t row, const std::vector<int>& named,
                   nedit::NameTable::Id name) {
    // The members from `position` on move one place on.
    for (std::size_t p = position; p < Members.size(); ++p) {
        if (Members[p].Name == nedit::NameTable::kNone) continue;
        const auto first = FirstOfName.find(Members[p].Name);
        if (first->second == p) first->second = static_cast<std::uint32_t>(p + 1);
    }
    for (auto& [field, positions] : WithField) {
        for (auto it = std::lower_bound(positions.begin(), positions.end(), position);
             it != positions.end(); ++it) {
            ++*it;
        }
    }
    Members.insert(Members.begin() + static_cast<std::ptrdiff_t>(position), {row, name});
    const auto at = static_cast<std::uint32_t>(position);
    if (at <= Leading) Leading = name == nedit::NameTable::kNone ? Leading + 1 : at;
    if (name != nedit::NameTable::kNone) {
        const auto [first, added] = FirstOfName.emplace(name, at);
        if (!added && first->second > at) first->second = at;
    }
    for (const int field : named) {
        std::vector<std::uint32_t>& positions = WithField[field];
        positions.insert(std::lower_bound(positions.begin(), positions.end(), at), at);
    }
    if (HasUnitField(named)) Irregular = true;
}

void RowIndex::Make(const nedit::RowSource& rows) {
    Members.clear();
    FirstOfName.clear();
    Leading = 0;
    WithField.clear();
    Irregular = false;
    std::vector<int> named;
    nedit::NameTable::Id name = nedit::NameTable::kNone;
    for (int row = 0; row < rows.GetItemCount(); ++row) {
        if (Peek(rows.GetRowUtf8(row), named, name))
            Add(Members.size(), static_cast<std::uint32_t>(row), named, name);
    }
    Source = &rows;
    Revision = rows.GetRevision();
    Made = true;
}

std::size_t RowIndex::PositionOf(std::uint32_t row) const {
    return static_cast<std::size_t>(
        std::lower_bound(Members.begin(), Members.end(), row,
                         [](const Member& member, std::uint32_t r) { return member.Row < r; }) -
        Members.begin());
}

void RowIndex::Inserted(const nedit::RowSource& rows, int row, std::uint64_t before) {
    if (!InSync(rows, before)) return;
    const auto at = static_cast<std::uint32_t>(row);
    const std::size_t position = PositionOf(at);
    for (std::size_t p = position; p < Members.size(); ++p) ++Members[p].Row;
    std::vector<int> named;
    nedit::NameTable::Id name = nedit::NameTable::kNone;
    if (Peek(rows.GetRowUtf8(row), named, name)) Add(position, at, named, name);
    Revision = rows.GetRevision();
}

void RowIndex::Replaced(const nedit::RowSource& rows, int row, std::string_view old,
                        std::uint64_t before) {
    if (!InSync(rows, before)) return;
    const auto at = static_cast<std::uint32_t>(row);
    const std::size_t position = PositionOf(at);
    const bool was = position < Members.size() && Members[position].Row == at;
    std::vector<int> named;
    nedit::NameTable::Id name = nedit::NameTable::kNone;
    const bool is = Peek(rows.GetRowUtf8(row), named, name);
    std::vector<int> old_named;
    nedit::NameTable::Id old_name = nedit::NameTable::kNone;
    if (was) Peek(old, old_named, old_name);
    if (was != is || (was && name != old_name)) {
        Made = false;  // made again at the next look-up
        return;
    }
    if (was) {
        // The same name: only the fields it names may differ.
        const auto p = static_cast<std::uint32_t>(position);
        for (const int field : old_named) {
            if (std::find(named.begin(), named.end(), field) != named.end()) continue;
            std::vector<std::uint32_t>& positions = WithField[field];
            positions.erase(std::lower_bound(positions.begin(), positions.end(), p));
        }
        for (const int field : named) {
            if (std::find(old_named.begin(), old_named.end(), field) != old_named.end()) continue;
            std::vector<std::uint32_t>& positions = WithField[field];
            positions.insert(std::lower_bound(positions.begin(), positions.end(), p), p);
        }
        if (HasUnitField(named)) Irregular = true;
    }
    Revision = rows.GetRevision();
}

void RowIndex::Parse(std::string_view text, RecordFields& fields) {
    std::string_view row;
    const int type = Classify(text, Buffer, row);
    Format.ReadRecord(type, row, fields);
}

int RowIndex::Find(const nedit::RowSource& rows, std::wstring_view name, RecordFields& fields) {
    if (!InSync(rows, rows.GetRevision())) Make(rows);
    const std::string wanted = nedit::ToUtf8(name);
    if (Irregular) return Walk(rows, wanted, fields);
    if (Members.empty()) return -1;

    // The member the walk stops at: a first one without an ID of its own when the ID in force
    // is the name, else the first with the name as its own, else the last.
    std::size_t at = Members.size() - 1;
    bool found = false;
    const RecordValue current = Format.CurrentValueOf(fld::ID);
    if (Leading > 0 && (current.converted ? current.Text() == wanted : current.text == wanted)) {
        at = 0;
        found = true;
    } else if (const nedit::NameTable::Id id = Names.Find(name); id != nedit::NameTable::kNone) {
        const auto first = FirstOfName.find(id);
        if (first != FirstOfName.end()) {
            at = first->second;
            found = true;
        }
    }
    // The rows whose values are in force there, in their order, the member itself last.
    std::vector<std::uint32_t> parsed;
    for (const auto& [field, positions] : WithField) {
        const auto after = std::upper_bound(positions.begin(), positions.end(), at);
        if (after != positions.begin() && *(after - 1) != at) parsed.push_back(*(after - 1));
    }
    std::sort(parsed.begin(), parsed.end());
    parsed.erase(std::unique(parsed.begin(), parsed.end()), parsed.end());
    parsed.push_back(static_cast<std::uint32_t>(at));
    for (const std::uint32_t p : parsed) Parse(rows.GetRowUtf8(Members[p].Row), fields);
    return found ? static_cast<int>(Members[at].Row) : -1;
}

int RowIndex::Walk(const nedit::RowSource& rows, std::string_view name, RecordFields& fields) {
    for (int row = 0; row < rows.GetItemCount(); ++row) {
        std::string_view text;
        const int type = Classify(rows.GetRowUtf8(row), Buffer, text);
        if (type == rec::None) continue;
        Format.ReadRecord(type, text, fields);
        if (IdIs(fields, Format, name)) return row;
    }
    return -1;
}
