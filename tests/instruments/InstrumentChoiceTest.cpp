// The raw import's instrument dialog and the upload selection.

#include <gtest/gtest.h>

#include <algorithm>

#include "../support/TestSupport.h"
#include "instruments/PortStores.h"
#include "instruments/UDeviceManager.h"
#include "instruments/ULoadRawDlg.h"
#include "instruments/UUploadSource.h"

namespace {

TEST(ULoadRawDlg, StartsOnTheRememberedInstrumentAndRemembersTheChoice) {
    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config("SXNEDIT_CONFIG", dir.Path());
    UDeviceManager manager(L"", 0, false, SXNEDIT_TEST_DRIVER_DIR);
    std::vector<std::wstring> names;
    manager.GetNameList(names);
    const auto neutral = std::find(names.begin(), names.end(), L"Neutral");
    ASSERT_NE(neutral, names.end());
    {
        ULoadRawDlg dialog(&manager);
        dialog.OnInitDialog();
        EXPECT_EQ(dialog.GetSelected(), 0);  // nothing remembered: every name begins with it
        EXPECT_EQ(dialog.GetDetails(), manager.GetDeviceDescription(names.front()));
        EXPECT_FALSE(dialog.OnOK());
        EXPECT_EQ(dialog.GetEndCode(), nedit::mb::IdCancel);
    }
    nedit::InstrumentProfile().WriteInstrument(L"neu");
    ULoadRawDlg dialog(&manager);
    dialog.OnInitDialog();
    EXPECT_EQ(dialog.GetSelected(), neutral - names.begin());
    EXPECT_EQ(dialog.OnButton(ULoadRawDlg::kImport), ULoadRawDlg::kImport);
    EXPECT_EQ(dialog.Device, L"Neutral");
    EXPECT_EQ(nedit::InstrumentProfile().ReadInstrument(), L"Neutral");

    ULoadRawDlg empty(nullptr);
    empty.OnInitDialog();
    EXPECT_EQ(empty.GetSelected(), -1);
    EXPECT_EQ(empty.OnButton(ULoadRawDlg::kImportFromDevice), ULoadRawDlg::kImportFromDevice);
    EXPECT_EQ(empty.Device, L"");
}

class Layers : public ULayerSource {
  public:
    std::vector<std::wstring> GetLayerList() const override {
        return {L"0", L"WALLS", L"", L"HIDDEN"};
    }
};

TEST(UUploadSource, StartsOnItsDefaultsAndFillsTheLayerLists) {
    Layers layers;
    UUploadSource dialog(nullptr, &layers);
    EXPECT_EQ(dialog.GetSource(), UUploadSource::kDatabase);
    EXPECT_EQ(dialog.GetAllLayer(), UUploadSource::kAllLayers);
    std::wstring from;
    std::wstring to;
    EXPECT_EQ(dialog.GetByPtno(from, to), 0);
    EXPECT_EQ(from, L"1");
    EXPECT_EQ(to, L"10000");
    double low = 0.0;
    double high = 0.0;
    EXPECT_EQ(dialog.GetByHeight(low, high), 0);
    EXPECT_EQ(low, -100.0);
    EXPECT_EQ(high, 10000.0);
    EXPECT_EQ(dialog.GetByWindow() + dialog.GetByScreen(), 0);
    dialog.OnInitDialog();
    const std::vector<std::wstring> expected = {L"0", L"WALLS"};
    EXPECT_EQ(dialog.GetLayerItems(UUploadSource::kLayerFromList), expected);
    EXPECT_EQ(dialog.GetLayerItems(UUploadSource::kLayerToList), expected);
    EXPECT_EQ(dialog.Create_Dlg(), 0);  // no host to show it

    UUploadSource alone(nullptr, nullptr);
    alone.OnInitDialog();
    EXPECT_TRUE(alone.GetLayerItems(UUploadSource::kLayerFromList).empty());
}

TEST(UUploadSource, RangesComeInOrder) {
    UUploadSource dialog(nullptr, nullptr);
    dialog.ByCode = 1;
    dialog.CodeFrom = L"Z";
    dialog.CodeTo = L"A";
    std::wstring from;
    std::wstring to;
    EXPECT_EQ(dialog.GetByCode(from, to), 1);
    EXPECT_EQ(from, L"A");
    EXPECT_EQ(to, L"Z");
    EXPECT_EQ(dialog.CodeFrom, L"A");  // the dialog's own values are put in order too
    dialog.PointFrom = L"9";
    dialog.PointTo = L"10000";
    dialog.GetByPtno(from, to);  // as texts, 9 comes after 10000
    EXPECT_EQ(from, L"10000");
    EXPECT_EQ(to, L"9");
    dialog.HeightFrom = 10.0;
    dialog.HeightTo = -5.0;
    double low = 0.0;
    double high = 0.0;
    dialog.GetByHeight(low, high);
    EXPECT_EQ(low, -5.0);
    EXPECT_EQ(high, 10.0);
    dialog.LayerFrom = L"b";
    dialog.LayerTo = L"B";  // case counts: 'B' comes before 'b'
    dialog.GetByLayer(from, to);
    EXPECT_EQ(from, L"B");
    EXPECT_EQ(to, L"b");
}

}  // namespace
