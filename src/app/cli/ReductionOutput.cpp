#include "ReductionOutput.h"

#include <cstdio>

#include "Json.h"
#include "reduction/UNeditDatabase.h"

std::vector<PointRow> ReducedPoints(const UNeditDatabase& engine) {
    std::vector<PointRow> points;
    points.reserve(engine.GetPointList().size());
    for (const UNeditPt& point : engine.GetPointList()) {
        points.push_back({point.GetID(), point.x, point.y, point.z > kNoHeight, point.z, point.GetCode()});
    }
    return points;
}

void PrintJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages) {
    std::string out = "{\n  \"points\": " + PointsJson(ReducedPoints(engine), 2) + ",\n  \"lines\": [";
    const char* separator = "\n    ";
    for (const UNeditLine& line : engine.GetLineList()) {
        out += separator;
        out += "{\"from\": " + json::Quote(line.GetFromPt()) + ", \"to\": " + json::Quote(line.GetToPt()) +
               ", \"station_line\": " + (line.GetStationLine() ? "true" : "false") + "}";
        separator = ",\n    ";
    }
    out += "\n  ],\n  \"arcs\": [";
    separator = "\n    ";
    for (const UNeditArc& arc : engine.GetArcList()) {
        out += separator;
        out += "{\"start\": " + json::Quote(arc.GetStartPt()) + ", \"end\": " + json::Quote(arc.GetEndPt()) +
               ", \"third\": " + json::Quote(arc.GetThirdPt()) + ", \"type\": " + std::to_string(arc.GetArcType()) + "}";
        separator = ",\n    ";
    }
    out += "\n  ],\n  \"circles\": [";
    separator = "\n    ";
    for (const UWCircle& circle : engine.GetCircleList()) {
        out += separator;
        out += "{\"e\": " + json::Number(circle.GetCentre().x) + ", \"n\": " + json::Number(circle.GetCentre().y) +
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

