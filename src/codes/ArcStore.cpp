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
        // The arc is now found by its new stored type, unless an earlier arc holds that key.
        if (stored != type) {
            Index.erase(KeyOf(first.GetID(), second.GetID(), third.GetID(), type));
            Index.emplace(KeyOf(first.GetID(), second.GetID(), third.GetID(), stored),
                          static_cast<std::size_t>(existing));
        }
        return existing;
    }
    Index.emplace(KeyOf(first.GetID(), second.GetID(), third.GetID(), stored), Arcs.size());
    Arcs.push_back(std::move(arc));
    return static_cast<int>(Arcs.size()) - 1;
}

int ArcStore::Find(const std::wstring& a, const std::wstring& b, const std::wstring& third,
                   ArcType type) const {
    const auto found = Index.find(KeyOf(a, b, third, type));
    return found == Index.end() ? -1 : static_cast<int>(found->second);
}

std::wstring ArcStore::KeyOf(const std::wstring& a, const std::wstring& b,
                             const std::wstring& third, ArcType type) {
    const bool ordered = a < b;
    return (ordered ? a : b) + L'\x1f' + (ordered ? b : a) + L'\x1f' + third + L'\x1f' +
           std::to_wstring(type);
}

}  // namespace nedit
