#pragma once
// Files reduced points under their strings as reduction offers them: every group of a
// point's code puts the point into the string of its number and feature code, made when it
// is first met. A string is keyed by number (without regard to case) and feature code
// (exactly), and holds no station, so it runs on across set-ups. A feature without a number
// whose library definition says it forms strings gets a made-up number, 10000 for the first
// such code of a run, 10001 for the next. Codes that no library defines are noted for the
// report. Filing also runs the shape steps that work on a string as it grows: the two- and
// three-point rectangles and the offset strings (Rectangles.cpp, OffsetStrings.cpp).
//
// Look-ups are by hash, and the library is asked once per code, so filing stays linear in
// the points.

#include <map>
#include <string>
#include <unordered_map>
#include <vector>

#include "codes/CStrList.h"
#include "codes/CodeGeometryHost.h"
#include "codes/USvyCodeCtrl.h"

class USurveyDoc;

namespace nedit {

/// A point that waits for its twin in an offset string.
struct UOffsetStringPtInfo {
    std::wstring StrNo;
    int Contour = 0;
    std::wstring Code;
    std::wstring Group;  ///< the whole text of the group that asked for the offset
    UNeditPt Pt;
    double Distance = 0.0;  ///< in the job's unit
};

class StringFiling {
  public:
    /// CheckCode answers.
    static constexpr int kDefined = 1;
    static constexpr int kNoLibrary = 0;
    static constexpr int kUndefined = -2;
    static constexpr int kEmptyCode = -3;

    /// `job` may be null: then no code is looked up and no made-up numbers are given.
    StringFiling(const USvyCodeCtrl& ctrl, USurveyDoc* job, CodeGeometryHost& host);

    /// Files the point `name` under every group of its code, in order.
    void Arrange_SS_String(const std::wstring& code, const std::wstring& name);
    /// Files the point under one group.
    void InsertStringNoList(const std::wstring& name, const std::wstring& group);
    /// kDefined, kNoLibrary, kUndefined (the code is noted) or kEmptyCode.
    int CheckCode(const std::wstring& code);
    /// A made-up number for a string code without one, or empty.
    std::wstring GetStrNoFromLibrary(const std::wstring& code);
    /// Closes the open offset string: makes its offset points and files them.
    void ProcessOffsetStringPoints();
    /// Forgets every string, made-up number and undefined code.
    void DeleteStrNoList();

    const std::vector<CStrNoList>& Strings() const { return StrListHead; }
    /// Code text to 1, in the order of the text.
    const std::map<std::wstring, int>& UndefinedCodes() const { return Undefined; }

  private:
    /// The string of that number and code, or -1.
    int FindString(const std::wstring& strNo, const std::wstring& code) const;
    std::size_t AddString(CStrNoList string);
    void RectangleStep(std::size_t string, const std::vector<std::wstring>& commands);
    void TwoPointRectangle(CStrNoList& string, unsigned q, unsigned p, double width);
    void ThreePointRectangle(CStrNoList& string, unsigned r, unsigned q, unsigned p);
    void OffsetStep(const std::wstring& name, const std::wstring& group, std::size_t string,
                    const std::vector<std::wstring>& commands);
    /// `base` with "-1", "-1-2", ... until no point has the name.
    std::wstring UniqueName(const std::wstring& base) const;
    double CommandDistance(const std::wstring& token, const std::wstring& name);

    const USvyCodeCtrl& Ctrl;
    USurveyDoc* Job;
    CodeGeometryHost& Host;
    std::vector<CStrNoList> StrListHead;
    std::unordered_map<std::wstring, std::size_t> ByKey;  // upper-case number, code
    std::vector<std::wstring> StringCodes;
    std::map<std::wstring, int> Undefined;
    std::unordered_map<std::wstring, int> CheckedCodes;
    std::unordered_map<std::wstring, bool> StringFlags;
    std::vector<UOffsetStringPtInfo> OffsetPts;
    bool OffsetOpen = false;
};

}  // namespace nedit
