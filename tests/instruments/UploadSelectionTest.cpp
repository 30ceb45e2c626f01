// Which points of a job go to an instrument, by the dialog's choice or the command line's.

#include <gtest/gtest.h>

#include "../platform/job/JobTestSupport.h"
#include "instruments/UUploadSource.h"
#include "instruments/UploadSelection.h"
#include "platform/job/UDBLayer.h"
#include "platform/job/UDBPoint.h"
#include "platform/text/WideText.h"

namespace {

using nedit::UploadSelection;

class UploadSelectionTest : public nedit::test::JobTest {
  protected:
    void SetUp() override {
        JobTest::SetUp();
        UDBLayer boundary(job.get(), L"BOUNDARY");
        boundary.SetActive(false);
        ASSERT_TRUE(boundary.Save());
        UDBLayer topo(job.get(), L"TOPO");
        ASSERT_TRUE(topo.Save());
        Add(L"1", L"TREE 0.5", 10.0, topo.GetId());
        Add(L"9", L"FENCE", 20.0, topo.GetId());
        Add(L"10000", L"PEG", UWPoint::kNoHeight, boundary.GetId());
        Add(L"A7", L"tree", -5.0, 0);
        Add(L"100001", L"PEG", 5.0, topo.GetId());
    }
    void Add(const std::wstring& name, const std::wstring& code, double height, long layer) {
        UDBPoint point(job.get(), UWPoint(100.0, 200.0, height));
        point.SetName(name);
        point.SetCode(code);
        point.SetLayer(layer);
        ASSERT_TRUE(point.Save()) << nedit::ToUtf8(point.LastError());
    }
    std::vector<std::wstring> Chosen(const UploadSelection& selection) {
        std::vector<std::wstring> names;
        for (const nedit::UploadPoint& point : selection.Select(*job)) names.push_back(point.name);
        return names;
    }
};

using Names = std::vector<std::wstring>;

TEST_F(UploadSelectionTest, EachCriterionAlone) {
    UploadSelection all;
    EXPECT_EQ(Chosen(all), (Names{L"1", L"9", L"10000", L"A7", L"100001"}));

    // Numbers as numbers, given in either order; a name that is no number compares as text.
    UploadSelection range;
    range.SetPointRange(L"10000", L"9");
    EXPECT_EQ(Chosen(range), (Names{L"9", L"10000"}));

    UploadSelection on;
    on.SetLayers(UploadSelection::Layers::On);
    EXPECT_EQ(Chosen(on), (Names{L"1", L"9", L"A7", L"100001"}));
    UploadSelection off;
    off.SetLayers(UploadSelection::Layers::Off);
    EXPECT_EQ(Chosen(off), (Names{L"10000"}));

    // The feature code, without regard to case.
    UploadSelection codes;
    codes.SetCodeNames({L"Tree"});
    EXPECT_EQ(Chosen(codes), (Names{L"1", L"A7"}));
    UploadSelection codeRange;
    codeRange.SetCodeRange(L"peg", L"fence");
    EXPECT_EQ(Chosen(codeRange), (Names{L"9", L"10000", L"100001"}));

    // A point without height lies outside every height range; both ends belong to it.
    UploadSelection heights;
    heights.SetHeightRange(10.0, -5.0);
    EXPECT_EQ(Chosen(heights), (Names{L"1", L"A7", L"100001"}));

    UploadSelection layers;
    layers.SetLayerNames({L"topo"});
    EXPECT_EQ(Chosen(layers), (Names{L"1", L"9", L"100001"}));
    UploadSelection layerRange;
    layerRange.SetLayerRange(L"A", L"C");
    EXPECT_EQ(Chosen(layerRange), (Names{L"10000"}));
}

TEST_F(UploadSelectionTest, TheDialogsChoicesTogether) {
    UUploadSource dialog(nullptr, nullptr);
    dialog.AllLayer = UUploadSource::kLayersOn;
    dialog.ByPtRange = 1;
    dialog.PointFrom = L"1";
    dialog.PointTo = L"10000";
    dialog.ByHeight = 1;
    dialog.HeightFrom = 15.0;
    dialog.HeightTo = 0.0;
    EXPECT_EQ(Chosen(UploadSelection::FromDialog(dialog)), (Names{L"1"}));

    const std::vector<nedit::UploadPoint> points = UploadSelection().Select(*job);
    ASSERT_EQ(points.size(), 5u);
    EXPECT_EQ(points[2].layer, L"BOUNDARY");
    EXPECT_FALSE(points[2].layerOn);
    EXPECT_FALSE(points[2].hasHeight);
    EXPECT_EQ(points[3].layer, L"");
    EXPECT_DOUBLE_EQ(points[3].height, -5.0);
    EXPECT_DOUBLE_EQ(points[3].north, 200.0);
}

}  // namespace
