#pragma once
// One field of a form: a line edit that knows what it holds. Numbers are typed with a point
// for the decimals whatever the desktop's language. A length, a coordinate or an angle is
// shown and typed in the job's unit, and the unit stands greyed at the field's right end.
// Text that does not read as a value of the field's kind (or a name or code that would split
// its record) turns red, and Problem() names the fault; the forms check it before they take their
// values, so a wrong digit is said rather than read as something else.
//
// The kinds are the field controls the system has always had: plain text, a point name, a
// point code, a whole number, a real number, a horizontal angle, a vertical angle (shown as a
// zenith angle), a bearing, and the lengths (length, distance, coordinate, elevation).
// Values go in and out in the program's units: degrees, and the job's length unit.
//
// Decisions:
// - An empty number field reads as 0, an empty elevation as no height; neither is a fault.
// - A field that shows a record's own text (the record form) can be given the angle unit of
//   its file, which it then shows; no value is converted there.

#include <QLineEdit>

#include "platform/units/Units.h"

class UJobSettings;

namespace nedit {

class UEdit : public QLineEdit {
    Q_OBJECT
  public:
    enum class Kind {
        Text,
        PointName,
        PointCode,
        Long,
        Double,
        Angle,
        VAngle,
        Bearing,
        Length,
        Distance,
        Coordinate,
        Elevation,
    };

    /// A field of `kind` in the units of `job` (null: metres, ddd.mmss, 3 and 4 decimals).
    UEdit(Kind kind, const UJobSettings* job, QWidget* parent = nullptr);

    Kind GetKind() const { return kind_; }
    bool IsNumber() const { return kind_ >= Kind::Long; }
    bool IsAngle() const { return kind_ >= Kind::Angle && kind_ <= Kind::Bearing; }
    bool IsLength() const { return kind_ >= Kind::Length; }
    /// The angle unit shown and typed: the job's unless set.
    AngleUnit GetAngleUnit() const { return angle_unit_; }
    void SetAngleUnit(AngleUnit unit);
    /// The unit written beside the value: "m", "ft", "usft", "dms", "deg", "gon"; empty for
    /// text and plain numbers.
    QString Unit() const;

    /// SetValue shows at least this many places (a record's own value shows all it holds).
    void SetMinimumDecimals(int decimals) { minimum_decimals_ = decimals; }
    /// Shows `value`: degrees in the angle unit (a bearing brought into 0 to 360), a length
    /// as it is, with the job's decimals; an elevation of no height as an empty field.
    void SetValue(double value);
    /// The value typed, in degrees or the job's length unit; an empty field gives 0, or no
    /// height for an elevation.
    double Value() const;
    bool IsBlank() const;
    /// Why the text is no value of this kind; empty when it is one.
    QString Problem() const;

  protected:
    void paintEvent(QPaintEvent* event) override;

  private:
    void Check();

    Kind kind_;
    const UJobSettings* job_;
    AngleUnit angle_unit_;
    int minimum_decimals_ = 0;
};

}  // namespace nedit
