// The stages of higher rooms that a document is given go into every engine it builds.

#include <gtest/gtest.h>

#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "reduction/RunStage.h"
#include "reduction/UNeditDatabase.h"

namespace {

class CountingStage : public nedit::RunStage {
  public:
    void Run(UNeditDatabase& engine, nedit::RunStep step) override {
        if (step == nedit::RunStep::Routes) points = engine.GetPointList().size();
        ++calls;
    }
    int calls = 0;
    std::size_t points = 0;
};

}  // namespace

TEST(DocumentRunStages, EveryEngineOfTheDocumentRunsTheStages) {
    nedit::test::TempDir config;
    nedit::test::ScopedEnv env{"SXNEDIT_CONFIG", config.Path()};
    UNeditDoc doc(nullptr);
    UListCtrl list(&doc);
    for (const wchar_t* row :
         {L"#VERSION-1.0 NEUTRAL FILE", L"PT ID=A,E=1,N=2,H=3", L"PT ID=B,E=4,N=5,H=6"}) {
        list.AddRecord(list.GetItemCount(), row);
    }
    CountingStage stage;
    doc.AddRunStage(&stage);
    ASSERT_EQ(doc.SetupDataBase(&list), 1);
    EXPECT_EQ(stage.calls, 2);  // routes, then attachments
    EXPECT_EQ(stage.points, 2u);
    ASSERT_EQ(doc.SetupDataBase(&list), 1);  // a new engine, the same stage
    EXPECT_EQ(stage.calls, 4);
}
