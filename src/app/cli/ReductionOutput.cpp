#include "ReductionOutput.h"

#include <cstdio>

#include "Json.h"
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
    std::string out =
        "{\n  \"points\": " + PointsJson(ReducedPoints(engine), 2) + ",\n  \"lines\": [";
    const char* separator = "\n    ";
    for (const UNeditLine& line : engine.GetLineList()) {
        out += separator;
        out += "{\"from\": " + json::Quote(line.GetFromPt()) +
               ", \"to\": " + json::Quote(line.GetToPt()) +
               ", \"station_line\": " + (line.GetStationLine() ? "true" : "false") + "}";
        separator = ",\n    ";
    }
    out += "\n  ],\n  \"arcs\": [";
    separator = "\n    ";
    for (const UNeditArc& arc : engine.GetArcList()) {
        out += separator;
        out += "{\"start\": " + json::Quote(arc.GetStartPt()) +
               ", \"end\": " + json::Quote(arc.GetEndPt()) +
               ", \"third\": " + json::Quote(arc.GetThirdPt()) +
               ", \"type\": " + std::to_string(arc.GetArcType()) + "}";
        separator = ",\n    ";
    }
    out += "\n  ],\n  \"circles\": [";
    separator = "\n    ";
    for (const UWCircle& circle : engine.GetCircleList()) {
        out += separator;
        out += "{\"e\": " + json::Number(circle.GetCentre().x) +
               ", \"n\": " + json::Number(circle.GetCentre().y) +
               ", \"radius\": " + json::Number(circle.GetRadius()) + "}";
        separator = ",\n    ";
    }
    out += "\n  ],\n  \"error\": " + std::to_string(engine.GetErrorCode()) + ",\n  \"messages\": [";
    separator = "";
    for (const std::wstring& message : messages) {
        out += separator + json::Quote(message);
        separator = ", ";
    }
    out += "]\n}\n";
    std::fputs(out.c_str(), stdout);
}

bool CheckOutputOptions(const std::string& reportPath, bool json) {
    if (!json || reportPath != "-") return true;
    std::fprintf(stderr, "sxnedit: --json and --report - both want standard output\n");
    return false;
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
