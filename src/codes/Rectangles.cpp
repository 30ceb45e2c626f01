// The rectangle step of string filing: a point with a rectangle command, appended to its
// string, completes a rectangle from the points before it. The corners it makes are derived
// points named "RECT-" and the name of the point they stand behind.

#include "codes/StringFiling.h"
#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWLine.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"

namespace nedit {

namespace {

/// The corners behind A and B of a rectangle on the base line from A to B with width `w`:
/// false when there are none (no width, or A on B).
bool Corners(const UWPoint& a, const UWPoint& b, double w, UWPoint& behindA, UWPoint& behindB) {
    if (Is_Zero(w) || a == b) return false;
    const UWLine base(a, b);
    behindB = base.PtOffset(base.Length(), w);
    behindA = base.PtOffset(0.0, w);
    return true;
}

}  // namespace

double StringFiling::CommandDistance(const std::wstring& token, const std::wstring& name) {
    std::wstring value;
    const std::wstring word = Ctrl.InterpretCommand(token, value);
    if (value.empty()) {
        Host.CodeNotice(Translate(L"Point {1}: {2} without a number makes nothing.", {name, word}));
        return 0.0;
    }
    if (!USvyCodeCtrl::IsNumberText(value)) {
        Host.CodeNotice(Translate(L"Point {1}: \"{2}\" of {3} is no number; nothing is made.",
                                  {name, value, word}));
        return 0.0;
    }
    return Host.CodeDistance(TextToDouble(value));
}

void StringFiling::RectangleStep(std::size_t string, const std::vector<std::wstring>& commands) {
    int kind = 0;
    std::wstring width_token;
    for (const std::wstring& command : commands) {
        const int cmd = Ctrl.IsCmdString(command);
        if (cmd == USvyCodeCtrl::kThreePointRect && kind == 0) kind = cmd;
        if (cmd == USvyCodeCtrl::kTwoPointRect && kind == 0) {
            kind = cmd;
            width_token = command;
        }
    }
    if (kind == 0) return;
    CStrNoList& list = StrListHead[string];
    const std::size_t needed = kind == USvyCodeCtrl::kTwoPointRect ? 2 : 3;
    const std::wstring& name = list.StrList.back().PtName;
    if (list.StrList.size() < needed) {
        Host.CodeNotice(
            Translate(L"Point {1}: the rectangle needs {2} points of its string; "
                      L"nothing is made.",
                      {name, std::to_wstring(needed)}));
        return;
    }
    unsigned index[3] = {0, 0, 0};
    for (std::size_t i = 0; i < needed; ++i) {
        const int at = Host.PointIndex(list.StrList[list.StrList.size() - 1 - i].PtName);
        if (at < 0) return;  // a point not reduced stops the step
        index[i] = static_cast<unsigned>(at);
    }
    if (kind == USvyCodeCtrl::kTwoPointRect) {
        TwoPointRectangle(list, index[1], index[0], CommandDistance(width_token, name));
    } else {
        ThreePointRectangle(list, index[2], index[1], index[0]);
    }
}

void StringFiling::TwoPointRectangle(CStrNoList& string, unsigned q, unsigned p, double width) {
    const UNeditPt first = Host.PointAt(q);
    const UNeditPt last = Host.PointAt(p);
    UWPoint behind_q, behind_p;
    if (!Corners(first, last, width, behind_q, behind_p)) {
        if (!Is_Zero(width)) {
            Host.CodeNotice(
                Translate(L"Point {1}: the rectangle's two corners coincide; "
                          L"nothing is made.",
                          {last.GetID()}));
        }
        return;
    }
    for (const auto& [corner, behind] :
         {std::make_pair(behind_p, &last), std::make_pair(behind_q, &first)}) {
        const std::wstring name = L"RECT-" + behind->GetID();
        Host.SaveDerivedPoint(name, corner.x, corner.y, first.GetCode());
        string.StrList.push_back(CStrList{name, 0.0, 0.0, 0.0, {}, {}});
    }
    string.StrList.push_back(CStrList{first.GetID(), 0.0, 0.0, 0.0, {}, {}});
}

void StringFiling::ThreePointRectangle(CStrNoList& string, unsigned r, unsigned q, unsigned p) {
    const UNeditPt first = Host.PointAt(r);
    const UNeditPt second = Host.PointAt(q);
    const UNeditPt third = Host.PointAt(p);
    const double width = static_cast<const UWPoint&>(third).DistanceTo(UWLine(first, second));
    UWPoint behind_r, behind_q;
    if (third == first || third == second || !Corners(first, second, width, behind_r, behind_q)) {
        Host.CodeNotice(
            Translate(L"Point {1}: the rectangle's three points fix no rectangle; "
                      L"nothing is made.",
                      {third.GetID()}));
        return;
    }
    if (!(static_cast<const UWPoint&>(third) == behind_q)) {
        // The third point gave only the width: it leaves the string, and the corner takes
        // its place.
        for (auto it = string.StrList.begin(); it != string.StrList.end(); ++it) {
            if (it->PtName == third.GetID()) {
                string.StrList.erase(it);
                break;
            }
        }
        const std::wstring name = L"RECT-" + second.GetID();
        Host.SaveDerivedPoint(name, behind_q.x, behind_q.y, third.GetCode());
        string.StrList.push_back(CStrList{name, 0.0, 0.0, 0.0, {}, {}});
    }
    const std::wstring name = L"RECT-" + first.GetID();
    Host.SaveDerivedPoint(name, behind_r.x, behind_r.y, first.GetCode());
    string.StrList.push_back(CStrList{name, 0.0, 0.0, 0.0, {}, {}});
    string.StrList.push_back(CStrList{first.GetID(), 0.0, 0.0, 0.0, {}, {}});
}

}  // namespace nedit
