// Stages of the rooms above the engine are called at their place in a run, and a run
// without them stands.

#include <vector>

#include "ReductionFixture.h"
#include "reduction/RunStage.h"
#include "reduction/UCoordEntryDlg.h"

namespace {

// Records the steps it is called at, with the number of points the run had reduced then.
class RecordingStage : public nedit::RunStage {
  public:
    struct Call {
        nedit::RunStep step;
        std::size_t points;
        bool operator==(const Call& other) const {
            return step == other.step && points == other.points;
        }
    };
    void Run(UNeditDatabase& engine, nedit::RunStep step) override {
        calls.push_back({step, engine.GetPointList().size()});
    }
    std::vector<Call> calls;
};

using RunStages = ReductionFixture;
using Call = RecordingStage::Call;
using nedit::RunStep;

const wchar_t* const kSurvey =
    L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=A,HI=1.5\nXYZ ID=A,E=0,N=0,H=0\n"
    L"BKB ID=B,BRG=0,HA=0\nSS ID=P,HA=90,VA=90,SD=10,HT=1.5\n";

}  // namespace

TEST_F(RunStages, AFullRunCallsRoutesThenAttachmentsAfterTheWalk) {
    RecordingStage first, second;
    engine.AddStage(&first);
    engine.AddStage(&second);
    Rows(kSurvey);
    ASSERT_EQ(engine.Process(), 1);
    // Both stages see the two reduced points, A and P; routes come before attachments.
    const std::vector<Call> expected = {{RunStep::Routes, 2}, {RunStep::Attachments, 2}};
    EXPECT_EQ(first.calls, expected);
    EXPECT_EQ(second.calls, expected);
}

TEST_F(RunStages, ReRunsCallOnlyTheRoutes) {
    RecordingStage stage;
    engine.AddStage(&stage);
    Rows(kSurvey);
    const std::vector<std::wstring> rows = list.GetRows();
    engine.Regenerate();
    engine.Generate(rows, false);
    engine.Generate(rows, true);
    const std::vector<Call> expected = {{RunStep::Routes, 2}, {RunStep::Routes, 2}};
    EXPECT_EQ(stage.calls, expected);
}

TEST_F(RunStages, AWalkThatFailsCallsNoStage) {
    RecordingStage stage;
    engine.AddStage(&stage);
    host.SetFace<UCoordEntryDlg>([](UCoordEntryDlg&) { return nedit::mb::IdCancel; });
    Rows(L"#VERSION-1.0 NEUTRAL FILE\nSTN ID=K\nSS ID=Q,HA=0,VA=90,SD=5,HT=0\n");
    EXPECT_EQ(engine.Process(), 0);
    EXPECT_TRUE(stage.calls.empty());
}

TEST_F(RunStages, ARunWithoutStagesGivesTheSamePoints) {
    Rows(kSurvey);
    ASSERT_EQ(engine.Process(), 1);
    const std::vector<UNeditPt> alone = engine.GetPointList();
    RecordingStage stage;
    UNeditDatabase staged(&format, &list, nullptr, &host);
    staged.AddStage(&stage);
    ASSERT_EQ(staged.Process(), 1);
    ASSERT_EQ(staged.GetPointList().size(), alone.size());
    for (std::size_t i = 0; i < alone.size(); ++i) {
        EXPECT_EQ(staged.GetPointList()[i].GetID(), alone[i].GetID());
        EXPECT_DOUBLE_EQ(staged.GetPointList()[i].x, alone[i].x);
        EXPECT_DOUBLE_EQ(staged.GetPointList()[i].y, alone[i].y);
    }
}

TEST_F(RunStages, TheRoutesStepReadsTheRowsOfItsRun) {
    // The list holds the survey; Generate is given it with a note more.
    class RowCounter : public nedit::RunStage {
      public:
        void Run(UNeditDatabase& engine, nedit::RunStep) override {
            counts.push_back(engine.GetRunRows().size());
        }
        std::vector<std::size_t> counts;
    } stage;
    engine.AddStage(&stage);
    Rows(kSurvey);
    std::vector<std::wstring> rows = list.GetRows();
    rows.push_back(L"NOTE      GIVEN");
    engine.Regenerate();
    engine.Generate(rows, true);
    EXPECT_EQ(stage.counts, (std::vector<std::size_t>{6, 7}));
    EXPECT_EQ(engine.GetRunRows().size(), 6u);
}
