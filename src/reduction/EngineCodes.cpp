// The engine's part in the field codes: it files each reduced point under its strings, offers
// it to the circle commands, and at the end of a walk turns the strings into lines and arcs.
// The grammar, the filing and the walk are the codes' (codes/); what is the engine's is the
// point list they read and write, and the look that lines and arcs take from the job's codes.
//
// Decision: a line or arc of a string takes its feature code and string name from the code
// grammar, which is always there (the job's settings, or their defaults without a job); only
// its look (layer, colour, line type, thickness) needs the job's code library.

#include "platform/job/USurveyDoc.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

int UNeditDatabase::LoadSvyCodeCtrl() {
    SvyCodeCtrl = USvyCodeCtrl(SurveyDoc ? SurveyDoc->GetCodeSettings() : nedit::CodeSettings());
    ChkCode = SvyCodeCtrl.ChkCode();
    return 1;
}

void UNeditDatabase::Arrange_SS_String(const std::wstring& code, const std::wstring& name) {
    const wchar_t mark = SvyCodeCtrl.CommentMark();
    const std::size_t comment = mark == L'\0' ? std::wstring::npos : code.find(mark);
    if (comment != std::wstring::npos) {
        // What stands behind the comment mark is not read, commands included: say so.
        for (const std::wstring& token : SvyCodeCtrl.SplitCode(code.substr(comment + 1), 1)) {
            if (SvyCodeCtrl.IsCommand(token)) {
                CodeNotice(
                    nedit::Translate(L"Point {1}: {2} stands behind the comment mark of "
                                     L"\"{3}\" and is not read.",
                                     {name, token, code}));
            }
        }
    }
    Strings.Arrange_SS_String(code, name);
}

void UNeditDatabase::ArrangePtNames(const std::wstring* first, const std::wstring* last) {
    for (; first != last; ++first) {
        const std::wstring& name = *first;
        const int index = PointIndex(name);
        if (index < 0) continue;
        const UNeditPt& point = PointList[static_cast<std::size_t>(index)];
        if (!point.IsPTRecord()) continue;
        Arrange_SS_String(std::wstring(point.GetCode()), name);
    }
}

void UNeditDatabase::ProcessString() {
    Assembly.ProcessString(Strings.Strings(), CirclePoints);
}

void UNeditDatabase::ResetCircleData() {
    CircleMgr.Reset();
    CirclePoints.clear();
}

void UNeditDatabase::ProcessCircle(unsigned index, const std::wstring& code) {
    UCircleCommandMgr::Made made;
    std::wstring notice;
    const bool done = CircleMgr.Offer(
        static_cast<int>(index), code, SvyCodeCtrl,
        [this](int at) -> const UNeditPt* {
            return at >= 0 && static_cast<std::size_t>(at) < PointList.size()
                       ? &PointList[static_cast<std::size_t>(at)]
                       : nullptr;
        },
        made, notice);
    if (!notice.empty()) CodeNotice(notice);
    if (!done) return;
    CircleList.push_back(made.Circle);
    for (const int point : made.Points) CirclePoints.insert(point);
}

int UNeditDatabase::Process_Code_Offsets(SSSTRUCT& target) const {
    const std::wstring_view code = target.SSCode;
    if (code.find(USvyCodeCtrl::kOffsetMark) == std::wstring_view::npos) return 1;
    for (const std::wstring& group : SvyCodeCtrl.SplitCode(code, 2)) {
        const std::vector<std::wstring> tokens = SvyCodeCtrl.SplitCode(group, 1);
        if (tokens.empty()) continue;
        std::wstring strNo, remark, name;
        int contour = 0;
        double offsets[3] = {0.0, 0.0, 0.0};
        SvyCodeCtrl.InterpretCode(tokens, strNo, &contour, &offsets[0], &offsets[1], &offsets[2],
                                  remark, name);
        double* fields[3] = {&target.OffsetAlong, &target.OffsetRight, &target.OffsetUp};
        for (int i = 0; i < 3; ++i) {
            if (offsets[i] != 0.0) *fields[i] = CodeDistance(offsets[i]);
        }
    }
    return 1;
}

void UNeditDatabase::PrintUnDefineCode() {
    if (Report == nullptr) return;
    if (!Strings.UndefinedCodes().empty()) {
        Report->PrintUndefinedCodeHead();
        for (const auto& entry : Strings.UndefinedCodes()) Report->PrintUndefined(entry.first);
    }
}

int UNeditDatabase::PointIndex(const std::wstring& name) const {
    return GetPointIdx(name);
}

const UNeditPt& UNeditDatabase::PointAt(unsigned index) const {
    return PointList[index];
}

unsigned UNeditDatabase::SaveDerivedPoint(const std::wstring& name, double x, double y,
                                          const std::wstring& code) {
    return SavePoint(name, x, y, 0.0, code, 0, 0, 1);
}

void UNeditDatabase::CodeOfLinework(const std::wstring& pointCode, std::wstring& code,
                                    std::wstring& stringName) const {
    std::vector<USvyCodeExt> groups;
    SvyCodeCtrl.ParseString(pointCode, groups);
    code = groups.empty() ? std::wstring() : groups.front().Code;
    stringName.clear();
    for (const USvyCodeExt& group : groups) {
        if (group.Code == code && !group.StrNo.empty()) {
            stringName = SvyCodeCtrl.JoinedName(group.Code, group.StrNo);
            break;
        }
    }
}

void UNeditDatabase::ApplyCodeLook(const std::wstring& code, UNeditLinework& linework) const {
    if (SurveyDoc == nullptr || code.empty()) return;
    int answer = 0;
    linework.SetLayer(SurveyDoc->GetSurveyCodeEx(code.c_str(), answer, false, true).Layer);
    linework.SetColor(SurveyDoc->GetPenColourBySvyCode(code.c_str(), false, false));
    linework.SetLineType(SurveyDoc->GetLineTypeBySvyCode(code.c_str()));
    linework.SetThickness(SurveyDoc->GetLineThicknessBySvyCode(code.c_str()));
}

int UNeditDatabase::SaveStringLine(unsigned from, unsigned to, const std::wstring& code,
                                   const std::wstring& stringName) {
    constexpr unsigned kNone = static_cast<unsigned>(-1);
    if (from == kNone || to == kNone || from >= PointList.size() || to >= PointList.size())
        return 0;
    UNeditLine& line = LineList.At(LineList.Save(PointList[from], PointList[to], false));
    line.SetCode(code);
    line.SetStringNo(stringName);
    ApplyCodeLook(code, line);
    return 1;
}

void UNeditDatabase::SaveStringArc(const UNeditPt& first, const UNeditPt& second,
                                   const UNeditPt& third, ArcType type) {
    // An arc takes its code and string from its second point, not from the string in hand.
    UNeditArc& arc = ArcList.At(static_cast<std::size_t>(SaveArc(first, second, third, type)));
    std::wstring code, string_name;
    CodeOfLinework(second.GetCode(), code, string_name);
    arc.SetCode(code);
    arc.SetStringNo(string_name);
    ApplyCodeLook(code, arc);
}

double UNeditDatabase::CodeDistance(double value) const {
    return Doc != nullptr ? Doc->ConvertDist(value, false) : value;
}

void UNeditDatabase::StringProgress(unsigned percent) {
    UpdateProgress(percent, percent == 0 ? L"" : L"Generating Graphics");
}

void UNeditDatabase::CodeNotice(const std::wstring& text) {
    CodeNotices.push_back(text);
}

void UNeditDatabase::ShowCodeNotices(bool printing) {
    if (CodeNotices.empty()) return;
    if (printing) {
        for (std::size_t i = 0; i < CodeNotices.size(); ++i)
            Report->WriteText(CodeNotices[i], i == 0 ? 1 : 0, 1, 0);
    }
    // One message for the run, not one box for each code.
    constexpr std::size_t kShown = 20;
    std::wstring text;
    for (std::size_t i = 0; i < CodeNotices.size() && i < kShown; ++i)
        text += (i == 0 ? L"" : L"\n") + CodeNotices[i];
    if (CodeNotices.size() > kShown) {
        text += L"\n" + nedit::Translate(L"... and {1} more; the report lists them all.",
                                         {std::to_wstring(CodeNotices.size() - kShown)});
    }
    nedit::AppMessageBox(Host, text, nedit::mb::IconExclamation);
}
