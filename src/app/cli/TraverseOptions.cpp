#include "TraverseOptions.h"

#include <CLI/CLI.hpp>
#include <cstdio>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "ReductionOutput.h"
#include "TraverseRun.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "traverse/CTraverse.h"

void AddTraverseOptions(CLI::App& command, TraverseOptions& options) {
    TraverseFlags& flags = options.flags;
    CLI::Option* params =
        command
            .add_option("--params", options.params,
                        "the parameters as JSON, named as the dialogs name them:\n"
                        "route, Start, EndStn, StartX, StartY, StartZ, BSName,\n"
                        "UseBSCoord, BSX, BSY, StartBearing, FixedPt, FixedX,\n"
                        "FixedY, FixedZ, AdjustAngle, ChkPt, UseCloseCoord,\n"
                        "CloseX, CloseY, CloseBearing, Transit (0 Compass,\n"
                        "1 Transit), AdjustElevations, AdjustAngles (1: \"Angles\"\n"
                        "before \"Coordinates\"); angles in decimal degrees")
            ->option_text("P.json");
    const auto flag = [&](CLI::Option* option) { option->excludes(params); };
    flag(command
             .add_option("--route", flags.route,
                         "the route, as found or cut down, or carried on to a point\n"
                         "observed from its last station (a loop: A,B,C,D,A)")
             ->option_text("A,B,C,..."));
    flag(command.add_option("--start", flags.start, "the start (default: the route's first)")
             ->option_text("NAME"));
    flag(command
             .add_option("--start-coords", flags.start_coords,
                         "the start's coordinates (default: where the reduction\n"
                         "left it, which a later observation of it may have moved)")
             ->option_text("E,N[,H]"));
    flag(command
             .add_option("--start-bearing", flags.start_bearing,
                         "the bearing from the start to its back sight\n"
                         "(default: from the back sight's coordinates)")
             ->option_text("DEG"));
    flag(command
             .add_option("--backsight", flags.backsight,
                         "orient the start on this back sight's coordinates")
             ->option_text("NAME"));
    flag(command.add_option("--fixed", flags.fixed, "the fixed end (default: the start)")
             ->option_text("NAME"));
    flag(command
             .add_option("--fixed-coords", flags.fixed_coords,
                         "its coordinates (default: where the reduction left it;\n"
                         "for a loop that is the start as re-observed, so that the\n"
                         "misclose reads 0: give the known values)")
             ->option_text("E,N[,H]"));
    flag(command.add_flag("--adjust-angles", flags.adjust_angles,
                          "check and adjust the angles at the closing station"));
    flag(command
             .add_option("--check-point", flags.check_point,
                         "the point observed from the closing station for the\n"
                         "angle check")
             ->option_text("NAME"));
    flag(command
             .add_option("--close-bearing", flags.close_bearing,
                         "the known bearing from the closing station to it\n"
                         "(default: from the coordinates of the two)")
             ->option_text("DEG"));
    flag(command.add_option("--rule", flags.rule, "the coordinate adjustment (default: compass)")
             ->check(CLI::IsMember({"compass", "transit"}))
             ->option_text("compass|transit"));
    flag(command.add_flag("--adjust-elevations", flags.adjust_elevations,
                          "adjust the elevations as well"));
    command.add_flag("--json", options.json,
                     "print the route, each stage's points and misclose, the\n"
                     "side shots reduced again, the result and the messages");
    command.add_option("--report", options.report, "write the reduction report; - prints it")
        ->option_text("OUT.txt|-");
    command
        .add_option("--save", options.save,
                    "write the rows as saving leaves them, adjusted points\n"
                    "behind the marker row")
        ->option_text("OUT.neu");
}

bool ReadRequest(const TraverseOptions& options, TraverseRequest& request) {
    std::string error;
    const bool read = options.params.empty() ? RequestFromFlags(options.flags, request, error)
                                             : ReadTraverseRequest(options.params, request, error);
    if (!read) std::fprintf(stderr, "sxnedit: %s\n", error.c_str());
    return read;
}

int WriteTraverseOutput(const TraverseOutcome& outcome, const UNeditReport* report,
                        const TraverseOptions& options, ConsoleDialogHost& host, int decimals) {
    if (outcome.result == CTraverse::kDone && outcome.adjusted) {
        // Saving keeps only the points listed behind the marker; the adjustment puts none there.
        nedit::AppMessageBox(
            &host,
            nedit::Translate(L"The adjusted coordinates are not written into the rows: a later "
                             L"reduction computes the stations from the observations again. To "
                             L"keep them, list them as PT records behind the line {1}.",
                             {kAdjustedPointsMarker}),
            nedit::mb::Ok);
    }
    if (!WriteReport(report, options.report)) return exit_status::Failed;
    if (options.json) {
        std::fputs(TraverseJson(outcome, host.Messages()).c_str(), stdout);
    } else if (options.report != "-") {
        std::fputs(TraverseText(outcome, decimals).c_str(), stdout);
    }
    return outcome.result == CTraverse::kDone ? exit_status::Ok : exit_status::Failed;
}
