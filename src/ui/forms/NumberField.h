#pragma once
// A line edit for a number as surveyors type it: a point for the decimals whatever the
// desktop's language, an optional minus, and (where allowed) blank for "none".

#include <QLineEdit>

namespace nedit {

class NumberField : public QLineEdit {
    Q_OBJECT
  public:
    explicit NumberField(QWidget* parent = nullptr);

    /// The value with `decimals` places.
    void SetValue(double value, int decimals = 3);
    /// The number typed; `fallback` for a blank field.
    double Value(double fallback = 0.0) const;
    bool IsBlank() const;
};

}  // namespace nedit
