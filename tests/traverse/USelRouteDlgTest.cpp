// The route dialog without a screen: its defaults from the reduced data, its check of a route
// and two names, and the steps of "Compute".

#include <gtest/gtest.h>

#include "TraverseFixture.h"
#include "traverse/USelRouteDlg.h"

class RouteDialog : public TraverseFixture {
  protected:
    void Open(const std::string& fixture) {
        Load(fixture);
        dialog.OnInitDialog();
    }

    /// DoCheck's verdict: the names it gives, or the message it shows.
    std::wstring Check() {
        const std::size_t shown = host.Messages().size();
        std::wstring out;
        const bool good = dialog.DoCheck(out);
        EXPECT_EQ(good, host.Messages().size() == shown);
        return good ? out : host.Messages().back().text;
    }

    USelRouteDlg dialog{&engine, &routes, USelRouteDlg::kEastFirstId, nullptr};
};

TEST_F(RouteDialog, OpensOnTheFirstRouteClosingOnItsStart) {
    Open("traverse_loop.neu");
    ASSERT_EQ(dialog.GetRouteRows().size(), 2u);
    EXPECT_EQ(dialog.GetRouteRows()[0].Text, L"A,B,C,D,");
    EXPECT_EQ(dialog.GetRouteRows()[1].Text, L"A,B,C,D,A,");
    EXPECT_EQ(dialog.GetSelectedRow(), 0);
    EXPECT_EQ(dialog.Start, L"A");
    EXPECT_EQ(dialog.EndStn, L"D");
    EXPECT_EQ(dialog.GetStartNames(), (std::vector<std::wstring>{L"A", L"B", L"C", L"D"}));
    // Start and fixed point are A where the run left it: as re-observed from D.
    EXPECT_EQ(dialog.FixedPt, L"A");
    EXPECT_NEAR(dialog.StartX, 999.987235, 2e-6);
    EXPECT_NEAR(dialog.FixedY, 2000.030275, 2e-6);
    EXPECT_NEAR(dialog.FixedZ, 49.990218, 2e-6);
    // Oriented on the back sight D's reduced coordinates.
    EXPECT_EQ(dialog.BSName, L"D");
    EXPECT_EQ(dialog.UseBSCoord, 1);
    EXPECT_EQ(dialog.UseBSBearing, 0);
    EXPECT_NEAR(dialog.BSX, 1070.091090, 2e-6);
    EXPECT_NEAR(dialog.StartBearing, 138.633135, 2e-6);
    EXPECT_TRUE(dialog.IsEnabled(USelRouteDlg::kBSXField));
    EXPECT_FALSE(dialog.IsEnabled(USelRouteDlg::kStartBearingField));
    EXPECT_TRUE(dialog.IsEnabled(USelRouteDlg::kComputeButton));
    EXPECT_TRUE(dialog.IsEnabled(USelRouteDlg::kAdjustAngleBox));
    EXPECT_FALSE(dialog.IsEnabled(USelRouteDlg::kCheckCombo));
    EXPECT_EQ(dialog.GetCheckNames(), std::vector<std::wstring>{L"A"});

    dialog.OnFixedPtChanged(L"");
    EXPECT_FALSE(dialog.IsEnabled(USelRouteDlg::kComputeButton));
    dialog.OnOrientationClicked(false);
    EXPECT_TRUE(dialog.IsEnabled(USelRouteDlg::kStartBearingField));
}

TEST_F(RouteDialog, ChecksTheRouteAndTheTwoNames) {
    Open("traverse_loop.neu");
    EXPECT_EQ(Check(), L"A,B,C,D,");

    dialog.OnStartChanged(L"B");
    dialog.OnEndChosen(L"C");
    EXPECT_EQ(Check(), L"B,C,");  // a stretch of the route, which stays whole
    EXPECT_EQ(routes.GetTraverseList()[0]->size(), 4u);

    dialog.OnStartChanged(L"C");
    dialog.OnEndChosen(L"B");
    EXPECT_EQ(Check(), L"Incorrect sequence of start and end station.");

    dialog.Start = L"Q";
    EXPECT_EQ(Check(), L"Start station is not on the selected traverse route.");
    dialog.Start.clear();
    EXPECT_EQ(Check(), L"Start station unspecified.");
    dialog.Start = L"A";
    dialog.EndStn.clear();
    EXPECT_EQ(Check(), L"End station unspecified.");

    // A loop closes on its start only when the end is typed: chosen, it is no point yet.
    dialog.OnEndChosen(L"A");
    EXPECT_EQ(Check(), L"End point is not in the neutral database.");
    dialog.OnEndTyped(L" a ");
    EXPECT_EQ(Check(), L"A,B,C,D,A,");
    EXPECT_EQ(dialog.GetSelectedRow(), 1);  // the route found already is taken
    EXPECT_EQ(routes.GetTraverseList().size(), 2u);

    dialog.OnEndTyped(L"S1");  // observed from B, not from the route's last station
    EXPECT_EQ(Check(), L"Point S1 is not observed from station D.");

    dialog.OnEndTyped(L"D");
    dialog.OnAdjustAngleClicked(true);
    EXPECT_TRUE(dialog.IsEnabled(USelRouteDlg::kCheckCombo));
    dialog.ChkPt.clear();
    EXPECT_EQ(Check(), L"Invalid angle-checking point !");
    dialog.ChkPt = L"ZZ";
    EXPECT_EQ(Check(), L"Invalid angle-checking point !");
    dialog.ChkPt = L"a";
    EXPECT_EQ(Check(), L"A,B,C,D,");
}

TEST_F(RouteDialog, CarriesARouteOnToAPointObservedFromItsEnd) {
    Open("traverse_link.neu");
    ASSERT_EQ(dialog.GetRouteRows().size(), 1u);
    EXPECT_EQ(dialog.GetRouteRows()[0].Text, L"A,B,C,E,");
    EXPECT_EQ(dialog.BSName, L"R");
    EXPECT_EQ(dialog.UseBSCoord, 0);  // R has no coordinates: the set-up's back bearing
    EXPECT_DOUBLE_EQ(dialog.StartBearing, 315.0);
    dialog.OnEndTyped(L"F");
    // F is no set-up: no angle check at it.
    EXPECT_EQ(dialog.AdjustAngle, 0);
    EXPECT_FALSE(dialog.IsEnabled(USelRouteDlg::kAdjustAngleBox));
    EXPECT_EQ(Check(), L"A,B,C,E,F,");
    ASSERT_EQ(dialog.GetRouteRows().size(), 2u);
    EXPECT_EQ(dialog.GetRouteRows()[dialog.GetSelectedRow()].Text, L"A,B,C,E,F,");
    EXPECT_EQ(routes.GetTraverseList().size(), 2u);
    EXPECT_EQ(routes.GetTraverseList()[1]->back().Value, 18);  // the row of the shot to F
    EXPECT_EQ(Check(), L"A,B,C,E,F,");
    EXPECT_EQ(routes.GetTraverseList().size(), 2u);
}

TEST_F(RouteDialog, ComputeClosesTheDialogOnlyWhenTheTraverseIsAdjusted) {
    Open("traverse_link.neu");
    dialog.OnFixedPtChanged(L"E");
    dialog.FixedX = 1300.0;
    dialog.FixedY = 2080.0;
    dialog.FixedZ = 52.0;
    dialog.OnCoordinatesChanged();
    dialog.OnAdjustAngleClicked(true);
    dialog.OnCheckPtChosen(L"F");
    EXPECT_EQ(dialog.ChkPt, L"F");
    dialog.CloseX = 1380.0;
    dialog.CloseY = 2150.0;
    dialog.OnCloseModeClicked(true);
    dialog.OnCoordinatesChanged();
    EXPECT_NEAR(dialog.CloseBearing, 48.81407483, 1e-8);

    bool cancel_blocked = false;
    host.SetFace<UMisReportDlg>([&](UMisReportDlg&) {
        cancel_blocked = !dialog.CanCancel();
        return nedit::mb::IdOk;
    });
    host.QueueAnswer(nedit::mb::IdNo);  // "Adjust Traverse ?"
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_TRUE(cancel_blocked);
    EXPECT_TRUE(dialog.CanCancel());
    EXPECT_EQ(dialog.GetResult(), CTraverse::kGivenUp);
    EXPECT_NEAR(engine.searchSTN(L"C")->East, 1210.001118, 2e-6);  // nothing written

    EXPECT_TRUE(dialog.OnOK());
    EXPECT_EQ(dialog.GetResult(), CTraverse::kDone);
    // The angles were balanced before the Compass rule, as "OK" completes what is missing.
    EXPECT_NEAR(engine.searchSTN(L"C")->East, 1209.995597, 2e-6);
    EXPECT_NEAR(engine.searchSTN(L"C")->North, 2009.997085, 2e-6);
}

TEST_F(RouteDialog, RefusalsLeaveTheDialogOpen) {
    Open("traverse_routes.neu");
    // The route through B's second set-up, which sights back to C.
    const auto& rows = dialog.GetRouteRows();
    const auto through_e = std::find_if(rows.begin(), rows.end(),
                                        [](const auto& row) { return row.Text == L"A,B,E,F,"; });
    ASSERT_NE(through_e, rows.end());
    dialog.OnSelectRoute(static_cast<int>(through_e - rows.begin()));
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(host.Messages().back().text,
              L"Backsight point C from Occupied point B is not the previous traverse point.\n");
    EXPECT_EQ(dialog.GetResult(), 0);
}
