#include "codes/UCircleCommandMgr.h"

#include "platform/geometry/Tolerance.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"

namespace {

bool HoldsKeyword(const std::wstring& code, const std::wstring& keyword, const USvyCodeCtrl& ctrl) {
    std::vector<USvyCodeExt> groups;
    ctrl.ParseString(code, groups);
    return UCircleCommandMgr::FindCode(groups, keyword, ctrl) > 0;
}

}  // namespace

int UCircleCommandMgr::FindCode(const std::vector<USvyCodeExt>& groups, const std::wstring& keyword,
                                const USvyCodeCtrl& ctrl) {
    if (keyword.empty()) return 0;
    for (std::size_t g = 0; g < groups.size(); ++g) {
        for (const std::wstring& token : ctrl.SplitCode(groups[g].Commands, 1)) {
            std::wstring value;
            if (nedit::EqualsIgnoreCase(ctrl.InterpretCommand(token, value), keyword))
                return static_cast<int>(g) + 1;
        }
    }
    return 0;
}

bool UCircleCommandMgr::Compare_code_string_no(const USvyCodeExt& a, const USvyCodeExt& b) {
    return a.Code == b.Code && nedit::EqualsIgnoreCase(a.StrNo, b.StrNo);
}

bool UCircleCommandMgr::FindCircleRadius(const std::wstring& code, const std::wstring& keyword,
                                         const USvyCodeCtrl& ctrl) {
    if (HoldsKeyword(code, keyword, ctrl)) RadiusActive = true;
    return RadiusActive;
}

bool UCircleCommandMgr::FindCircleCircumference(const std::wstring& code,
                                                const std::wstring& keyword,
                                                const USvyCodeCtrl& ctrl) {
    if (HoldsKeyword(code, keyword, ctrl)) CircumActive = true;
    return CircumActive;
}

void UCircleCommandMgr::ResetCR_CmdFlag() {
    RadiusActive = false;
    RadiusPoints.clear();
}

void UCircleCommandMgr::ResetCC_CmdFlag() {
    CircumActive = false;
    CircumPoints.clear();
}

void UCircleCommandMgr::Reset() {
    ResetCR_CmdFlag();
    ResetCC_CmdFlag();
}

bool UCircleCommandMgr::Joins(const std::vector<USvyCodeExt>& groups, bool& active,
                              std::vector<int>& points, const std::wstring& keyword,
                              const std::wstring& code, const USvyCodeCtrl& ctrl,
                              const PointOf& pointOf) {
    if (!active) {
        if (!HoldsKeyword(code, keyword, ctrl)) return false;
        active = true;
        return true;
    }
    if (points.empty()) return false;
    const UNeditPt* opener = pointOf(points.front());
    if (opener == nullptr) return false;
    std::vector<USvyCodeExt> opening;
    ctrl.ParseString(opener->GetCode(), opening);
    const int group = FindCode(opening, keyword, ctrl);
    return group > 0 &&
           Compare_code_string_no(opening[static_cast<std::size_t>(group - 1)], groups.front());
}

bool UCircleCommandMgr::Offer(int id, const std::wstring& code, const USvyCodeCtrl& ctrl,
                              const PointOf& pointOf, Made& made, std::wstring& notice) {
    notice.clear();
    // Circle handling reads a code only up to its first slash.
    const std::wstring cut = code.substr(0, code.find(L'/'));
    const nedit::CodeSettings& settings = ctrl.Settings();
    if (!RadiusActive && !CircumActive) {
        // Most points open no circle: pass them by without parsing their code.
        const std::wstring upper = nedit::ToUpper(cut);
        const bool may_open =
            (!settings.CircleRadiusCmd.empty() &&
             upper.find(nedit::ToUpper(settings.CircleRadiusCmd)) != std::wstring::npos) ||
            (!settings.CircleCircumCmd.empty() &&
             upper.find(nedit::ToUpper(settings.CircleCircumCmd)) != std::wstring::npos);
        if (!may_open) return false;
    }
    std::vector<USvyCodeExt> groups;
    if (ctrl.ParseString(cut, groups) == 0) return false;
    const bool radius =
        Joins(groups, RadiusActive, RadiusPoints, settings.CircleRadiusCmd, cut, ctrl, pointOf);
    const bool circum =
        Joins(groups, CircumActive, CircumPoints, settings.CircleCircumCmd, cut, ctrl, pointOf);
    if (!radius && !circum) return false;
    const UNeditPt* here = pointOf(id);
    if (here == nullptr) return false;
    bool done = false;
    if (RadiusActive) {
        if (RadiusPoints.empty()) {
            RadiusPoints.push_back(id);
            OpeningCode = groups.front().Code;
        } else {
            const int centre_id = RadiusPoints.front();
            const UNeditPt* centre = pointOf(centre_id);
            const double r = centre ? static_cast<const UWPoint&>(*centre).DistanceTo(*here) : 0.0;
            if (centre != nullptr && !Is_Zero(r)) {
                made = Made{UNeditCircle(UWCircle(*centre, r), OpeningCode), {id, centre_id}};
                done = true;
            } else {
                notice = nedit::Translate(
                    L"Point {1}: the rim point lies on the centre; no circle "
                    L"is made.",
                    {here->GetID()});
            }
            ResetCR_CmdFlag();
        }
    }
    if (CircumActive) {
        if (CircumPoints.size() < 2) {
            if (CircumPoints.empty()) OpeningCode = groups.front().Code;
            CircumPoints.push_back(id);
        } else {
            const UNeditPt* a = pointOf(CircumPoints[0]);
            const UNeditPt* b = pointOf(CircumPoints[1]);
            const UWCircle circle = a && b ? UWCircle(*here, *a, *b) : UWCircle();
            if (circle.IsValid()) {
                made =
                    Made{UNeditCircle(circle, OpeningCode), {id, CircumPoints[0], CircumPoints[1]}};
                done = true;
            } else {
                notice = nedit::Translate(
                    L"Point {1}: the three points of the circle lie on a "
                    L"line or coincide; no circle is made.",
                    {here->GetID()});
            }
            ResetCC_CmdFlag();
        }
    }
    return done;
}
