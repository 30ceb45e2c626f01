#include "codes/LineStore.h"

namespace nedit {

// Lines are looked up without regard to direction.
std::wstring LineStore::KeyOf(const std::wstring& a, const std::wstring& b) {
    return a < b ? a + L'\x1f' + b : b + L'\x1f' + a;
}

std::size_t LineStore::Save(const UNeditPt& from, const UNeditPt& to, bool stationLine) {
    std::wstring key = KeyOf(from.GetID(), to.GetID());
    const auto found = Index.find(key);
    const int existing = found == Index.end() ? -1 : static_cast<int>(found->second);
    const bool forward =
        existing < 0 || Lines[static_cast<std::size_t>(existing)].GetFromPt() == from.GetID();
    UNeditLine line = forward ? UNeditLine(from, to) : UNeditLine(to, from);
    if (stationLine) line.SetStationLine(1);
    if (existing >= 0) {
        Lines[static_cast<std::size_t>(existing)] = std::move(line);
        return static_cast<std::size_t>(existing);
    }
    Index.emplace(std::move(key), Lines.size());
    Lines.push_back(std::move(line));
    return Lines.size() - 1;
}

int LineStore::IndexOf(const std::wstring& a, const std::wstring& b) const {
    const auto found = Index.find(KeyOf(a, b));
    return found == Index.end() ? -1 : static_cast<int>(found->second);
}

bool LineStore::Names(const std::wstring& name) const {
    for (const UNeditLine& line : Lines) {
        if (line.GetFromPt() == name || line.GetToPt() == name) return true;
    }
    return false;
}

std::unordered_set<std::wstring> LineStore::KeepStationLines() {
    std::vector<UNeditLine> kept;
    std::unordered_set<std::wstring> named;
    for (UNeditLine& line : Lines) {
        if (line.GetStationLine() == 0) continue;
        named.insert(line.GetFromPt());
        named.insert(line.GetToPt());
        kept.push_back(std::move(line));
    }
    Lines = std::move(kept);
    RebuildIndex();
    return named;
}

void LineStore::RebuildIndex() {
    Index.clear();
    for (std::size_t i = 0; i < Lines.size(); ++i)
        Index.emplace(KeyOf(Lines[i].GetFromPt(), Lines[i].GetToPt()), i);
}

}  // namespace nedit
