#pragma once
// "Export": the desktop's export of the job, as a logic object that a form shows. The user
// chooses the format, the file, the layers (none ticked: all) and the job's coordinate
// system, and for LandXML whether the open document's observations go under Survey. OK
// refuses, saying why in Refusal(), a file that is missing, that is the job itself or that
// cannot be written (see ReplaceFile.h), and a coordinate system that is no "EPSG:NNNN" GDAL
// knows. Export then keeps a changed coordinate system in the job and runs ExportJob.

#include <string>
#include <vector>

#include "exports/JobExport.h"
#include "platform/messages/DialogHost.h"

class USurveyDoc;

namespace nedit {

class UExportDlg : public UDialogLogic {
  public:
    /// `layers` are the job's, `crs` the one it keeps, `document` the open document's name.
    UExportDlg(std::string jobPath, std::vector<std::string> layers, std::string crs,
               std::string document);

    std::wstring DialogName() const override { return L"Export"; }
    bool OnOK() override;

    const std::vector<std::string>& JobLayers() const { return job_layers_; }
    const std::string& DocumentName() const { return document_; }
    /// Why OnOK refused; empty when it did not.
    const std::string& Refusal() const { return refusal_; }

    /// Runs the export chosen; `document` holds the open document's rows. Never throws.
    ExportResult Export(USurveyDoc& job, const ExportDocument& document) const;

    ExportFormat Format = ExportFormat::Dxf;
    std::string Output;               // UTF-8
    std::vector<std::string> Layers;  // ticked; none: every layer
    std::string Crs;                  // "EPSG:NNNN", or empty for none
    bool WithDocument = true;         // LandXML: the document's observations too

  private:
    std::string job_path_;
    std::vector<std::string> job_layers_;
    std::string job_crs_;
    std::string document_;
    std::string refusal_;
};

}  // namespace nedit
