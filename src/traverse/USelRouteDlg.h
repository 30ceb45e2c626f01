#pragma once
// "Traverse Adjustment": where the user meets the traverse. It offers the routes found, lets
// the user cut one down to a start and an end or carry it on to a point only observed from
// its last station, declares the known values at both ends, chooses the rule, and computes.
// The logic is here, without a screen: each parameter, its defaulting from the reduced data
// when another changes, the check of a route and two names (DoCheck), and the steps of
// "Compute". A DialogHost shows it; a face calls the handlers as the user acts.
//
// The parameters are the computation's (TraverseParams) and the dialog's own below. A field
// a face writes is read as it stands: the dialog reads its fields before it acts.
//
// Decisions:
// - OnOK is "Compute": true, ending the dialog, only when the computation closed it; every
//   refusal leaves the dialog open with its values.
// - Names that look up coordinates while a route is chosen may ask the user (the start, its
//   back sight, the angle-check point), as the engine asks; the fixed and closing points
//   never do.

#include <functional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "platform/messages/DialogHost.h"
#include "traverse/NameList.h"
#include "traverse/TraverseParams.h"

class CTraverse;
class UNeditDatabase;
struct STNSTRUCT;

namespace nedit {
class TraverseRoutes;
}

class USelRouteDlg : public nedit::UDialogLogic, public TraverseParams {
  public:
    /// Dialog forms: Easting above Northing, or Northing above Easting.
    static constexpr int kEastFirstId = 8015;
    static constexpr int kNorthFirstId = 8044;
    // Controls whose enabling the logic decides.
    static constexpr int kStartCombo = 2000;
    static constexpr int kEndCombo = 2001;
    static constexpr int kRouteList = 2002;
    static constexpr int kCheckCombo = 2004;
    static constexpr int kBackSightCombo = 2005;
    static constexpr int kUseBSBearingRadio = 1034;
    static constexpr int kUseBSCoordRadio = 1035;
    static constexpr int kBSXField = 1031;
    static constexpr int kBSYField = 1033;
    static constexpr int kStartBearingField = 1036;
    static constexpr int kFixedPtField = 1030;
    static constexpr int kFixedXField = 1027;
    static constexpr int kFixedYField = 1028;
    static constexpr int kFixedZField = 1029;
    static constexpr int kAdjustAngleBox = 1038;
    static constexpr int kUseCloseBearingRadio = 1040;
    static constexpr int kUseCloseCoordRadio = 1041;
    static constexpr int kClosePtField = 1092;
    static constexpr int kCloseXField = 1037;
    static constexpr int kCloseYField = 1039;
    static constexpr int kCloseBearingField = 1042;
    static constexpr int kComputeButton = 1048;

    /// A route offered in the route list: its text and the route.
    struct RouteRow {
        std::wstring Text;
        const nedit::NameList* Route;
    };

    /// `records` receives the report lines of the re-reduction; it may be null.
    USelRouteDlg(UNeditDatabase* db, nedit::TraverseRoutes* routes, int dialogId,
                 std::vector<std::wstring>* records);
    ~USelRouteDlg() override;

    std::wstring DialogName() const override { return L"Traverse Adjustment"; }
    /// Offers the routes of two names or more, sorted, and proposes the first, closing on
    /// its start.
    void OnInitDialog() override;
    /// "Compute".
    bool OnOK() override;
    /// Cancel ends the dialog, except while a computation runs.
    bool CanCancel() const { return Running == 0; }
    /// Called by the computation when it ends in an adjustment.
    void CloseDialog() { Closed = 1; }
    /// Checks the route and the two names; `out` becomes the names of the computation, each
    /// followed by a comma. A route carried on to an observed point is added to the routes.
    bool DoCheck(std::wstring& out);

    // ---- The user's acts ----------------------------------------------------------------
    void OnSelectRoute(int row);
    void OnStartChanged(const std::wstring& name);
    void OnBackSightChosen(const std::wstring& name);
    void OnEndChosen(const std::wstring& name);
    void OnEndTyped(const std::wstring& text);
    void OnCheckPtTyped(const std::wstring& text);
    void OnCheckPtChosen(const std::wstring& name);
    void OnFixedPtChanged(const std::wstring& text);
    void OnClosePtChanged(const std::wstring& text);
    /// The fixed or closing coordinates were typed: the closing bearing follows them.
    void OnCoordinatesChanged();
    void OnOrientationClicked(bool useCoordinates);
    void OnAdjustAngleClicked(bool checked);
    void OnCloseModeClicked(bool useCoordinates);

    // ---- What it shows --------------------------------------------------------------------
    int GetDialogId() const { return DialogId; }
    const std::vector<RouteRow>& GetRouteRows() const { return RouteRows; }
    int GetSelectedRow() const { return SelectedRow; }
    const nedit::NameList* GetRouteSel() const { return RouteSel; }
    const std::vector<std::wstring>& GetStartNames() const { return StartNames; }
    const std::vector<std::wstring>& GetEndNames() const { return EndNames; }
    const std::vector<std::wstring>& GetCheckNames() const { return CheckNames; }
    const std::vector<std::wstring>& GetBackSightNames() const { return BackSightNames; }
    const std::wstring& GetEndText() const { return EndText; }
    int GetEndPtIdx() const { return EndPtIdx; }
    bool IsEnabled(int control) const { return Disabled.count(control) == 0; }
    /// What the last computation gave: CTraverse::kDone, kGivenUp or an error code; 0 before.
    int GetResult() const { return Result; }
    /// Called with each computation before it runs, to watch its stages.
    void SetComputeObserver(std::function<void(CTraverse&)> observer) {
        ComputeObserver = std::move(observer);
    }

    // The dialog's own parameters.
    std::wstring Start;
    std::wstring EndStn;
    std::wstring ClosePt;
    int UseBSBearing = 1;
    int UseCloseBearing = 0;
    int Compass = 1;

  private:
    void UpdateStartStn();
    void UpdateEndStn();
    void SetOrientPtBox();
    int SetXYZBoxes(int control);
    void SetCheckPtBox();
    void UpdateFixedPt();
    /// The closing bearing from the fixed point to the closing coordinates.
    void CloseBearingFromCoordinates();
    void EnableOrientParBoxes();
    void EnableCheckParBoxes();
    void DisableAllCheckParBoxes();
    void EnableFixedPtWindow(bool on);
    void Enable(int control, bool on);
    void Show(const std::wstring& message) const;
    /// Selects the first route row that begins with `text`, adding one of `route` when none
    /// does.
    void SelectRouteRow(const std::wstring& text, nedit::NameList route);

    UNeditDatabase* Db;
    nedit::TraverseRoutes* Routes;
    int DialogId;
    std::vector<std::wstring>* Records;
    std::vector<RouteRow> RouteRows;
    int SelectedRow = -1;
    const nedit::NameList* RouteSel = nullptr;
    std::vector<std::wstring> StartNames;
    std::vector<std::wstring> EndNames;
    std::vector<std::wstring> CheckNames;
    std::vector<std::wstring> BackSightNames;
    STNSTRUCT* StartStn = nullptr;
    STNSTRUCT* EndStnPtr = nullptr;
    std::wstring EndText;
    int EndPtIdx = -1;
    int Running = 0;
    int Closed = 0;
    int Result = 0;
    std::set<int> Disabled;
    std::function<void(CTraverse&)> ComputeObserver;
};
