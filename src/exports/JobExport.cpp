#include "exports/JobExport.h"

#include <ctime>
#include <exception>
#include <stdexcept>
#include <utility>

#include "exports/CsvPointsExport.h"
#include "exports/DxfExport.h"
#include "exports/ExportText.h"
#include "exports/LandXmlExport.h"
#include "exports/OgrExport.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/USurveyDoc.h"
#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

// The objects other than points, for a format that holds points only.
void SayPointsOnly(const JobContents& contents, const std::string& format,
                   std::vector<std::string>& messages) {
    const std::size_t others = contents.lines.size() + contents.arcs.size() +
                               contents.circles.size() + contents.polylines.size();
    if (others == 0) return;
    messages.push_back(format + " holds points only; not in it: " +
                       Counted(contents.lines.size(), "line", "lines") + ", " +
                       Counted(contents.arcs.size(), "arc", "arcs") + ", " +
                       Counted(contents.circles.size(), "circle", "circles") + " and " +
                       Counted(contents.polylines.size(), "polyline", "polylines"));
}

// Now, in UTC, as "YYYY-MM-DDTHH:MM:SS".
std::string UtcStamp() {
    const std::time_t now = std::time(nullptr);
    std::tm utc{};
    gmtime_r(&now, &utc);
    char text[32];
    std::strftime(text, sizeof text, "%Y-%m-%dT%H:%M:%S", &utc);
    return text;
}

std::string LandXml(USurveyDoc& job, const ExportRequest& request, ExportResult& result) {
    const JobContents& contents = result.contents;
    const std::size_t others = contents.lines.size() + contents.arcs.size() +
                               contents.circles.size() + contents.polylines.size();
    if (others > 0) {
        result.messages.push_back(
            "LandXML holds the points and the survey only; not in it: " +
            Counted(others, "line, arc, circle or polyline", "lines, arcs, circles and polylines"));
    }
    Survey survey;
    LandXmlSurvey written;
    if (request.document != nullptr) {
        survey = ReadSurvey(request.document->rows, job.GetSettings(), FromUtf8(DataDirectory()));
        written = {request.document->name, &survey};
        for (const SurveySetup& setup : survey.setups)
            result.observations += static_cast<int>(setup.observations.size());
        if (survey.withoutStation > 0) {
            result.messages.push_back(Counted(static_cast<std::size_t>(survey.withoutStation),
                                              "observation", "observations") +
                                      " before the first set-up (STN) of " +
                                      request.document->name + ": not in the file");
        }
    }
    const std::string stamp = request.stamp.empty() ? UtcStamp() : request.stamp;
    return LandXmlText(contents, request.crs, written, stamp);
}

ExportFiles Lay(USurveyDoc& job, const ExportRequest& request, ExportResult& result) {
    const JobContents& contents = result.contents;
    switch (request.format) {
        case ExportFormat::Csv:
            SayPointsOnly(contents, "a CSV file", result.messages);
            return {{request.output, PointsCsvText(contents)}};
        case ExportFormat::Dxf:
            return {{request.output, DxfText(contents, result.messages)}};
        case ExportFormat::GeoPackage:
        case ExportFormat::GeoJson:
        case ExportFormat::Shapefile:
        case ExportFormat::Kml:
            return OgrFiles(contents, request.format, request.output, request.crs, result.messages);
        case ExportFormat::LandXml:
            return {{request.output, LandXml(job, request, result)}};
    }
    throw std::logic_error("an export format without a writer");
}

}  // namespace

ExportResult ExportJob(USurveyDoc& job, const ExportRequest& request) {
    ExportResult result;
    try {
        result.contents = ReadJobContents(job, request.layers);
        for (const auto& [path, bytes] : Lay(job, request, result)) {
            if (!ReplaceFile(path, bytes)) {
                const std::string why = WhyNotWritable(path);
                result.messages.push_back("cannot write " + path + (why.empty() ? "" : ": " + why));
                return result;
            }
            result.files.push_back(path);
        }
        result.written = true;
    } catch (const std::exception& error) {
        result.messages.emplace_back(error.what());
    }
    return result;
}

}  // namespace nedit
