// The engine's side of its stores of reduced geometry: the operations by which the run and
// the other rooms reach the point, line and arc stores. The rules of each store are its own
// (codes/); what is the engine's is the traverse flag, the indices into the point list, and
// the thinning before a re-run.

#include <algorithm>
#include <cmath>
#include <unordered_set>

#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"

unsigned UNeditDatabase::SavePoint(const std::wstring& name, double x, double y, double z,
                                   std::wstring code, int /*ptFlag*/, unsigned flags, int derived) {
    return SavePointOf(NameOf(name), x, y, z, code, flags, derived);
}

unsigned UNeditDatabase::SavePointOf(NameId name, double x, double y, double z,
                                     std::wstring_view code, unsigned flags, int derived) {
    // The point of a name is found by its id, once; points of one code share its text.
    const int existing = PointOf(name);
    std::shared_ptr<const std::wstring> point_code;
    const std::wstring_view trimmed = nedit::TrimView(code);
    if (!trimmed.empty()) {
        point_code = SharedCode(CodeOf(trimmed));
    } else if (existing >= 0) {
        point_code = PointList[static_cast<std::size_t>(existing)].GetSharedCode();
    }
    unsigned point_flags = 0;
    if ((flags & kSaveFromPTRecord) != 0) point_flags |= UNeditPt::kFromPTRecord;
    if (derived != 0) point_flags |= UNeditPt::kInterpolated;
    // Layer, colour, mark, contour use and the control flag come from the survey code
    // library; without one the point keeps its defaults.
    const std::wstring id(Names.Name(name));
    const unsigned index =
        PointList.SaveAt(existing, UNeditPt(id, x, y, z, point_code, point_flags));
    if (existing < 0) {
        if (name >= PointOfName.size())
            PointOfName.resize(std::max<std::size_t>(name + 1, Names.size()), -1);
        PointOfName[name] = static_cast<std::int32_t>(index);
    }
    if (TravFlag) SaveTravPoint(id, x, y, z, point_code ? *point_code : std::wstring(), 0);
    ProcessCircle(index, point_code ? *point_code : std::wstring());
    return index;
}

const std::shared_ptr<const std::wstring>& UNeditDatabase::SharedCode(NameId code) {
    if (code >= CodeTexts.size()) CodeTexts.resize(Codes.size());
    if (!CodeTexts[code]) CodeTexts[code] = std::make_shared<const std::wstring>(Codes.Name(code));
    return CodeTexts[code];
}

int UNeditDatabase::PointOf(NameId name) const {
    return name < PointOfName.size() ? PointOfName[name] : -1;
}

void UNeditDatabase::IndexPoints() {
    PointOfName.assign(Names.size(), -1);
    for (std::size_t i = 0; i < PointList.size(); ++i) {
        const NameId name = Names.Intern(PointList[i].GetID());
        if (name >= PointOfName.size()) PointOfName.resize(name + 1, -1);
        PointOfName[name] = static_cast<std::int32_t>(i);
    }
}

unsigned UNeditDatabase::SaveTravPoint(const std::wstring& name, double x, double y, double z,
                                       const std::wstring& code, int additionFlag) {
    UNeditPt point(name, x, y, z, code, 0);
    return additionFlag ? AddPtList.Put(std::move(point)) : TravPtList.Put(std::move(point));
}

int UNeditDatabase::SaveLine(unsigned from, unsigned to, int stationLine) {
    constexpr unsigned kNone = static_cast<unsigned>(-1);
    if (from == kNone || to == kNone || from >= PointList.size() || to >= PointList.size())
        return 0;
    UNeditLine& line = LineList.At(LineList.Save(PointList[from], PointList[to], stationLine != 0));
    if (stationLine == 0) {
        // A line outside string assembly takes the code and look of the point it reaches.
        std::wstring code, string_name;
        CodeOfLinework(PointList[to].GetCode(), code, string_name);
        line.SetCode(code);
        line.SetStringNo(string_name);
        ApplyCodeLook(code, line);
    }
    return 1;
}

int UNeditDatabase::SaveArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                            ArcType type) {
    return ArcList.Save(first, second, third, type);
}

void UNeditDatabase::DeleteTopoLines() {
    const std::unordered_set<std::wstring> named = LineList.KeepStationLines();
    ArcList.Clear();
    CircleList.clear();
    PointList.KeepIf([&named](const UNeditPt& point) {
        return point.GetPtFlag() != 0 || named.count(point.GetID()) != 0;
    });
    IndexPoints();
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
    return PointOf(Names.Find(name));
}
int UNeditDatabase::GetAddPointIdx(const std::wstring& name) const {
    return AddPtList.IndexOf(name);
}
int UNeditDatabase::GetTravPointIdx(const std::wstring& name) const {
    return TravPtList.IndexOf(name);
}

UNeditPt* UNeditDatabase::SearchPt(const std::wstring& name) {
    const int index = PointOf(Names.Find(name));
    return index < 0 ? nullptr : &PointList[static_cast<std::size_t>(index)];
}

UNeditPt* UNeditDatabase::GetLastPoint() {
    return PointList.empty() ? nullptr : &PointList[PointList.size() - 1];
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
    return LineList.IndexOf(a, b);
}

int UNeditDatabase::Check_In_LnList(const std::wstring& name) const {
    return LineList.Names(name) ? 1 : 0;
}

int UNeditDatabase::SearchArc(const std::wstring& a, const std::wstring& b,
                              const std::wstring& third, ArcType type) const {
    return ArcList.Find(a, b, third, type);
}
