#include "records/NamelessCoordinates.h"

#include "platform/text/WideText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

std::wstring NamelessCoordinates::Complete(const UNeutralFileFormat& format, int type,
                                           const std::wstring& row) {
    if (type == rec::Stn || type == rec::Bkb) IdText = GetIdText(row);
    if (type == rec::Xyz && nedit::CountOf(row, L',') <= 2)
        return format.ReformatRecord(row, IdText);
    return row;
}
