#pragma once
// A record's text split into its key and its fields for the record form, and joined
// again: "SS        ID=P1,HA=12.3000" is the key "SS" and the fields ID and HA; a record of
// a single field ("SCALE     0.99960") has one field without a name. A comment has no
// fields.

#include <string>
#include <vector>

namespace nedit {

struct RecordFields {
    struct Field {
        std::wstring name;  // empty for the value of a single-field record
        std::wstring value;
    };
    std::wstring key;
    std::vector<Field> fields;

    /// Splits a row. A comment or an empty text gives no key and no fields.
    static RecordFields Split(const std::wstring& text);
    /// The record's text: the key, a blank, and the fields joined by commas.
    std::wstring Join() const;
};

}  // namespace nedit
