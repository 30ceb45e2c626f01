#pragma once
// The strings of a run: for every string number and feature code, the points filed under it
// in the order reduction offered them.

#include <string>
#include <vector>

/// One point of a string.
struct CStrList {
    std::wstring PtName;
    double OffsetAlong = 0.0;  ///< the offsets the code states, unconverted
    double OffsetRight = 0.0;
    double OffsetUp = 0.0;
    std::wstring Remark;                ///< the group's comment; kept, not read further
    std::vector<std::wstring> CmdList;  ///< the group's command tokens, empty if none
};

/// One string.
struct CStrNoList {
    std::vector<CStrList> StrList;
    std::wstring StrNo;    ///< string number as written, or a made-up one from 10000
    int Contour = 0;       ///< contour value of the point that opened the string
    std::wstring Code;     ///< feature code
    std::wstring StrName;  ///< name under which lines and arcs record the string
};
