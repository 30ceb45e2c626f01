// sxnedit reduce FILE.neu: a full reduction of a neutral file, its points as a table, as
// JSON, or as a CSV file.

#include <cstdio>
#include <string>

#include "Commands.h"
#include "Json.h"
#include "PointOutput.h"
#include "RecordSession.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace {

struct ReduceOptions {
    std::string file;
    std::string job;
    std::string points_csv;
    bool json = false;
    bool interactive = false;
};

bool ParseOptions(const std::vector<std::string>& args, ReduceOptions& options) {
    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& arg = args[i];
        const bool has_value = i + 1 < args.size();
        if (arg == "--json") {
            options.json = true;
        } else if (arg == "--interactive") {
            options.interactive = true;
        } else if (arg == "--job" && has_value) {
            options.job = args[++i];
        } else if (arg == "--points" && has_value) {
            options.points_csv = args[++i];
        } else if (!arg.empty() && arg[0] != '-' && options.file.empty()) {
            options.file = arg;
        } else {
            std::fprintf(stderr, "sxnedit: reduce: unexpected '%s' (see sxnedit --help)\n", arg.c_str());
            return false;
        }
    }
    if (options.file.empty()) std::fprintf(stderr, "sxnedit: reduce needs a neutral file (see sxnedit --help)\n");
    return !options.file.empty();
}

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

}  // namespace

int RunReduce(const std::vector<std::string>& args) {
    ReduceOptions options;
    if (!ParseOptions(args, options)) return exit_status::Usage;
    RecordSession session;
    session.host.SetInteractive(options.interactive);
    session.host.SetEcho(!options.json);
    if (!session.LoadDefinition()) return exit_status::Failed;
    std::unique_ptr<USurveyDoc> job;
    if (!options.job.empty()) {
        try {
            job = USurveyDoc::OpenJob(options.job);
        } catch (const nedit::JobError& error) {
            std::fprintf(stderr, "sxnedit: %s\n", error.what());
            return exit_status::Unreadable;
        }
        session.settings = job->GetSettings();  // the job's units and decimals
    }
    UNeditDatabase& engine = session.StartEngine(job.get());
    if (!engine.LoadNeFile(nedit::FromUtf8(options.file))) {
        if (options.json) {
            for (const std::wstring& message : session.host.Messages()) {
                std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(message).c_str());
            }
        }
        return exit_status::Unreadable;
    }
    const int result = engine.Process();
    if (options.json) {
        PrintJson(engine, session.host.Messages());
    } else {
        const std::string table = PointsTable(ReducedPoints(engine), session.settings.GetLengthDecimals());
        std::fputs(table.c_str(), stdout);
    }
    if (!options.points_csv.empty() && !WritePointsCsv(options.points_csv, ReducedPoints(engine))) {
        return exit_status::Failed;
    }
    return result == 1 ? exit_status::Ok : exit_status::Failed;
}
