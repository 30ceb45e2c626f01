#include "ReductionFixture.h"

using PrepareList = ReductionFixture;

namespace {
const STNSTRUCT* StationNamed(const UNeditDatabase& engine, const std::wstring& name) {
    for (const auto& station : engine.GetStations()) {
        if (station->StnName == name && !station->ReverseStn && !station->PointOnly)
            return station.get();
    }
    return nullptr;
}
}  // namespace

TEST_F(PrepareList, RepeatedObservationsGatherUnderOneTargetPerListAndStation) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=A\nBS ID=T,HA=1,VA=90,SD=5,HT=0\n"
        L"SS ID=T,HA=10,VA=90,SD=5,HT=0,CO=FIRST\nSS ID=T,HA=11,VA=90,SD=5,HT=0,CO=SECOND\n"
        L"STN ID=B\nSS ID=T,HA=12,VA=90,SD=5,HT=0\nSS ID=U,HA=0,VA=90,SD=1,HT=0\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    const STNSTRUCT* a = StationNamed(engine, L"A");
    const STNSTRUCT* b = StationNamed(engine, L"B");
    ASSERT_TRUE(a && b);
    // A back sight and a side shot to one name stay two targets.
    ASSERT_EQ(a->SSList.size(), 1u);
    EXPECT_EQ(a->BSList.size(), 1u);
    const SSSTRUCT* target = a->SSList.front();
    EXPECT_EQ(target->Meas->size(), 2u);
    EXPECT_EQ(target->SSCode, L"SECOND");
    EXPECT_EQ(target->RecordNo, 6);
    EXPECT_EQ(b->SSList.Find(L"T")->Meas->size(), 1u);
    int stations = 0, side_shots = 0, forward = 0;
    EXPECT_EQ(engine.GetListCount(stations, side_shots, forward), 5);
    EXPECT_EQ(stations, 2);
}

TEST_F(PrepareList, SwingInstrumentHeightAndScaleRunDownAsTheyShould) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"SWING 10\n"             // before any station: reaches all
        L"STN ID=A,HI=0.00005\n"  // below 0.0001: takes CurInstHt
        L"SWING 5\n"              // inside A before observing: A only
        L"SS ID=P,HA=0,VA=90,SD=1,HT=0\n"
        L"SWING 7\n"  // after the first observation: nothing
        L"STN ID=B,HI=0.0001\n"
        L"INSHT 1.7\n"  // B has a height: only CurInstHt moves
        L"SCALE 0\n"    // zero returns the factor to 1
        L"SS ID=Q,HA=0,VA=90,SD=1,HT=0\n"
        L"STN ID=C\n"
        L"SCALE 0.5\n"
        L"SS ID=R,HA=0,VA=90,SD=1,HT=0\n");
    CurInstHt = 1.2;
    ASSERT_EQ(engine.PrepareList(), 1);
    const STNSTRUCT* a = StationNamed(engine, L"A");
    const STNSTRUCT* b = StationNamed(engine, L"B");
    const STNSTRUCT* c = StationNamed(engine, L"C");
    ASSERT_TRUE(a && b && c);
    EXPECT_DOUBLE_EQ(a->Swing, 5.0);
    EXPECT_DOUBLE_EQ(a->SSList.front()->Meas->front().HAng, 5.0);
    EXPECT_DOUBLE_EQ(b->Swing, 10.0);
    EXPECT_DOUBLE_EQ(a->HtInst, 1.2);
    EXPECT_DOUBLE_EQ(b->HtInst, 0.0001);
    EXPECT_DOUBLE_EQ(CurInstHt, 1.7);
    EXPECT_DOUBLE_EQ(b->SSList.front()->Meas->front().SDist, 1.0);
    EXPECT_DOUBLE_EQ(c->SSList.front()->Meas->front().SDist, 0.5);
    EXPECT_DOUBLE_EQ(engine.GetStnScaleFactor(L"C"), 0.5);
    EXPECT_DOUBLE_EQ(engine.GetStnScaleFactor(L"B"), 0.5);  // no entry: the current factor
    CurInstHt = 0.0;
}

TEST_F(PrepareList, EmptyStationsAreDroppedAndTheirPointNamesMoveOn) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"PT ID=K1,E=1,N=2,H=3\n"
        L"STN ID=DROPPED\n"
        L"STN ID=A\n"
        L"PT ID=K2,E=1,N=1,H=1\n"
        L"SS ID=P,HA=0,VA=90,SD=1,HT=0\n"
        L"PT ID=K3,E=1,N=1,H=1\n"
        L"SS ID=P,HA=0,VA=90,SD=2,HT=0\n"
        L"STN ID=LAST\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    EXPECT_EQ(StationNamed(engine, L"DROPPED"), nullptr);
    const STNSTRUCT* a = StationNamed(engine, L"A");
    ASSERT_NE(a, nullptr);
    EXPECT_EQ(a->PtNames, std::vector<std::wstring>{L"K1"});
    // Names filed before each observation of P stay with P, the later after the earlier.
    EXPECT_EQ(a->SSList.Find(L"P")->PtNames, (std::vector<std::wstring>{L"K2", L"K3"}));
    // A station record in the last row never reaches the list; it stays the current one.
    EXPECT_EQ(StationNamed(engine, L"LAST"), nullptr);
    ASSERT_NE(engine.GetCurStn(), nullptr);
    EXPECT_EQ(engine.GetCurStn()->StnName, L"LAST");
    // The PT record made a point of its own.
    ASSERT_GE(engine.GetPointIdx(L"K1"), 0);
    EXPECT_TRUE(engine.GetPointList()[0].IsPTRecord());
}

TEST_F(PrepareList, TheDistanceCorrectionFollowsTheEarthAndRefraction) {
    // D 1000, zenith 88, R 6 370 000, k 0.13: a = D sin z / 2R, b = k a; worked separately
    // with the field programs' single-precision degree constants to D' = 999.9972663 and
    // z' = 87.9960867 (exact constants would give 87.9960842).
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nRADIUS 6370000\nDCORR 0.13\n"
        L"STN ID=A\nSS ID=P,HA=0,VA=88,SD=1000,HT=0\nSS ID=TINY,HA=0,VA=88,SD=1e-41,HT=0\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    const STNSTRUCT* a = StationNamed(engine, L"A");
    ASSERT_NE(a, nullptr);
    const MEASSTRUCT& corrected = a->SSList.Find(L"P")->Meas->front();
    EXPECT_NEAR(corrected.SDist, 999.9972663, 1e-6);
    EXPECT_NEAR(corrected.VAng, 87.9960867, 1e-6);
    const MEASSTRUCT& tiny = a->SSList.Find(L"TINY")->Meas->front();
    EXPECT_DOUBLE_EQ(tiny.VAng, 88.0);
}

TEST_F(PrepareList, SideShotsOnOccupiedStationsBecomeForwardTargets) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"STN ID=A\nSS ID=B,HA=0,VA=90,SD=1,HT=0\nSS ID=X,HA=0,VA=90,SD=1,HT=0\n"
        L"STN ID=B\nSS ID=A,HA=0,VA=90,SD=1,HT=0\n");
    ASSERT_EQ(engine.PrepareList(), 1);
    ASSERT_EQ(engine.PrepareForwardNoBS(), 1);
    const STNSTRUCT* a = StationNamed(engine, L"A");
    const STNSTRUCT* b = StationNamed(engine, L"B");
    ASSERT_TRUE(a && b);
    EXPECT_EQ(a->FSList.size(), 1u);
    EXPECT_EQ(a->FSList.front()->Meas, a->SSList.Find(L"B")->Meas);  // shared measurements
    EXPECT_EQ(a->SSList.Find(L"B")->ForwardFlag, 1);
    EXPECT_EQ(a->SSList.Find(L"X")->ForwardFlag, 0);
    EXPECT_EQ(b->Sighted, 1);
    // One reverse node for each observation of a station, after the stations.
    const auto& stations = engine.GetStations();
    ASSERT_EQ(stations.size(), 4u);
    EXPECT_EQ(stations[2]->StnName, L"B");
    EXPECT_EQ(stations[2]->ReverseStn, 1);
    EXPECT_EQ(stations[2]->FSList.front()->SSName, L"A");
    EXPECT_EQ(engine.searchSTN(L"B"), b);
    std::vector<STNSTRUCT*> found;
    EXPECT_EQ(engine.SearchSTN(L"b", found), 2);  // the reverse node is no point-only node
}
