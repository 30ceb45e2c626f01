#pragma once
// One group of a code field as the grammar parses it (USvyCodeCtrl::ParseString).

#include <string>

struct USvyCodeExt {
    std::wstring StrNo;     ///< string number as written, empty when the group has none
    std::wstring Code;      ///< feature code, upper case
    std::wstring Comment;   ///< text behind the comment mark (on the group that holds it)
    std::wstring Commands;  ///< the group's command tokens, joined by the separator
    int ContourValue = 0;   ///< 1 or 0 when the token states the contour digit
    bool ContourGiven = false;
    int ExtraFlag = 0;  ///< no code of this grammar states it
    int ExtraFlagGiven = 0;
    double SymbolScale = 0.0;  ///< the three symbol values; this grammar states none
    double SymbolValue2 = 0.0;
    double SymbolValue3 = 0.0;
};
