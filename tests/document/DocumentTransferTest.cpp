// Save To Survey from a document: the stores of its last reduction go into its job, the
// points whose coordinates the run took from the job stay as the job has them.

#include <gtest/gtest.h>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/URawDataContainer.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"
#include "transfer/DuplicatePtsDlg.h"

namespace {

long Count(USurveyDoc& job, const char* table) {
    auto query = job.Database().Query(std::string("SELECT count(*) FROM ") + table);
    return query->Step() ? static_cast<long>(query->Int(0)) : -1;
}

}  // namespace

TEST(DocumentTransfer, ReducedSurveyGoesIntoTheJobAndJobCoordinatesStand) {
    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    auto job = USurveyDoc::CreateJob(dir.File("site.job"), nullptr);
    auto container = std::make_unique<URawDataContainer>(job.get());
    ASSERT_EQ(container->Open(), 1);
    const std::string path = SXNEDIT_TEST_DATA "/transfer_site.neu";
    ASSERT_EQ(container->CreateNEditDocNamed(L"SITE", std::wstring(path.begin(), path.end())), 1);
    UNeditDoc* doc = container->GetNeditDoc(L"SITE");
    nedit::HeadlessDialogHost host;
    doc->SetDialogHost(&host);
    EXPECT_EQ(doc->TransferToJob(), 0);  // no reduction yet: nothing to write
    UListCtrl& list = doc->OpenList();
    ASSERT_EQ(doc->SetupDataBase(&list), 1);
    ASSERT_EQ(doc->TransferToJob(), 1);
    EXPECT_EQ(Count(*job, "point"), 5);
    EXPECT_EQ(Count(*job, "line"), 1);
    // The SS to 0012 at 10 m on bearing 90 from A (1000, 2000): the job's point 12.
    const UDBPoint twelve(job.get(), job->GetPointId(UPointNumber(L"12")));
    EXPECT_DOUBLE_EQ(twelve.GetX(), 1010.0);
    EXPECT_DOUBLE_EQ(twelve.GetY(), 2000.0);

    // A moved in the job: the next reduction takes A from the job (the host answers as
    // "Apply to All" would), and the transfer leaves it there and says so.
    UDBPoint a(job.get(), job->GetPointId(UPointNumber(L"A")));
    a.SetEast(1000.25);
    ASSERT_TRUE(a.Save());
    ASSERT_EQ(doc->SetupDataBase(&list), 1);
    ASSERT_EQ(doc->GetDatabase()->GetDbCoordNames().count(L"A"), 1u);
    host.SetFace<DuplicatePtsDlg>([](DuplicatePtsDlg& dialog) {
        dialog.ApplyAll = true;
        return static_cast<int>(nedit::mb::IdOk);
    });
    ASSERT_EQ(doc->TransferToJob(), 1);
    EXPECT_DOUBLE_EQ(UDBPoint(job.get(), a.GetId()).GetX(), 1000.25);
    const nedit::TransferReport& report = doc->GetTransferReport();
    EXPECT_EQ(report.End, nedit::TransferEnd::Finished);
    bool named = false;
    for (const nedit::NotWritten& left : report.Left) named = named || left.Name == L"A";
    EXPECT_TRUE(named);
    // 12 moved with A: 10 m east of 1000.25.
    EXPECT_DOUBLE_EQ(UDBPoint(job.get(), twelve.GetId()).GetX(), 1010.25);
}
