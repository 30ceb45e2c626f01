#include "TraverseRun.h"

#include <algorithm>
#include <cmath>
#include <functional>
#include <optional>
#include <unordered_set>

#include "ConsoleDialogHost.h"
#include "JsonLayout.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"
#include "traverse/USelRouteDlg.h"

namespace {

using nedit::Format;

void Tell(ConsoleDialogHost& host, const std::wstring& text) {
    nedit::AppMessageBox(&host, text, nedit::mb::Ok);
}

std::wstring Coordinates(double e, double n, double h) {
    return Format(L"E %.3f, N %.3f, H ", e, n) + (h > kNoHeight ? Format(L"%.3f", h) : L"none");
}

std::wstring Joined(const std::vector<std::wstring>& names) {
    std::wstring text;
    for (const std::wstring& name : names) text += (text.empty() ? L"" : L",") + name;
    return text;
}

bool SameName(std::wstring_view a, std::wstring_view b) {
    return nedit::EqualsIgnoreCase(a, b);
}

/// Whether `names` runs along `row` from its place `at`: all the way, or but for its last
/// name, which the route is then carried on to from the row's last station.
bool RunsAlong(const std::vector<std::wstring>& names, const nedit::NameList& row, std::size_t at) {
    std::size_t j = 0;
    while (j < names.size() && at + j < row.size() && SameName(row[at + j].Key, names[j])) ++j;
    return j == names.size() || (j + 1 == names.size() && at + j == row.size());
}

/// Selects the first route row that the requested route runs along.
bool ChooseRoute(USelRouteDlg& dialog, const std::vector<std::wstring>& names,
                 ConsoleDialogHost& host) {
    const std::vector<USelRouteDlg::RouteRow>& rows = dialog.GetRouteRows();
    for (std::size_t r = 0; r < rows.size(); ++r) {
        const nedit::NameList& row = *rows[r].Route;
        for (std::size_t at = 0; at < row.size(); ++at) {
            if (!SameName(row[at].Key, names.front()) || !RunsAlong(names, row, at)) continue;
            if (static_cast<int>(r) != dialog.GetSelectedRow())
                dialog.OnSelectRoute(static_cast<int>(r));
            return true;
        }
    }
    std::wstring offered;
    for (const USelRouteDlg::RouteRow& row : rows) offered += L" " + row.Text;
    Tell(host, Format(L"No route found runs %s; the routes are:%s", Joined(names), offered));
    return false;
}

/// The start, its coordinates and its orientation.
void ApplyStart(USelRouteDlg& dialog, const TraverseRequest& request) {
    const std::optional<std::wstring> start =
        request.Start
            ? request.Start
            : (request.route.empty() ? std::nullopt : std::optional(request.route.front()));
    if (start && *start != dialog.Start) dialog.OnStartChanged(nedit::ToUpper(*start));
    if (request.StartX) dialog.StartX = *request.StartX;
    if (request.StartY) dialog.StartY = *request.StartY;
    if (request.StartZ) dialog.StartZ = *request.StartZ;
    if (request.BSName) dialog.OnBackSightChosen(nedit::ToUpper(*request.BSName));
    if (request.BSX) dialog.BSX = *request.BSX;
    if (request.BSY) dialog.BSY = *request.BSY;
    if (request.BSX || request.BSY) dialog.OnOrientationClicked(true);
    if (request.StartBearing) {
        dialog.StartBearing = *request.StartBearing;
        dialog.OnOrientationClicked(request.UseBSCoord.value_or(0) != 0);
    } else if (request.UseBSCoord) {
        dialog.OnOrientationClicked(*request.UseBSCoord != 0);
    }
}

/// The end and the fixed point.
void ApplyEnd(USelRouteDlg& dialog, const TraverseRequest& request) {
    const std::optional<std::wstring> end =
        request.EndStn
            ? request.EndStn
            : (request.route.empty() ? std::nullopt : std::optional(request.route.back()));
    // A typed end is looked up among the points: a loop closes only so.
    if (end && (!SameName(*end, dialog.EndStn) || SameName(*end, dialog.Start)))
        dialog.OnEndTyped(*end);
    if (request.FixedPt) dialog.OnFixedPtChanged(nedit::ToUpper(*request.FixedPt));
    if (request.FixedX) dialog.FixedX = *request.FixedX;
    if (request.FixedY) dialog.FixedY = *request.FixedY;
    if (request.FixedZ) dialog.FixedZ = *request.FixedZ;
    if (request.FixedX || request.FixedY) dialog.OnCoordinatesChanged();
}

/// The angle check at the closing station.
void ApplyAngleCheck(USelRouteDlg& dialog, const TraverseRequest& request,
                     ConsoleDialogHost& host) {
    if (request.AdjustAngle) {
        if (*request.AdjustAngle != 0 && !dialog.IsEnabled(USelRouteDlg::kAdjustAngleBox)) {
            Tell(host, Format(L"The angle check needs a set-up at the end; %s is none, so "
                              L"AdjustAngle is left off.",
                              dialog.EndStn));
        } else {
            dialog.OnAdjustAngleClicked(*request.AdjustAngle != 0);
        }
    }
    if (request.ChkPt) {
        const std::vector<std::wstring>& offered = dialog.GetCheckNames();
        const auto chosen = std::find_if(offered.begin(), offered.end(), [&](const auto& name) {
            return SameName(name, *request.ChkPt);
        });
        if (chosen != offered.end()) {
            dialog.OnCheckPtChosen(*chosen);
        } else {
            dialog.OnCheckPtTyped(*request.ChkPt);
        }
    }
    if (request.ClosePt) dialog.OnClosePtChanged(nedit::ToUpper(*request.ClosePt));
    if (request.CloseX) dialog.CloseX = *request.CloseX;
    if (request.CloseY) dialog.CloseY = *request.CloseY;
    if (request.CloseX || request.CloseY) {
        dialog.OnCloseModeClicked(true);
        dialog.OnCoordinatesChanged();
    }
    if (request.CloseBearing) {
        dialog.CloseBearing = *request.CloseBearing;
        dialog.OnCloseModeClicked(request.UseCloseCoord.value_or(0) != 0);
    } else if (request.UseCloseCoord) {
        dialog.OnCloseModeClicked(*request.UseCloseCoord != 0);
    }
}

/// Acts on the route dialog as a user would on the values of `request`, in the dialog's
/// order; false when the route cannot be chosen.
bool ApplyRequest(USelRouteDlg& dialog, const TraverseRequest& request, ConsoleDialogHost& host) {
    if (request.route.size() == 1) {
        Tell(host, nedit::Translate(L"Invalid or empty traverse route !"));
        return false;
    }
    if (!request.route.empty() && !ChooseRoute(dialog, request.route, host)) return false;
    ApplyStart(dialog, request);
    ApplyEnd(dialog, request);
    ApplyAngleCheck(dialog, request, host);
    if (request.Transit) {
        dialog.Transit = *request.Transit != 0 ? 1 : 0;
        dialog.Compass = dialog.Transit != 0 ? 0 : 1;
    }
    return true;
}

/// Tells every value the computation is about to use, and where it came from.
void TellValuesUsed(const USelRouteDlg& dialog, const TraverseRequest& request,
                    const CTraverse& traverse, UNeditDatabase& engine, ConsoleDialogHost& host) {
    const auto source = [](bool given) { return given ? L"given" : L"the dialog's default"; };
    std::vector<std::wstring> names;
    for (const CTravStn& entry : traverse.GetRoute()) names.push_back(entry.Name);
    std::wstring text =
        Format(L"Values used: route %s; start %s at %s (%s); ", Joined(names), dialog.Start,
               Coordinates(dialog.StartX, dialog.StartY, dialog.StartZ),
               source(request.StartX.has_value()));
    if (dialog.UseBSCoord != 0) {
        text += Format(L"start bearing %.6f from back sight %s at E %.3f, N %.3f; ",
                       dialog.StartBearing, dialog.BSName, dialog.BSX, dialog.BSY);
    } else {
        text += Format(L"start bearing %.6f (%s); ", dialog.StartBearing,
                       source(request.StartBearing.has_value()));
    }
    text += Format(L"fixed point %s at %s (%s); ", dialog.FixedPt,
                   Coordinates(dialog.FixedX, dialog.FixedY, dialog.FixedZ),
                   source(request.FixedX.has_value()));
    if (dialog.AdjustAngle != 0) {
        text +=
            Format(L"angle check on %s, known bearing %.6f; ", dialog.ChkPt, dialog.CloseBearing);
    }
    text += dialog.Transit != 0 ? L"Transit rule." : L"Compass rule.";
    Tell(host, text);

    // Where the reduced data moved a station that a record fixes, the default is surprising.
    double e = 0.0, n = 0.0, h = 0.0;
    if (!request.StartX && engine.FindXYZ(dialog.Start, e, n, h) >= 0 &&
        std::hypot(e - dialog.StartX, n - dialog.StartY) > 0.0005) {
        Tell(host, Format(L"The start %s is where the reduction left it, %s, not at its XYZ "
                          L"record, %s: a later observation of %s moved it. Give StartX, StartY "
                          L"(--start-coords) to start from the record.",
                          dialog.Start, Coordinates(dialog.StartX, dialog.StartY, dialog.StartZ),
                          Coordinates(e, n, h), dialog.Start));
    }
    std::wstring code;
    if (!request.FixedX && !engine.findCoord(dialog.FixedPt, e, n, h, code, 1, false)) {
        Tell(host,
             Format(L"The fixed point %s has no coordinates in the reduced data, so the "
                    L"dialog's %s are used. Give FixedX, FixedY (--fixed-coords).",
                    dialog.FixedPt, Coordinates(dialog.FixedX, dialog.FixedY, dialog.FixedZ)));
    } else if (!request.FixedX && !names.empty() && SameName(dialog.FixedPt, names.back())) {
        Tell(host, Format(L"The fixed point %s is where the reduction left it, as observed along "
                          L"the route, so the traverse closes on itself and its misclose reads 0. "
                          L"Give FixedX, FixedY (--fixed-coords) to close on known coordinates.",
                          dialog.FixedPt));
    }
}

PointRow RowOf(const std::wstring& name, double e, double n, double h, const std::wstring& code) {
    return {name, e, n, h > kNoHeight, h, code};
}

TraverseStage StageOf(const CTraverse& traverse) {
    TraverseStage stage;
    for (const CTravStn& entry : traverse.GetRoute())
        stage.points.push_back(RowOf(entry.Name, entry.X, entry.Y, entry.Z, L""));
    stage.misclose = traverse.GetReport();
    return stage;
}

/// The side shots of `stations`, each name once, as the re-reduction left them.
std::vector<PointRow> SideShots(const UNeditDatabase& engine,
                                const std::vector<const STNSTRUCT*>& stations) {
    std::vector<PointRow> shots;
    std::unordered_set<std::wstring> listed;
    for (const STNSTRUCT* station : stations) {
        for (const auto& target : station->SSList) {
            const std::wstring name(target->SSName);
            if (!target->AngleValid || target->ForwardFlag || engine.IsTraversePoint(name) ||
                SameName(name, station->StnName) || !listed.insert(name).second) {
                continue;
            }
            const int index = engine.GetPointIdx(name);
            if (index < 0) continue;
            const UNeditPt& point = engine.GetPointList()[static_cast<std::size_t>(index)];
            shots.push_back(RowOf(name, point.x, point.y, point.z, point.GetCode()));
        }
    }
    return shots;
}

json::Value Number(double value) {
    return json::Value(value + 0.0);  // no negative zero
}

std::string StageJson(const TraverseStage& stage, const char* rule) {
    const MiscloseFigures& figures = stage.misclose;
    const bool heights = figures.FixedH > kNoHeight && figures.ObservedH > kNoHeight;
    json::Value misclose = {
        {"DiffE", Number(figures.DiffE)},
        {"DiffN", Number(figures.DiffN)},
        {"DiffH", heights ? Number(figures.DiffH) : json::Value()},
        {"MiscloseBearing", Number(figures.MiscloseBearing)},
        {"MiscloseDist", Number(figures.MiscloseDist)},
        {"AngularError", Number(figures.AngularError)},
        {"PerStation", Number(figures.PerStation)},
        {"EnclosedArea", Number(figures.EnclosedArea)},
        {"Accuracy", json::Text(figures.Accuracy)},
        {"TraverseLength", Number(figures.TraverseLength)},
        {"Setups", figures.Setups},
    };
    std::string out = "{\n    ";
    if (rule != nullptr) out += "\"rule\": \"" + std::string(rule) + "\",\n    ";
    return out + "\"points\": " + PointsJson(stage.points, 4) +
           ",\n    \"misclose\": " + json::Inline(misclose) + "\n  }";
}

/// A figure to three decimals, without a minus on a value that shows as zero.
std::wstring Shown(double value) {
    return Format(L"%.3f", std::fabs(value) < 0.0005 ? 0.0 : value);
}

std::string MiscloseLine(const char* title, const TraverseStage& stage) {
    const MiscloseFigures& figures = stage.misclose;
    const bool heights = figures.FixedH > kNoHeight && figures.ObservedH > kNoHeight;
    std::wstring line =
        Format(L"%s: misclose E %s, N %s, H %s; %.3f at %.6f; length %.3f, %ld legs",
               nedit::FromUtf8(title), Shown(figures.DiffE), Shown(figures.DiffN),
               heights ? Shown(figures.DiffH) : L"none", figures.MiscloseDist,
               figures.MiscloseBearing, figures.TraverseLength, figures.Setups);
    if (!figures.Accuracy.empty()) line += L", accuracy " + figures.Accuracy;
    if (figures.EnclosedArea > 0.0) line += Format(L", area %.3f", figures.EnclosedArea);
    return nedit::ToUtf8(line) + "\n";
}

}  // namespace

TraverseOutcome RunTraverse(UNeditDatabase& engine, nedit::TraverseRoutes& routes,
                            ConsoleDialogHost& host, const TraverseRequest& request) {
    TraverseOutcome outcome;
    outcome.result = CTraverse::kGivenUp;
    if (routes.GetTraverseList().empty()) {
        Tell(host, nedit::Translate(L"No traverse route exists."));
        return outcome;
    }
    std::vector<const STNSTRUCT*> stations;
    USelRouteDlg dialog(
        &engine, &routes,
        engine.CoordsOrderXY() ? USelRouteDlg::kEastFirstId : USelRouteDlg::kNorthFirstId, nullptr);
    dialog.SetComputeObserver([&](CTraverse& traverse) {
        TellValuesUsed(dialog, request, traverse, engine, host);
        outcome.transit = dialog.Transit != 0;
        traverse.SetStageObserver([&](int stage) {
            outcome.route.clear();
            stations.clear();
            for (const CTravStn& entry : traverse.GetRoute()) {
                outcome.route.push_back(entry.Name);
                if (entry.Stn != nullptr) stations.push_back(entry.Stn);
            }
            std::optional<TraverseStage>& kept =
                stage == CTraverse::kUnadjusted
                    ? outcome.unadjusted
                    : (stage == CTraverse::kAfterAngles ? outcome.after_angles : outcome.adjusted);
            kept = StageOf(traverse);
        });
    });
    host.SetFace<UMisReportDlg>([&request](UMisReportDlg& report) {
        report.OnAdjustElevations(request.AdjustElevations.value_or(0) != 0);
        if (request.AdjustAngles.value_or(0) != 0 &&
            report.IsEnabled(UMisReportDlg::kAnglesButton)) {
            report.OnAngleAdjust();
        }
        report.OnCoordinateAdjust();
        return nedit::mb::IdOk;
    });
    host.SetFace<USelRouteDlg>([&request, &host](USelRouteDlg& route) {
        if (!ApplyRequest(route, request, host)) return nedit::mb::IdCancel;
        return route.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    host.Run(dialog);
    if (dialog.GetResult() != 0) outcome.result = dialog.GetResult();
    if (outcome.result == CTraverse::kDone) outcome.sideshots = SideShots(engine, stations);
    return outcome;
}

std::string TraverseJson(const TraverseOutcome& outcome,
                         const std::vector<std::wstring>& messages) {
    json::Value route = json::Value::array();
    for (const std::wstring& name : outcome.route) route.push_back(json::Text(name));
    json::Value said = json::Value::array();
    for (const std::wstring& message : messages) said.push_back(json::Text(message));
    std::vector<std::pair<const char*, std::string>> members = {{"route", json::Inline(route)}};
    members.emplace_back("unadjusted",
                         outcome.unadjusted ? StageJson(*outcome.unadjusted, nullptr) : "null");
    if (outcome.after_angles)
        members.emplace_back("after_angles", StageJson(*outcome.after_angles, nullptr));
    members.emplace_back("adjusted",
                         outcome.adjusted
                             ? StageJson(*outcome.adjusted, outcome.transit ? "transit" : "compass")
                             : "null");
    members.emplace_back("sideshots", PointsJson(outcome.sideshots, 2));
    members.emplace_back("result", std::to_string(outcome.result));
    members.emplace_back("messages", json::Inline(said));
    return json::Members(members) + "\n";
}

std::string TraverseText(const TraverseOutcome& outcome, int decimals) {
    std::string out;
    if (outcome.unadjusted) out += MiscloseLine("Unadjusted traverse", *outcome.unadjusted);
    if (outcome.after_angles)
        out += MiscloseLine("Traverse after angle adjustment", *outcome.after_angles);
    if (outcome.adjusted) {
        out += MiscloseLine(outcome.transit ? "Results after coordinate adjustment (Transit Rule)"
                                            : "Results after coordinate adjustment (Compass Rule)",
                            *outcome.adjusted);
        out += PointsTable(outcome.adjusted->points, decimals);
    }
    if (!outcome.sideshots.empty()) {
        out += "Adjusted sideshots\n";
        out += PointsTable(outcome.sideshots, decimals);
    }
    return out;
}
