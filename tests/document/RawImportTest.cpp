// A raw file through a driver into a document's list, and what the reduction makes of it.

#include <cmath>

#include "InstrumentDocFixture.h"
#include "reduction/UNeditDatabase.h"
#include "sxnedit_driver.h"

namespace {

using RawImport = InstrumentDocFixture;

TEST_F(RawImport, TheGsi16FixtureFillsTheListAsStoredRowsAre) {
    ASSERT_EQ(Manager().LoadDLL(L"Leica GSI"), 1);
    EXPECT_EQ(doc.GetImportMode(), SXN_MODE_DMS | SXN_MODE_METRES);  // a new job's units
    ASSERT_EQ(doc.Import(nedit::FromUtf8(RawFixture("leica_gsi16_gurob.gsi")), &list), 1);
    ASSERT_EQ(list.GetItemCount(), 346);
    EXPECT_EQ(Row(0), L"#VERSION-1.0 NEUTRAL FILE");
    EXPECT_EQ(Row(1), L"UNIT      UL=M,UA=S");
    EXPECT_EQ(Row(2), L"INSHT     1.324");
    // *110002+00000000GDEM5415 21.024+0000000003545100 22.024+0000000009117510
    // 31...0+0000000000013825 ... 87...0+0000000000001300
    EXPECT_EQ(Row(3), L"SS        ID=GDEM5415,HA=35.45100,VA=91.17510,SD=13.825,HT=1.300,CO=");
    EXPECT_EQ(doc.GetModified(), 1);
    EXPECT_NE(MessagesShown().find(L"before any station block"), std::wstring::npos);
}

// RILIEVO.gsi records the instrument's horizontal distance (word 32) beside the slope
// distance and the zenith angle. Reduced from a station at a known point, every observed point
// lies at that horizontal distance from it, to the millimetre. The distances are read by hand
// from the file, block by block.
TEST_F(RawImport, TheReducedSlopeDistancesAgreeWithTheInstrumentsHorizontalDistances) {
    const double kHorizontal[] = {0.000,  0.000,  5.156,  5.341,  4.614,  4.208,  3.784,  3.848,
                                  6.450,  11.369, 20.328, 26.758, 36.927, 33.475, 50.671, 65.823,
                                  72.036, 69.647, 41.342, 24.337, 67.649, 83.283, 4.593};
    for (const unsigned angles : {SXN_MODE_DMS, SXN_MODE_DEGREES, SXN_MODE_GONS}) {
        list.DeleteAllItems();
        doc.SetImportMode(angles | SXN_MODE_METRES);
        ASSERT_EQ(Manager().LoadDLL(L"Leica GSI"), 1);
        ASSERT_EQ(doc.Import(nedit::FromUtf8(RawFixture("RILIEVO.gsi")), &list), 1);
        ASSERT_EQ(list.GetItemCount(), 25);
        list.AddRecord(2, L"STN ID=S,HI=1.5");
        list.AddRecord(3, L"XYZ ID=S,E=1000,N=2000,H=100");
        ASSERT_EQ(doc.SetupDataBase(&list), 1);
        const UNeditDatabase& engine = *doc.GetDatabase();
        for (int block = 0; block < 23; ++block) {
            const std::wstring name = std::to_wstring(100 + block);
            const int index = engine.GetPointIdx(name);
            ASSERT_GE(index, 0) << "block " << block + 1;
            const UNeditPt& point = engine.GetPointList()[static_cast<std::size_t>(index)];
            EXPECT_NEAR(std::hypot(point.x - 1000.0, point.y - 2000.0), kHorizontal[block], 0.001)
                << "block " << block + 1 << " with angles " << angles;
        }
    }
}

TEST_F(RawImport, AnAbortKeepsTheRowsReadSoFar) {
    AbortAtRows abort(list, 100);
    doc.SetProgressSink(&abort);
    ASSERT_EQ(Manager().LoadDLL(L"Leica GSI"), 1);
    EXPECT_EQ(doc.Import(nedit::FromUtf8(RawFixture("leica_gsi16_gurob.gsi")), &list), 1);
    EXPECT_EQ(list.GetItemCount(), 100);
    EXPECT_EQ(Row(99).substr(0, 22), L"SS        ID=GDEM5511,");
    EXPECT_EQ(Manager().GetEOF(), 1);
    doc.SetProgressSink(nullptr);
}

TEST_F(RawImport, FilesThatCannotBeReadOrAreOfAnotherFormatSaySo) {
    EXPECT_EQ(doc.Import(L"/nonexistent.gsi", &list), 0);  // no driver loaded
    ASSERT_EQ(Manager().LoadDLL(L"Leica GSI"), 1);
    EXPECT_EQ(doc.Import(nedit::FromUtf8(dir.File("missing.gsi")), &list), 0);
    EXPECT_EQ(Manager().GetLastError(),
              nedit::FromUtf8("Failed to open " + dir.File("missing.gsi") +
                              ": No such file or directory."));
    EXPECT_EQ(doc.Import(nedit::FromUtf8(dir.Path()), &list), 0);
    EXPECT_EQ(Manager().GetLastError(), nedit::FromUtf8(dir.Path() + " is not a file."));

    dir.Write("survey.neu", "#VERSION-1.0 NEUTRAL FILE\nSTN ID=A\n");
    EXPECT_EQ(doc.Import(nedit::FromUtf8(dir.File("survey.neu")), &list), 1);
    EXPECT_EQ(list.GetItemCount(), 0);
    EXPECT_EQ(MessagesShown(), L"The data are not Leica GSI: no GSI word was found in them.\n");

    // The neutral driver takes the same file whole.
    ASSERT_EQ(Manager().LoadDLL(L"Neutral"), 1);
    EXPECT_EQ(doc.Import(nedit::FromUtf8(dir.File("survey.neu")), &list), 1);
    EXPECT_EQ(list.GetItemCount(), 2);
    EXPECT_EQ(Row(1), L"STN       ID=A");
}

}  // namespace
