#include "codes/StringAssembly.h"

#include "platform/geometry/UWLine.h"
#include "platform/geometry/UWPolyline.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {

StringAssembly::StringAssembly(const USvyCodeCtrl& ctrl, CodeGeometryHost& host)
    : Ctrl(ctrl), Host(host) {}

unsigned StringAssembly::CommandsOf(const CStrList& element) const {
    const CodeSettings& settings = Ctrl.Settings();
    unsigned commands = 0;
    for (const std::wstring& token : element.CmdList) {
        std::wstring value;
        const std::wstring word = Ctrl.InterpretCommand(token, value);
        if (word.empty()) continue;
        if (EqualsIgnoreCase(word, settings.ArcStartCmd)) commands |= kArcStart;
        if (EqualsIgnoreCase(word, settings.ArcEndCmd)) commands |= kArcEnd;
        if (EqualsIgnoreCase(word, settings.CloseCmd)) commands |= kClose;
    }
    return commands;
}

bool StringAssembly::SearchForwArc(const std::vector<unsigned>& commands, std::size_t pos) const {
    for (; pos < commands.size(); ++pos) {
        if ((commands[pos] & kArcEnd) != 0) return true;
        if ((commands[pos] & kArcStart) != 0) return false;
    }
    return false;
}

void StringAssembly::Line(int from, int to) {
    if (from < 0 || to < 0) return;
    Host.SaveStringLine(static_cast<unsigned>(from), static_cast<unsigned>(to), CurStrCode,
                        CurStrName);
}

void StringAssembly::ProcessString(const std::vector<CStrNoList>& strings,
                                   const std::unordered_set<int>& circlePoints) {
    CurStrCode.clear();
    CurStrName.clear();
    bool aborted = false;
    for (const CStrNoList& string : strings) {
        if (Host.StopRequested()) {
            aborted = true;
            break;
        }
        if (ArcOpen) FinishOpenArc();
        if (string.StrNo.empty() || TextToInt(string.StrNo) == 0) continue;
        CurStrCode = string.Code;
        CurStrName = string.StrName;
        const std::vector<CStrList>& list = string.StrList;
        std::vector<unsigned> commands(list.size());
        for (std::size_t i = 0; i < list.size(); ++i) commands[i] = CommandsOf(list[i]);
        for (std::size_t i = 0; i < list.size(); ++i) {
            if (Host.StopRequested()) {
                aborted = true;
                break;
            }
            Host.StringProgress(static_cast<unsigned>(100 * (i + 1) / list.size()));
            PrevName = CurName;
            CurName = list[i].PtName;
            const int current = Host.PointIndex(CurName);
            const unsigned has = commands[i];
            if (i == 0) {
                FirstPt = PrevPt = current;
                if ((has & kArcStart) != 0) {
                    ArcOpen = true;
                    ArcPts.push_back(Host.PointIndex(PrevName));
                    ArcPts.push_back(current);
                }
                continue;
            }
            if (current == PrevPt) continue;
            if (!ArcOpen && (has & kArcStart) == 0) {
                const bool circle =
                    circlePoints.count(PrevPt) != 0 && circlePoints.count(current) != 0;
                if (!circle) {
                    if ((has & kArcEnd) != 0) {
                        Host.CodeNotice(
                            Translate(L"Point {1}: an arc end with no arc start; "
                                      L"the string runs on straight.",
                                      {CurName}));
                    }
                    Line(PrevPt, current);
                    if ((has & kClose) != 0) {
                        Line(current, FirstPt);
                        FirstPt = current;
                    }
                    PrevPt = current;
                    continue;
                }
            }
            if (!ArcOpen && (has & kArcStart) != 0) {
                Line(PrevPt, current);
                ArcOpen = true;
            }
            ArcPts.push_back(current);
            if ((has & kArcEnd) != 0) {
                ProcessArc(list, i + 1);
                if (SearchForwArc(commands, i + 1)) {
                    ArcPts = {PrevPt, current};
                } else {
                    ArcOpen = false;
                }
            } else if ((has & kArcStart) != 0) {
                ProcessArc(list, i + 1);
                ArcPts = {PrevPt, current};
                ArcOpen = true;
            }
            PrevPt = current;
        }
    }
    if (!aborted && ArcOpen) FinishOpenArc();
    ArcPts.clear();
    ArcOpen = false;
    Host.StringProgress(0);
    CurStrCode.clear();
    CurStrName.clear();
}

void StringAssembly::FinishOpenArc() {
    if (ArcPts.size() == 3) {
        Process2PointArc(0);
    } else if (ArcPts.size() >= 4) {
        Process3PointArc();
    }
    ArcPts.clear();
    ArcOpen = false;
}

void StringAssembly::ProcessArc(const std::vector<CStrList>& list, std::size_t next) {
    if (ArcPts.size() == 3) {
        // The element after the arc; none, or the first point of all, gives a straight line.
        int after = 0;
        if (next < list.size()) after = Host.PointIndex(list[next].PtName);
        Process2PointArc(after);
    } else if (ArcPts.size() > 3) {
        Process3PointArc();
    }
    ArcPts.clear();
}

void StringAssembly::Process2PointArc(int next) {
    const int start = ArcPts[1];
    const int end = ArcPts[2];
    if (next == 0) {
        Line(start, end);
        return;
    }
    if (start < 0 || end < 0) return;
    const UNeditPt first = Host.PointAt(static_cast<unsigned>(start));
    const UNeditPt second = Host.PointAt(static_cast<unsigned>(end));
    if (ArcPts[0] < 0 || next < 0) {
        Host.CodeNotice(
            Translate(L"Arc {1}-{2}: no point before or after it to take its "
                      L"tangents from; a straight line is drawn.",
                      {first.GetID(), second.GetID()}));
        Line(start, end);
        return;
    }
    UWPoint centre;
    if (!Calc_Arc_Center(Host.PointAt(static_cast<unsigned>(ArcPts[0])), first, second,
                         Host.PointAt(static_cast<unsigned>(next)), centre)) {
        Host.CodeNotice(
            Translate(L"Arc {1}-{2}: its tangents are parallel; neither arc nor "
                      L"line is made.",
                      {first.GetID(), second.GetID()}));
        return;
    }
    const std::wstring name = L"CENTER" + first.GetID() + L"-" + second.GetID();
    const unsigned at = Host.SaveDerivedPoint(name, centre.x, centre.y, first.GetCode());
    const UNeditPt centre_point = Host.PointAt(at);
    Host.SaveStringArc(first, second, centre_point, 0);
}

void StringAssembly::Process3PointArc() {
    const int start = ArcPts[1];
    const int on = ArcPts[2];
    const int end = ArcPts.back();
    if (start < 0 || on < 0 || end < 0) {
        Host.CodeNotice(
            Translate(L"String {1}: a point of an arc was not reduced; the arc is "
                      L"not made.",
                      {CurStrName}));
        return;
    }
    Host.SaveStringArc(Host.PointAt(static_cast<unsigned>(start)),
                       Host.PointAt(static_cast<unsigned>(end)),
                       Host.PointAt(static_cast<unsigned>(on)), UWArc::kThirdOnArc);
}

bool StringAssembly::Calc_Arc_Center(const UWPoint& before, const UWPoint& start,
                                     const UWPoint& end, const UWPoint& after, UWPoint& centre) {
    UWLine incoming(before, start);
    incoming.Rotate(start, UAngle(90.0));
    UWLine outgoing(after, end);
    outgoing.Rotate(end, UAngle(90.0));
    UWPolyline meeting;
    if (incoming.IntersectState(outgoing, meeting, false, UWLine::kEndless) <= 0) return false;
    const UWPoint mid = UWLine(start, end).MidPt();
    UWLine bisector(mid, end);
    bisector.Rotate(mid, UAngle(90.0));
    centre = bisector.PtAtDistance(meeting.GetAt(0).DistanceAlong(bisector));
    return true;
}

}  // namespace nedit
