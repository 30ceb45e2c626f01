#pragma once
// The job's definition of one feature code: how points and lines of that code look and
// behave. Members that hold numbers (colours, point mark) are text, as code libraries have
// always kept them; readers convert with plain text-to-integer conversion.

#include <string>

struct USvyCode {
    /// The code of the definition that stands for every code a library does not define.
    static constexpr const wchar_t* kDefaultCode = L"$$DEFAULT";

    std::wstring Code;
    std::wstring Layer;
    std::wstring PointMark;
    std::wstring Symbol;
    std::wstring PointColour;
    std::wstring LineType;
    std::wstring LineColour;
    std::wstring Thickness;
    std::wstring Description;
    int IsString = 0;          // points of this code form strings even without a string number
    int UseInSurface = 0;      // points of this code are used for contours
    int LineUseInSurface = 0;  // lines of this code are used for contours
    /// The four point flags, passed to a job point's flags word as 0x4000, 0x2000, 0x1000
    /// and 0x800 in this order.
    int PointFlag1 = 0;
    int PointFlag2 = 0;
    int PointFlag3 = 0;
    int PointFlag4 = 0;

    bool operator==(const USvyCode& other) const;
    bool operator!=(const USvyCode& other) const { return !(*this == other); }
};
