#pragma once
// An engine that has reduced a fixture of tests/data, with its routes found and a report, and
// the stage figures of the traverse computations run on it.

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

#include "../reduction/ReductionFixture.h"
#include "report/UNeditReport.h"
#include "traverse/CTraverse.h"
#include "traverse/TraverseRoutes.h"

class TraverseFixture : public ReductionFixture {
  protected:
    /// Loads and reduces the fixture; the run finds the routes.
    void Load(const std::string& fixture) {
        engine.AddStage(&routes);
        engine.SetReportPtr(&report);
        const std::string path = SXNEDIT_TEST_DATA "/" + fixture;
        ASSERT_EQ(engine.LoadNeFile(std::wstring(path.begin(), path.end())), 1);
        ASSERT_EQ(engine.Process(), 1);
    }

    /// Keeps the route's positions and the dialog's figures of every stage of `traverse`.
    void Watch(CTraverse& traverse) {
        traverse.SetStageObserver([this, &traverse](int stage) {
            positions[stage] = traverse.GetRoute();
            figures[stage] = traverse.GetReport();
        });
    }

    /// Presses the buttons of the misclose dialog as a user would, then OK.
    void PressOnMisclose(bool angles, bool elevations) {
        host.SetFace<UMisReportDlg>([angles, elevations](UMisReportDlg& dialog) {
            dialog.OnAdjustElevations(elevations);
            if (angles) dialog.OnAngleAdjust();
            dialog.OnCoordinateAdjust();
            return nedit::mb::IdOk;
        });
    }

    void ExpectAt(const std::vector<CTravStn>& route, std::size_t i, double e, double n, double h,
                  double tolerance = 2e-6) {
        ASSERT_LT(i, route.size());
        EXPECT_NEAR(route[i].X, e, tolerance) << "East of entry " << i;
        EXPECT_NEAR(route[i].Y, n, tolerance) << "North of entry " << i;
        EXPECT_NEAR(route[i].Z, h, tolerance) << "Height of entry " << i;
    }

    bool ReportHas(const std::wstring& text) const {
        return report.GetText().find(text) != std::wstring::npos;
    }

    nedit::TraverseRoutes routes{format};
    UNeditReport report{nullptr, L"Raw Data Reduction Report"};
    std::map<int, std::vector<CTravStn>> positions;
    std::map<int, MiscloseFigures> figures;
};
