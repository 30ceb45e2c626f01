#pragma once
// The state of the circle commands of a run: a circle by its centre and a rim point (CR on
// the centre), and a circle through three rim points (CC on the first). The point that gives
// the command opens the circle; the next points of the same feature code and string number
// complete it, whether or not they repeat the command, and points of other features pass by
// without disturbing it. A circle left with too few points makes nothing.
//
// Points are known by an integer that the caller chooses: an index of the point list in a
// reduction, a job point's id in a transfer.

#include <functional>
#include <string>
#include <vector>

#include "codes/UNeditCircle.h"
#include "codes/UNeditPt.h"
#include "codes/USvyCodeCtrl.h"
#include "codes/USvyCodeExt.h"

class UCircleCommandMgr {
  public:
    /// A circle completed by a point: the circle and the points that defined it.
    struct Made {
        UNeditCircle Circle;
        std::vector<int> Points;
    };
    /// The point of an id, or null when there is none.
    using PointOf = std::function<const UNeditPt*(int)>;

    bool RadiusActive = false;
    bool CircumActive = false;
    std::vector<int> RadiusPoints;
    std::vector<int> CircumPoints;

    /// True, and RadiusActive set, if the code holds the keyword.
    bool FindCircleRadius(const std::wstring& code, const std::wstring& keyword,
                          const USvyCodeCtrl& ctrl);
    bool FindCircleCircumference(const std::wstring& code, const std::wstring& keyword,
                                 const USvyCodeCtrl& ctrl);
    /// Position from 1 of the group that holds the keyword, 0 if none.
    static int FindCode(const std::vector<USvyCodeExt>& groups, const std::wstring& keyword,
                        const USvyCodeCtrl& ctrl);
    /// The same feature code and string number.
    static bool Compare_code_string_no(const USvyCodeExt& a, const USvyCodeExt& b);
    void ResetCR_CmdFlag();
    void ResetCC_CmdFlag();
    void Reset();

    /// One point offered to the circle commands, with its code: true when it completed a
    /// circle, given in `made`. `notice` tells of a circle that its points could not fix.
    bool Offer(int id, const std::wstring& code, const USvyCodeCtrl& ctrl, const PointOf& pointOf,
               Made& made, std::wstring& notice);

  private:
    /// The point joins the open circle of `points`, or opens one by its command.
    bool Joins(const std::vector<USvyCodeExt>& groups, bool& active, std::vector<int>& points,
               const std::wstring& keyword, const std::wstring& code, const USvyCodeCtrl& ctrl,
               const PointOf& pointOf);
    std::wstring OpeningCode;
};
