#pragma once
// The record definition: which key names which record type, which fields each record has,
// and how each field's value is read. Loaded from a definition text shipped under data/.

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

/// How a field's value is read from a file.
enum class FieldKind { Text, Angle, Length, Number, Integer };

struct FieldDefinition {
    int id = 0;
    std::wstring key;
    FieldKind kind = FieldKind::Text;
    /// The field's place among all fields, from 0 up to FieldCount(): where its current
    /// value is kept.
    int slot = 0;
};

struct RecordDefinition {
    int type = 0;
    std::wstring key;
    /// Ids of the named fields in layout order; empty for a single-field record.
    std::vector<int> fields;
    bool single_field = false;
    /// For a single-field record: how its value is read, and the field id it stands for
    /// (its own type when it stands for no field).
    FieldKind single_kind = FieldKind::Text;
    int stands_for = 0;
};

class RecordDefinitionTable {
  public:
    /// Reads the definition text. Gives false and a message naming the line when a line
    /// is not understood; the table is then left empty.
    bool Parse(const std::wstring& text, std::wstring& error);

    bool Empty() const { return records_.empty(); }
    void Clear();

    const RecordDefinition* RecordByType(int type) const;
    const RecordDefinition* RecordByKey(const std::wstring& key) const;
    /// The same for a key in UTF-8.
    const RecordDefinition* RecordByKeyUtf8(std::string_view key) const;
    /// The type of a key in UTF-8, or -1.
    int RecordTypeByKeyUtf8(std::string_view key) const {
        return record_types_by_utf8_key_.Find(key);
    }
    /// Fields by id and by key. The key of a single-field record is also a field key, with
    /// the record's type as its id, so that its one value can be named.
    const FieldDefinition* FieldById(int id) const;
    const FieldDefinition* FieldByKey(const std::wstring& key) const;
    const FieldDefinition* FieldByKeyUtf8(std::string_view key) const;
    std::size_t FieldCount() const { return fields_.size(); }

  private:
    /// Short UTF-8 keys to numbers, found by one hash of the key's bytes: every row read
    /// looks its key up, so no string is made for the look-up.
    class Utf8Keys {
      public:
        void Set(const std::string& key, int value);
        /// The number of `key`, or -1.
        int Find(std::string_view key) const;
        void Clear();

      private:
        struct Slot {
            std::string key;
            int value = -1;
        };
        std::vector<Slot> slots_;  // a power of two in size, at most a quarter full
        std::size_t used_ = 0;
    };

    bool ParseLine(const std::vector<std::wstring>& words, std::wstring& error);
    void AddField(FieldDefinition field);

    std::unordered_map<int, RecordDefinition> records_;
    std::unordered_map<std::wstring, int> record_types_by_key_;
    Utf8Keys record_types_by_utf8_key_;
    std::unordered_map<int, FieldDefinition> fields_;
    std::unordered_map<std::wstring, int> field_ids_by_key_;
    Utf8Keys field_ids_by_utf8_key_;
};
