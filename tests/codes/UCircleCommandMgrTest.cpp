#include <gtest/gtest.h>

#include <map>

#include "codes/UCircleCommandMgr.h"

namespace {

class CircleCommands : public ::testing::Test {
  protected:
    /// Offers the point; gives whether it completed a circle.
    bool Offer(int id, double e, double n, const std::wstring& code) {
        points[id] = UNeditPt(std::to_wstring(id), e, n, 0.0, code, 0);
        return manager.Offer(
            id, code, ctrl,
            [this](int at) -> const UNeditPt* {
                const auto found = points.find(at);
                return found == points.end() ? nullptr : &found->second;
            },
            made, notice);
    }

    USvyCodeCtrl ctrl;
    UCircleCommandMgr manager;
    UCircleCommandMgr::Made made;
    std::wstring notice;
    std::map<int, UNeditPt> points;
};

TEST_F(CircleCommands, ATreeByCentreAndRimPointLetsOtherFeaturesPass) {
    // Centre (5, 5), rim (8, 9): radius 5 by the 3-4-5 triangle.
    EXPECT_FALSE(Offer(1, 5, 5, L"TR01*CR"));
    EXPECT_FALSE(Offer(2, 100, 100, L"KB01"));  // passes by
    ASSERT_TRUE(Offer(3, 8, 9, L"TR01"));
    EXPECT_DOUBLE_EQ(made.Circle.GetCentre().x, 5.0);
    EXPECT_DOUBLE_EQ(made.Circle.GetCentre().y, 5.0);
    EXPECT_DOUBLE_EQ(made.Circle.GetRadius(), 5.0);
    EXPECT_EQ(made.Circle.GetCode(), L"TR");
    EXPECT_EQ(made.Points, (std::vector<int>{3, 1}));
    EXPECT_FALSE(manager.RadiusActive);
}

TEST_F(CircleCommands, AManholeThroughThreePoints) {
    // (0, 0), (10, 0), (5, 5): centre (5, 0), radius 5.
    EXPECT_FALSE(Offer(1, 0, 0, L"MH01*CC"));
    EXPECT_FALSE(Offer(2, 10, 0, L"MH01"));
    ASSERT_TRUE(Offer(3, 5, 5, L"MH01"));
    EXPECT_NEAR(made.Circle.GetCentre().x, 5.0, 1e-9);
    EXPECT_NEAR(made.Circle.GetCentre().y, 0.0, 1e-9);
    EXPECT_NEAR(made.Circle.GetRadius(), 5.0, 1e-9);
}

TEST_F(CircleCommands, CirclesThatCannotBeMadeResetAndSaySo) {
    EXPECT_FALSE(Offer(1, 0, 0, L"MH02*CC"));
    EXPECT_FALSE(Offer(2, 1, 1, L"MH02"));
    EXPECT_FALSE(Offer(3, 2, 2, L"MH02"));  // on one line
    EXPECT_FALSE(notice.empty());
    EXPECT_FALSE(manager.CircumActive);
    EXPECT_FALSE(Offer(4, 5, 5, L"TR02*CR"));
    EXPECT_FALSE(Offer(5, 5, 5, L"TR02"));  // rim on the centre
    EXPECT_FALSE(notice.empty());
    EXPECT_FALSE(manager.RadiusActive);
    // A command behind the slash is no command.
    EXPECT_FALSE(Offer(6, 0, 0, L"TR03/CR"));
    EXPECT_FALSE(manager.RadiusActive);
}

}  // namespace
