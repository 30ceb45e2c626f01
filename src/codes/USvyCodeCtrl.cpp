#include "codes/USvyCodeCtrl.h"

#include <cwctype>
#include <utility>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace {

bool IsDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

}  // namespace

bool USvyCodeCtrl::IsNumberText(std::wstring_view text) {
    text = nedit::TrimView(text);
    std::size_t i = 0;
    if (i < text.size() && (text[i] == L'+' || text[i] == L'-')) ++i;
    bool digits = false;
    while (i < text.size() && IsDigit(text[i])) digits = (++i, true);
    if (i < text.size() && text[i] == L'.') {
        ++i;
        while (i < text.size() && IsDigit(text[i])) digits = (++i, true);
    }
    if (!digits) return false;
    if (i < text.size() && (text[i] == L'E' || text[i] == L'e')) {
        ++i;
        if (i < text.size() && (text[i] == L'+' || text[i] == L'-')) ++i;
        bool exponent = false;
        while (i < text.size() && IsDigit(text[i])) exponent = (++i, true);
        if (!exponent) return false;
    }
    return i == text.size();
}

namespace {

/// Text that a value keyword's number may begin with.
bool StartsNumber(std::wstring_view text) {
    text = nedit::TrimLeftView(text);
    return !text.empty() && (IsDigit(text[0]) || text[0] == L'+' || text[0] == L'-' ||
                             text[0] == L'.' || text[0] == L',');
}

}  // namespace

USvyCodeCtrl::USvyCodeCtrl(nedit::CodeSettings settings) : S(std::move(settings)) {}

wchar_t USvyCodeCtrl::Separator() const {
    return S.CodeSeparator.empty() ? L'*' : S.CodeSeparator[0];
}

wchar_t USvyCodeCtrl::CommentMark() const {
    return S.CommentMark.empty() ? L'\0' : S.CommentMark[0];
}

std::vector<std::wstring> USvyCodeCtrl::Tokens(std::wstring_view text) const {
    const wchar_t comment = CommentMark();
    if (comment != L'\0') text = text.substr(0, text.find(comment));
    std::vector<std::wstring> raw;
    std::wstring token;
    for (const wchar_t c : text) {
        if (c == Separator() || nedit::IsBlank(c)) {
            if (!token.empty()) raw.push_back(std::move(token));
            token.clear();
        } else {
            token += c;
        }
    }
    if (!token.empty()) raw.push_back(std::move(token));
    // A value keyword standing alone takes the number that follows it as its value.
    std::vector<std::wstring> tokens;
    for (std::size_t i = 0; i < raw.size(); ++i) {
        if (IsValueKeyword(raw[i]) && i + 1 < raw.size() && IsNumberText(raw[i + 1])) {
            tokens.push_back(raw[i] + raw[i + 1]);
            ++i;
        } else {
            tokens.push_back(raw[i]);
        }
    }
    return tokens;
}

bool USvyCodeCtrl::IsValueKeyword(std::wstring_view word) const {
    return (!S.RectWidthCmd.empty() && nedit::EqualsIgnoreCase(word, S.RectWidthCmd)) ||
           (!S.OffsetStringCmd.empty() && nedit::EqualsIgnoreCase(word, S.OffsetStringCmd));
}

bool USvyCodeCtrl::IsFeatureToken(std::wstring_view token) const {
    return !IsCommand(token) && !IsOffset(token);
}

std::vector<std::wstring> USvyCodeCtrl::SplitCode(std::wstring_view text, int mode) const {
    const std::vector<std::wstring> tokens = Tokens(text);
    const std::wstring separator(1, Separator());
    std::vector<std::wstring> out;
    if (mode == 1) {
        for (const std::wstring& token : tokens) {
            if (out.empty() && !IsFeatureToken(token)) out.emplace_back();
            out.push_back(token);
        }
        return out;
    }
    for (const std::wstring& token : tokens) {
        if (out.empty() || IsFeatureToken(token)) {
            out.push_back(token);
        } else {
            out.back() += separator + token;
        }
    }
    return out;
}

std::wstring USvyCodeCtrl::InterpretCommand(std::wstring_view token, std::wstring& value) const {
    value.clear();
    const std::wstring_view trimmed = nedit::TrimView(token);
    const std::wstring plain[] = {S.ArcStartCmd,     S.ArcEndCmd,       S.CloseCmd,
                                  S.ChkShotCmd,      S.CircleRadiusCmd, S.CircleCircumCmd,
                                  kThreePointRectCmd};
    for (const std::wstring& word : plain) {
        if (!word.empty() && nedit::EqualsIgnoreCase(trimmed, word)) return nedit::ToUpper(word);
    }
    for (const std::wstring* word : {&S.RectWidthCmd, &S.OffsetStringCmd}) {
        if (word->empty() || trimmed.size() < word->size() ||
            !nedit::EqualsIgnoreCase(trimmed.substr(0, word->size()), *word)) {
            continue;
        }
        const std::wstring_view rest = trimmed.substr(word->size());
        if (!rest.empty() && !StartsNumber(rest)) continue;
        value = nedit::Trim(rest);
        return nedit::ToUpper(*word);
    }
    return {};
}

void USvyCodeCtrl::CheckComment(std::wstring& token) const {
    const wchar_t comment = CommentMark();
    if (comment != L'\0') token = token.substr(0, token.find(comment));
    token = nedit::Trim(token);
}

int USvyCodeCtrl::IsCommand(std::wstring_view token) const {
    std::wstring value;
    return InterpretCommand(token, value).empty() ? 0 : 1;
}

int USvyCodeCtrl::IsOffset(std::wstring_view token) const {
    token = nedit::TrimView(token);
    return !token.empty() && token[0] == kOffsetMark ? 1 : 0;
}

int USvyCodeCtrl::IsCmdString(std::wstring_view token) const {
    std::wstring value;
    const std::wstring word = InterpretCommand(token, value);
    if (word.empty()) return 0;
    if (nedit::EqualsIgnoreCase(word, S.RectWidthCmd)) return kTwoPointRect;
    if (nedit::EqualsIgnoreCase(word, kThreePointRectCmd)) return kThreePointRect;
    if (nedit::EqualsIgnoreCase(word, S.OffsetStringCmd)) return kOffsetString;
    return 0;
}

int USvyCodeCtrl::Split_String(std::wstring_view text, int& strNo, int& contour) const {
    strNo = 0;
    contour = 1;
    text = nedit::TrimView(text);
    if (text.empty()) return 0;
    const std::size_t digits = S.StrNoDigits > 0 ? static_cast<std::size_t>(S.StrNoDigits) : 0;
    if (text.size() <= digits || S.ContourDigit == 0) {
        strNo = nedit::TextToInt(text);
    } else if (S.ContourDigitFirst == 0) {
        contour = nedit::TextToInt(text.substr(digits));
        strNo = nedit::TextToInt(text.substr(0, digits));
    } else {
        strNo = nedit::TextToInt(text.substr(1));
        contour = nedit::TextToInt(text.substr(0, 1));
    }
    return 1;
}

std::wstring USvyCodeCtrl::InterpretCode(const std::vector<std::wstring>& tokens,
                                         std::wstring& strNo, int* contour, double* along,
                                         double* right, double* up, std::wstring& remark,
                                         std::wstring& name) const {
    strNo.clear();
    remark.clear();
    name.clear();
    if (contour) *contour = -1;
    for (double* offset : {along, right, up}) {
        if (offset) *offset = 0.0;
    }
    if (tokens.empty()) return {};
    for (const std::wstring& token : tokens) {
        if (!IsOffset(token)) continue;
        std::wstring_view rest = nedit::TrimView(token).substr(1);
        for (double* offset : {along, right, up}) {
            const std::size_t part = rest.find(kOffsetPart);
            if (offset) *offset = nedit::TextToDouble(rest.substr(0, part));
            if (part == std::wstring_view::npos) break;
            rest = rest.substr(part + 1);
        }
        break;
    }
    std::wstring feature = tokens.front();
    CheckComment(feature);
    feature = nedit::ToUpper(feature);
    // The number part: the digits at the end of the token, or at its start.
    std::size_t split = S.StrNoFirst ? 0 : feature.size();
    if (S.StrNoFirst) {
        while (split < feature.size() && IsDigit(feature[split])) ++split;
    } else {
        while (split > 0 && IsDigit(feature[split - 1])) --split;
    }
    std::wstring number = S.StrNoFirst ? feature.substr(0, split) : feature.substr(split);
    std::wstring code = S.StrNoFirst ? feature.substr(split) : feature.substr(0, split);
    const std::size_t digits = S.StrNoDigits > 0 ? static_cast<std::size_t>(S.StrNoDigits) : 0;
    if (S.ContourDigit != 0 && number.size() > digits) {
        const std::size_t at = S.ContourDigitFirst ? 0 : number.size() - 1;
        if (contour) *contour = number[at] == L'0' ? 0 : 1;
        number.erase(at, 1);
    }
    strNo = number;
    name = JoinedName(code, number);
    return code;
}

int USvyCodeCtrl::ParseString(std::wstring_view code, std::vector<USvyCodeExt>& out) const {
    out.clear();
    const wchar_t comment = CommentMark();
    const std::size_t mark = comment == L'\0' ? std::wstring_view::npos : code.find(comment);
    const std::wstring separator(1, Separator());
    for (const std::wstring& group : SplitCode(code, 2)) {
        const std::vector<std::wstring> tokens = SplitCode(group, 1);
        USvyCodeExt ext;
        std::wstring remark, name;
        int contour = -1;
        ext.Code =
            InterpretCode(tokens, ext.StrNo, &contour, nullptr, nullptr, nullptr, remark, name);
        ext.ContourGiven = contour >= 0;
        ext.ContourValue = contour < 0 ? 0 : contour;
        for (std::size_t i = 1; i < tokens.size(); ++i) {
            if (!IsCommand(tokens[i])) continue;
            if (!ext.Commands.empty()) ext.Commands += separator;
            ext.Commands += tokens[i];
        }
        out.push_back(std::move(ext));
    }
    if (mark != std::wstring_view::npos && !out.empty())
        out.back().Comment = nedit::Trim(code.substr(mark + 1));
    return static_cast<int>(out.size());
}

int USvyCodeCtrl::CheckCtrl(std::wstring_view token) const {
    const std::wstring_view trimmed = nedit::TrimView(token);
    if (trimmed.empty()) return 0;
    for (int position = 1; position <= nedit::CodeSettings::kKeywordCount; ++position) {
        const std::wstring word = S.Keyword(position);
        if (!word.empty() && nedit::EqualsIgnoreCase(trimmed, word)) return position;
    }
    return 0;
}

std::wstring USvyCodeCtrl::JoinedName(const std::wstring& code, const std::wstring& strNo) const {
    return S.StrNoFirst ? strNo + code : code + strNo;
}

std::wstring USvyCodeCtrl::ChkCode() const {
    return std::wstring(1, Separator()) + S.ChkShotCmd;
}
