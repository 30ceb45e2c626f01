// What saving keeps of a traverse: the rows after the pane's Save, stored in the job.

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"
#include "traverse/CTraverse.h"
#include "traverse/USelRouteDlg.h"

namespace {

std::string LoopSurvey() {
    std::ifstream in(SXNEDIT_TEST_DATA "/traverse_loop.neu");
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
}

}  // namespace

TEST(TraverseSave, RowsAfterSaveHoldThePointsBehindTheMarkerAndNothingOfTheAdjustment) {
    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    auto job = USurveyDoc::CreateJob(dir.File("site.job"), nullptr);
    auto container = std::make_unique<URawDataContainer>(job.get());
    ASSERT_EQ(container->Open(), 1);
    // Two points typed behind the marker as PT records, and a remark after them.
    dir.Write("loop.neu", LoopSurvey() +
                              "##########adjusted-points\nPT ID=K1,E=500,N=600,H=10\n"
                              "PT ID=K2,E=510.25,N=610.5,H=11\n# KEPT\n");
    const std::string path = dir.File("loop.neu");
    ASSERT_EQ(container->CreateNEditDocNamed(L"LOOP", std::wstring(path.begin(), path.end())), 1);
    UNeditDoc* doc = container->GetNeditDoc(L"LOOP");
    nedit::HeadlessDialogHost host;
    doc->SetDialogHost(&host);
    UListCtrl& list = doc->OpenList();
    ASSERT_EQ(doc->SetupDataBase(&list), 1);
    const std::vector<std::wstring> before = list.GetRows();

    USelRouteDlg dialog(doc->GetDatabase(), &doc->GetTraverseRoutes(), USelRouteDlg::kEastFirstId,
                        nullptr);
    host.SetFace<USelRouteDlg>([](USelRouteDlg& route) {
        route.OnSelectRoute(1);  // A,B,C,D,A,
        route.FixedX = route.StartX = 1000.0;
        route.FixedY = route.StartY = 2000.0;
        route.FixedZ = route.StartZ = 50.0;
        return route.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    host.SetFace<UMisReportDlg>([](UMisReportDlg& report) {
        report.OnCoordinateAdjust();
        return nedit::mb::IdOk;
    });
    ASSERT_EQ(host.Run(dialog), nedit::mb::IdOk);
    ASSERT_EQ(dialog.GetResult(), CTraverse::kDone);
    EXPECT_NEAR(doc->GetDatabase()->searchSTN(L"B")->East, 1080.527139, 2e-6);

    // The pane saves after a traverse.
    ASSERT_EQ(doc->Save(&list, 0), 1);
    std::vector<std::wstring> after = before;
    const std::size_t marker = after.size() - 4;
    ASSERT_EQ(after[marker], L"##########ADJUSTED-POINTS");
    after[marker + 1] = L"XYZ       ID=K1,E=500.000,N=600.000,H=10.000";
    after[marker + 2] = L"XYZ       ID=K2,E=510.250,N=610.500,H=11.000";
    EXPECT_EQ(list.GetRows(), after);
    ASSERT_EQ(doc->SaveDocument(), 1);

    container.reset();
    job = USurveyDoc::OpenJob(dir.File("site.job"));
    container = std::make_unique<URawDataContainer>(job.get());
    ASSERT_EQ(container->Open(), 1);
    EXPECT_EQ(container->GetNeditDoc(L"LOOP")->OpenList().GetRows(), after);
}
