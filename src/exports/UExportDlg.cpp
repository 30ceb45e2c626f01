#include "exports/UExportDlg.h"

#include <sys/stat.h>

#include "exports/JobCrs.h"
#include "exports/OgrExport.h"
#include "platform/io/ReplaceFile.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"

namespace nedit {

namespace {

bool SameFile(const std::string& a, const std::string& b) {
    struct stat first {};
    struct stat second {};
    return ::stat(a.c_str(), &first) == 0 && ::stat(b.c_str(), &second) == 0 &&
           first.st_dev == second.st_dev && first.st_ino == second.st_ino;
}

}  // namespace

UExportDlg::UExportDlg(std::string jobPath, std::vector<std::string> layers, std::string crs,
                       std::string document)
    : Crs(crs),
      job_path_(std::move(jobPath)),
      job_layers_(std::move(layers)),
      job_crs_(std::move(crs)),
      document_(std::move(document)) {}

bool UExportDlg::OnOK() {
    refusal_.clear();
    if (Output.empty()) {
        refusal_ = "Choose the file to write.";
    } else if (!Crs.empty() && !IsEpsgCode(Crs)) {
        refusal_ = "The coordinate system must be EPSG:NNNN.";
    } else if (!Crs.empty()) {
        refusal_ = WhyUnknownCrs(Crs);
    }
    for (const std::string& output : ExportOutputs(Format, Output)) {
        if (!refusal_.empty()) break;
        if (SameFile(output, job_path_)) {
            refusal_ = "cannot write " + output + ": it is the job itself";
        } else if (const std::string why = WhyNotWritable(output); !why.empty()) {
            refusal_ = "cannot write " + output + ": " + why;
        }
    }
    return refusal_.empty();
}

ExportResult UExportDlg::Export(USurveyDoc& job, const ExportDocument& document) const {
    if (Crs != job_crs_) {
        try {
            WriteJobCrs(job.Database(), Crs);
        } catch (const JobError& error) {
            ExportResult kept;
            kept.messages.emplace_back(error.what());
            return kept;
        }
    }
    ExportRequest request;
    request.format = Format;
    request.output = Output;
    request.layers = Layers;
    request.crs = Crs;
    if (Format == ExportFormat::LandXml && WithDocument) request.document = &document;
    return ExportJob(job, request);
}

}  // namespace nedit
