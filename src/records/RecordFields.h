#pragma once
// The fields of one record read from its UTF-8 text (UNeutralFileFormat::ReadRecord): for
// each field id its value, as a view into the row, or, when the file's units are not the
// working units, as the number the value became. Reading a survey this way copies no text,
// and clearing keeps the entries for the next record.

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// One value: the text as written, trimmed, or a number in working units.
struct RecordValue {
    std::string_view text;
    double number = 0.0;
    bool converted = false;

    bool empty() const { return !converted && text.empty(); }
    /// The number the value reads as, as nedit::TextToDouble reads its text: 0 when no number
    /// starts it, or when it is not finite.
    double Number() const;
    /// The value as text in UTF-8; a converted number as the shortest text that reads back.
    std::string Text() const;
    /// The same as wide text.
    std::wstring WideText() const;
};

class RecordFields {
  public:
    using Entry = std::pair<int, RecordValue>;

    void clear() { used_ = 0; }
    bool empty() const { return used_ == 0; }
    std::size_t size() const { return used_; }
    /// The value of `id`, or null when the record has none.
    const RecordValue* find(int id) const;
    /// The value of `id`, added empty when the record had none.
    RecordValue& operator[](int id);

    std::vector<Entry>::const_iterator begin() const { return entries_.begin(); }
    std::vector<Entry>::const_iterator end() const {
        return entries_.begin() + static_cast<std::ptrdiff_t>(used_);
    }

  private:
    std::vector<Entry> entries_;
    std::size_t used_ = 0;
};
