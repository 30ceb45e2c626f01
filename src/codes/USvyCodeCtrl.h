#pragma once
// The grammar of code fields: how the text a surveyor types beside a point is parted into
// groups, feature codes, string numbers, commands and offsets. Its words and the layout of
// string numbers come from the job's code settings (nedit::CodeSettings).
//
// The grammar, with the default settings:
//  * The comment mark "/" ends the codes of a field: whatever follows it is a comment, and
//    no command in it is read ("KB01*AS/new kerb" is KB01 with an arc start; in
//    "TREE01/old*CR" the CR is comment).
//  * Tokens are parted by the separator "*" and by blanks; empty tokens are dropped.
//  * A command is a whole token: AS (arc start), AE (arc end), CLS (close), CHK (check shot),
//    CR (circle by centre and radius point), CC (circle through three points), R3P
//    (three-point rectangle), and two that take a number: RECT (two-point rectangle, its
//    width) and OS (offset string, its distance). The number stands right behind the word
//    ("RECT2.5", "OS-1.5") or as the next token ("RECT*2.5", "OS 1.5"). Words compare
//    without regard to case. A token that merely begins with a word is no command: "ASPH"
//    is a feature code, not AS and PH. A word that takes a number followed by a digit, a sign,
//    a point or a comma is that command: "RECT2,5" is a RECT whose width is no number (the
//    run says so and makes no rectangle).
//  * An offset token begins with "@" and gives along, right and up, parted by colons (a comma
//    would end the record's field): "@0:1.5" or "@::-0.2"; a missing part is 0. Offsets are
//    in the file's length unit.
//  * Every other token is a feature token and begins a group: the feature code with its
//    string number. The number is the run of digits at the end of the token (at its start
//    when StrNoFirst is set): "KB01" is feature KB, number 01. The number is kept as written,
//    so KB1 and KB01 are two strings. With ContourDigit on, a number part longer than
//    StrNoDigits holds one contour digit, last (first when ContourDigitFirst is set).
//  * Commands and offsets belong to the feature token before them. Commands before any
//    feature token form a group with an empty feature code ("*CHK P12").
//  * A field "KB01*AS FC02" is two groups: KB01 with an arc start, and FC02.
//
// Only the check-shot code is read elsewhere (the separator followed by the check word).

#include <string>
#include <string_view>
#include <vector>

#include "codes/USvyCodeExt.h"
#include "platform/job/CodeSettings.h"

class USvyCodeCtrl {
  public:
    /// IsCmdString answers.
    static constexpr int kTwoPointRect = 4;
    static constexpr int kThreePointRect = 5;
    static constexpr int kOffsetString = 7;
    /// The word of the three-point rectangle, which the job's settings do not hold.
    static constexpr const wchar_t* kThreePointRectCmd = L"R3P";
    /// The prefix of an offset token, and the mark between its values.
    static constexpr wchar_t kOffsetMark = L'@';
    static constexpr wchar_t kOffsetPart = L':';

    explicit USvyCodeCtrl(nedit::CodeSettings settings = {});
    const nedit::CodeSettings& Settings() const { return S; }
    wchar_t Separator() const;
    wchar_t CommentMark() const;

    /// Mode 2: the groups of a field, each as text; mode 1: the tokens of one group, the
    /// feature token first (empty when the group opens with a command). Empty when there is
    /// nothing to split.
    std::vector<std::wstring> SplitCode(std::wstring_view text, int mode) const;
    /// The feature code of a group's tokens; out: the string number text, the contour value
    /// (-1 when the token states none), the three offsets, the remark (the comment) and the
    /// string name (feature and number joined as the settings order them).
    std::wstring InterpretCode(const std::vector<std::wstring>& tokens, std::wstring& strNo,
                               int* contour, double* along, double* right, double* up,
                               std::wstring& remark, std::wstring& name) const;
    /// The keyword of a command token, upper case, and the text behind it in `value`; empty
    /// when the token is no command.
    std::wstring InterpretCommand(std::wstring_view token, std::wstring& value) const;
    /// Cuts a token at the comment mark and trims it.
    void CheckComment(std::wstring& token) const;
    int IsCommand(std::wstring_view token) const;
    int IsOffset(std::wstring_view token) const;
    /// kTwoPointRect, kThreePointRect or kOffsetString for those commands, else 0.
    int IsCmdString(std::wstring_view token) const;
    /// The groups of a field; gives their number.
    int ParseString(std::wstring_view code, std::vector<USvyCodeExt>& out) const;
    /// Position 1 to 11 of a keyword of the settings, 0 if the token is none.
    int CheckCtrl(std::wstring_view token) const;
    /// The feature and number joined: "KB01", or "01KB" when the number stands first.
    std::wstring JoinedName(const std::wstring& code, const std::wstring& strNo) const;
    /// The check code: the separator followed by the check word.
    std::wstring ChkCode() const;
    /// The number part of a feature token parted into string number and contour digit, as
    /// the settings lay it out; 0 for empty text.
    int Split_String(std::wstring_view text, int& strNo, int& contour) const;

    /// The text is one number and nothing else: sign, digits, fraction, exponent.
    static bool IsNumberText(std::wstring_view text);

  private:
    std::vector<std::wstring> Tokens(std::wstring_view text) const;
    bool IsValueKeyword(std::wstring_view word) const;
    bool IsFeatureToken(std::wstring_view token) const;

    nedit::CodeSettings S;
};
