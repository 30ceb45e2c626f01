#include "ui/dialogs/NEdit_Global_Edit.h"

#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"

namespace nedit {

namespace {

/// The record with `token` ("CO=FENCE") in place of its field: the field of that name, else
/// the field at `position`, else (another field stands there) a new field at the end.
std::wstring ReplaceField(const std::wstring& record, int position, const std::wstring& token) {
    const std::wstring name = token.substr(0, token.find(L'=') + 1);
    const std::size_t key_end = record.find_first_of(L" ,");
    std::size_t start = key_end == std::wstring::npos ? record.size() : key_end + 1;
    int index = 0;
    bool taken = false;  // another field stands at `position`
    while (start < record.size()) {
        std::size_t end = record.find(L',', start);
        if (end == std::wstring::npos) end = record.size();
        const std::wstring_view piece =
            TrimView(std::wstring_view(record).substr(start, end - start));
        if (StartsWith(piece, name)) return record.substr(0, start) + token + record.substr(end);
        if (index == position && piece.find(L'=') != std::wstring_view::npos) taken = true;
        start = end + 1;
        ++index;
    }
    return taken ? record + L',' + token : ReplaceToken(record, position, token);
}

}  // namespace

int NEdit_Global_Edit::MaskOf(int type) {
    if (type == rec::Stn) return kStationRows;
    if (type == rec::Bs || type == rec::Ss || type == rec::Ss2) return kTargetRows;
    return 0;
}

const int& NEdit_Global_Edit::BoxOf(int box) const {
    switch (box) {
        case kStnCodeBox:
            return ModifyStnCode;
        case kInstHeightBox:
            return ModifyInstHeight;
        case kTargetCodeBox:
            return ModifyTargetCode;
        default:
            return ModifyTargetHeight;
    }
}

bool NEdit_Global_Edit::IsBoxEnabled(int box) const {
    if (box == kStnCodeBox || box == kInstHeightBox) return (Mask & kStationRows) != 0;
    return (Mask & ~kStationRows) != 0;
}

bool NEdit_Global_Edit::IsValueEnabled(int box) const {
    return IsBoxEnabled(box) && BoxOf(box) != 0;
}

int NEdit_Global_Edit::GetValues(std::wstring& values, LengthUnit fileLength) const {
    int mask = 0;
    const auto height = [&](double value) {
        return Format(L"%.3f", ConvertLength(value, JobLength, fileLength));
    };
    std::wstring tokens[4];
    if (IsValueEnabled(kStnCodeBox)) {
        tokens[0] = L"CO=" + StnCode;
        mask |= kChangeStnCode;
    }
    if (IsValueEnabled(kInstHeightBox)) {
        tokens[1] = L"HI=" + height(InstHeight);
        mask |= kChangeInstHeight;
    }
    if (IsValueEnabled(kTargetCodeBox)) {
        tokens[2] = L"CO=" + TargetCode;
        mask |= kChangeTargetCode;
    }
    if (IsValueEnabled(kTargetHeightBox)) {
        tokens[3] = L"HT=" + height(TargetHeight);
        mask |= kChangeTargetHeight;
    }
    values = tokens[0] + L',' + tokens[1] + L',' + tokens[2] + L',' + tokens[3];
    return mask;
}

int NEdit_Global_Edit::UpdateRecord(std::wstring& record, int type, int mask,
                                    const std::wstring& values) {
    struct Change {
        int bit;
        int token;
        int position;
    };
    static constexpr Change kStation[] = {{kChangeInstHeight, 1, 1}, {kChangeStnCode, 0, 2}};
    static constexpr Change kTarget[] = {{kChangeTargetHeight, 3, 4}, {kChangeTargetCode, 2, 5}};
    static constexpr Change kPoint[] = {{kChangeTargetCode, 2, 4}};
    const auto apply = [&](const auto& changes) {
        for (const Change& change : changes) {
            const std::wstring token = GetDelimToken(values, change.token, L",");
            if ((mask & change.bit) != 0 && !token.empty())
                record = ReplaceField(record, change.position, token);
        }
        return 1;
    };
    if (type == rec::Stn) return apply(kStation);
    if (type == rec::Bs || type == rec::Ss || type == rec::Ss2) return apply(kTarget);
    if (type == rec::PSX || type == rec::PSN) return apply(kPoint);
    return 0;
}

}  // namespace nedit
