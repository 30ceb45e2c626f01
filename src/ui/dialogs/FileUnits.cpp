#include "ui/dialogs/FileUnits.h"

#include <algorithm>

#include "platform/job/UJobSettings.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

namespace nedit {

FileUnits FileUnits::OfJob(const UJobSettings* job) {
    FileUnits units;
    if (job != nullptr) {
        units.length = job->GetLengthUnit();
        units.angle = job->GetAngleUnit();
    }
    return units;
}

FileUnits FileUnits::AtRow(const UNeutralFileFormat& format, const UJobSettings* job,
                           const std::vector<std::wstring>& rows, int row) {
    FileUnits units = OfJob(job);
    const int end = std::min(row, static_cast<int>(rows.size()));
    for (int i = 0; i < end; ++i) {
        const std::wstring& text = rows[static_cast<std::size_t>(i)];
        // Only the three unit records matter; most rows are passed over by their first letters.
        if (!StartsWith(text, L"UNIT") && !StartsWith(text, L"AMODE")) continue;
        units.Take(text, format.GetRecordType(text));
    }
    return units;
}

void FileUnits::Take(std::wstring_view row, int type) {
    if (type == rec::Unit || type == rec::Unit2) {
        const std::wstring linear = FieldValueOf(row, L"UL", 0);
        const std::wstring angular = FieldValueOf(row, L"UA", 1);
        if (!linear.empty()) length = LengthUnitFromLetter(linear[0]);
        if (!angular.empty()) angle = AngleUnitFromLetter(angular[0]);
    } else if (type == rec::Amode) {
        const std::wstring vertical = FieldValueOf(row, L"VM", 1);
        if (!vertical.empty())
            verticalMode = vertical[0] == L'N' || vertical[0] == L'A' ? vertical[0] : L'Z';
    }
}

double FileUnits::ToZenith(double reading) const {
    switch (verticalMode) {
        case L'N':
            return 180.0 - reading;
        case L'A':
            return 90.0 - reading;
        default:
            return reading;
    }
}

std::wstring FieldValueOf(std::wstring_view row, std::wstring_view name, int position) {
    const std::size_t key_end = row.find_first_of(L" ,");
    if (key_end == row.npos) return {};
    std::wstring_view rest = row.substr(key_end + 1);
    std::wstring bare;
    for (int index = 0;; ++index) {
        const std::size_t comma = rest.find(L',');
        const std::wstring_view piece = rest.substr(0, comma);
        const std::size_t equals = piece.find(L'=');
        if (equals == piece.npos) {
            if (index == position) bare = Trim(piece);
        } else if (EqualsIgnoreCase(TrimView(piece.substr(0, equals)), name)) {
            return ToUpper(TrimView(piece.substr(equals + 1)));
        }
        if (comma == rest.npos) break;
        rest = rest.substr(comma + 1);
    }
    return ToUpper(bare);
}

}  // namespace nedit
