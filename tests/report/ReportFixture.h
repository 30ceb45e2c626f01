#pragma once
// A report on a context whose NEDIT.INI lies in a temporary configuration directory.

#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "../support/TestSupport.h"
#include "platform/job/USurveyDoc.h"
#include "platform/units/Units.h"
#include "records/UNeutralFileFormat.h"
#include "report/NeditIni.h"
#include "report/ReportContext.h"
#include "report/UNeditReport.h"

/// What a raw-data document gives its report: the job's settings and units, the columns of
/// NEDIT.INI's ORDER key, and a record service.
class TestReportContext : public nedit::ReportContext, public UNeutralFileFormat {
  public:
    explicit TestReportContext(USurveyDoc* job) : UNeutralFileFormat(&settings) {
        if (job != nullptr) settings = job->GetSettings();
        SetFlagsFromOrder(parameters, nedit::ReadOrderKey());
        parameters.AngularUnit = nedit::IndexOf(settings.GetAngleUnit());
        parameters.LinearUnit = nedit::IndexOf(settings.GetLengthUnit());
    }

    OutParamStruct& GetOutputParameters() { return parameters; }
    const OutParamStruct& GetOutputParameters() const override { return parameters; }
    bool IsENOrder() const override {
        return settings.GetCoordinateOrder() == UJobSettings::kEastNorth;
    }
    const UJobSettings& GetSettings() const override { return settings; }
    const UNeutralFileFormat& GetRecordFormat() const override { return *this; }

  private:
    UJobSettings settings;
    OutParamStruct parameters;
};

class ReportFixture : public ::testing::Test {
  protected:
    /// A context and report reading `ini` as NEDIT.INI; pages are endless.
    void Open(const std::string& ini, USurveyDoc* job = nullptr) {
        config.Write("NEDIT.INI", ini);
        doc = std::make_unique<TestReportContext>(job);
        report = std::make_unique<UNeditReport>(doc.get(), L"Raw Data Reduction Report");
        report->SetPageLength(0);
    }

    /// The report's lines, the line being written left out when it is empty.
    std::vector<std::wstring> Lines() const {
        std::vector<std::wstring> lines = report->Lines();
        if (!lines.empty() && lines.back().empty()) lines.pop_back();
        return lines;
    }

    nedit::test::TempDir config;
    nedit::test::ScopedEnv env{"SXNEDIT_CONFIG", config.Path()};
    std::unique_ptr<TestReportContext> doc;
    std::unique_ptr<UNeditReport> report;
};

/// Labels of the head lines used by the tests.
inline const char* const kTitles =
    "[TITLE]\nOCCSTN=Occupied Station\nCOORD=Coordinates\nCODE=Code\nINSHT=Instrument Height\n"
    "BACKSTN=Back Station\nBSBEARING=Back Bearing\nBSOBS=Back Sight Obs\nBSANGLE=Back Sight "
    "Angle\n";
