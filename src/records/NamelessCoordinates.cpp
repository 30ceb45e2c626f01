#include "records/NamelessCoordinates.h"

#include <algorithm>

#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

std::wstring NamelessCoordinates::Complete(const UNeutralFileFormat& format, int type,
                                           const std::wstring& row) {
    if (type == rec::Stn || type == rec::Bkb) {
        IdText = GetIdText(row);
        IdTextUtf8 = nedit::ToUtf8(IdText);
    }
    if (type == rec::Xyz && nedit::CountOf(row, L',') <= 2)
        return format.ReformatRecord(row, IdText);
    return row;
}

std::string_view NamelessCoordinates::CompleteUtf8(const UNeutralFileFormat& format, int type,
                                                   std::string_view row, std::string& buffer) {
    if (type == rec::Stn || type == rec::Bkb) {
        IdTextUtf8 = GetIdTextUtf8(row);
        IdText = nedit::FromUtf8(IdTextUtf8);
    }
    if (type != rec::Xyz || std::count(row.begin(), row.end(), ',') > 2) return row;
    if (nedit::IsAscii(row.substr(0, row.find(' ')))) {
        buffer = format.ReformatRecordUtf8(row, IdTextUtf8);
    } else {
        buffer = nedit::ToUtf8(format.ReformatRecord(nedit::FromUtf8(row), IdText));
    }
    return buffer;
}
