#include <gtest/gtest.h>

#include <stdexcept>

#include "ExportFixture.h"
#include "exports/CsvPointsExport.h"

namespace nedit::test {
namespace {

TEST_F(ExportTest, ContentsAreReadWithTheirLayersArcsAndClosedPolylines) {
    const JobContents all = Contents();
    EXPECT_EQ(all.layers, (std::vector<std::string>{"BOUNDARY", "TOPO"}));
    ASSERT_EQ(all.points.size(), 4u);
    EXPECT_FALSE(all.points[2].point.at.HasHeight());
    ASSERT_EQ(all.arcs.size(), 1u);
    EXPECT_NEAR(all.arcs[0].centre.x, 1000.0, 1e-9);
    EXPECT_NEAR(all.arcs[0].centre.y, 2000.0, 1e-9);
    EXPECT_NEAR(all.arcs[0].radius, 10.0, 1e-9);
    EXPECT_NEAR(all.arcs[0].bulge, 0.41421356237309503, 1e-12);  // clockwise quarter
    ASSERT_EQ(all.polylines.size(), 1u);
    EXPECT_TRUE(all.polylines[0].closed);
    EXPECT_EQ(all.polylines[0].vertices.size(), 4u);

    const JobContents topo = Contents({"TOPO"});
    EXPECT_EQ(topo.layers, std::vector<std::string>{"TOPO"});
    ASSERT_EQ(topo.points.size(), 1u);
    EXPECT_EQ(topo.points[0].point.name, "P4");
    EXPECT_TRUE(topo.lines.empty());
    EXPECT_TRUE(topo.arcs.empty());
    EXPECT_EQ(topo.circles.size(), 1u);
    // The polyline goes out whole, though P1 and P2 lie on another layer.
    ASSERT_EQ(topo.polylines.size(), 1u);
    EXPECT_EQ(topo.polylines[0].vertices[1].first.name, "P2");

    EXPECT_THROW(Contents({"TOPO", "NOPE"}), std::invalid_argument);
}

TEST_F(ExportTest, CsvHasAHeaderAndAColumnPerAttribute) {
    EXPECT_EQ(PointsCsvText(Contents()),
              "name,east,north,height,code,layer,note,Owner\n"
              "P1,1000,2000,50,FC01,BOUNDARY,iron pin,\"Smith, J\"\n"
              "P2,1010,2000,51,FC02,BOUNDARY,,\n"
              "P3,1010,2010,,,BOUNDARY,,\n"
              "P4,1000,2010,52,TREE,TOPO,,\n");
    EXPECT_EQ(PointsCsvText(Contents({"EMPTY"})), "name,east,north,height,code,layer,note\n");
}

}  // namespace
}  // namespace nedit::test
