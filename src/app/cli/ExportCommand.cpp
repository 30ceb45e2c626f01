// sxnedit export JOB FORMAT OUT: the job's points, lines, arcs, circles and polylines for CAD
// and GIS, and with --doc a document's observations as LandXML.

#include <CLI/CLI.hpp>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "RunFiles.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "exports/ExportText.h"
#include "exports/JobCrs.h"
#include "exports/JobExport.h"
#include "exports/OgrExport.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace {

struct ExportOptions {
    std::string job;
    std::string format;
    std::string output;
    std::string document;
    std::vector<std::string> layers;
    std::string crs;
};

// The rows of the stored document `name`; false, after a message, when there is none.
bool ReadDocument(USurveyDoc& job, const std::string& name, nedit::ExportDocument& document) {
    URawDataContainer container(&job);
    UNeditDoc* doc = container.Open() ? container.GetNeditDoc(nedit::FromUtf8(name)) : nullptr;
    if (doc == nullptr) {
        std::fprintf(stderr, "sxnedit: the job has no document %s\n", name.c_str());
        return false;
    }
    ConsoleDialogHost host;
    doc->SetDialogHost(&host);
    document.name = name;
    document.rows = doc->OpenList().GetRows();
    return true;
}

int Export(const ExportOptions& options) {
    const nedit::ExportFormat format = *nedit::ExportFormatNamed(options.format);
    if (!options.document.empty() && format != nedit::ExportFormat::LandXml) {
        std::fprintf(stderr, "sxnedit: export: --doc is for landxml only\n");
        return exit_status::Usage;
    }
    RunFiles files;
    files.Reads(options.job);
    for (const std::string& output : nedit::ExportOutputs(format, options.output))
        files.Writes(output);
    if (!files.Check()) return exit_status::Failed;
    if (!options.crs.empty()) {
        const std::string why = nedit::WhyUnknownCrs(options.crs);
        if (!why.empty()) {
            std::fprintf(stderr, "sxnedit: export: %s\n", why.c_str());
            return exit_status::Usage;
        }
    }

    nedit::JobOpenOptions access;
    access.access = options.crs.empty() ? nedit::JobAccess::ReadOnly : nedit::JobAccess::ReadWrite;
    std::unique_ptr<USurveyDoc> job;
    nedit::ExportRequest request;
    nedit::ExportDocument document;
    try {
        job = USurveyDoc::OpenJob(options.job, access);
        if (!options.crs.empty()) nedit::WriteJobCrs(job->Database(), options.crs);
        request.crs = nedit::ReadJobCrs(job->Database());
    } catch (const nedit::JobError& error) {
        std::fprintf(stderr, "sxnedit: %s\n", error.what());
        return exit_status::Unreadable;
    }
    if (!options.document.empty()) {
        if (!ReadDocument(*job, options.document, document)) return exit_status::Failed;
        request.document = &document;
    }
    request.format = format;
    request.output = options.output;
    request.layers = options.layers;
    const nedit::ExportResult result = nedit::ExportJob(*job, request);
    for (const std::string& message : result.messages)
        std::fprintf(stderr, "sxnedit: %s\n", message.c_str());
    if (!result.written) return exit_status::Failed;
    const nedit::JobContents& done = result.contents;
    using nedit::Counted;
    std::string summary = Counted(done.points.size(), "point", "points");
    if (format != nedit::ExportFormat::Csv && format != nedit::ExportFormat::LandXml) {
        summary += ", " + Counted(done.lines.size(), "line", "lines") + ", " +
                   Counted(done.arcs.size(), "arc", "arcs") + ", " +
                   Counted(done.circles.size(), "circle", "circles") + ", " +
                   Counted(done.polylines.size(), "polyline", "polylines");
    }
    if (request.document != nullptr) {
        summary += ", " + Counted(static_cast<std::size_t>(result.observations), "observation",
                                  "observations");
    }
    std::printf("Exported %s to %s (%s).\n", summary.c_str(), options.output.c_str(),
                nedit::ExportFormatTitle(format).c_str());
    return exit_status::Ok;
}

}  // namespace

void AddExportCommand(CLI::App& app, CommandRun& run) {
    auto options = std::make_shared<ExportOptions>();
    CLI::App* command = app.add_subcommand(
        "export", "write the job's points, lines, arcs, circles and polylines\nfor CAD and GIS");
    command->add_option("JOB", options->job, "the job file")->required();
    command
        ->add_option("FORMAT", options->format,
                     "csv (points), dxf, gpkg, geojson, shp (OUT.shp and\n"
                     "OUT_lines.shp), kml or landxml")
        ->required()
        ->check(CLI::IsMember(nedit::ExportFormatWords(), CLI::ignore_case));
    command->add_option("OUT", options->output, "the file to write")->required();
    command
        ->add_option("--doc", options->document,
                     "landxml: the document whose observations go under Survey")
        ->option_text("NAME");
    command->add_option("--layers", options->layers, "only the objects of these layers")
        ->delimiter(',')
        ->option_text("LAYER,...");
    command
        ->add_option("--crs", options->crs,
                     "the job's coordinate system, kept in the job for\nlater exports")
        ->option_text("EPSG:NNNN")
        ->check([](const std::string& crs) {
            return nedit::IsEpsgCode(crs) ? std::string()
                                          : "the coordinate system must be EPSG:NNNN";
        });
    command->callback([options, &run] { run = [options] { return Export(*options); }; });
}
