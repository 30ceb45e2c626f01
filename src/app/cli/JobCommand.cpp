// sxnedit job ...: make a job file, list, import and export its points, and describe it.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <functional>
#include <iterator>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "Commands.h"
#include "JobListings.h"
#include "PointOutput.h"
#include "RunFiles.h"
#include "platform/io/LineReader.h"
#include "platform/job/Csv.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBSQLiteTransaction.h"
#include "platform/job/USurveyDoc.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace {

/// One point of a CSV file.
struct CsvPoint {
    std::wstring name;
    double east = 0.0;
    double north = 0.0;
    double height = UWPoint::kNoHeight;
    std::wstring code;
    long line = 0;
};

void Print(const std::wstring& text) {
    std::fputs(nedit::ToUtf8(text).c_str(), stdout);
}

long long Count(USurveyDoc& job, const char* sql) {
    auto query = job.Database().Query(sql);
    return query->Step() ? query->Int(0) : 0;
}

// Reads and checks the whole file before anything is imported. Gives false after a message
// naming the line; duplicate names are told and the later row kept.
bool ReadCsvPoints(const std::string& file, std::vector<CsvPoint>& points, int& status) {
    nedit::LineReader reader;
    if (!reader.Open(file)) {
        std::fprintf(stderr, "sxnedit: cannot read %s\n", file.c_str());
        status = exit_status::Unreadable;
        return false;
    }
    status = exit_status::Unreadable;
    std::map<std::wstring, std::size_t> byName;
    std::string bytes;
    std::vector<std::string> fields;
    std::string error;
    long line = 0;
    bool first = true;
    while (reader.ReadLine(bytes)) {
        ++line;
        if (nedit::Trim(nedit::DecodeTextLine(bytes)).empty()) continue;
        const std::string where = file + " line " + std::to_string(line) + ": ";
        if (!nedit::SplitCsvLine(bytes, fields, error)) {
            std::fprintf(stderr, "sxnedit: %s%s; nothing was imported\n", where.c_str(),
                         error.c_str());
            return false;
        }
        const bool header =
            first && nedit::ToLower(nedit::Trim(nedit::DecodeTextLine(fields[0]))) == L"name";
        first = false;
        if (header) continue;
        if (fields.size() < 4 || fields.size() > 5) {
            std::fprintf(stderr,
                         "sxnedit: %s%zu columns where name,east,north,height,code are expected; "
                         "nothing was imported\n",
                         where.c_str(), fields.size());
            return false;
        }
        CsvPoint point;
        point.line = line;
        point.name = nedit::Trim(nedit::DecodeTextLine(fields[0]));
        if (fields.size() == 5) point.code = nedit::Trim(nedit::DecodeTextLine(fields[4]));
        const char* bad = nullptr;
        if (point.name.empty()) {
            std::fprintf(stderr, "sxnedit: %sthe point has no name; nothing was imported\n",
                         where.c_str());
            return false;
        }
        if (!nedit::ParseCsvNumber(fields[1], point.east))
            bad = "east";
        else if (!nedit::ParseCsvNumber(fields[2], point.north))
            bad = "north";
        else if (!nedit::Trim(nedit::DecodeTextLine(fields[3])).empty() &&
                 !nedit::ParseCsvNumber(fields[3], point.height))
            bad = "height";
        if (bad != nullptr) {
            const std::size_t column = bad[0] == 'e' ? 1 : bad[0] == 'n' ? 2 : 3;
            std::fprintf(stderr,
                         "sxnedit: %sthe %s value \"%s\" is not a number; nothing was imported\n",
                         where.c_str(), bad, fields[column].c_str());
            return false;
        }
        const auto seen = byName.find(point.name);
        if (seen != byName.end()) {
            std::fprintf(stderr, "sxnedit: %spoint %s repeats line %ld; the later row is used\n",
                         where.c_str(), nedit::ToUtf8(point.name).c_str(),
                         points[seen->second].line);
            points[seen->second] = point;
        } else {
            byName[point.name] = points.size();
            points.push_back(point);
        }
    }
    return true;
}

int New(const std::string& path) {
    USvyCodeLib codes;
    std::wstring error;
    if (!codes.LoadFile(nedit::DataDirectory() + "/SurveyCodes.csv", error)) {
        std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(error).c_str());
        return exit_status::Failed;
    }
    USurveyDoc::CreateJob(path, &codes);
    std::printf("Created job %s with %d survey codes.\n", path.c_str(), codes.GetCount());
    return exit_status::Ok;
}

// The job's points, in the order they were stored.
std::vector<PointRow> JobPoints(USurveyDoc& job) {
    std::vector<PointRow> points;
    auto query =
        job.Database().Query("SELECT name, east, north, height, code FROM point ORDER BY id");
    while (query->Step()) {
        points.push_back({query->Text(0), query->Real(1), query->Real(2), !query->IsNull(3),
                          query->Real(3), query->Text(4)});
    }
    return points;
}

int Points(const std::string& path, bool json) {
    nedit::JobOpenOptions options;
    options.access = nedit::JobAccess::ReadOnly;
    auto job = USurveyDoc::OpenJob(path, options);
    const std::vector<PointRow> points = JobPoints(*job);
    const std::string out = json ? PointsJson(points, 0) + "\n"
                                 : PointsTable(points, job->GetSettings().GetLengthDecimals());
    std::fwrite(out.data(), 1, out.size(), stdout);
    return std::fflush(stdout) == 0 ? exit_status::Ok : exit_status::Failed;
}

int Import(const std::string& path, const std::string& file) {
    std::vector<CsvPoint> points;
    int status = exit_status::Ok;
    if (!ReadCsvPoints(file, points, status)) return status;
    auto job = USurveyDoc::OpenJob(path);
    int added = 0;
    int updated = 0;
    UDBSQLiteTransaction transaction(job.get());
    UDBPoint point(job.get());
    for (const CsvPoint& row : points) {
        point.ReInit();
        const long id = job->GetPointId(UPointNumber(row.name));
        if (id != 0) point.Load(id);
        point.SetName(row.name);
        point.SetEast(row.east);
        point.SetNorth(row.north);
        point.SetHeight(row.height);
        point.SetCode(row.code);
        if (!point.Save()) {
            std::fprintf(
                stderr,
                "sxnedit: %s line %ld: point %s cannot be saved (%s); nothing was imported\n",
                file.c_str(), row.line, nedit::ToUtf8(row.name).c_str(),
                nedit::ToUtf8(point.LastError()).c_str());
            return exit_status::Failed;
        }
        if (id != 0) {
            ++updated;
        } else {
            ++added;
        }
    }
    transaction.Commit();
    std::printf("Imported %zu points into %s (%d new, %d updated).\n", points.size(), path.c_str(),
                added, updated);
    return exit_status::Ok;
}

int Export(const std::string& path, const std::string& file) {
    if (!RunFiles().Reads(path).Writes(file).Check()) return exit_status::Failed;
    nedit::JobOpenOptions options;
    options.access = nedit::JobAccess::ReadOnly;
    auto job = USurveyDoc::OpenJob(path, options);
    const std::vector<PointRow> points = JobPoints(*job);
    if (!WritePointsCsv(file, points)) return exit_status::Failed;
    std::printf("Exported %zu points to %s.\n", points.size(), file.c_str());
    return exit_status::Ok;
}

int Info(const std::string& path) {
    nedit::JobOpenOptions options;
    options.access = nedit::JobAccess::ReadOnly;
    auto job = USurveyDoc::OpenJob(path, options);
    const UJobSettings& settings = job->GetSettings();
    const wchar_t* lengths[] = {L"metres", L"feet", L"US survey feet"};
    const wchar_t* angles[] = {L"degrees, minutes and seconds", L"decimal degrees", L"gons"};
    Print(nedit::Format(L"Job:            %s\n", nedit::FromUtf8(path)));
    Print(nedit::Format(L"Schema:         %d\n", job->Database().SchemaVersion()));
    Print(nedit::Format(L"Length unit:    %s, %d decimals\n",
                        lengths[static_cast<int>(settings.GetLengthUnit())],
                        settings.GetLengthDecimals()));
    Print(nedit::Format(L"Angle unit:     %s, %d decimals\n",
                        angles[static_cast<int>(settings.GetAngleUnit())],
                        settings.GetAngleDecimals()));
    Print(nedit::Format(L"Coordinates:    %s\n",
                        job->CoordsOrderXY() ? L"East, North" : L"North, East"));
    Print(nedit::Format(L"Points:         %lld\n", Count(*job, "SELECT count(*) FROM point")));
    Print(nedit::Format(L"Lines:          %lld\n", Count(*job, "SELECT count(*) FROM line")));
    Print(nedit::Format(L"Arcs:           %lld\n", Count(*job, "SELECT count(*) FROM arc")));
    Print(nedit::Format(L"Circles:        %lld\n", Count(*job, "SELECT count(*) FROM circle")));
    Print(nedit::Format(L"Polylines:      %lld\n", Count(*job, "SELECT count(*) FROM polyline")));
    Print(nedit::Format(L"Layers:         %lld\n", Count(*job, "SELECT count(*) FROM layer")));
    Print(
        nedit::Format(L"Survey codes:   %lld\n", Count(*job, "SELECT count(*) FROM survey_code")));
    Print(nedit::Format(L"Transfers:      %lld\n", Count(*job, "SELECT count(*) FROM transfer")));
    Print(nedit::Format(L"Raw-data files: %lld\n",
                        Count(*job, "SELECT count(*) FROM storage WHERE parent_id IS NOT NULL")));
    return exit_status::Ok;
}

}  // namespace

void AddJobCommands(CLI::App& app, CommandRun& run) {
    struct JobOptions {
        std::string job;
        std::string file;
        bool json = false;
    };
    auto options = std::make_shared<JobOptions>();
    CLI::App* job = app.add_subcommand("job", "job files and their points");
    job->require_subcommand(1);
    // Every job command names the job first; `work` is its work on the words given.
    auto add = [&](const char* name, const char* description,
                   std::function<int(const JobOptions&)> work) {
        CLI::App* command = job->add_subcommand(name, description);
        command->add_option("JOB", options->job, "the job file")->required();
        command->callback(
            [options, work, &run] { run = [options, work] { return work(*options); }; });
        return command;
    };
    add("new", "make a new job file, with the default survey codes",
        [](const JobOptions& o) { return New(o.job); });
    add("points", "list the job's points", [](const JobOptions& o) {
        return Points(o.job, o.json);
    })->add_flag("--json", options->json, "objects with id, e, n, h (null: no height) and code");
    struct Listing {
        const char* name;
        int (*list)(const std::string&, bool);
        const char* jsonHelp;
    };
    const Listing listings[] = {
        {"polylines", ListPolylines,
         "objects with name, layer, closed and vertices (id, e, n,\nh (null: no height), bulge)"},
        {"lines", ListLines, "objects with the two ends from and to (id, e, n, h) and\nthe layer"},
        {"arcs", ListArcs, "objects with start, end, centre, radius, sense and layer"},
        {"circles", ListCircles, "objects with centre (id, e, n, h), radius and layer"},
        {"transfers", ListTransfers,
         "objects with made_at, source, complete, written (counts)\nand not_written (kind, "
         "name, reason)"}};
    for (const Listing& listing : listings) {
        const auto list = listing.list;
        add(listing.name, (std::string("list the job's ") + listing.name).c_str(),
            [list](const JobOptions& o) { return list(o.job, o.json); })
            ->add_flag("--json", options->json, listing.jsonHelp);
    }
    add("import-points",
        "add or update points from name,east,north,height,code\n"
        "rows (empty height: none; a later row of a name wins)",
        [](const JobOptions& o) { return Import(o.job, o.file); })
        ->add_option("FILE.csv", options->file, "the points")
        ->required();
    add("export-points", "write the job's points as such rows",
        [](const JobOptions& o) { return Export(o.job, o.file); })
        ->add_option("FILE.csv", options->file, "the file to write")
        ->required();
    add("info", "the job's settings and what it holds",
        [](const JobOptions& o) { return Info(o.job); });
}
