// The job as a source of coordinates for the reduction.

#include <gtest/gtest.h>

#include "../support/TestSupport.h"
#include "ReductionFixture.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UCoordEntryDlg.h"

namespace {

class JobSource : public ReductionFixture {
  protected:
    void SetUp() override {
        ReductionFixture::SetUp();
        job = USurveyDoc::CreateJob(dir.File("site.job"), nullptr);
        UDBPoint point(job.get());
        point.SetName(L"CP1");
        point.SetEast(700.0);
        point.SetNorth(800.0);
        point.SetHeight(12.5);
        point.SetCode(L"CONTROL");
        ASSERT_TRUE(point.Save());
    }

    nedit::test::TempDir dir;
    std::unique_ptr<USurveyDoc> job;
};

}  // namespace

TEST_F(JobSource, TheJobsPointIsOfferedFirstAndRememberedOnceTaken) {
    int shown = 0;
    host.SetFace<UCoordEntryDlg>([&](UCoordEntryDlg& dialog) {
        ++shown;
        // The job and the field record both know CP1: the job's source is selected, and the
        // other row shows the record's values.
        EXPECT_EQ(dialog.GetSelectedSource(), UCoordEntryDlg::Source::Database);
        EXPECT_DOUBLE_EQ(dialog.RowOf(UCoordEntryDlg::Source::Field).East, 1.0);
        EXPECT_EQ(dialog.GetDialogId(), UCoordEntryDlg::kEastFirstId);
        return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
    });
    UNeditDatabase on_job(&format, &list, job.get(), &host);
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=CP1,HI=1.5\nXYZ ID=CP1,E=1,N=2,H=3\nBKB ID=R,BRG=90,HA=0\n"
        L"SS ID=Q,HA=0,VA=90,SD=10,HT=1.5\n");
    ASSERT_EQ(on_job.Process(), 1);
    // Q lies 10 m East of the job's CP1.
    const UNeditPt* q = on_job.SearchPt(L"Q");
    ASSERT_NE(q, nullptr);
    EXPECT_NEAR(q->x, 710.0, 1e-9);
    EXPECT_NEAR(q->y, 800.0, 1e-9);
    EXPECT_NEAR(q->z, 12.5, 1e-9);
    // Taken from the job, the station is not copied into the run's points: the job has it.
    EXPECT_EQ(on_job.SearchPt(L"CP1"), nullptr);
    double e = 0, n = 0, z = 0;
    std::wstring code;
    ASSERT_EQ(on_job.findCoord(L"CP1", e, n, z, code, 1, true), 1);
    EXPECT_DOUBLE_EQ(e, 700.0);
    EXPECT_EQ(code, L"CONTROL");
    EXPECT_EQ(shown, 1);
}
