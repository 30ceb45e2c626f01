#pragma once
// The record-definition service: everything that parses or lays out a neutral record goes
// through it. It knows the keys and fields of every record type, reads values in the
// file's units and modes, and remembers the current value of each field, so that a field
// left out of a record takes the value it last had in the file.
//
// Units: the file's linear and angular units and its vertical mode are the current values
// of the fields UL, UA and VM. Parsing a UNIT or AMODE record therefore switches the units
// for the records after it; with no such record the job's units, and the zenith mode, hold.
// Values handed out are in working units: lengths in the job's unit, angles in degrees.

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "platform/job/UJobSettings.h"
#include "records/FieldMap.h"
#include "records/RecordDefinition.h"
#include "records/RecordFields.h"

class UNeutralFileFormat {
  public:
    /// Binds the service to the job's settings, from which the working units are read.
    /// The settings must outlive the service; without them metres and ddd.mmss hold.
    explicit UNeutralFileFormat(const UJobSettings* settings);
    virtual ~UNeutralFileFormat();
    UNeutralFileFormat(const UNeutralFileFormat&) = delete;
    UNeutralFileFormat& operator=(const UNeutralFileFormat&) = delete;

    void InitMaps();
    void ClearMaps();
    /// Loads "NeutralRecords.def" from `dir` (with or without a trailing separator).
    /// Gives false when it cannot be read or understood; LastDefinitionError() says why.
    bool LoadNeutralFileDefinition(const std::wstring& dir);
    /// The same from the text of a definition.
    bool LoadDefinitionText(const std::wstring& text);
    const std::wstring& LastDefinitionError() const { return definition_error_; }
    bool IsKeysInitialised() const { return !definition_.Empty(); }

    /// True when the trimmed, upper-cased line is a neutral file header: "#VERSION-",
    /// a version, and " NEUTRAL FILE" at its end.
    bool IsFileHeader(const std::wstring& line) const;
    /// 0 when the line holds no record, i.e. nothing is left once control characters are
    /// blanked and the ends trimmed; otherwise 1 with that text in `record`.
    int ExtractRecord(const std::wstring& line, std::wstring& record) const;
    /// The type of a row: 99 for a comment, the type of its key, or 0 for an unknown key.
    int GetRecordType(const std::wstring& line) const;
    /// The same for a row in UTF-8.
    int GetRecordTypeUtf8(std::string_view line) const;

    int FindRecordKey(int type, std::wstring& key) const;
    int FindRecordKey(const std::wstring& key, int& type) const;
    /// The same for a key in UTF-8, already in upper case.
    int FindRecordKeyUtf8(std::string_view key, int& type) const;
    int FindRecordField(int id, std::wstring& key) const;
    int FindRecordField(const std::wstring& key, int& id) const;
    /// The kind of edit control of a field: 1 whole number, 3 real number, 7 angle,
    /// 6 plain text. Gives 0 for an unknown key.
    int FindFieldWinType(const std::wstring& key, int& type) const;
    /// How many fields the type has (1 for a single-field record); 0 for none.
    int FindFieldsArray(int type) const;
    bool IsKeyOfSingleField(int type) const;
    /// The field id that a single-field record stands for; its own type when it stands for
    /// no other field; 0 for a type that is not a single-field record.
    int GetFieldId(int type) const;

    /// Parses `line` as a record of `type` into `fields`, lengths and angles in working
    /// units. A field is named ("HA=123.4530") or, without "=", taken by its position in
    /// the record's layout. Every non-empty value becomes the field's current value. A
    /// single-field record keeps its value under its own type number.
    /// Gives 0, with `fields` empty, for an unknown type or a type without fields.
    int ProcessRecord(int type, const std::wstring& line, FieldMap& fields);
    /// The same from a row in UTF-8, its values as views into `line` (which must outlive
    /// them) or as numbers in working units; what the values read as, and the current values
    /// it leaves, are those of ProcessRecord.
    int ReadRecord(int type, std::string_view line, RecordFields& fields);
    /// The same, leaving the current values alone: the fields a record names and their
    /// texts, as an index of the rows needs them. Values in other units are converted with
    /// the units in force now.
    int PeekRecord(int type, std::string_view line, RecordFields& fields) const;

    /// The template of a record type: its field keys, each with "=", joined by commas
    /// ("ID=,HI=,CO=" for a station); empty for a single-field record. False for an unknown type.
    bool GetRecordTemplate(int type, std::wstring& text) const;

    /// The record laid out in the standard way: the key padded to nine characters and a
    /// blank, then the fields separated by commas, blanks around "=" and "," removed.
    /// Values are not touched. A comment or an empty text is given back as it is.
    std::wstring FormatRecord(int type, const std::wstring& line) const;
    /// The same for a record in UTF-8 whose key is ASCII.
    std::string FormatRecordUtf8(std::string_view line) const;
    /// The record with `id` inserted as its first field: "%-10s%s,%s" of the key, `id`, and
    /// the text from the first field on. A record without a comma is given back unchanged.
    std::wstring ReformatRecord(const std::wstring& record, const std::wstring& id) const;
    /// The same in UTF-8, for a record whose key is ASCII.
    std::string ReformatRecordUtf8(std::string_view record, std::string_view id) const;

    std::wstring MakeUpperCaseString(const std::wstring& text) const;
    int GetStringCount(const std::wstring& text, wchar_t c) const;

    /// The current value of a field; empty when it has none. Valid until the next parse.
    const std::wstring& GetCurrentValue(int id) const;
    void SetCurrentValue(int id, const std::wstring& value);
    void ResetCurrentValues();
    /// The current value as ReadRecord gives values, good until the next parse.
    RecordValue CurrentValueOf(int id) const;
    void SetCurrentValue(int id, const RecordValue& value);

    /// The job's angle and length letters, and the start modes "A" and "Z".
    void InitUnitsAndAngleModes(wchar_t& angle, wchar_t& length, wchar_t& hmode,
                                wchar_t& vmode) const;
    /// A vertical reading in degrees, in the current vertical mode, as a zenith angle:
    /// "Z" zenith as it is, "N" nadir (180 - v), "A" above the horizon (90 - v).
    double ConvertToZenithVA(double reading) const;
    /// true: working length to file length; false: file length to working length.
    double ConvertDist(double value, bool to_file) const;
    /// A file angle, in the current angular unit, to degrees.
    double ConvertAngle(double value) const;
    /// Degrees to the job's angle display unit (ddd.mmss, degrees or gons).
    double ConvertToAngleDisplayUnit(double degrees) const;

    const UJobSettings* GetJobSettings() const { return settings_; }

    /// The letters in force for the records read so far: linear and angular unit (the
    /// job's until a UNIT record), horizontal and vertical mode ("A" and "Z" until an AMODE).
    wchar_t GetFileLengthLetter() const { return nedit::LetterOf(FileLengthUnit()); }
    wchar_t GetFileAngleLetter() const { return nedit::LetterOf(FileAngleUnit()); }
    wchar_t GetHModeLetter() const { return CurrentLetter(819, L'A'); }
    wchar_t GetVModeLetter() const { return CurrentLetter(820, L'Z'); }

  private:
    /// The current value of one field: its text in UTF-8 as it came, or, for a value read in
    /// other units, the number it became. Its wide text is made when it is asked for.
    struct CurrentValue {
        std::string text;
        double number = 0.0;
        bool converted = false;
        mutable std::wstring wide;
        mutable bool wide_made = false;
    };

    nedit::LengthUnit WorkingLengthUnit() const;
    nedit::LengthUnit FileLengthUnit() const;
    nedit::AngleUnit FileAngleUnit() const;
    wchar_t CurrentLetter(int id, wchar_t fallback) const;
    /// Whether a value of `kind` written as `text` is read in other units, and the number it
    /// then becomes.
    bool Converts(FieldKind kind, bool empty) const;
    double Converted(FieldKind kind, double value) const;
    /// A value text read in the file's units, written into `value` in working units.
    void ReadValue(FieldKind kind, std::wstring_view text, std::wstring& value) const;
    void StoreField(int id, FieldKind kind, std::wstring_view text, FieldMap& fields);
    void StoreField(int id, FieldKind kind, std::string_view text, RecordFields& fields);
    /// Gives each field of a record's text, with its value text, to `store`.
    template <typename Char, typename Store>
    int WalkFields(int type, std::basic_string_view<Char> line, Store store) const;
    /// The value of a field read from UTF-8 text.
    RecordValue ValueOf(FieldKind kind, std::string_view text) const;
    const FieldDefinition* FieldOfKey(std::wstring_view key) const;
    const FieldDefinition* FieldOfKey(std::string_view key) const;
    /// Where the current value of a field is kept, or -1 for a field the definition lacks.
    int SlotOf(int id) const;
    CurrentValue* CurrentOf(int id);
    const CurrentValue* CurrentOf(int id) const;
    void StartCurrentValues();

    const UJobSettings* settings_;
    RecordDefinitionTable definition_;
    std::wstring definition_error_;
    std::vector<CurrentValue> current_;                    // by the slot of the field
    std::unordered_map<int, CurrentValue> other_current_;  // ids that the definition lacks
    std::vector<int> slot_of_id_;                          // -1 for an id without a field
};
