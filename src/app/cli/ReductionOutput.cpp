#include "ReductionOutput.h"

#include <CLI/CLI.hpp>
#include <cmath>
#include <cstdio>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "JsonLayout.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

// Names beyond this many are left to the report.
constexpr std::size_t kNamesTold = 10;

bool IsFinite(const UWPoint& point) {
    return std::isfinite(point.x) && std::isfinite(point.y) && std::isfinite(point.z);
}

bool IsFinite(const UWCircle& circle) {
    return IsFinite(circle.GetCentre()) && std::isfinite(circle.GetRadius());
}

// Tells of what came out as no finite numbers; true when something did.
bool TellNonFinite(const UNeditDatabase& engine, ConsoleDialogHost& host) {
    std::wstring names;
    std::size_t points = 0;
    for (const UNeditPt& point : engine.GetPointList()) {
        if (IsFinite(point)) continue;
        if (++points <= kNamesTold) names += (points > 1 ? L", " : L"") + point.GetID();
    }
    if (points > kNamesTold) names += L", \u2026";
    std::size_t circles = 0;
    for (const UWCircle& circle : engine.GetCircleList()) circles += IsFinite(circle) ? 0 : 1;
    if (points > 0) {
        nedit::AppMessageBox(&host,
                             nedit::Translate(L"{1} points have coordinates that are not finite "
                                              L"numbers ({2}); they are left out.",
                                              {std::to_wstring(points), names}),
                             nedit::mb::IconExclamation);
    }
    if (circles > 0) {
        nedit::AppMessageBox(&host,
                             nedit::Translate(L"{1} circles have a centre or radius that is not a "
                                              L"finite number; they are left out.",
                                              {std::to_wstring(circles)}),
                             nedit::mb::IconExclamation);
    }
    return points + circles > 0;
}

}  // namespace

std::string ReductionJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages) {
    std::vector<json::Value> lines;
    for (const UNeditLine& line : engine.GetLineList()) {
        lines.push_back({{"from", json::Text(line.GetFromPt())},
                         {"to", json::Text(line.GetToPt())},
                         {"station_line", line.GetStationLine() != 0}});
    }
    std::vector<json::Value> arcs;
    for (const UNeditArc& arc : engine.GetArcList()) {
        arcs.push_back({{"start", json::Text(arc.GetStartPt())},
                        {"end", json::Text(arc.GetEndPt())},
                        {"third", json::Text(arc.GetThirdPt())},
                        {"type", arc.GetArcType()}});
    }
    std::vector<json::Value> circles;
    for (const UWCircle& circle : engine.GetCircleList()) {
        if (!IsFinite(circle)) continue;
        circles.push_back({{"e", circle.GetCentre().x},
                           {"n", circle.GetCentre().y},
                           {"radius", circle.GetRadius()}});
    }
    json::Value said = json::Value::array();
    for (const std::wstring& message : messages) said.push_back(json::Text(message));
    return json::Members({{"points", PointsJson(ReducedPoints(engine), 2)},
                          {"lines", json::Rows(lines, 2)},
                          {"arcs", json::Rows(arcs, 2)},
                          {"circles", json::Rows(circles, 2)},
                          {"error", std::to_string(engine.GetErrorCode())},
                          {"messages", json::Inline(said)}}) +
           "\n";
}

std::vector<PointRow> ReducedPoints(const UNeditDatabase& engine) {
    std::vector<PointRow> points;
    points.reserve(engine.GetPointList().size());
    for (const UNeditPt& point : engine.GetPointList()) {
        if (!IsFinite(point)) continue;
        points.push_back(
            {point.GetID(), point.x, point.y, point.z > kNoHeight, point.z, point.GetCode()});
    }
    return points;
}

void CheckOutputOptions(const std::string& reportPath, bool json) {
    if (json && reportPath == "-") {
        throw CLI::ValidationError("--json and --report - both want standard output");
    }
}

bool WriteReport(const UNeditReport* report, const std::string& path) {
    if (report == nullptr || path.empty()) return true;
    if (path == "-") {
        std::string text = nedit::ToUtf8(report->GetText());
        if (!text.empty() && text.back() != '\n') text += '\n';
        std::fputs(text.c_str(), stdout);
        return true;
    }
    if (report->SaveAsText(path)) return true;
    std::fprintf(stderr, "sxnedit: cannot write %s\n", path.c_str());
    return false;
}

int WriteReductionOutput(const UNeditDatabase& engine, const UNeditReport* report,
                         const ReductionOutputs& outputs, ConsoleDialogHost& host) {
    const bool left_out = TellNonFinite(engine, host);
    if (!WriteReport(report, outputs.report)) return exit_status::Failed;
    if (outputs.json) {
        std::fputs(ReductionJson(engine, host.Messages()).c_str(), stdout);
    } else if (outputs.report != "-") {
        std::fputs(PointsTable(ReducedPoints(engine), outputs.decimals).c_str(), stdout);
    }
    if (!outputs.points.empty() && !WritePointsCsv(outputs.points, ReducedPoints(engine))) {
        return exit_status::Failed;
    }
    return left_out ? exit_status::Failed : exit_status::Ok;
}
