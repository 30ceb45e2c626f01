#include "reduction/ObservationModel.h"

SSSTRUCT* TargetList::Find(std::wstring_view name) const {
    for (SSSTRUCT* target : Targets) {
        if (target->SSName == name) return target;
    }
    return nullptr;
}
