#include "traverse/USelRouteDlg.h"

#include <algorithm>

#include "platform/geometry/UWLine.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"

namespace {

/// The bearing from (e1, n1) to (e2, n2), in plan.
double PlanBearing(double e1, double n1, double e2, double n2) {
    return UWLine(UWPoint(e1, n1, 0.0), UWPoint(e2, n2, 0.0)).Bearing();
}

double LessATurn(double bearing) {
    return bearing >= 360.0 ? bearing - 360.0 : bearing;
}

std::vector<std::wstring> NamesOf(const nedit::NameList* route) {
    std::vector<std::wstring> names;
    if (route != nullptr) {
        for (const nedit::NameEntry& entry : *route) names.push_back(entry.Key);
    }
    return names;
}

bool BeginsWith(const std::wstring& text, const std::wstring& start) {
    return text.size() >= start.size() &&
           nedit::EqualsIgnoreCase(std::wstring_view(text).substr(0, start.size()), start);
}

}  // namespace

USelRouteDlg::USelRouteDlg(UNeditDatabase* db, nedit::TraverseRoutes* routes, int dialogId,
                           std::vector<std::wstring>* records)
    : Db(db), Routes(routes), DialogId(dialogId), Records(records) {}

USelRouteDlg::~USelRouteDlg() = default;

void USelRouteDlg::Show(const std::wstring& message) const {
    nedit::AppMessageBox(Db->GetDialogHost(), message, nedit::mb::Ok);
}

void USelRouteDlg::Enable(int control, bool on) {
    if (on) {
        Disabled.erase(control);
    } else {
        Disabled.insert(control);
    }
}

// ---- Opening and the choice of a route --------------------------------------------------------

void USelRouteDlg::OnInitDialog() {
    RouteRows.clear();
    for (const nedit::NameList* route : Routes->GetTraverseList()) {
        if (route->size() >= 2) RouteRows.push_back({nedit::RouteText(*route), route});
    }
    std::stable_sort(RouteRows.begin(), RouteRows.end(), [](const RouteRow& a, const RouteRow& b) {
        return nedit::ToUpper(a.Text) < nedit::ToUpper(b.Text);
    });
    if (!RouteRows.empty()) {
        SelectedRow = 0;
        RouteSel = RouteRows.front().Route;
        UpdateStartStn();
        UpdateEndStn();
    }
    // The first proposal closes on the start.
    if (!Start.empty()) FixedPt = Start;
    UpdateFixedPt();
}

void USelRouteDlg::OnSelectRoute(int row) {
    if (row < 0 || row >= static_cast<int>(RouteRows.size())) return;
    SelectedRow = row;
    RouteSel = RouteRows[static_cast<std::size_t>(row)].Route;
    Start = RouteSel->front().Key;
    EndStn = EndText = RouteSel->back().Key;
    FixedPt = Start;
    UpdateStartStn();
    UpdateEndStn();
    UpdateFixedPt();
}

void USelRouteDlg::UpdateStartStn() {
    StartNames = NamesOf(RouteSel);
    Start = StartNames.empty() ? std::wstring() : StartNames.front();
    SetXYZBoxes(kStartCombo);
    SetOrientPtBox();
}

void USelRouteDlg::UpdateEndStn() {
    EndNames = NamesOf(RouteSel);
    EndStn = EndText = EndNames.empty() ? std::wstring() : EndNames.back();
    UseCloseBearing = UseCloseCoord != 0 ? 0 : 1;
    EnableCheckParBoxes();
    SetCheckPtBox();
    if (Db->searchSTN(EndStn) == nullptr) {
        AdjustAngle = 0;
        Enable(kAdjustAngleBox, false);
    } else {
        Enable(kAdjustAngleBox, true);
    }
}

void USelRouteDlg::SetOrientPtBox() {
    BackSightNames.clear();
    StartStn = Start.empty() ? nullptr : Db->searchSTN(Start);
    if (StartStn == nullptr || StartStn->BkStnName.empty()) {
        for (const int control : {kBackSightCombo, kUseBSCoordRadio, kUseBSBearingRadio, kBSXField,
                                  kBSYField, kStartBearingField}) {
            Enable(control, false);
        }
        return;
    }
    BackSightNames.emplace_back(StartStn->BkStnName);
    BSName = StartStn->BkStnName;
    SetXYZBoxes(kBackSightCombo);
}

// The defaulting of coordinates from the reduced data.
int USelRouteDlg::SetXYZBoxes(int control) {
    std::wstring name;
    switch (control) {
        case kFixedPtField:
            name = FixedPt;
            break;
        case kClosePtField:
            name = ClosePt;
            break;
        case kStartCombo:
            name = Start;
            break;
        case kBackSightCombo:
            name = BSName;
            break;
        default:
            name = ChkPt;
            break;
    }
    name = nedit::Trim(name);
    if (name.empty()) return 0;
    double x = 0.0, y = 0.0, z = kNoHeight;
    std::wstring code;
    const bool ask = control != kFixedPtField && control != kClosePtField;
    const int found = Db->findCoord(name, x, y, z, code, 1, ask);
    switch (control) {
        case kStartCombo:
            StartX = x;
            StartY = y;
            StartZ = z;
            break;
        case kBackSightCombo: {
            BSX = BSY = 0.0;
            const STNSTRUCT* start = Db->searchSTN(Start);
            if (start == nullptr) return found;
            double bearing = start->BkBearing;
            if (found) {
                BSX = x;
                BSY = y;
                bearing = PlanBearing(StartX, StartY, x, y);
            }
            StartBearing = bearing;
            UseBSCoord = found ? 1 : 0;
            UseBSBearing = found ? 0 : 1;
            EnableOrientParBoxes();
            break;
        }
        case kFixedPtField:
            FixedX = x;
            FixedY = y;
            FixedZ = z;
            break;
        default:
            CloseX = found ? x : 0.0;
            CloseY = found ? y : 0.0;
            break;
    }
    return found;
}

// The proposal of the angle check at the end.
void USelRouteDlg::SetCheckPtBox() {
    CheckNames.clear();
    EndStnPtr = EndStn.empty() ? nullptr : Db->searchSTN(EndStn);
    if (EndStnPtr == nullptr) return;
    const SSSTRUCT* first = nullptr;
    for (const TargetList* list : {&EndStnPtr->FSList, &EndStnPtr->SSList}) {
        for (const auto& target : *list) {
            const std::wstring name(target->SSName);
            const bool listed =
                std::any_of(CheckNames.begin(), CheckNames.end(),
                            [&](const std::wstring& n) { return BeginsWith(n, name); });
            if (listed) continue;
            CheckNames.push_back(name);
            if (first == nullptr) first = target;
        }
    }
    if (CheckNames.empty()) return;
    // The bearing is proposed from the first target, the point from the last.
    CloseBearing = LessATurn(EndStnPtr->BkBearing + first->AngleFromBS);
    CloseX = CloseY = 0.0;
    ChkPt = CheckNames.back();
    if (!ChkPt.empty()) {
        double z = kNoHeight;
        std::wstring code;
        Db->findCoord(ChkPt, CloseX, CloseY, z, code, 1, true);
    }
}

void USelRouteDlg::UpdateFixedPt() {
    Enable(kComputeButton, !FixedPt.empty());
    SetXYZBoxes(kFixedPtField);
    CloseBearingFromCoordinates();
}

void USelRouteDlg::CloseBearingFromCoordinates() {
    CloseBearing = PlanBearing(FixedX, FixedY, CloseX, CloseY);
}

// ---- The user's acts --------------------------------------------------------------------------

void USelRouteDlg::OnStartChanged(const std::wstring& name) {
    Start = name;
    SetXYZBoxes(kStartCombo);
    SetOrientPtBox();
}

void USelRouteDlg::OnBackSightChosen(const std::wstring& name) {
    BSName = name;
    SetXYZBoxes(kBackSightCombo);
}

void USelRouteDlg::OnEndChosen(const std::wstring& name) {
    EndStn = EndText = name;
    EnableCheckParBoxes();
}

void USelRouteDlg::OnEndTyped(const std::wstring& text) {
    EndStn.clear();
    EndPtIdx = -1;
    EndText = nedit::Trim(text);
    if (!EndText.empty()) {
        EndText = nedit::ToUpper(EndText);
        EndStn = EndText;
        EndPtIdx = Db->GetPointIdx(EndStn);
    }
    if (EndPtIdx < 0) {
        AdjustAngle = 0;
        DisableAllCheckParBoxes();
        EnableFixedPtWindow(false);
        return;
    }
    EnableFixedPtWindow(true);
    if (Db->searchSTN(EndStn) == nullptr) {
        AdjustAngle = 0;
        DisableAllCheckParBoxes();
    } else {
        Enable(kAdjustAngleBox, true);
    }
}

void USelRouteDlg::OnCheckPtTyped(const std::wstring& text) {
    ChkPt = nedit::ToUpper(nedit::Trim(text));
    CloseX = CloseY = 0.0;
    double z = kNoHeight;
    std::wstring code;
    if (!ChkPt.empty() && Db->findCoord(ChkPt, CloseX, CloseY, z, code, 1, true))
        CloseBearingFromCoordinates();
}

void USelRouteDlg::OnCheckPtChosen(const std::wstring& name) {
    if (EndStnPtr == nullptr) return;
    ChkPt = name;
    const SSSTRUCT* target = EndStnPtr->SSList.Find(name);
    if (target == nullptr) return;
    CloseBearing = LessATurn(target->AngleFromBS + EndStnPtr->BkBearing);
    SetXYZBoxes(kCheckCombo);
}

void USelRouteDlg::OnFixedPtChanged(const std::wstring& text) {
    FixedPt = text;
    UpdateFixedPt();
}

void USelRouteDlg::OnClosePtChanged(const std::wstring& text) {
    ClosePt = text;
    if (SetXYZBoxes(kClosePtField)) {
        CloseBearingFromCoordinates();
    } else {
        CloseBearing = PlanBearing(0.0, 0.0, 0.0, 0.0);
    }
}

void USelRouteDlg::OnCoordinatesChanged() {
    CloseBearingFromCoordinates();
}

void USelRouteDlg::OnOrientationClicked(bool useCoordinates) {
    UseBSCoord = useCoordinates ? 1 : 0;
    UseBSBearing = useCoordinates ? 0 : 1;
    EnableOrientParBoxes();
}

void USelRouteDlg::OnAdjustAngleClicked(bool checked) {
    AdjustAngle = checked ? 1 : 0;
    EnableCheckParBoxes();
    SetCheckPtBox();
}

void USelRouteDlg::OnCloseModeClicked(bool useCoordinates) {
    UseCloseCoord = useCoordinates ? 1 : 0;
    UseCloseBearing = useCoordinates ? 0 : 1;
    EnableCheckParBoxes();
}

// ---- Enabling -----------------------------------------------------------------------------------

void USelRouteDlg::EnableOrientParBoxes() {
    for (const int control : {kBackSightCombo, kUseBSCoordRadio, kUseBSBearingRadio})
        Enable(control, true);
    Enable(kBSXField, UseBSCoord != 0);
    Enable(kBSYField, UseBSCoord != 0);
    Enable(kStartBearingField, UseBSBearing != 0);
}

void USelRouteDlg::EnableCheckParBoxes() {
    Enable(kAdjustAngleBox, true);
    const bool on = AdjustAngle != 0;
    for (const int control :
         {kCheckCombo, kUseCloseCoordRadio, kUseCloseBearingRadio, kClosePtField})
        Enable(control, on);
    Enable(kCloseXField, on && UseCloseCoord != 0);
    Enable(kCloseYField, on && UseCloseCoord != 0);
    Enable(kCloseBearingField, on && UseCloseBearing != 0);
}

void USelRouteDlg::DisableAllCheckParBoxes() {
    AdjustAngle = 0;
    EnableCheckParBoxes();
    Enable(kAdjustAngleBox, false);
}

void USelRouteDlg::EnableFixedPtWindow(bool on) {
    for (const int control : {kFixedPtField, kFixedXField, kFixedYField, kFixedZField})
        Enable(control, on);
}

// ---- The check and the computation --------------------------------------------------------------

bool USelRouteDlg::DoCheck(std::wstring& out) {
    out.clear();
    if (Start.empty()) {
        Show(nedit::Translate(L"Start station unspecified."));
        return false;
    }
    if (EndStn.empty()) {
        Show(nedit::Translate(L"End station unspecified."));
        return false;
    }
    if (AdjustAngle != 0) {
        ChkPt = nedit::ToUpper(ChkPt);
        const bool offered =
            !ChkPt.empty() && std::any_of(CheckNames.begin(), CheckNames.end(), [&](const auto& n) {
                return nedit::EqualsIgnoreCase(n, ChkPt);
            });
        if (!offered) {
            Show(nedit::Translate(L"Invalid angle-checking point !"));
            return false;
        }
    }
    const bool closed = nedit::EqualsIgnoreCase(Start, EndStn);
    if (RouteSel == nullptr) {
        Show(nedit::Translate(L"Start station is not on the selected traverse route."));
        return false;
    }
    nedit::NameList stretch;
    std::wstring names;
    int s = -1, e = -1;
    for (std::size_t i = 0; i < RouteSel->size(); ++i) {
        const nedit::NameEntry& entry = (*RouteSel)[i];
        const int at = static_cast<int>(i);
        if (!closed) {
            if (entry.Key == Start) {
                s = at;
            } else if (nedit::EqualsIgnoreCase(entry.Key, EndStn)) {
                e = at;
            }
        } else if (entry.Key == Start) {
            if (s < 0) {
                s = at;
            } else if (e < 0) {
                e = at;
            }
        }
        if (s >= 0) {
            names += entry.Key + L',';
            stretch.push_back(entry);
            if (e >= 0) break;
        }
    }
    if (s < 0) {
        Show(nedit::Translate(L"Start station is not on the selected traverse route."));
        return false;
    }
    if (e >= 0 && s > e) {
        Show(nedit::Translate(L"Incorrect sequence of start and end station."));
        return false;
    }
    if (e < 0) {
        // The end is off the route: the route is carried on to it.
        if (EndPtIdx < 0) {
            Show(nedit::Translate(L"End point is not in the neutral database."));
            return false;
        }
        if (EndText.empty()) {
            Show(nedit::Translate(L"End station or point not specified."));
            return false;
        }
        const nedit::NameEntry& last = RouteSel->back();
        const int row = Routes->IsPtObserved(last.Key, last.Value, EndText);
        if (row < 1) {
            Show(nedit::Translate(L"Point {1} is not observed from station {2}.",
                                  {EndText, last.Key}));
            return false;
        }
        names += EndText + L',';
        stretch.push_back({EndText, row});
        SelectRouteRow(names, std::move(stretch));
    }
    out = names;
    return true;
}

void USelRouteDlg::SelectRouteRow(const std::wstring& text, nedit::NameList route) {
    for (std::size_t row = 0; row < RouteRows.size(); ++row) {
        if (BeginsWith(RouteRows[row].Text, text)) {
            SelectedRow = static_cast<int>(row);
            return;
        }
    }
    // The engine's routes take the new one: it stays on offer until the next search.
    const nedit::NameList* added = Routes->AddRoute(std::move(route));
    const RouteRow fresh{text, added};
    const auto place = std::upper_bound(RouteRows.begin(), RouteRows.end(), fresh,
                                        [](const RouteRow& a, const RouteRow& b) {
                                            return nedit::ToUpper(a.Text) < nedit::ToUpper(b.Text);
                                        });
    const auto inserted = RouteRows.insert(place, fresh);
    SelectedRow = static_cast<int>(inserted - RouteRows.begin());
}

bool USelRouteDlg::OnOK() {
    std::wstring names;
    if (!DoCheck(names) || names.empty()) return false;
    if (SelectedRow < 0) return false;
    RouteSel = RouteRows[static_cast<std::size_t>(SelectedRow)].Route;
    CTraverse traverse(Db);
    if (!traverse.CreateStnList(names)) {
        Show(nedit::Translate(L"Could not create the station list."));
        return false;
    }
    if (!traverse.CheckBackSights()) return false;
    if (UseBSCoord != 0) StartBearing = PlanBearing(StartX, StartY, BSX, BSY);
    if (UseCloseCoord != 0) CloseBearing = PlanBearing(FixedX, FixedY, CloseX, CloseY);
    traverse.SetCloseDialog([this] { CloseDialog(); });
    if (ComputeObserver) ComputeObserver(traverse);
    Running = 1;
    Result = traverse.Compute(*this, Records);
    Running = 0;
    return Closed != 0;
}
