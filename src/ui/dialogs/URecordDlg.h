#pragma once
// The logic of the record form beneath the list: the current record split into its fields,
// and every change of a field joined into the record's text again and written to its row,
// keystroke by keystroke. The form shows each field's text as the row holds it, so what is
// typed is what the row says.
//
// A record is its key and its fields "NAME=value" separated by commas; a field without a
// name is a bare value in its place of the record's layout, and a record of a single field
// ("SCALE     0.99960") is one bare value. A comment shows nothing, except one that begins
// "#!" or "#?": that line, like a record whose fields cannot be told, shows as one field
// holding the whole line, under no label.
//
// Decisions:
// - Typing in the whole-line field makes the typed text the row (through the list's gate,
//   which lays it out or, for an unknown key, keeps it as a comment).
// - At most 20 fields are shown, the first 12 editable; fields beyond them stay in the row
//   as they are when the others are typed in, so a keystroke never drops part of a record.
// - A row that cannot be shown leaves no fields behind, so nothing typed can go to it.
// - The angle type (the file's angular unit, which the form shows beside angle fields) is
//   set by whoever knows the file's units (SetAngType: the pane after each reduction) and
//   follows at once a unit record edited here.

#include <string>
#include <vector>

class UDocument;
class UListCtrl;
class UNeutralFileFormat;

namespace nedit {

class URecordDlg {
  public:
    static constexpr int kMaxFields = 20;
    static constexpr int kLinkedFields = 12;
    /// Kinds of field, as the record definition gives them.
    static constexpr int kWholeNumber = 1;
    static constexpr int kRealNumber = 3;
    static constexpr int kPlainText = 6;
    static constexpr int kAngle = 7;

    /// One field of the form.
    struct EDITFLDPTR {
        std::wstring Caption;  // shown above the field; blank for STRING, REAL, NUMBER
        std::wstring Name;     // empty for a bare value
        std::wstring Value;    // the text of the field, as shown or typed
        int Kind = kPlainText;
        bool Linked = true;  // typing in it rewrites the row
    };

    /// `format` reads the records; it must outlive the form.
    explicit URecordDlg(const UNeutralFileFormat& format);

    void SetList(UListCtrl* list) { List = list; }
    /// The document marked modified by an edit; may be null.
    void SetDoc(UDocument* doc) { Doc = doc; }
    /// The file's angular unit: 0 ddd.mmss, 1 decimal degrees, 2 gons.
    void SetAngType(int type) { AngleType = type; }
    int GetAngType() const { return AngleType; }

    /// 1 when a record was edited since ClearModified (the last reduction).
    int GetModifiedFlag() const { return Modified; }
    void SetModified() { Modified = 1; }
    void ClearModified() { Modified = 0; }

    /// Shows `text` as the record of `row`: 1 when it has fields; 0 for a line shown whole,
    /// a comment or an empty text (which show no fields or one).
    int ShowRecord(const std::wstring& text, int row);
    /// Takes every field away and forgets the record; gives 1.
    int ClearFields();
    /// Field `index` now reads `text`: the record is joined again and written to its row.
    /// A field that is not linked, or does not exist, changes nothing.
    void OnFieldChanged(int index, const std::wstring& text);
    /// The text field `index` had when the record was shown, which Escape puts back.
    const std::wstring& RememberedText(int index) const;

    /// The label: the record's key; empty for a line shown whole or nothing shown.
    const std::wstring& GetLabel() const { return Label; }
    const std::vector<EDITFLDPTR>& GetFields() const { return Fields; }
    const std::wstring& GetRecord() const { return Record; }
    int GetRow() const { return Row; }
    int GetRecordType() const { return RecordType; }
    bool IsLoading() const { return Loading; }
    /// The record's text with the fields as they now stand.
    std::wstring JoinFields() const;

  private:
    /// The record's own fields; false when it has none that can be told.
    bool SplitFields(const std::wstring& text, int type);
    void AddField(const std::wstring& name, const std::wstring& caption, std::wstring value);
    int KindOf(const std::wstring& fieldKey) const;

    const UNeutralFileFormat& RecordFormat;
    UDocument* Doc = nullptr;
    UListCtrl* List = nullptr;
    int AngleType = 0;
    int Modified = 0;
    bool Loading = false;
    std::wstring Label;
    std::vector<EDITFLDPTR> Fields;
    /// The pieces of the record beyond the fields shown, kept as they are.
    std::vector<std::wstring> Rest;
    bool WholeLine = false;
    std::wstring Record;
    std::wstring Key;
    int RecordType = 0;
    int Row = -1;
    std::vector<std::wstring> FieldTexts;
};

}  // namespace nedit
