#pragma once
// A report on a document whose NEDIT.INI lies in a temporary configuration directory.

#include <gtest/gtest.h>

#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "../support/TestSupport.h"
#include "document/UNeditDoc.h"
#include "report/UNeditReport.h"

class ReportFixture : public ::testing::Test {
  protected:
    /// A document and report reading `ini` as NEDIT.INI; pages are endless.
    void Open(const std::string& ini, USurveyDoc* job = nullptr) {
        config.Write("NEDIT.INI", ini);
        doc = std::make_unique<UNeditDoc>(job);
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
    std::unique_ptr<UNeditDoc> doc;
    std::unique_ptr<UNeditReport> report;
};

/// Labels of the head lines used by the tests.
inline const char* const kTitles =
    "[TITLE]\nOCCSTN=Occupied Station\nCOORD=Coordinates\nCODE=Code\nINSHT=Instrument Height\n"
    "BACKSTN=Back Station\nBSBEARING=Back Bearing\nBSOBS=Back Sight Obs\nBSANGLE=Back Sight "
    "Angle\n";
