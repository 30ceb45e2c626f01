#include "codes/PointStore.h"

#include "platform/text/WideText.h"

namespace nedit {

const NameIndex& PointStore::Index() const {
    if (!Indexed) {
        Names.Clear();
        Names.Reserve(Points.size());
        for (std::size_t i = 0; i < Points.size(); ++i) Names.Set(Points[i].GetID(), i);
        Indexed = true;
    }
    return Names;
}

void PointStore::Append(UNeditPt point) {
    Points.push_back(std::move(point));
    if (Indexed) Names.Set(Points.back().GetID(), Points.size() - 1);
}

unsigned PointStore::Put(UNeditPt point) {
    const std::size_t found = Index().Find(point.GetID());
    if (found != NameIndex::npos) {
        Points[found] = std::move(point);
        return static_cast<unsigned>(found);
    }
    Append(std::move(point));
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
    return SaveAt(existing, std::move(point));
}

unsigned PointStore::SaveAt(int existing, UNeditPt point) {
    if (existing < 0) {
        Append(std::move(point));
        return static_cast<unsigned>(Points.size() - 1);
    }
    UNeditPt& stored = Points[static_cast<std::size_t>(existing)];
    if (!point.IsPTRecord() || stored.IsPTRecord()) stored = std::move(point);
    return static_cast<unsigned>(existing);
}

int PointStore::IndexOf(const std::wstring& name) const {
    const std::size_t found = Index().Find(name);
    return found == NameIndex::npos ? -1 : static_cast<int>(found);
}

UNeditPt* PointStore::Find(const std::wstring& name) {
    const int index = IndexOf(name);
    return index < 0 ? nullptr : &Points[static_cast<std::size_t>(index)];
}

void PointStore::Clear() {
    Points.clear();
    Names.Clear();
    Indexed = false;
}

void PointStore::Reserve(std::size_t count) {
    Points.reserve(count);
}

void PointStore::RebuildIndex() {
    Indexed = false;
}

}  // namespace nedit
