#include "ReductionOutput.h"

#include <CLI/CLI.hpp>
#include <cstdio>

#include "JsonLayout.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

std::vector<PointRow> ReducedPoints(const UNeditDatabase& engine) {
    std::vector<PointRow> points;
    points.reserve(engine.GetPointList().size());
    for (const UNeditPt& point : engine.GetPointList()) {
        points.push_back(
            {point.GetID(), point.x, point.y, point.z > kNoHeight, point.z, point.GetCode()});
    }
    return points;
}

void PrintJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages) {
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
        circles.push_back({{"e", circle.GetCentre().x},
                           {"n", circle.GetCentre().y},
                           {"radius", circle.GetRadius()}});
    }
    json::Value said = json::Value::array();
    for (const std::wstring& message : messages) said.push_back(json::Text(message));
    const std::string out = json::Members({{"points", PointsJson(ReducedPoints(engine), 2)},
                                           {"lines", json::Rows(lines, 2)},
                                           {"arcs", json::Rows(arcs, 2)},
                                           {"circles", json::Rows(circles, 2)},
                                           {"error", std::to_string(engine.GetErrorCode())},
                                           {"messages", json::Inline(said)}}) +
                            "\n";
    std::fputs(out.c_str(), stdout);
}

void CheckOutputOptions(const std::string& reportPath, bool json) {
    if (json && reportPath == "-") {
        throw CLI::ValidationError("--json and --report - both want standard output");
    }
}

bool WriteReductionOutput(const UNeditDatabase& engine, const UNeditReport* report,
                          const std::string& reportPath, bool json,
                          const std::vector<std::wstring>& messages, int decimals) {
    if (report != nullptr && reportPath == "-") {
        std::string text = nedit::ToUtf8(report->GetText());
        if (!text.empty() && text.back() != '\n') text += '\n';
        std::fputs(text.c_str(), stdout);
    } else if (report != nullptr && !reportPath.empty() && !report->SaveAsText(reportPath)) {
        std::fprintf(stderr, "sxnedit: cannot write %s\n", reportPath.c_str());
        return false;
    }
    if (json) {
        PrintJson(engine, messages);
    } else if (reportPath != "-") {
        std::fputs(PointsTable(ReducedPoints(engine), decimals).c_str(), stdout);
    }
    return true;
}
