// The stores of reduced geometry of the engine: points, lines, arcs and circles, their
// writers and look-ups. Names are indexed so that a run stays linear in its records; each
// look-up gives what a scan in the documented order would.

#include <cmath>
#include <unordered_set>

#include "platform/geometry/UAngle.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"

namespace {

// Lines are looked up without regard to direction.
std::wstring LineKey(const std::wstring& a, const std::wstring& b) {
    return a < b ? a + L'\x1f' + b : b + L'\x1f' + a;
}

// The index of `name` in `index`, or -1.
int IndexOf(const NameIndex& index, const std::wstring& name) {
    const std::size_t found = index.Find(name);
    return found == NameIndex::npos ? -1 : static_cast<int>(found);
}

// Writes `point` over the entry of its name, or appends it; gives its index.
unsigned StoreByName(std::vector<UNeditPt>& store, NameIndex& index, UNeditPt point) {
    const std::size_t found = index.Find(point.GetID());
    if (found != NameIndex::npos) {
        store[found] = std::move(point);
        return static_cast<unsigned>(found);
    }
    store.push_back(std::move(point));
    index.Set(store.back().GetID(), store.size() - 1);
    return static_cast<unsigned>(store.size() - 1);
}

}  // namespace

unsigned UNeditDatabase::SavePoint(const std::wstring& name, double x, double y, double z,
                                   std::wstring code, int /*ptFlag*/, unsigned flags, int derived) {
    const int existing = GetPointIdx(name);
    const std::wstring_view trimmed = nedit::TrimView(code);
    if (trimmed.size() != code.size()) code = std::wstring(trimmed);
    if (existing >= 0 && code.empty())
        code = PointList[static_cast<std::size_t>(existing)].GetCode();
    const bool from_pt_record = (flags & 2u) != 0;
    unsigned point_flags = 0;
    if (from_pt_record) point_flags |= UNeditPt::kFromPTRecord;
    if (derived != 0) point_flags |= UNeditPt::kInterpolated;
    // Layer, colour, mark, contour use and the control flag come from the survey code
    // library; without one the point keeps its defaults.
    UNeditPt point(name, x, y, z, code, point_flags);

    unsigned index = 0;
    if (existing < 0) {
        index = StoreByName(PointList, PointIndex, std::move(point));
    } else {
        index = static_cast<unsigned>(existing);
        // A PT record overwrites only another PT record: an observed point is not replaced.
        if (!from_pt_record || PointList[index].IsPTRecord()) PointList[index] = std::move(point);
    }
    if (TravFlag) SaveTravPoint(name, x, y, z, code, 0);
    return index;
}

unsigned UNeditDatabase::SaveTravPoint(const std::wstring& name, double x, double y, double z,
                                       const std::wstring& code, int additionFlag) {
    UNeditPt point(name, x, y, z, code, 0);
    return additionFlag ? StoreByName(AddPtList, AddPtIndex, std::move(point))
                        : StoreByName(TravPtList, TravPtIndex, std::move(point));
}

int UNeditDatabase::SaveLine(unsigned from, unsigned to, int stationLine) {
    constexpr unsigned kNone = static_cast<unsigned>(-1);
    if (from == kNone || to == kNone || from >= PointList.size() || to >= PointList.size())
        return 0;
    const UNeditPt& start = PointList[from];
    const UNeditPt& end = PointList[to];
    const int existing = GetLineIdx(start.GetID(), end.GetID());
    // An existing line keeps its direction.
    const bool forward =
        existing < 0 || LineList[static_cast<std::size_t>(existing)].GetFromPt() == start.GetID();
    UNeditLine line = forward ? UNeditLine(start, end) : UNeditLine(end, start);
    if (stationLine != 0) line.SetStationLine(1);
    // Code, layer, colour, line type and thickness come from the survey code library.
    if (existing >= 0) {
        LineList[static_cast<std::size_t>(existing)] = std::move(line);
    } else {
        LineIndex.emplace(LineKey(start.GetID(), end.GetID()), LineList.size());
        LineList.push_back(std::move(line));
    }
    return 1;
}

int UNeditDatabase::SaveArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                            ArcType type) {
    ArcType stored = type;
    // About a centre, the turn from the first point to the second gives the arc's sense.
    if (type != 1 && UAngle(first, third, second).Degrees() < 0.0) stored |= UWArc::kAnticlockwise;
    UNeditArc arc(first, second, third, stored);
    const int existing = SearchArc(first.GetID(), second.GetID(), third.GetID(), type);
    if (existing >= 0) {
        ArcList[static_cast<std::size_t>(existing)] = std::move(arc);
        return existing;
    }
    ArcList.push_back(std::move(arc));
    return static_cast<int>(ArcList.size()) - 1;
}

void UNeditDatabase::DeleteTopoLines() {
    std::vector<UNeditLine> kept_lines;
    std::unordered_set<std::wstring> named;
    for (UNeditLine& line : LineList) {
        if (line.GetStationLine() == 0) continue;
        named.insert(line.GetFromPt());
        named.insert(line.GetToPt());
        kept_lines.push_back(std::move(line));
    }
    LineList = std::move(kept_lines);
    ArcList.clear();
    CircleList.clear();
    std::vector<UNeditPt> kept_points;
    for (UNeditPt& point : PointList) {
        if (point.GetPtFlag() != 0 || named.count(point.GetID()) != 0)
            kept_points.push_back(std::move(point));
    }
    PointList = std::move(kept_points);
    RebuildPointIndex();
    RebuildLineIndex();
}

void UNeditDatabase::RebuildPointIndex() {
    PointIndex.Clear();
    for (std::size_t i = 0; i < PointList.size(); ++i) PointIndex.Set(PointList[i].GetID(), i);
}

void UNeditDatabase::RebuildLineIndex() {
    LineIndex.clear();
    for (std::size_t i = 0; i < LineList.size(); ++i) {
        LineIndex.emplace(LineKey(LineList[i].GetFromPt(), LineList[i].GetToPt()), i);
    }
}

void UNeditDatabase::SetMinMaxCoord() {
    UWRect box;
    for (const UNeditPt& point : PointList) {
        if (std::isfinite(point.x) && std::isfinite(point.y)) box.Extend(point);
    }
    if (box.IsEmpty()) return;
    const double margin_x = box.Width() * 0.01;
    const double margin_y = box.Height() * 0.01;
    XMin = box.GetMinX() - margin_x;
    XMax = box.GetMaxX() + margin_x;
    YMin = box.GetMinY() - margin_y;
    YMax = box.GetMaxY() + margin_y;
    DocRect = UWRect(XMin, YMin, XMax, YMax);
}

int UNeditDatabase::GetPointIdx(const std::wstring& name) const {
    return IndexOf(PointIndex, name);
}
int UNeditDatabase::GetAddPointIdx(const std::wstring& name) const {
    return IndexOf(AddPtIndex, name);
}
int UNeditDatabase::GetTravPointIdx(const std::wstring& name) const {
    return IndexOf(TravPtIndex, name);
}

UNeditPt* UNeditDatabase::SearchPt(const std::wstring& name) {
    const int index = GetPointIdx(name);
    return index < 0 ? nullptr : &PointList[static_cast<std::size_t>(index)];
}

UNeditPt* UNeditDatabase::GetLastPoint() {
    return PointList.empty() ? nullptr : &PointList.back();
}

bool UNeditDatabase::GetPtNameAt(int index, std::wstring& name) const {
    if (index < 0 || static_cast<std::size_t>(index) >= PointList.size()) {
        name.clear();
        return false;
    }
    name = PointList[static_cast<std::size_t>(index)].GetID();
    return true;
}

int UNeditDatabase::GetLineIdx(const std::wstring& a, const std::wstring& b) const {
    const auto found = LineIndex.find(LineKey(a, b));
    return found == LineIndex.end() ? -1 : static_cast<int>(found->second);
}

int UNeditDatabase::Check_In_LnList(const std::wstring& name) const {
    for (const UNeditLine& line : LineList) {
        if (line.GetFromPt() == name || line.GetToPt() == name) return 1;
    }
    return 0;
}

int UNeditDatabase::SearchArc(const std::wstring& a, const std::wstring& b,
                              const std::wstring& third, ArcType type) const {
    for (std::size_t i = 0; i < ArcList.size(); ++i) {
        const UNeditArc& arc = ArcList[i];
        const bool ends = (arc.GetStartPt() == a && arc.GetEndPt() == b) ||
                          (arc.GetStartPt() == b && arc.GetEndPt() == a);
        if (ends && arc.GetThirdPt() == third && arc.GetArcType() == type)
            return static_cast<int>(i);
    }
    return -1;
}
