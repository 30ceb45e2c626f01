#pragma once
// A traverse computation as the command line runs it: the route dialog and the misclose
// dialog shown through the console host, with faces that act as a user would on the values of
// a request, and what came of it, for people and for programs.
//
// The faces: the route dialog opens with its defaults from the reduced data; the route given
// is chosen among the routes found (a route that carries on to a point observed from its last
// station, such as a loop back to its start, is chosen by the route it carries on); then each
// field given is set as the user would set it, in the dialog's order, and "Compute" pressed.
// The misclose dialog gets the box "Adjust Elevations", "Angles" when asked for, then
// "Coordinates", then OK. Every value the computation used is told in the messages, and where
// a default of the dialog would surprise a surveyor the messages say why and what to give.

#include <optional>
#include <string>
#include <vector>

#include "PointOutput.h"
#include "TraverseRequest.h"
#include "traverse/UMisReportDlg.h"

class ConsoleDialogHost;
class UNeditDatabase;

namespace nedit {
class TraverseRoutes;
}

/// The figures of one stage of the computation.
struct TraverseStage {
    std::vector<PointRow> points;  // the route's entries
    MiscloseFigures misclose;
};

struct TraverseOutcome {
    /// The names of the computation's route; empty when none was computed.
    std::vector<std::wstring> route;
    std::optional<TraverseStage> unadjusted;
    std::optional<TraverseStage> after_angles;
    std::optional<TraverseStage> adjusted;
    bool transit = false;
    /// The side shots of the route's set-ups, reduced again.
    std::vector<PointRow> sideshots;
    /// 11111 done, 22222 given up, or an error code of the traverse.
    int result = 0;
};

/// Runs the computation on the routes of the engine's last run.
TraverseOutcome RunTraverse(UNeditDatabase& engine, nedit::TraverseRoutes& routes,
                            ConsoleDialogHost& host, const TraverseRequest& request);

/// The outcome as one JSON object, with the messages shown.
std::string TraverseJson(const TraverseOutcome& outcome, const std::vector<std::wstring>& messages);
/// The outcome for people: the misclose of each stage and the adjusted points.
std::string TraverseText(const TraverseOutcome& outcome, int decimals);
