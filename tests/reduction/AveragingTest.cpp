#include <gtest/gtest.h>

#include "reduction/UNeditDatabase.h"

namespace {

MEASSTRUCT Reading(double h, double v, double d = 10.0, double ht = 1.0) {
    MEASSTRUCT measurement;
    measurement.HAng = h;
    measurement.VAng = v;
    measurement.SDist = d;
    measurement.HtTarget = ht;
    return measurement;
}

struct Means {
    double h = 0, v = 0, d = 0, ht = 0;
};

Means Average(const MeasurementList& list) {
    UNeditDatabase engine(nullptr, nullptr, nullptr, nullptr);
    Means means;
    engine.FindAverageMeas(list, means.h, means.v, means.d, means.ht);
    return means;
}

}  // namespace

TEST(Averaging, FacesFoldToFaceOneAndMeansWrapAtNorth) {
    Means m = Average({Reading(10, 90), Reading(190, 270)});
    EXPECT_DOUBLE_EQ(m.h, 10.0);
    EXPECT_DOUBLE_EQ(m.v, 90.0);
    // Face 2 at 181 folds to 1; with 359 the mean is 0.
    EXPECT_NEAR(Average({Reading(359, 90), Reading(181, 270)}).h, 0.0, 1e-12);
    EXPECT_NEAR(Average({Reading(350, 90), Reading(10, 90)}).h, 0.0, 1e-12);
    EXPECT_DOUBLE_EQ(Average({Reading(359, 90), Reading(0, 90)}).h, 359.5);
    EXPECT_DOUBLE_EQ(Average({Reading(359, 90), Reading(2, 90)}).h, 0.5);
    EXPECT_NEAR(Average({Reading(359, 90), Reading(2, 90), Reading(1, 90)}).h, 2.0 / 3.0, 1e-12);
    // Zenith 180 is face 1 and stays.
    EXPECT_DOUBLE_EQ(Average({Reading(20, 180)}).v, 180.0);
    // Distances and heights are plain means; one measurement is taken as it is.
    m = Average({Reading(0, 90, 100.0, 1.5), Reading(180, 270, 100.004, 1.7)});
    EXPECT_DOUBLE_EQ(m.d, 100.002);
    EXPECT_DOUBLE_EQ(m.ht, 1.6);
    EXPECT_DOUBLE_EQ(Average({Reading(0, 90, 33.3, 1.2)}).d, 33.3);
    double unused = 0;
    UNeditDatabase engine(nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(engine.FindAverageMeas({}, unused, unused, unused, unused), 0);
}

TEST(Averaging, AngleHelpers) {
    EXPECT_EQ(UNeditDatabase::CheckFace(180.0), 1);
    EXPECT_EQ(UNeditDatabase::CheckFace(180.0001), 2);
    EXPECT_EQ(UNeditDatabase::CheckFace(360.0), 1);
    EXPECT_DOUBLE_EQ(UNeditDatabase::chgface(200.0), 20.0);
    EXPECT_DOUBLE_EQ(UNeditDatabase::chgface(-190.0), 350.0);
    EXPECT_DOUBLE_EQ(UNeditDatabase::chgVaface(275.0), 85.0);
    EXPECT_DOUBLE_EQ(UNeditDatabase::AngleDiff(10, 5), 355.0);
    EXPECT_DOUBLE_EQ(UNeditDatabase::AngleDiff(5, 10), 5.0);
    EXPECT_DOUBLE_EQ(UNeditDatabase::AngleDiff(7, 7), 0.0);
    // 123°45'30" = 123.758333°; carries happen at 100, not 60.
    EXPECT_NEAR(UNeditDatabase::chgDeg(123.4530), 123.7583333, 1e-7);
    EXPECT_NEAR(UNeditDatabase::chgDeg(-10.3000), -10.5, 1e-12);
    EXPECT_NEAR(UNeditDatabase::chgDeg(10.0075), 10.0 + 75.0 / 3600, 1e-9);  // 75 seconds stand
    EXPECT_NEAR(UNeditDatabase::chgDeg(10.99995), 11.0, 1e-9);  // 99'100" carries twice
}
