#pragma once
// Circles that point codes ask for, made in the job as their points are written: a circle by
// its centre and a point on it (the radius command), or through three points (the
// circumference command). While a command is open its points are kept by their job
// identifiers. A point takes part when its code holds the command, or, while the command is
// open, when its first group has the feature code and string number of the group that holds
// the command in the code of the first point.

#include <string>
#include <vector>

#include "platform/job/USvyCode.h"

class UDBPoint;
class UWPoint;

namespace nedit {

class TransferContext;
struct CodeGroup;

class JobCircles {
  public:
    /// `radiusCommand` and `circumCommand` are the keywords of the job's code settings.
    JobCircles(TransferContext& context, std::wstring radiusCommand, std::wstring circumCommand);

    /// Whether the point just saved takes part in a circle (opening a command its code in the
    /// job holds). `first` is the first group of its code; `code` the code it was reduced
    /// with, whose circle commands, when the job's code lacks them, are named as lost.
    bool Takes(const UDBPoint& saved, const CodeGroup& first, const std::wstring& code);
    /// Adds the point to the open commands; a command that has its points makes its circle in
    /// the job with the look of `code`, and closes.
    void Add(const UDBPoint& saved, const CodeGroup& first, const USvyCode& code);
    /// Closes both commands.
    void ResetCircleData();

  private:
    /// Like FindCircleRadius and FindCircleCircumference: some group of `code` holds `command`.
    bool Holds(const std::wstring& code, const std::wstring& command) const;
    /// The first group of the point's code that holds `command` has the feature code and
    /// string number of `first`.
    bool SameString(long point, const std::wstring& command, const CodeGroup& first) const;
    /// Saves a circle about `centre` with the look of `code`; false after noting why it was not
    /// written.
    bool SaveCircle(long centre, double radius, const USvyCode& code, bool useInSurface,
                    const std::wstring& name);
    /// A new point at the centre of a circle through three points, named "Center-N"; 0 when
    /// it cannot be saved.
    long SaveCentre(const UWPoint& at, const UDBPoint& rim, const CodeGroup& first);

    /// One circle command: its keyword, whether it is open, and the points it has.
    struct Command {
        std::wstring Keyword;
        bool Active = false;
        std::vector<long> Points;
        void Reset() {
            Active = false;
            Points.clear();
        }
    };

    TransferContext& Context;
    Command Radius;
    Command Circum;
};

}  // namespace nedit
