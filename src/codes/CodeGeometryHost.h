#pragma once
// What the filing of strings and their assembly into lines, arcs and shapes need of the
// engine that owns the stores of reduced geometry. The engine stands above the codes, so it
// implements this and hands itself in.

#include <string>

#include "codes/UNeditPt.h"
#include "platform/geometry/UWArc.h"

namespace nedit {

class CodeGeometryHost {
  public:
    virtual ~CodeGeometryHost() = default;
    /// Index in the point list of the point of that exact name, or -1.
    virtual int PointIndex(const std::wstring& name) const = 0;
    /// The point at an index the list holds; good until the next point is saved.
    virtual const UNeditPt& PointAt(unsigned index) const = 0;
    /// Saves a point made by computation (a corner, a centre, an offset point) at height 0
    /// with no control flag, as the run saves every point; gives its index.
    virtual unsigned SaveDerivedPoint(const std::wstring& name, double x, double y,
                                      const std::wstring& code) = 0;
    /// A line of a string, with the string's feature code and name; 0 when either index is -1.
    virtual int SaveStringLine(unsigned from, unsigned to, const std::wstring& code,
                               const std::wstring& stringName) = 0;
    /// An arc of a string; its code and string come from the second point's code.
    virtual void SaveStringArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                               ArcType type) = 0;
    /// A distance stated in a code, in the file's length unit, converted to the job's.
    virtual double CodeDistance(double value) const = 0;
    /// The user asked the run to stop.
    virtual bool StopRequested() const = 0;
    virtual void StringProgress(unsigned percent) = 0;
    /// A code that could not be turned into the geometry it asks for: said to the user and
    /// printed in the report, so that nothing vanishes without a word.
    virtual void CodeNotice(const std::wstring& text) = 0;
};

}  // namespace nedit
