#include "reduction/UNeditDatabase.h"

UNeditDatabase::UNeditDatabase(UNeutralFileFormat* format, UListCtrl* list, nedit::DialogHost* host,
                               nedit::ProgressSink* progress)
    : format_(format), list_(list), host_(host), progress_(progress) {}

UNeditDatabase::~UNeditDatabase() = default;

int UNeditDatabase::GetAngleType() const {
    switch (angle_unit_) {
        case L'D': case L'd': return 1;
        case L'G': case L'g': return 2;
        default: return 0;
    }
}
