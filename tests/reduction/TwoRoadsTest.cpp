// Two roads to one answer: one survey, recorded once in ddd.mmss and once in gons (each file
// converted from the same observations by tests/data/convert_angles.py), reduces to the same
// coordinates, and both to the coordinates it was observed from.

#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <sstream>
#include <string>

#include "../records/RowList.h"
#include "../support/HeadlessDialogHost.h"
#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

struct Coordinates {
    double e, n, h;
};

// The points of a full reduction of `file`, by name.
std::map<std::wstring, Coordinates> Reduce(const std::string& file) {
    UJobSettings settings;
    UNeutralFileFormat format(&settings);
    EXPECT_TRUE(format.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR));
    nedit::test::RowList rows(&format);
    nedit::HeadlessDialogHost host;
    UNeditDatabase engine(&format, &rows, nullptr, &host);
    const std::string path = SXNEDIT_TEST_DATA "/" + file;
    EXPECT_EQ(engine.LoadNeFile(std::wstring(path.begin(), path.end())), 1);
    EXPECT_EQ(engine.Process(), 1);
    std::map<std::wstring, Coordinates> points;
    for (const UNeditPt& point : engine.GetPointList())
        points[point.GetID()] = {point.x, point.y, point.z};
    return points;
}

// The coordinates the observations were computed from.
std::map<std::wstring, Coordinates> Truth() {
    std::map<std::wstring, Coordinates> points;
    std::ifstream in(SXNEDIT_TEST_DATA "/closed_traverse_truth.csv");
    for (std::string line; std::getline(in, line);) {
        std::istringstream fields(line);
        std::string name, e, n, h;
        std::getline(fields, name, ',');
        std::getline(fields, e, ',');
        std::getline(fields, n, ',');
        std::getline(fields, h, ',');
        points[std::wstring(name.begin(), name.end())] = {std::stod(e), std::stod(n), std::stod(h)};
    }
    return points;
}

}  // namespace

TEST(TwoRoads, OneSurveyInDmsAndInGonsGivesOneSetOfCoordinates) {
    const auto dms = Reduce("closed_traverse_dms.neu");
    const auto gons = Reduce("closed_traverse_gon.neu");
    const auto truth = Truth();
    ASSERT_EQ(truth.size(), 24u);  // six stations and eighteen side shots
    ASSERT_EQ(dms.size(), truth.size());
    ASSERT_EQ(gons.size(), truth.size());
    for (const auto& [name, known] : truth) {
        const std::string label(name.begin(), name.end());
        ASSERT_EQ(dms.count(name), 1u) << label;
        ASSERT_EQ(gons.count(name), 1u) << label;
        const Coordinates& a = dms.at(name);
        const Coordinates& b = gons.at(name);
        // Angles to 1e-4" and 1e-8 gon move a point 130 m away by well under 0.01 mm.
        EXPECT_NEAR(a.e, b.e, 1e-5) << label;
        EXPECT_NEAR(a.n, b.n, 1e-5) << label;
        EXPECT_NEAR(a.h, b.h, 1e-5) << label;
        // The truth is written to 1e-5 m, the distances were too.
        EXPECT_NEAR(a.e, known.e, 1e-4) << label;
        EXPECT_NEAR(a.n, known.n, 1e-4) << label;
        EXPECT_NEAR(a.h, known.h, 1e-4) << label;
    }
}
