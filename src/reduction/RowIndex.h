#pragma once
// The rows of some record types (one type, or the coordinate types Xyz and Yxz together) by
// the name in their ID field: FindXYZ and FindRecord look a name up here instead of reading
// every row again, which made a run quadratic in stations that the user had to be asked for.
//
// A look-up gives what a walk down the rows from the first gives, current values included.
// Such a walk parses each row of the types in turn through the format service; a row without
// an ID of its own takes the ID in force (so rows before the first one with an ID take the
// ID the service held when the walk began), and a missing value takes the value in force. So
// the index keeps, for each row of the types, which fields it has, and a look-up parses only
// the rows whose values the walk would have left in force where it stops, in their order: the
// row found has the walk's values, and the service's current values end as the walk leaves
// them. Where a row of the types carries a unit field (UL, UA), values would be read in
// changing units, and a look-up walks every row as before.
//
// The index is made from the rows at its first look-up. Rows the engine puts in or replaces
// are told to it (Inserted, Replaced), and it follows them at the cost of the rows of its
// types that come after; any other change of the rows (their revision moved on) makes it
// again at the next look-up.

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "platform/text/NameTable.h"
#include "records/RecordFields.h"

class UNeutralFileFormat;

namespace nedit {
class RowSource;
}

class RowIndex {
  public:
    RowIndex(UNeutralFileFormat& format, nedit::NameTable& names, std::vector<int> types);

    /// The first row of the types whose ID is `name`, or -1. The fields of the last row the
    /// walk parses (the row found) are then in `fields`, good until the rows change.
    int Find(const nedit::RowSource& rows, std::wstring_view name, RecordFields& fields);
    /// A row was put in at `row` (those from there on moved down one), the rows' revision
    /// having been `before`.
    void Inserted(const nedit::RowSource& rows, int row, std::uint64_t before);
    /// The text of `row` was replaced; it held `old`, the rows' revision having been `before`.
    void Replaced(const nedit::RowSource& rows, int row, std::string_view old,
                  std::uint64_t before);

  private:
    /// A row of the types: the id of its own ID (none when it has none) and its fields.
    struct Member {
        std::uint32_t Row = 0;
        nedit::NameTable::Id Name = nedit::NameTable::kNone;
    };

    bool InSync(const nedit::RowSource& rows, std::uint64_t revision) const;
    /// The place among the members of the first at or after `row`.
    std::size_t PositionOf(std::uint32_t row) const;
    void Make(const nedit::RowSource& rows);
    /// The row's text as the walk reads it (trimmed, upper case) and its type when it is one of
    /// the types, else 0.
    int Classify(std::string_view text, std::string& buffer, std::string_view& row) const;
    /// Reads the fields the row names; false when it is no row of the types.
    bool Peek(std::string_view text, std::vector<int>& named, nedit::NameTable::Id& name);
    void Add(std::size_t position, std::uint32_t row, const std::vector<int>& named,
             nedit::NameTable::Id name);
    /// The walk over every row, for rows in changing units.
    int Walk(const nedit::RowSource& rows, std::string_view name, RecordFields& fields);
    void Parse(std::string_view text, RecordFields& fields);

    UNeutralFileFormat& Format;
    nedit::NameTable& Names;
    std::vector<int> Types;
    const nedit::RowSource* Source = nullptr;
    std::uint64_t Revision = 0;
    bool Made = false;
    bool Irregular = false;       // a row of the types has a unit field
    std::vector<Member> Members;  // in the order of their rows
    std::unordered_map<nedit::NameTable::Id, std::uint32_t> FirstOfName;  // member positions
    std::uint32_t Leading = 0;  // members before the first with an ID of its own
    std::map<int, std::vector<std::uint32_t>> WithField;  // field id: member positions
    std::string Buffer;
    RecordFields Scratch;
};
