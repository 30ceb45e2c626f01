// The report parameters of a raw-data document: read from NEDIT.INI, changed by the
// parameter dialog, and the units the document's report prints in.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <memory>
#include <string>

#include "../support/TestSupport.h"
#include "document/UNeditDoc.h"
#include "report/NeditIni.h"
#include "report/OutParamStruct.h"
#include "report/UNeditReport.h"
#include "report/UOutputParamDlg.h"

namespace {

class DocumentReportParameters : public ::testing::Test {
  protected:
    /// A document reading `ini` as NEDIT.INI.
    void Open(const std::string& ini) {
        config.Write("NEDIT.INI", ini);
        doc = std::make_unique<UNeditDoc>(nullptr);
    }

    nedit::test::TempDir config;
    nedit::test::ScopedEnv env{"SXNEDIT_CONFIG", config.Path()};
    std::unique_ptr<UNeditDoc> doc;
};

}  // namespace

TEST_F(DocumentReportParameters, TheParameterDialogStoresTheColumnsAndKeepsThePageSize) {
    Open("[OUTPUT]\nORDER=HC SD\n");
    OutParamStruct& parameters = doc->GetOutputParameters();
    EXPECT_EQ(parameters.OutHC, 1);
    EXPECT_EQ(parameters.OutID, 0);
    parameters.LinearUnit = 2;
    UOutputParamDlg dialog(parameters);
    EXPECT_EQ(dialog.LinearRadio, 1);  // US feet show as feet
    dialog.SetChecked(opt::ID, true);
    dialog.SetChecked(opt::SD, false);
    dialog.AngularRadio = 1;
    ASSERT_TRUE(dialog.OnOK());
    EXPECT_EQ(dialog.GetParameters().LinearUnit, 1);
    EXPECT_EQ(dialog.GetParameters().AngularUnit, 1);
    EXPECT_EQ(dialog.GetParameters().PageSize, 55);
    EXPECT_EQ(nedit::ReadOrderKey(), L"ID HC ");
    // A second document reads what the dialog wrote.
    UNeditDoc second(nullptr);
    EXPECT_EQ(second.GetCheckOn(opt::ID), 1);
    EXPECT_EQ(second.GetCheckOn(opt::SD), 0);
}

TEST_F(DocumentReportParameters, NeditIniStaysWritableWhileADocumentLives) {
    Open("[OUTPUT]\nORDER=ID\n");
    doc.reset();
    const std::string path = config.File("NEDIT.INI");
    ASSERT_EQ(chmod(path.c_str(), 0444), 0);
    {
        UNeditDoc open(nullptr);
        struct stat info {};
        ASSERT_EQ(stat(path.c_str(), &info), 0);
        EXPECT_NE(info.st_mode & S_IWUSR, 0u);
    }
    struct stat info {};
    ASSERT_EQ(stat(path.c_str(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777, 0444u);
}

TEST_F(DocumentReportParameters, TheDocumentsReportPrintsInItsUnitsAndColumns) {
    Open("[OUTPUT]\nORDER=ID HA\n");
    doc->GetOutputParameters().AngularUnit = 2;
    doc->GetOutputParameters().LinearUnit = 1;
    UNeditReport report(doc.get(), L"Raw Data Reduction Report");
    report.SetPageLength(0);
    EXPECT_EQ(report.GetOutUA(), L'G');
    EXPECT_EQ(report.GetOutUL(), L'F');
    report.PrintSSHead();
    // 90° is 100 gon; only the two columns of the ORDER key are printed.
    report.PrintSSLine(L"P7", 90.0, 90.0, 20.0, 1.5, 1.0, 2.0, 3.0, L"TREE", 3, true);
    EXPECT_EQ(report.GetText(), L"\nPointID    Horiz    \n\n     P7     100.0000\n");
}
