#pragma once
// "Traverse Adjustment": the face of the route dialog. The routes found stand in a list above
// the small plan of the chosen route; beside them the groups "Start Station", "End Station",
// "Angle Adjustment" and "Adjustment". Each act of the user goes to its handler in the
// dialog, which defaults the other values from the reduced data and decides what is enabled;
// the form then shows every value again, but the field being typed in. "Compute" is the
// default button: it runs the computation, whose misclose report is a dialog of its own, and
// the form closes only when the computation adjusted the traverse; else it stays with its
// values.
//
// Coordinates stand Easting first (dialog 8015) or Northing first (8044) in every group, in
// the job's length unit; bearings in its angle unit.
//
// Decisions:
// - Heights show as elevations: an empty field is no height, as the reduction gives it.
// - The start and its back sight are chosen from their lists; the end and the angle-check
//   point may also be typed, and a typed name is looked up as it is typed.

#include <functional>
#include <map>

#include "traverse/USelRouteDlg.h"
#include "ui/forms/LogicForm.h"

class QAbstractButton;
class QComboBox;
class QFormLayout;
class QGroupBox;
class QListWidget;

namespace nedit {

class SXTView;
class UEdit;

class TraverseForm : public LogicForm {
    Q_OBJECT
  public:
    TraverseForm(USelRouteDlg& dialog, const FormContext& context, QWidget* parent);

    QListWidget* Routes() const { return routes_; }
    /// A control by its number in the dialog (USelRouteDlg's and the coordinate fields':
    /// 1026, 1023, 1025 the start's Easting, Northing, Height); null for an unknown one.
    QWidget* Control(int id) const;
    /// The field of that number; null when the control is no field.
    UEdit* Field(int id) const;
    QComboBox* Combo(int id) const;
    QAbstractButton* Button(int id) const;
    SXTView* Preview() const { return preview_; }

    /// The numbers of the start's coordinate fields, and of the rule's radios.
    static constexpr int kStartXField = 1026;
    static constexpr int kStartYField = 1023;
    static constexpr int kStartZField = 1025;
    static constexpr int kCompassRadio = 1046;
    static constexpr int kTransitRadio = 1047;

  protected:
    void Refused() override;

  private:
    QGroupBox* StartGroup();
    QGroupBox* EndGroup();
    QGroupBox* AngleGroup();
    QGroupBox* RuleGroup();
    /// What a name chosen or typed sets off in the dialog.
    using NameAct = std::function<void(const std::wstring&)>;
    /// A coordinate field of a group, and the member it shows.
    struct PlanField {
        int id;
        double* value;
    };
    /// A combo of names: `chosen` runs when one is chosen; with `typed` it may be typed in.
    QComboBox* NameCombo(int id, const NameAct& chosen, const NameAct& typed = {});
    /// A field of a point's name, whose every change runs `changed`.
    UEdit* PointField(int id, std::wstring& value, const NameAct& changed);
    /// A field bound to `value`.
    UEdit* Coordinate(int id, const char* definition, double& value);
    /// The Easting and Northing rows of a group, in the dialog's order; `closing` ones move
    /// the closing bearing.
    void AddPlanRows(QFormLayout* rows, PlanField east, PlanField north, bool closing);
    /// The radios "Use Coord" and "Use Bearing" over `useCoord`; `clicked` when it changes.
    void AddCoordOrBearing(QFormLayout* rows, int coordId, int bearingId, const int& useCoord,
                           const std::function<void(bool)>& clicked);
    /// Runs `act` on the dialog when the user (not the form) changed a control, then shows
    /// the values again, but in `typing`, the control typed in.
    void Act(const std::function<void()>& act, const QObject* typing = nullptr);
    /// Shows every value, list and enabling as the dialog has them; `typing` keeps its text.
    void Refresh(const QObject* typing = nullptr);
    void FillRoutes();

    USelRouteDlg& dialog_;
    bool east_first_;
    bool refreshing_ = false;
    std::map<int, QWidget*> controls_;
    QListWidget* routes_ = nullptr;
    SXTView* preview_ = nullptr;
};

}  // namespace nedit
