#include <gtest/gtest.h>

#include "codes/ArcStore.h"

namespace {

const UNeditPt kNorth(L"N", 0, 10, 0, L"", 0);
const UNeditPt kEast(L"E", 10, 0, 0, L"", 0);
const UNeditPt kCentre(L"O", 0, 0, 0, L"", 0);
// On the circle of radius 10 about O, half way from N to E: (10 sin 45, 10 cos 45).
const UNeditPt kBetween(L"M", 7.0710678118654755, 7.0710678118654755, 0, L"", 0);

}  // namespace

TEST(ArcStore, ArcsAboutACentreTakeTheirSense) {
    nedit::ArcStore store;
    // From North round to East is a clockwise turn; the way back is anticlockwise.
    EXPECT_EQ(store.Save(kNorth, kEast, kCentre, 0), 0);
    EXPECT_EQ(store.Items()[0].GetArcType(), 0u);
    EXPECT_EQ(store.Save(kEast, kNorth, kCentre, 0), 0);  // the same ends and centre: replaced
    EXPECT_EQ(store.Items()[0].GetArcType(), UWArc::kAnticlockwise);
    // Found by the type stored, in either order of its ends.
    EXPECT_EQ(store.Find(L"N", L"E", L"O", UWArc::kAnticlockwise), 0);
    EXPECT_EQ(store.Find(L"N", L"E", L"O", 0), -1);
}

TEST(ArcStore, AThreePointArcKeepsItsType) {
    nedit::ArcStore store;
    EXPECT_EQ(store.Save(kEast, kNorth, kBetween, UWArc::kThirdOnArc), 0);
    EXPECT_EQ(store.Items()[0].GetArcType(), UWArc::kThirdOnArc);
    EXPECT_EQ(store.Save(kNorth, kEast, kCentre, 0), 1);
    EXPECT_EQ(store.Items().size(), 2u);
    store.Clear();
    EXPECT_TRUE(store.Items().empty());
}
