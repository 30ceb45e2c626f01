#include "ui/dialogs/URecordDlg.h"

#include "document/UListCtrl.h"
#include "platform/job/UDocument.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

namespace nedit {

namespace {

std::vector<std::wstring> SplitAtCommas(std::wstring_view text) {
    std::vector<std::wstring> pieces;
    std::size_t start = 0;
    for (;;) {
        const std::size_t comma = text.find(L',', start);
        pieces.emplace_back(text.substr(start, comma == text.npos ? text.npos : comma - start));
        if (comma == text.npos) return pieces;
        start = comma + 1;
    }
}

/// The text after the key: everything behind its first blank (or comma), trimmed.
std::wstring_view AfterKey(std::wstring_view text) {
    const std::size_t end = text.find_first_of(L" ,");
    return end == text.npos ? std::wstring_view() : TrimView(text.substr(end + 1));
}

bool IsShownComment(std::wstring_view text) {
    return StartsWith(text, L"#!") || StartsWith(text, L"#?");
}

}  // namespace

URecordDlg::URecordDlg(const UNeutralFileFormat& format) : RecordFormat(format) {}

int URecordDlg::ClearFields() {
    Fields.clear();
    Rest.clear();
    FieldTexts.clear();
    Label.clear();
    Key.clear();
    Record.clear();
    WholeLine = false;
    Row = -1;
    RecordType = 0;
    return 1;
}

int URecordDlg::ShowRecord(const std::wstring& text, int row) {
    ClearFields();
    Loading = true;
    Row = row;
    Record = text;
    const std::wstring line = Trim(text);
    RecordType = RecordFormat.GetRecordType(line);
    if (!line.empty() && line[0] != L'#' && SplitFields(line, RecordType)) {
        Label = Key;
        Loading = false;
        for (const EDITFLDPTR& field : Fields) FieldTexts.push_back(field.Value);
        return 1;
    }
    Fields.clear();
    Rest.clear();
    // A line without fields is still shown whole, unless it is a comment of another form.
    if (!line.empty() && (line[0] != L'#' || IsShownComment(line))) {
        WholeLine = true;
        Fields.push_back({L"", L"", line, kPlainText, true});
        FieldTexts.push_back(line);
        Loading = false;
    } else {
        // Nothing of another row may stay behind to be typed into.
        Row = -1;
    }
    return 0;
}

bool URecordDlg::SplitFields(const std::wstring& text, int type) {
    if (type == rec::None || type == rec::Comment) return false;
    Key = ToUpper(text.substr(0, text.find_first_of(L" ,")));
    const std::wstring_view values = AfterKey(text);
    if (RecordFormat.IsKeyOfSingleField(type)) {
        std::wstring field_key;
        if (!RecordFormat.FindRecordField(RecordFormat.GetFieldId(type), field_key))
            field_key = Key;
        Fields.push_back({Key, L"", std::wstring(values), KindOf(field_key), true});
        return true;
    }
    if (RecordFormat.FindFieldsArray(type) == 0 || values.empty()) return false;
    std::wstring layout;
    RecordFormat.GetRecordTemplate(type, layout);
    const std::vector<std::wstring> layout_keys = SplitAtCommas(layout);
    const std::vector<std::wstring> pieces = SplitAtCommas(values);
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        if (Fields.size() == kMaxFields) {
            Rest.push_back(pieces[i]);
            continue;
        }
        const std::size_t equals = pieces[i].find(L'=');
        if (equals != std::wstring::npos) {
            const std::wstring name = ToUpper(Trim(std::wstring_view(pieces[i]).substr(0, equals)));
            AddField(name, name, Trim(std::wstring_view(pieces[i]).substr(equals + 1)));
        } else {
            // A bare value stands in its place of the layout, and is captioned so.
            const std::wstring place =
                i < layout_keys.size() ? TrimChars(layout_keys[i], L"=") : std::wstring();
            AddField(L"", place, Trim(pieces[i]));
        }
    }
    return true;
}

void URecordDlg::AddField(const std::wstring& name, const std::wstring& caption,
                          std::wstring value) {
    EDITFLDPTR field;
    field.Name = name;
    field.Caption =
        caption == L"STRING" || caption == L"REAL" || caption == L"NUMBER" ? L"" : caption;
    field.Value = std::move(value);
    field.Kind = KindOf(caption);
    field.Linked = Fields.size() < kLinkedFields;
    Fields.push_back(std::move(field));
}

int URecordDlg::KindOf(const std::wstring& fieldKey) const {
    int type = 0;
    if (!RecordFormat.FindFieldWinType(fieldKey, type) || type == 0) return kPlainText;
    return type;
}

void URecordDlg::OnFieldChanged(int index, const std::wstring& text) {
    if (index < 0 || index >= static_cast<int>(Fields.size())) return;
    EDITFLDPTR& field = Fields[static_cast<std::size_t>(index)];
    if (!field.Linked) return;
    field.Value = text;
    Record = JoinFields();
    if (List != nullptr && Row >= 0) List->SetRecord(Row, Record);
    if (RecordType == rec::Unit || RecordType == rec::Unit2) AngleType = ::GetAngleType(Record);
    if (!Loading) {
        Modified = 1;
        if (Doc != nullptr) Doc->SetModified(1);
    }
}

const std::wstring& URecordDlg::RememberedText(int index) const {
    static const std::wstring kNone;
    return index >= 0 && index < static_cast<int>(FieldTexts.size())
               ? FieldTexts[static_cast<std::size_t>(index)]
               : kNone;
}

std::wstring URecordDlg::JoinFields() const {
    if (WholeLine) return Fields.empty() ? std::wstring() : Fields.front().Value;
    std::wstring text = nedit::Format(L"%-9s ", Key);
    if (RecordFormat.IsKeyOfSingleField(RecordType))
        return Fields.empty() ? text : text + Fields.front().Value;
    bool first = true;
    for (const EDITFLDPTR& field : Fields) {
        if (!first) text += L',';
        first = false;
        if (!field.Name.empty()) text += field.Name + L'=';
        text += field.Value;
    }
    for (const std::wstring& piece : Rest) text += L',' + piece;
    return text;
}

}  // namespace nedit
