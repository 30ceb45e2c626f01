#pragma once
// The settings of the job's survey code grammar: the separator of tokens, the comment mark,
// the command keywords and the layout of string numbers. The grammar that reads code fields
// with them is USvyCodeCtrl; this is what the job stores, in its settings section "codes".

#include <array>
#include <string>

namespace nedit {

class JobDatabase;

struct CodeSettings {
    /// Keywords 1 to 11 in the order the grammar numbers them; keyword 1 is the separator.
    static constexpr int kKeywordCount = 11;

    std::wstring CommentMark = L"/";
    std::wstring CodeSeparator = L"*";
    std::wstring ArcStartCmd = L"AS";
    std::wstring ArcEndCmd = L"AE";
    std::wstring RectWidthCmd = L"RECT";
    std::wstring CloseCmd = L"CLS";
    std::wstring Keyword6 = L"ST";
    std::wstring ChkShotCmd = L"CHK";
    std::wstring Keyword8;
    std::wstring Keyword9;
    std::wstring Keyword10;
    std::wstring Keyword11;
    std::wstring OffsetStringCmd = L"OS";
    std::wstring CircleRadiusCmd = L"CR";
    std::wstring CircleCircumCmd = L"CC";
    short StrNoDigits = 2;
    int StrNoFirst = 0;
    int ContourDigit = 0;
    int ContourDigitFirst = 0;

    /// Keyword `position` (1 to 11); empty text for any other position.
    std::wstring Keyword(int position) const;

    bool operator==(const CodeSettings& other) const;
    bool operator!=(const CodeSettings& other) const { return !(*this == other); }
};

/// The stored settings; keys that are missing keep the defaults above.
CodeSettings LoadCodeSettings(JobDatabase& job);
void SaveCodeSettings(JobDatabase& job, const CodeSettings& settings);

}  // namespace nedit
