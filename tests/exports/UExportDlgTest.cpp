#include <gtest/gtest.h>
#include <sys/stat.h>

#include "ExportFixture.h"
#include "exports/JobCrs.h"
#include "exports/UExportDlg.h"

namespace nedit::test {
namespace {

class ExportDialogTest : public ExportTest {
  protected:
    UExportDlg Dialog() { return UExportDlg(path, JobLayerNames(*job), "", "DAY 1"); }
};

TEST_F(ExportDialogTest, OkRefusesWhatCannotBeWrittenAndSaysWhy) {
    UExportDlg dialog = Dialog();
    EXPECT_EQ(dialog.JobLayers(), (std::vector<std::string>{"BOUNDARY", "TOPO", "EMPTY"}));
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(dialog.Refusal(), "Choose the file to write.");

    dialog.Output = path;
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(dialog.Refusal(), "cannot write " + path + ": it is the job itself");

    // A Shapefile's companion counts as much as the file named.
    dialog.Format = ExportFormat::Shapefile;
    dialog.Output = dir.File("site.shp");
    dir.Write("site_lines.dbf", "");
    ::chmod(dir.File("site_lines.dbf").c_str(), 0444);
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(dialog.Refusal(), "cannot write " + dir.File("site_lines.dbf") + ": it is read-only");

    dialog.Format = ExportFormat::Dxf;
    dialog.Output = dir.File("site.dxf");
    dialog.Crs = "27700";
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(dialog.Refusal(), "The coordinate system must be EPSG:NNNN.");
    dialog.Crs = "EPSG:999999";
    EXPECT_FALSE(dialog.OnOK());
    dialog.Crs = "EPSG:27700";
    EXPECT_TRUE(dialog.OnOK());
    EXPECT_TRUE(dialog.Refusal().empty());
}

TEST_F(ExportDialogTest, ExportKeepsTheCoordinateSystemAndTakesTheDocumentForLandXml) {
    const ExportDocument document{
        "DAY 1", {L"STN       ID=P1,HI=1.5", L"SS        ID=P4,HA=0.0000,VA=90.0000,SD=10.000"}};
    UExportDlg dialog = Dialog();
    dialog.Format = ExportFormat::LandXml;
    dialog.Output = dir.File("site.xml");
    dialog.Crs = "EPSG:27700";
    dialog.Layers = {"TOPO"};
    ASSERT_TRUE(dialog.OnOK());
    const ExportResult with = dialog.Export(*job, document);
    ASSERT_TRUE(with.written);
    EXPECT_EQ(with.observations, 1);
    EXPECT_EQ(with.contents.points.size(), 1u);  // P4 alone is on TOPO
    EXPECT_EQ(ReadJobCrs(job->Database()), "EPSG:27700");

    dialog.WithDocument = false;
    const ExportResult without = dialog.Export(*job, document);
    ASSERT_TRUE(without.written);
    EXPECT_EQ(without.observations, 0);
    EXPECT_EQ(dir.Read("site.xml").find("<Survey>"), std::string::npos);
}

}  // namespace
}  // namespace nedit::test
