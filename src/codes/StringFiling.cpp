#include "codes/StringFiling.h"

#include <utility>

#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

std::wstring KeyOf(const std::wstring& strNo, const std::wstring& code) {
    return ToUpper(strNo) + L'\x1f' + code;
}

}  // namespace

StringFiling::StringFiling(const USvyCodeCtrl& ctrl, USurveyDoc* job, CodeGeometryHost& host)
    : Ctrl(ctrl), Job(job), Host(host) {}

void StringFiling::Arrange_SS_String(const std::wstring& code, const std::wstring& name) {
    for (const std::wstring& group : Ctrl.SplitCode(code, 2)) InsertStringNoList(name, group);
}

int StringFiling::CheckCode(const std::wstring& code) {
    if (code.empty()) return kEmptyCode;
    const auto known = CheckedCodes.find(code);
    if (known != CheckedCodes.end()) return known->second;
    int result = kNoLibrary;
    USvyCodeLib* own = Job ? Job->GetJobCodeLibrary() : nullptr;
    USvyCodeLib* shared = Job ? Job->GetSurveyCodeLibrary() : nullptr;
    if (own != nullptr || shared != nullptr) {
        const bool defined = (own != nullptr && own->FindSvyCode(code.c_str()) != 0) ||
                             (shared != nullptr && shared->FindSvyCode(code.c_str()) != 0);
        result = defined ? kDefined : kUndefined;
        if (!defined) Undefined[code] = 1;
    }
    CheckedCodes.emplace(code, result);
    return result;
}

std::wstring StringFiling::GetStrNoFromLibrary(const std::wstring& code) {
    if (Job == nullptr) return {};
    auto flag = StringFlags.find(code);
    if (flag == StringFlags.end()) {
        int answer = 0;
        const bool is_string =
            Job->GetSurveyCodeEx(code.c_str(), answer, false, true, false, nullptr).IsString != 0;
        flag = StringFlags.emplace(code, is_string).first;
    }
    if (!flag->second) return {};
    std::size_t position = 0;
    while (position < StringCodes.size() && StringCodes[position] != code) ++position;
    if (position == StringCodes.size()) StringCodes.push_back(code);
    return std::to_wstring(position + 10000);
}

int StringFiling::FindString(const std::wstring& strNo, const std::wstring& code) const {
    const auto found = ByKey.find(KeyOf(strNo, code));
    return found == ByKey.end() ? -1 : static_cast<int>(found->second);
}

std::size_t StringFiling::AddString(CStrNoList string) {
    // The first string of a key is the one that points join; an offset string of the same
    // number and code comes later and is reached by its name.
    ByKey.emplace(KeyOf(string.StrNo, string.Code), StrListHead.size());
    StrListHead.push_back(std::move(string));
    return StrListHead.size() - 1;
}

void StringFiling::InsertStringNoList(const std::wstring& name, const std::wstring& group) {
    const std::vector<std::wstring> tokens = Ctrl.SplitCode(group, 1);
    if (tokens.empty()) return;
    CStrList element;
    element.PtName = name;
    std::wstring strNo, stringName;
    int contour = -1;
    std::wstring feature =
        Ctrl.InterpretCode(tokens, strNo, &contour, &element.OffsetAlong, &element.OffsetRight,
                           &element.OffsetUp, element.Remark, stringName);
    if (CheckCode(feature) < 1 && feature.empty() && Job != nullptr) {
        int answer = 0;
        feature =
            Job->GetSurveyCodeEx(USvyCode::kDefaultCode, answer, true, true, false, nullptr).Code;
    }
    if (strNo.empty()) strNo = GetStrNoFromLibrary(feature);
    for (std::size_t i = 1; i < tokens.size(); ++i) {
        std::wstring token = tokens[i];
        Ctrl.CheckComment(token);
        element.CmdList.push_back(std::move(token));
    }
    if (strNo.empty() && !element.CmdList.empty() && tokens.front().empty()) {
        Host.CodeNotice(
            Translate(L"Point {1}: the commands of \"{2}\" belong to no "
                      L"string and make nothing.",
                      {name, group}));
    }
    const std::vector<std::wstring> commands = element.CmdList;
    const int found = FindString(strNo, feature);
    std::size_t string = 0;
    if (found >= 0) {
        string = static_cast<std::size_t>(found);
        StrListHead[string].StrList.push_back(std::move(element));
        RectangleStep(string, commands);
    } else {
        CStrNoList added;
        added.StrNo = strNo;
        added.Contour = contour;
        added.Code = feature;
        added.StrName = stringName;
        added.StrList.push_back(std::move(element));
        string = AddString(std::move(added));
        for (const std::wstring& command : commands) {
            if (Ctrl.IsCmdString(command) == USvyCodeCtrl::kTwoPointRect ||
                Ctrl.IsCmdString(command) == USvyCodeCtrl::kThreePointRect) {
                Host.CodeNotice(
                    Translate(L"Point {1}: {2} on the first point of a "
                              L"string makes no rectangle.",
                              {name, command}));
            }
        }
    }
    OffsetStep(name, group, string, commands);
}

void StringFiling::DeleteStrNoList() {
    StrListHead.clear();
    ByKey.clear();
    StringCodes.clear();
    Undefined.clear();
    CheckedCodes.clear();
    StringFlags.clear();
    OffsetPts.clear();
    OffsetOpen = false;
}

std::wstring StringFiling::UniqueName(const std::wstring& base) const {
    std::wstring name = base;
    for (int counter = 1; Host.PointIndex(name) >= 0; ++counter)
        name += L'-' + std::to_wstring(counter);
    return name;
}

}  // namespace nedit
