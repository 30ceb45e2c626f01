// The offset-string step of string filing. Points whose group carries the offset command wait
// in OffsetPts; when a group without it comes (or one of another string, or the station loop
// ends) the run closes them into a string beside the base string: each base point gets a twin
// named "OFFSET-" and its name, where the offset legs meet.

#include <utility>

#include "codes/StringFiling.h"
#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWPolyline.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"

namespace nedit {

void StringFiling::OffsetStep(const std::wstring& name, const std::wstring& group,
                              std::size_t string, const std::vector<std::wstring>& commands) {
    const std::wstring* command = nullptr;
    for (const std::wstring& token : commands) {
        if (Ctrl.IsCmdString(token) == USvyCodeCtrl::kOffsetString) {
            command = &token;
            break;
        }
    }
    if (command == nullptr) {
        ProcessOffsetStringPoints();
        return;
    }
    const double distance = CommandDistance(*command, name);
    OffsetOpen = true;
    const CStrNoList& base = StrListHead[string];
    const int point = Host.PointIndex(base.StrList.back().PtName);
    if (point < 0) return;
    UOffsetStringPtInfo info{
        base.StrNo, base.Contour, base.Code, group, Host.PointAt(static_cast<unsigned>(point)),
        distance};
    if (!OffsetPts.empty() && (!EqualsIgnoreCase(OffsetPts.front().StrNo, info.StrNo) ||
                               OffsetPts.front().Code != info.Code)) {
        ProcessOffsetStringPoints();
        OffsetOpen = true;
    }
    OffsetPts.push_back(std::move(info));
}

void StringFiling::ProcessOffsetStringPoints() {
    if (!OffsetOpen) return;
    const std::vector<UOffsetStringPtInfo> base = std::move(OffsetPts);
    OffsetPts.clear();
    OffsetOpen = false;
    if (base.empty()) return;
    const UOffsetStringPtInfo& first = base.front();
    std::size_t target = StrListHead.size();
    for (std::size_t i = 0; i < StrListHead.size(); ++i) {
        if (StrListHead[i].StrName == first.Group) {
            target = i;
            break;
        }
    }
    if (target == StrListHead.size())
        target = AddString(CStrNoList{{}, first.StrNo, first.Contour, first.Code, first.Group});
    if (base.size() == 1) {
        Host.CodeNotice(
            Translate(L"Point {1}: an offset string needs two points; \"{2}\" "
                      L"makes no offset point.",
                      {first.Pt.GetID(), first.Group}));
        return;
    }
    auto save = [&](const UOffsetStringPtInfo& of, const UWPoint& at) {
        const std::wstring name = UniqueName(L"OFFSET-" + of.Pt.GetID());
        Host.SaveDerivedPoint(name, at.x, at.y, of.Group);
        StrListHead[target].StrList.push_back(CStrList{name, 0.0, 0.0, 0.0, {}, {}});
    };
    UWLine previous;
    for (std::size_t k = 0; k + 1 < base.size(); ++k) {
        const UWLine leg(base[k].Pt, base[k + 1].Pt);
        const UWLine offset(leg.PtOffset(0.0, base[k].Distance),
                            leg.PtOffset(leg.Length(), base[k + 1].Distance));
        if (k == 0) {
            save(base[k], offset.GetStart());
        } else {
            UWPolyline meeting;
            const UWLine reversed(offset.GetEnd(), offset.GetStart());
            const bool meet =
                previous.IntersectState(reversed, meeting, true, UWLine::kEndless) > 0;
            save(base[k], meet ? meeting.GetAt(0) : previous.GetEnd());
        }
        previous = offset;
    }
    save(base.back(), previous.GetEnd());
}

}  // namespace nedit
