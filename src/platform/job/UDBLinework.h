#pragma once
// What lines, arcs, circles and polylines of the job have beside their geometry: a line style and a
// thickness, on top of everything an object of the job has.

#include <functional>
#include <initializer_list>

#include "platform/job/UDBObject.h"

namespace nedit {
class Statement;
}

class UDBLinework : public UDBObject {
  public:
    int GetLineStyle() const { return line_style_; }
    void SetLineStyle(int style) { line_style_ = style; }
    int GetThickness() const { return thickness_; }
    void SetThickness(int thickness) { thickness_ = thickness; }

  protected:
    using UDBObject::UDBObject;

    // Every linework table has the same style columns (layer_id, colour, line_style,
    // thickness, flags) behind the columns of its own kind; these two map both.
    using ReadColumns = std::function<void(const nedit::Statement&)>;
    using BindColumns = std::function<void(nedit::Statement&)>;
    /// Loads the row `id` of this kind's table: the style into this object, and the kind's
    /// own `columns` through `read`, which finds them from column 0 on. False when `id` is
    /// of another kind or there is no such row.
    bool LoadRow(long id, std::initializer_list<const char*> columns, const ReadColumns& read);
    /// Inserts this object's row (id 0, and the object takes the new id) or updates it: the
    /// kind's own `columns`, whose values `bind` binds from parameter 1 on, and the style.
    void SaveRow(std::initializer_list<const char*> columns, const BindColumns& bind);

    int line_style_ = 0;
    int thickness_ = 0;
};
