#pragma once
// The job as a DXF drawing (AutoCAD 2000 format, written through dxflib) that CAD programs
// read: one layer per layer of the job ("0" for objects without one), and true entities:
// - a point is a POINT with two TEXTs beside it, its name above and its code below;
// - lines are LINEs, arcs ARCs, circles CIRCLEs, all in 3D where the points have heights;
// - a polyline is an LWPOLYLINE with its bulges, closed when it ends where it started.
//
// Decisions:
// - DXF bulges are positive anticlockwise, the job's clockwise: every bulge changes sign.
// - DXF has no "no height": such a point goes in at elevation 0. A lightweight polyline has
//   one elevation: that of its vertices when they share one, else 0. Both are counted in
//   the messages.
// - Text height is 0.5 in the job's unit (legible at 1:250 to 1:500); letters beyond ASCII
//   are written as \U+XXXX, which every release of the format reads.
// - Layer names lose the characters DXF forbids in them (<>/\":;?*|=`), each becoming "_".
// - $INSUNITS says the job's length unit (metres, feet; US survey feet as feet).

#include <string>
#include <vector>

#include "exports/JobContents.h"

namespace nedit {

/// The drawing's text; `messages` gets what the format could not keep.
std::string DxfText(const JobContents& contents, std::vector<std::string>& messages);

/// The text of the drawing height of names and codes.
constexpr double kDxfTextHeight = 0.5;

}  // namespace nedit
