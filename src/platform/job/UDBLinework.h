#pragma once
// What lines, arcs, circles and polylines of the job have beside their geometry: a line style and a
// thickness, on top of everything an object of the job has.

#include "platform/job/UDBObject.h"

class UDBLinework : public UDBObject {
  public:
    int GetLineStyle() const { return line_style_; }
    void SetLineStyle(int style) { line_style_ = style; }
    int GetThickness() const { return thickness_; }
    void SetThickness(int thickness) { thickness_ = thickness; }

  protected:
    using UDBObject::UDBObject;

    int line_style_ = 0;
    int thickness_ = 0;
};
