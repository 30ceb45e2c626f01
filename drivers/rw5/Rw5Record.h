#pragma once
// One line of a Carlson RW5 raw file, as the format's public documentation lays it out:
//
//   TYPE,FIELD,FIELD,...,--note
//
// TYPE is the record type (OC occupy, BK back sight, LS line of sight, SS side shot, BD/BR
// back sight and FD/FR foresight of an angle set on face 1 and 2, SP stored point, MO mode,
// JB job, ...). Each field is a code of one or two letters and its value without a separator
// ("FP105", "AR189.1420"); the coordinates are written "N 50000.0000" and "E 21085.8600".
// The note runs from "--" to the end of the line and may hold commas. A line that begins with
// "--" is a note as a whole.

#include <string>
#include <string_view>
#include <vector>

class Rw5Record {
  public:
    /// Splits a line. False when it has no record type of two or three capital letters.
    bool Read(std::string_view line);

    const std::string& Type() const { return type_; }
    const std::string& Note() const { return note_; }
    /// The value of the field `code` ("FP"), empty when the record has none.
    std::string_view Value(std::string_view code) const;
    bool Has(std::string_view code) const;

  private:
    struct Field {
        std::string code;
        std::string value;
    };
    std::string type_;
    std::string note_;
    std::vector<Field> fields_;
};
