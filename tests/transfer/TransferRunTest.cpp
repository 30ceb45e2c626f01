// The run as a whole: locked layers, lines and arcs that stand alone, circles that codes ask
// for, an abort half-way, and a job that another program holds.

#include <sqlite3.h>

#include "TransferFixture.h"
#include "platform/job/JobDatabase.h"
#include "platform/job/UDBArc.h"
#include "platform/job/UDBCircle.h"
#include "platform/job/UDBLayer.h"
#include "platform/job/UDBLine.h"
#include "platform/text/WideText.h"
#include "transfer/LockedLayersQuestion.h"
#include "transfer/StringTransferSettings.h"

using namespace nedit;
using namespace nedit::test;

namespace {

class TransferRunTest : public TransferTest {
  protected:
    void LockLayer(const std::wstring& name) {
        UDBLayer layer(job.get(), name);
        layer.SetLocked(true);
        ASSERT_TRUE(layer.Save());
    }
};

// A code grammar for the tests: tokens parted by '*', the first a feature code with its string
// number as trailing digits, the others commands.
class StarCodes : public PointCodeReader {
  public:
    std::vector<CodeGroup> Parse(const std::wstring& code) const override {
        CodeGroup group;
        std::size_t star = code.find(L'*');
        std::wstring feature = code.substr(0, star);
        std::size_t digits = feature.find_first_of(L"0123456789");
        group.Code = feature.substr(0, digits);
        if (digits != std::wstring::npos) group.StrNo = feature.substr(digits);
        if (star != std::wstring::npos) group.Commands = code.substr(star);
        return {group};
    }
    bool HasCommand(const CodeGroup& group, const std::wstring& keyword) const override {
        return group.Commands.find(L"*" + keyword) != std::wstring::npos;
    }
};

// Aborts when the run reports `at` percent or more.
class AbortingProgress : public ProgressSink {
  public:
    explicit AbortingProgress(int at) : At(at) {}
    void Update(int percent, const std::wstring&) override {
        if (percent >= At) RequestAbort();
    }

  private:
    int At;
};

}  // namespace

// Layers named by the points' feature codes that are locked are asked about in one question;
// OK unlocks them and the points are written, Cancel writes nothing.
TEST_F(TransferRunTest, LockedLayersAreAskedAboutOnce) {
    LockLayer(L"TREE");
    LockLayer(L"FN");
    LockLayer(L"VEG");  // the layer of code TREE; no feature code names it
    Point(L"T1", 1, 1, 1.0, L"TREE");
    Point(L"F1", 2, 2, 1.0, L"FN");
    Point(L"F2", 3, 3, 1.0, L"FN");
    host.SetFace<LockedLayersQuestion>([](LockedLayersQuestion& question) {
        EXPECT_EQ(question.GetMessage(),
                  L"<TREE><FN>\n\" are Locked !!!\n These layers needs to be Unlocked to "
                  L"transfer to Job.\n Unlocked these layers ?\";\n");
        return static_cast<int>(mb::IdCancel);
    });
    EXPECT_EQ(Transfer(), 0);
    EXPECT_EQ(report.End, TransferEnd::Declined);
    EXPECT_EQ(Count("point"), 0);
    EXPECT_TRUE(job->IsLayerLocked(job->GetLayerId(L"TREE")));

    // OK unlocks both; the point of code TREE then meets its own layer VEG locked, which no
    // question named: the run stops there and says why.
    host.SetFace<LockedLayersQuestion>(
        [](LockedLayersQuestion&) { return static_cast<int>(mb::IdOk); });
    EXPECT_EQ(Transfer(), 0);
    EXPECT_FALSE(job->IsLayerLocked(job->GetLayerId(L"TREE")));
    EXPECT_FALSE(job->IsLayerLocked(job->GetLayerId(L"FN")));
    EXPECT_TRUE(Told(L"Point T1 could not be written to the job: the layer VEG is locked."));
    EXPECT_TRUE(Told(L"Data Transfer Error !"));

    UDBLayer veg(job.get(), L"VEG");
    veg.SetLocked(false);
    veg.Save();
    EXPECT_EQ(Transfer(), 1);
    EXPECT_EQ(Count("point"), 3);
}

// The question's names run five to a line after the first six, as they always have.
TEST(LockedLayersQuestion, NamesBreakBehindEveryFifthFromTheFirst) {
    const LockedLayersQuestion question({L"A", L"B", L"C", L"D", L"E", L"F", L"G"});
    EXPECT_EQ(question.GetMessage().substr(0, 24), L"<A><B><C><D><E><F>\n<G>\n\"");
}

// Lines and arcs that stand alone go into the job between its points, styled by their codes;
// a second run updates them in place.
TEST_F(TransferRunTest, LinesAndArcsStandAloneAndAreUpdatedInPlace) {
    Point(L"A", 0, 0);
    Point(L"B", 10, 0);
    Point(L"C", 5, 5);
    Line(L"A", L"B", L"FN");
    Line(L"B", L"C");  // a station line: no code, the default look
    Arc(L"A", L"B", L"C", UWArc::kThirdOnArc, L"FN");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(report.LinesAdded, 2);
    EXPECT_EQ(report.ArcsAdded, 1);
    const UDBLine fence(job.get(), Ids("line").at(0));
    EXPECT_EQ(fence.GetLayer(), job->GetLayerId(L"FENCE"));
    EXPECT_EQ(fence.GetColour(), 4);
    EXPECT_EQ(fence.GetStartPointId(), job->GetPointId(UPointNumber(L"A")));

    std::swap(lines[0], lines[1]);
    lines[1] = UNeditLine(Find(L"B"), Find(L"A"));  // the other way round: the same line
    lines[1].SetCode(L"TREE");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(report.LinesUpdated, 2);
    EXPECT_EQ(report.ArcsUpdated, 1);
    EXPECT_EQ(Count("line"), 2);
    EXPECT_EQ(Count("arc"), 1);
    const UDBLine again(job.get(), fence.GetId());
    EXPECT_EQ(again.GetLayer(), job->GetLayerId(L"VEG"));
    EXPECT_EQ(again.GetStartPointId(), fence.GetStartPointId());
}

// Circles that the codes ask for: by a centre and a point on it, and through three points,
// whose centre becomes the point "Center-1". The commands are read in the job's point codes,
// so without "Include Commands" there is no circle, and the report says so.
TEST_F(TransferRunTest, CirclesByRadiusAndThroughThreePoints) {
    StarCodes codes;
    reader = &codes;
    Point(L"T1", 100, 100, 1.0, L"TREE1*CR");
    Point(L"X", 50, 50, 1.0, L"FN");  // another feature passes by
    Point(L"T2", 103, 104, 1.0, L"TREE1");
    Point(L"M1", 0, 10, 1.0, L"FN2*CC");
    Point(L"M2", 10, 0, 1.0, L"FN2");
    Point(L"M3", 0, -10, 1.0, L"FN2");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(Count("circle"), 0);
    ASSERT_EQ(report.Left.size(), 2u);
    EXPECT_EQ(report.Left[0].Name, L"T1");
    EXPECT_EQ(report.Left[0].Reason,
              L"the circle command CR of its code is not in the job's "
              L"point code (\"Include Commands\" is off)");

    StringTransferSettings settings;
    settings.IncludeCommands = 1;
    SetStringTransferSettings(settings);
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(JobPointNamed(L"T1").GetCode(), L"TREE1*CR");
    EXPECT_EQ(report.Circles, 2);
    std::vector<UDBCircle> circles;
    for (const long id : Ids("circle")) circles.emplace_back(job.get(), id);
    ASSERT_EQ(circles.size(), 2u);
    EXPECT_EQ(circles[0].GetCentreId(), job->GetPointId(UPointNumber(L"T1")));
    EXPECT_DOUBLE_EQ(circles[0].GetRadius(), 5.0);  // a 3-4-5 triangle
    EXPECT_EQ(circles[0].GetLayer(), job->GetLayerId(L"VEG"));
    const UDBPoint centre = JobPointNamed(L"Center-1");
    EXPECT_EQ(circles[1].GetCentreId(), centre.GetId());
    EXPECT_NEAR(centre.GetX(), 0.0, 1e-9);
    EXPECT_NEAR(centre.GetY(), 0.0, 1e-9);
    EXPECT_NEAR(circles[1].GetRadius(), 10.0, 1e-9);
    EXPECT_EQ(centre.GetCode(), L"FN");
}

// A stop half-way, among the lines, keeps what was written before it (the 40 points) and
// writes nothing after it: the strings loop sees the stop and leaves, so no polyline.
TEST_F(TransferRunTest, AStopHalfWayKeepsWhatWasWrittenBeforeIt) {
    JobPoint(L"OLD", 1, 1);
    for (int i = 0; i < 40; ++i) Point(L"P" + std::to_wstring(i), i, 0, 1.0, L"KB01");
    for (int i = 1; i < 40; ++i)
        Line(L"P" + std::to_wstring(i - 1), L"P" + std::to_wstring(i), L"KB", L"KB01");
    AbortingProgress aborting(60);  // among the lines
    TransferRun run(job.get(), &host, &aborting, wholeCodes);
    EXPECT_EQ(run.TransferToJob({points, lines, arcs, nullptr, L"SITE"}), 1);
    EXPECT_EQ(run.GetReport().End, TransferEnd::Aborted);
    EXPECT_EQ(run.GetReport().PointsAdded, 40);
    EXPECT_EQ(Count("point"), 41);
    EXPECT_EQ(Count("polyline"), 0);
    EXPECT_EQ(job->Database().TransactionDepth(), 0);
    const auto transfers = ReadTransfers(job->Database());
    ASSERT_EQ(transfers.size(), 1u);
    EXPECT_FALSE(transfers[0].Complete);
    EXPECT_TRUE(
        Told(L"The transfer was stopped: what was written before the stop (40 points, "
             L"0 lines, 0 arcs, 0 circles, 0 polylines) is kept in the job, the rest was "
             L"not written."));
}

// A job that another program holds for longer than the busy time-out: nothing is written,
// and the user is told why.
TEST_F(TransferRunTest, JobHeldByAnotherProgramIsLeftAsItWas) {
    const std::string path = job->GetPathName();
    job.reset();
    JobOpenOptions options;
    options.busyTimeoutMs = 50;
    job = USurveyDoc::OpenJob(path, options);
    sqlite3* other = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &other), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(other, "BEGIN IMMEDIATE", nullptr, nullptr, nullptr), SQLITE_OK);
    Point(L"P1", 1, 1);
    EXPECT_EQ(Transfer(), 0);
    EXPECT_EQ(report.End, TransferEnd::Failed);
    EXPECT_FALSE(report.Kept);
    EXPECT_TRUE(Told(L"The transfer to the job was undone: "));
    sqlite3_exec(other, "ROLLBACK", nullptr, nullptr, nullptr);
    sqlite3_close(other);
    EXPECT_EQ(Count("point"), 0);
}
