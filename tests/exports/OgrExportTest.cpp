#include <gdal_priv.h>
#include <gtest/gtest.h>
#include <ogr_geometry.h>
#include <ogrsf_frmts.h>

#include <cmath>

#include "ExportFixture.h"
#include "exports/JobExport.h"
#include "exports/OgrExport.h"

namespace nedit::test {
namespace {

class GisExportTest : public ExportTest {
  protected:
    // Exports the whole job and opens what was written with GDAL.
    GDALDatasetUniquePtr Export(ExportFormat format, const std::string& name,
                                const std::string& crs = "") {
        ExportRequest request;
        request.format = format;
        request.output = dir.File(name);
        request.crs = crs;
        result = ExportJob(*job, request);
        EXPECT_TRUE(result.written);
        return GDALDatasetUniquePtr(
            GDALDataset::Open(request.output.c_str(), GDAL_OF_VECTOR | GDAL_OF_READONLY));
    }

    static OGRFeatureUniquePtr Feature(OGRLayer& layer, GIntBig index) {
        return OGRFeatureUniquePtr(layer.GetFeature(index));
    }

    ExportResult result;
};

// A densified arc: every vertex on the circle of radius 10 about P1.
void ExpectOnQuarterCircle(const OGRLineString& line) {
    ASSERT_EQ(line.getNumPoints(), 57);  // 56 chords within 1 mm on a radius of 10
    for (int i = 0; i < line.getNumPoints(); ++i)
        EXPECT_NEAR(std::hypot(line.getX(i) - 1000.0, line.getY(i) - 2000.0), 10.0, 1e-9);
}

TEST_F(GisExportTest, GeoPackageKeepsAttributesHeightsAndArcsAsCurves) {
    auto gpkg = Export(ExportFormat::GeoPackage, "site.gpkg", "EPSG:32633");
    ASSERT_TRUE(gpkg);
    OGRLayer* points = gpkg->GetLayerByName("points");
    ASSERT_NE(points, nullptr);
    ASSERT_EQ(points->GetFeatureCount(), 4);
    EXPECT_STREQ(points->GetSpatialRef()->GetAuthorityCode(nullptr), "32633");
    auto p1 = Feature(*points, 1);
    EXPECT_STREQ(p1->GetFieldAsString("name"), "P1");
    EXPECT_STREQ(p1->GetFieldAsString("code"), "FC01");
    EXPECT_STREQ(p1->GetFieldAsString("Owner"), "Smith, J");
    EXPECT_DOUBLE_EQ(p1->GetFieldAsDouble("height"), 50.0);
    const auto* at = p1->GetGeometryRef()->toPoint();
    EXPECT_DOUBLE_EQ(at->getX(), 1000.0);
    EXPECT_DOUBLE_EQ(at->getY(), 2000.0);
    EXPECT_DOUBLE_EQ(at->getZ(), 50.0);
    auto p3 = Feature(*points, 3);
    EXPECT_TRUE(p3->IsFieldNull(p3->GetFieldIndex("height")));
    EXPECT_FALSE(p3->GetGeometryRef()->Is3D());

    OGRLayer* linework = gpkg->GetLayerByName("linework");
    ASSERT_NE(linework, nullptr);
    ASSERT_EQ(linework->GetFeatureCount(), 4);
    auto arc = Feature(*linework, 2);
    EXPECT_STREQ(arc->GetFieldAsString("kind"), "arc");
    const auto* arc_curve = arc->GetGeometryRef()->toCompoundCurve();
    ASSERT_EQ(arc_curve->getNumCurves(), 1);
    const auto* circular = arc_curve->getCurve(0)->toCircularString();
    ASSERT_EQ(wkbFlatten(circular->getGeometryType()), wkbCircularString);
    EXPECT_NEAR(circular->getX(1), 1007.0710678118655, 1e-9);
    EXPECT_NEAR(circular->getY(1), 2007.0710678118655, 1e-9);
    EXPECT_DOUBLE_EQ(circular->getX(2), 1010.0);

    // KERB: a line to P2, the half circle through (1015, 2005) to P3, a line back to P1.
    auto kerb = Feature(*linework, 4);
    EXPECT_STREQ(kerb->GetFieldAsString("name"), "KERB");
    const auto* pieces = kerb->GetGeometryRef()->toCompoundCurve();
    ASSERT_EQ(pieces->getNumCurves(), 3);
    const auto* half = pieces->getCurve(1)->toSimpleCurve();
    EXPECT_NEAR(half->getX(1), 1015.0, 1e-9);
    EXPECT_NEAR(half->getY(1), 2005.0, 1e-9);
    EXPECT_TRUE(pieces->get_IsClosed());
}

TEST_F(GisExportTest, GeoJsonHoldsEverythingInOneCollectionWithArcsDensified) {
    auto geojson = Export(ExportFormat::GeoJson, "site.geojson");
    ASSERT_TRUE(geojson);
    OGRLayer* all = geojson->GetLayer(0);
    ASSERT_EQ(all->GetFeatureCount(), 8);
    int kinds = 0;
    for (auto& feature : *all) {
        const std::string kind = feature->GetFieldAsString("kind");
        kinds += kind == "point" ? 1 : 10;
        if (kind == "arc") ExpectOnQuarterCircle(*feature->GetGeometryRef()->toLineString());
    }
    EXPECT_EQ(kinds, 44);
}

TEST_F(GisExportTest, ShapefileWritesThePointsAndTheLineworkApart) {
    auto points = Export(ExportFormat::Shapefile, "site.shp");
    ASSERT_TRUE(points);
    EXPECT_EQ(points->GetLayer(0)->GetFeatureCount(), 4);
    EXPECT_EQ(result.files.size(), 8u);  // .shp .shx .dbf .cpg of each, no coordinate system
    GDALDatasetUniquePtr lines(
        GDALDataset::Open(dir.File("site_lines.shp").c_str(), GDAL_OF_VECTOR));
    ASSERT_TRUE(lines);
    OGRLayer* linework = lines->GetLayer(0);
    ASSERT_EQ(linework->GetFeatureCount(), 4);
    auto arc = Feature(*linework, 1);
    ExpectOnQuarterCircle(*arc->GetGeometryRef()->toLineString());
    auto circle = Feature(*linework, 2);
    EXPECT_EQ(circle->GetGeometryRef()->toLineString()->getNumPoints(), 113);
}

// Web Mercator to degrees by hand: lon = x / R, lat = 2 atan(e^(y / R)) - 90 degrees.
TEST_F(GisExportTest, KmlNeedsACoordinateSystemAndHoldsLongitudesAndLatitudes) {
    ExportRequest request;
    request.format = ExportFormat::Kml;
    request.output = dir.File("site.kml");
    const ExportResult refused = ExportJob(*job, request);
    EXPECT_FALSE(refused.written);
    ASSERT_EQ(refused.messages.size(), 1u);
    EXPECT_NE(refused.messages[0].find("--crs EPSG:NNNN"), std::string::npos);

    auto kml = Export(ExportFormat::Kml, "site.kml", "EPSG:3857");
    ASSERT_TRUE(kml);
    OGRLayer* points = kml->GetLayerByName("points");
    ASSERT_NE(points, nullptr);
    OGRFeatureUniquePtr p1(points->GetNextFeature());
    ASSERT_TRUE(p1);
    const auto* at = p1->GetGeometryRef()->toPoint();
    EXPECT_NEAR(at->getX(), 0.008983152841195214, 1e-12);
    EXPECT_NEAR(at->getY(), 0.01796630538796444, 1e-12);
}

TEST(JobCrs, OnlyEpsgCodesThatGdalKnows) {
    EXPECT_TRUE(WhyUnknownCrs("EPSG:27700").empty());
    EXPECT_FALSE(WhyUnknownCrs("EPSG:999999").empty());
}

}  // namespace
}  // namespace nedit::test
