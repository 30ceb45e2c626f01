#include "codes/ArcStore.h"

#include "platform/geometry/UAngle.h"

namespace nedit {

int ArcStore::Save(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                   ArcType type) {
    ArcType stored = type;
    // About a centre, the turn from the first point to the second gives the arc's sense.
    if (type != UWArc::kThirdOnArc && UAngle(first, third, second).Degrees() < 0.0)
        stored |= UWArc::kAnticlockwise;
    UNeditArc arc(first, second, third, stored);
    const int existing = Find(first.GetID(), second.GetID(), third.GetID(), type);
    if (existing >= 0) {
        Arcs[static_cast<std::size_t>(existing)] = std::move(arc);
        return existing;
    }
    Arcs.push_back(std::move(arc));
    return static_cast<int>(Arcs.size()) - 1;
}

int ArcStore::Find(const std::wstring& a, const std::wstring& b, const std::wstring& third,
                   ArcType type) const {
    for (std::size_t i = 0; i < Arcs.size(); ++i) {
        const UNeditArc& arc = Arcs[i];
        const bool ends = (arc.GetStartPt() == a && arc.GetEndPt() == b) ||
                          (arc.GetStartPt() == b && arc.GetEndPt() == a);
        if (ends && arc.GetThirdPt() == third && arc.GetArcType() == type)
            return static_cast<int>(i);
    }
    return -1;
}

}  // namespace nedit
