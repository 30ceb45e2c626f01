#include <dxflib/dl_creationadapter.h>
#include <dxflib/dl_dxf.h>
#include <gtest/gtest.h>

#include <set>

#include "ExportFixture.h"
#include "exports/DxfExport.h"

namespace nedit::test {
namespace {

// What dxflib reads back from a drawing.
struct DrawingRead : DL_CreationAdapter {
    void addLayer(const DL_LayerData& data) override { layers.insert(data.name); }
    void addPoint(const DL_PointData& data) override {
        points.push_back(data);
        entity_layers.insert(attributes.getLayer());
    }
    void addLine(const DL_LineData& data) override { lines.push_back(data); }
    void addArc(const DL_ArcData& data) override { arcs.push_back(data); }
    void addCircle(const DL_CircleData& data) override { circles.push_back(data); }
    void addPolyline(const DL_PolylineData& data) override { polylines.push_back(data); }
    void addVertex(const DL_VertexData& data) override { vertices.push_back(data); }
    void addText(const DL_TextData& data) override { texts.push_back(data.text); }

    std::set<std::string> layers;
    std::set<std::string> entity_layers;
    std::vector<DL_PointData> points;
    std::vector<DL_LineData> lines;
    std::vector<DL_ArcData> arcs;
    std::vector<DL_CircleData> circles;
    std::vector<DL_PolylineData> polylines;
    std::vector<DL_VertexData> vertices;
    std::vector<std::string> texts;
};

TEST_F(ExportTest, DxfReadsBackWithItsEntitiesLayersAndBulges) {
    std::vector<std::string> messages;
    dir.Write("site.dxf", DxfText(Contents(), messages));
    DrawingRead read;
    DL_Dxf dxf;
    ASSERT_TRUE(dxf.in(dir.File("site.dxf"), &read));

    EXPECT_EQ(read.layers, (std::set<std::string>{"0", "BOUNDARY", "TOPO"}));
    EXPECT_EQ(read.entity_layers, (std::set<std::string>{"BOUNDARY", "TOPO"}));
    ASSERT_EQ(read.points.size(), 4u);
    EXPECT_DOUBLE_EQ(read.points[3].x, 1000.0);
    EXPECT_DOUBLE_EQ(read.points[3].y, 2010.0);
    EXPECT_DOUBLE_EQ(read.points[3].z, 52.0);
    EXPECT_EQ(read.texts,
              (std::vector<std::string>{"P1", "FC01", "P2", "FC02", "P3", "P4", "TREE"}));

    ASSERT_EQ(read.lines.size(), 1u);
    EXPECT_DOUBLE_EQ(read.lines[0].x2, 1010.0);
    EXPECT_DOUBLE_EQ(read.lines[0].z2, 51.0);

    // Clockwise from North to East about P1 is anticlockwise from 0 to 90 degrees.
    ASSERT_EQ(read.arcs.size(), 1u);
    EXPECT_NEAR(read.arcs[0].cx, 1000.0, 1e-9);
    EXPECT_NEAR(read.arcs[0].cy, 2000.0, 1e-9);
    EXPECT_NEAR(read.arcs[0].radius, 10.0, 1e-9);
    EXPECT_NEAR(read.arcs[0].angle1, 0.0, 1e-9);
    EXPECT_NEAR(read.arcs[0].angle2, 90.0, 1e-9);

    ASSERT_EQ(read.circles.size(), 1u);
    EXPECT_DOUBLE_EQ(read.circles[0].radius, 2.5);

    // The closed KERB: three vertices, the job's anticlockwise bulge -1 is DXF's +1.
    ASSERT_EQ(read.polylines.size(), 1u);
    EXPECT_EQ(read.polylines[0].flags & 1, 1);
    ASSERT_EQ(read.vertices.size(), 3u);
    EXPECT_DOUBLE_EQ(read.vertices[1].x, 1010.0);
    EXPECT_DOUBLE_EQ(read.vertices[1].y, 2000.0);
    EXPECT_DOUBLE_EQ(read.vertices[1].bulge, 1.0);
    EXPECT_DOUBLE_EQ(read.vertices[0].bulge + read.vertices[2].bulge, 0.0);

    EXPECT_EQ(messages, (std::vector<std::string>{
                            "1 point without a height: at elevation 0 in the drawing",
                            "1 polyline with vertices of different heights: at elevation 0 (a "
                            "lightweight polyline has one elevation)"}));
}

TEST_F(ExportTest, DxfEscapesLettersBeyondAsciiAndMendsLayerNames) {
    job->Database().Execute(
        "INSERT INTO layer (name) VALUES ('A/B'); UPDATE point SET name = 'Ö1', layer_id = 4 "
        "WHERE name = 'P4'");
    std::vector<std::string> messages;
    const std::string text = DxfText(Contents({"A/B"}), messages);
    EXPECT_NE(text.find("\\U+00D61"), std::string::npos);
    EXPECT_NE(text.find("\nA_B\n"), std::string::npos);
    EXPECT_EQ(text.find("A/B"), std::string::npos);
}

}  // namespace
}  // namespace nedit::test
