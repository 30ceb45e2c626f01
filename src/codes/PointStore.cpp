#include "codes/PointStore.h"

#include "platform/text/WideText.h"

namespace nedit {

unsigned PointStore::Put(UNeditPt point) {
    const std::size_t found = Index.Find(point.GetID());
    if (found != NameIndex::npos) {
        Points[found] = std::move(point);
        return static_cast<unsigned>(found);
    }
    Points.push_back(std::move(point));
    Index.Set(Points.back().GetID(), Points.size() - 1);
    return static_cast<unsigned>(Points.size() - 1);
}

std::wstring PointStore::CodeFor(const std::wstring& name, std::wstring code) const {
    const std::wstring_view trimmed = TrimView(code);
    if (trimmed.size() != code.size()) code = std::wstring(trimmed);
    const int existing = IndexOf(name);
    if (existing >= 0 && code.empty()) code = Points[static_cast<std::size_t>(existing)].GetCode();
    return code;
}

unsigned PointStore::Save(UNeditPt point) {
    const int existing = IndexOf(point.GetID());
    if (existing < 0) return Put(std::move(point));
    UNeditPt& stored = Points[static_cast<std::size_t>(existing)];
    if (!point.IsPTRecord() || stored.IsPTRecord()) stored = std::move(point);
    return static_cast<unsigned>(existing);
}

int PointStore::IndexOf(const std::wstring& name) const {
    const std::size_t found = Index.Find(name);
    return found == NameIndex::npos ? -1 : static_cast<int>(found);
}

UNeditPt* PointStore::Find(const std::wstring& name) {
    const int index = IndexOf(name);
    return index < 0 ? nullptr : &Points[static_cast<std::size_t>(index)];
}

void PointStore::Clear() {
    Points.clear();
    Index.Clear();
}

void PointStore::Reserve(std::size_t count) {
    Points.reserve(count);
    Index.Reserve(count);
}

void PointStore::RebuildIndex() {
    Index.Clear();
    for (std::size_t i = 0; i < Points.size(); ++i) Index.Set(Points[i].GetID(), i);
}

}  // namespace nedit
