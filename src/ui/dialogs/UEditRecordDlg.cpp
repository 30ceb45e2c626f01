#include "ui/dialogs/UEditRecordDlg.h"

#include <algorithm>
#include <cmath>

#include "platform/format/UFormatAngle.h"
#include "platform/geometry/UWPoint.h"
#include "platform/job/UJobSettings.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

namespace nedit {

namespace {

bool IsAngleField(int id) {
    return id == fld::HA || id == fld::HCorr || id == fld::VCorr || id == fld::BkBearing ||
           id == fld::Bearing2 || id == 913;
}

bool IsLengthField(int id) {
    return (id >= fld::SD && id <= fld::HI) || (id >= fld::E && id <= fld::OffsetUp) ||
           (id >= 829 && id <= 832) || (id >= 907 && id <= 912) || id == 914;
}

/// The whole text is one number: a sign, digits and a point, with at least one digit.
bool ReadsAsNumber(std::wstring_view text) {
    std::size_t i = text.empty() || (text[0] != L'+' && text[0] != L'-') ? 0 : 1;
    bool digit = false;
    bool point = false;
    for (; i < text.size(); ++i) {
        if (text[i] >= L'0' && text[i] <= L'9') {
            digit = true;
        } else if (text[i] == L'.' && !point) {
            point = true;
        } else {
            return false;
        }
    }
    return digit;
}

int DecimalsOf(std::wstring_view text) {
    const std::size_t point = text.find(L'.');
    return point == text.npos ? 0 : static_cast<int>(text.size() - point - 1);
}

std::vector<std::wstring> SplitAtCommas(std::wstring_view text) {
    std::vector<std::wstring> pieces;
    for (;;) {
        const std::size_t comma = text.find(L',');
        pieces.emplace_back(text.substr(0, comma));
        if (comma == text.npos) return pieces;
        text = text.substr(comma + 1);
    }
}

constexpr wchar_t kLinearLetters[] = {L'M', L'F', L'U'};
constexpr wchar_t kAngularLetters[] = {L'S', L'D', L'G'};

}  // namespace

UEditRecordDlg::UEditRecordDlg(const UNeutralFileFormat& format, const UJobSettings* job,
                               FileUnits units)
    : RecordFormat(format), Job(job), Units(units) {}

std::wstring UEditRecordDlg::GetTitle() const {
    return Format(L"Edit %s Record", RecordKey);
}

UEditRecordDlg::Control UEditRecordDlg::ControlOf(int fieldId) {
    switch (fieldId) {
        case fld::ID:
            return Control::PointName;
        case fld::VA:
            return Control::VAngle;
        case fld::SD:
        case fld::HD:
        case fld::OffsetAlong:
        case fld::OffsetRight:
        case fld::OffsetUp:
        case 911:
        case 914:
            return Control::Distance;
        case fld::CO:
            return Control::Code;
        case fld::E:
        case fld::N:
            return Control::Coord;
        case fld::H:
            return Control::Elevation;
        case fld::BkBearing:
        case fld::Bearing2:
            return Control::Bear;
        case fld::Number1:
        case fld::Number2:
            return Control::Long;
        default:
            break;
    }
    if (IsAngleField(fieldId)) return Control::Angle;
    if (IsLengthField(fieldId)) return Control::Length;
    return Control::Plain;
}

bool UEditRecordDlg::LoadRecord(const std::wstring& text) {
    Fields.clear();
    FieldIds.clear();
    Windows.clear();
    const std::wstring line = Trim(text);
    if (line.empty() || line[0] == L'#') return false;
    const std::size_t key_end = line.find_first_of(L" ,");
    RecordKey = ToUpper(line.substr(0, key_end));
    if (!RecordFormat.FindRecordKey(RecordKey, RecordType) || RecordType == rec::Comment)
        return false;
    const std::wstring values =
        key_end == std::wstring::npos ? std::wstring() : Trim(line.substr(key_end + 1));
    SingleField = RecordFormat.IsKeyOfSingleField(RecordType);
    if (SingleField) {
        const int id = RecordFormat.GetFieldId(RecordType);
        std::wstring field_key;
        Fields.push_back({RecordKey, values});
        FieldIds.push_back(RecordFormat.FindRecordField(id, field_key) ? id : 0);
        return true;
    }
    if (values.empty()) return false;
    std::wstring layout;
    RecordFormat.GetRecordTemplate(RecordType, layout);
    const std::vector<std::wstring> layout_keys = SplitAtCommas(layout);
    const std::vector<std::wstring> pieces = SplitAtCommas(values);
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        const std::size_t equals = pieces[i].find(L'=');
        UFieldData field;
        if (equals == std::wstring::npos) {
            if (i < layout_keys.size()) field.Name = TrimChars(layout_keys[i], L"=");
            field.Value = ToUpper(Trim(pieces[i]));
        } else {
            field.Name = ToUpper(Trim(std::wstring_view(pieces[i]).substr(0, equals)));
            field.Value = ToUpper(Trim(std::wstring_view(pieces[i]).substr(equals + 1)));
        }
        int id = 0;
        if (field.Name.empty() || !RecordFormat.FindRecordField(field.Name, id)) id = 0;
        Fields.push_back(std::move(field));
        FieldIds.push_back(id);
    }
    return true;
}

bool UEditRecordDlg::ShowsUnitChoices() const {
    return RecordType == rec::Unit;
}

bool UEditRecordDlg::ShowsModeChoices() const {
    return RecordType == rec::Amode;
}

void UEditRecordDlg::MakeFieldWindows() {
    Windows.clear();
    if (ShowsUnitChoices() || ShowsModeChoices()) return;
    const LengthUnit job_length = Job != nullptr ? Job->GetLengthUnit() : LengthUnit::Metres;
    const AngleUnit job_angle = Job != nullptr ? Job->GetAngleUnit() : AngleUnit::DegMinSec;
    for (std::size_t i = 0; i < Fields.size(); ++i) {
        UFieldWindow window;
        window.Name = Fields[i].Name;
        window.Id = FieldIds[i];
        window.Edit = ControlOf(window.Id);
        window.Value = Fields[i].Value;
        const bool angle = IsAngleField(window.Id) || window.Id == fld::VA;
        const bool length = IsLengthField(window.Id);
        if ((angle || length || window.Edit == Control::Long) && ReadsAsNumber(window.Value)) {
            const double value = TextToDouble(window.Value);
            window.HasNumber = true;
            const bool as_kept = angle ? Units.angle == job_angle &&
                                             (window.Id != fld::VA || Units.verticalMode == L'Z')
                                       : !length || Units.length == job_length;
            if (as_kept) window.Decimals = DecimalsOf(window.Value);
            if (window.Id == fld::VA) {
                window.Number = Units.ToZenith(ToDegrees(value, Units.angle));
            } else if (angle) {
                window.Number = ToDegrees(value, Units.angle);
            } else if (length) {
                window.Number = ConvertLength(value, Units.length, job_length);
            } else {
                window.Number = value;
            }
        }
        Windows.push_back(std::move(window));
    }
}

void UEditRecordDlg::OnInitDialog() {
    MakeFieldWindows();
    const auto letter = [this](int id) {
        const int index = FieldIndex(id);
        const std::wstring& value =
            index >= 0 ? Fields[static_cast<std::size_t>(index)].Value : std::wstring();
        return value.empty() ? L' ' : value[0];
    };
    if (ShowsUnitChoices()) {
        LinearChoice = IndexOf(LengthUnitFromLetter(letter(fld::UL)));
        AngularChoice = IndexOf(AngleUnitFromLetter(letter(fld::UA)));
    } else if (ShowsModeChoices()) {
        HorizontalChoice = letter(fld::HMode) == L'B' ? 1 : 0;
        const wchar_t vertical = letter(fld::VMode);
        VerticalChoice = vertical == L'N' ? 3 : vertical == L'A' ? 4 : 2;
    }
    LoadedChoices[0] = LinearChoice;
    LoadedChoices[1] = AngularChoice;
    LoadedChoices[2] = HorizontalChoice;
    LoadedChoices[3] = VerticalChoice;
}

bool UEditRecordDlg::OnOK() {
    if (ShowsUnitChoices()) {
        // A choice left as it was keeps the record's own letter ("1" stays "1").
        if (LinearChoice != LoadedChoices[0])
            SetField(fld::UL, std::wstring(1, kLinearLetters[std::clamp(LinearChoice, 0, 2)]));
        if (AngularChoice != LoadedChoices[1])
            SetField(fld::UA, std::wstring(1, kAngularLetters[std::clamp(AngularChoice, 0, 2)]));
    } else if (ShowsModeChoices()) {
        if (HorizontalChoice != LoadedChoices[2])
            SetField(fld::HMode, HorizontalChoice == 1 ? L"B" : L"A");
        if (VerticalChoice != LoadedChoices[3])
            SetField(fld::VMode, VerticalChoice == 3 ? L"N" : VerticalChoice == 4 ? L"A" : L"Z");
    } else {
        for (std::size_t i = 0; i < Windows.size() && i < Fields.size(); ++i)
            Fields[i].Value = WrittenValue(Windows[i]);
    }
    return true;
}

std::wstring UEditRecordDlg::WrittenValue(const UFieldWindow& window) const {
    const std::size_t index = static_cast<std::size_t>(&window - Windows.data());
    if (!window.Edited) return Fields[index].Value;
    const std::wstring typed = ToUpper(Trim(window.Value));
    const bool angle = IsAngleField(window.Id) || window.Id == fld::VA;
    const bool length = IsLengthField(window.Id);
    if (typed.empty() || !(angle || length || window.Edit == Control::Long)) return typed;
    if (window.Edit == Control::Long)
        return Format(L"%d", static_cast<int>(std::lround(window.Number)));
    if (angle) {
        const double degrees =
            window.Id == fld::VA ? Units.FromZenith(window.Number) : window.Number;
        const int decimals =
            std::max(Job != nullptr ? Job->GetAngleDecimals() : 4, DecimalsOf(typed));
        const UFormatAngle format(IndexOf(Units.angle), decimals, 0);
        return format.ConvertToDisplayString(DoubleToText(degrees));
    }
    const LengthUnit job_length = Job != nullptr ? Job->GetLengthUnit() : LengthUnit::Metres;
    const int decimals = std::max(Job != nullptr ? Job->GetLengthDecimals() : 3, DecimalsOf(typed));
    return Format(L"%.*f", decimals, ConvertLength(window.Number, job_length, Units.length));
}

int UEditRecordDlg::FieldIndex(int id) const {
    for (std::size_t i = 0; i < FieldIds.size(); ++i) {
        if (FieldIds[i] == id) return static_cast<int>(i);
    }
    return -1;
}

void UEditRecordDlg::SetField(int id, const std::wstring& value) {
    const int index = FieldIndex(id);
    if (index >= 0) {
        Fields[static_cast<std::size_t>(index)].Value = value;
        return;
    }
    std::wstring name;
    RecordFormat.FindRecordField(id, name);
    Fields.push_back({name, value});
    FieldIds.push_back(id);
}

void UEditRecordDlg::GetRecordText(std::wstring& out) const {
    out = Format(L"%-10s", RecordKey);
    if (SingleField) {
        if (!Fields.empty()) out += Fields.front().Value;
        return;
    }
    for (std::size_t i = 0; i < Fields.size(); ++i) {
        if (i > 0) out += L',';
        if (!Fields[i].Name.empty()) out += Fields[i].Name + L'=';
        out += Fields[i].Value;
    }
}

std::wstring UEditRecordDlg::GetRecordText() const {
    std::wstring text;
    GetRecordText(text);
    return text;
}

}  // namespace nedit
