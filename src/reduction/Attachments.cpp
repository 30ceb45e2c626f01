// Images, attributes and notes of points: records that take no part in the reduction but hang
// data on a point. They are read after all points exist, in three walks over the rows: an
// image record names its point; an attribute belongs to the last PT or side shot above it; a
// note to the last record above it that names a point (an occupied station too), a later note
// replacing an earlier one. Rows are read upper case, so names, values and notes are too.
//
// A walk is made only when the rows hold a record of its kind: the answer is the same, and a
// survey without attachments is not read three times more.

#include "platform/text/NumberText.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/UNeditDatabase.h"

template <typename Take>
void UNeditDatabase::EachRecord(Take take) {
    std::string text;
    const int count = Rows->GetItemCount();
    for (int index = 0; index < count; ++index) {
        const std::string_view row = RowAsRead(Rows->GetRowUtf8(index), text);
        const int type = Doc->GetRecordTypeUtf8(row);
        if (type == rec::None || !take(type, false)) continue;
        if (Doc->ReadRecord(type, row, Fields)) take(type, true);
    }
    Fields.clear();
}

void UNeditDatabase::ProcessAttachments() {
    if (Rows == nullptr || Doc == nullptr) return;
    bool images = false, attributes = false, notes = false;
    const int count = Rows->GetItemCount();
    for (int index = 0; index < count; ++index) {
        const int type = Doc->GetRecordTypeUtf8(Rows->GetRowUtf8(index));
        images = images || type == rec::Image;
        attributes = attributes || type == rec::Attrib;
        notes = notes || type == rec::Note;
    }
    if (images) ProcessImages();
    if (attributes) ProcessPointAttributes();
    if (notes) ProcessPointNotes();
}

int UNeditDatabase::ProcessImages() {
    if (Rows == nullptr || Doc == nullptr) return 1;
    EachRecord([this](int type, bool parsed) {
        if (type != rec::Image) return false;
        if (!parsed) return true;
        // GetValue gives one buffer: each value is copied before the next is read.
        const std::wstring name = GetValue(fld::ID);
        const int number1 = nedit::TextToInt(GetValue(fld::Number1));
        const int number2 = nedit::TextToInt(GetValue(fld::Number2));
        UNeditPt* point = SearchPt(name);
        if (point != nullptr) point->SetImage(number1, number2, GetValue(fld::File));
        return true;
    });
    return 1;
}

int UNeditDatabase::ProcessPointAttributes() {
    if (Rows == nullptr || Doc == nullptr) return 1;
    std::wstring current;
    EachRecord([&](int type, bool parsed) {
        if (type != rec::Pt && type != rec::Ss && type != rec::Ss2 && type != rec::Attrib)
            return false;
        if (!parsed) return true;
        if (type != rec::Attrib) {
            const std::wstring& name = GetValue(fld::ID);
            if (!name.empty()) current = name;
            return true;
        }
        const std::wstring attribute = GetValue(fld::AttribName);
        const std::wstring kind = GetValue(fld::AttribType);
        UNeditPt* point = current.empty() ? nullptr : SearchPt(current);
        if (point != nullptr) point->SetPointAttribute(attribute, kind, GetValue(fld::AttribValue));
        return true;
    });
    return 1;
}

int UNeditDatabase::ProcessPointNotes() {
    if (Rows == nullptr || Doc == nullptr) return 1;
    std::wstring current;
    EachRecord([&](int type, bool parsed) {
        if (type == rec::Image || type == rec::Attrib) return false;
        if (!parsed) return true;
        const std::wstring& name = GetValue(fld::ID);
        if (!name.empty()) current = name;
        if (type != rec::Note || current.empty()) return true;
        const std::wstring& note = GetValue(rec::Note);
        UNeditPt* point = note.empty() ? nullptr : SearchPt(current);
        if (point != nullptr) point->SetNote(note);
        return true;
    });
    return 1;
}
