// Images, attributes and notes on the points of a run.

#include "ReductionFixture.h"

using Attachments = ReductionFixture;

TEST_F(Attachments, AnAttributeAnImageAndANoteGoOnTheirPoints) {
    Rows(
        L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n"
        L"ATTRIB ID=S1,ANAME=EARLY,ATYPE=TEXT,AVALUE=DROPPED\n"  // before any point: dropped
        L"STN ID=S1,HI=1.5\nNOTE tripod over nail\n"
        L"XYZ ID=S1,E=1000,N=2000,H=50\nBKB ID=RO,BRG=0,HA=0\n"
        L"SS ID=P1,HA=0,VA=90,SD=5,HT=1.5,CO=MH01\n"
        L"ATTRIB ANAME=DEPTH,ATYPE=REAL,AVALUE=1.85\n"  // the point above it, not its ID
        L"NOTE first note\nNOTE cover cracked\n"
        L"IMAGE ID=P1,N1=3,N2=7,FILE=mh01.jpg\n"
        L"IMAGE ID=GHOST,N1=1,N2=1,FILE=none.jpg\n"  // never reduced: no trace
        L"IMAGE ID=P1,FILE=second.jpg\n");           // GHOST's numbers, the last read
    ASSERT_EQ(engine.Process(), 1);
    const UNeditPt& station = Point(L"S1");
    EXPECT_EQ(station.GetNote(), L"TRIPOD OVER NAIL");
    EXPECT_EQ(station.GetPointAttributeSize(), 0);
    const UNeditPt& manhole = Point(L"P1");
    ASSERT_EQ(manhole.GetPointAttributeSize(), 1);
    EXPECT_EQ(manhole.GetPointAttributes()[0].Name, L"DEPTH");
    EXPECT_EQ(manhole.GetPointAttributes()[0].Type, L"REAL");
    EXPECT_EQ(manhole.GetPointAttributes()[0].Value, L"1.85");
    EXPECT_EQ(manhole.GetNote(), L"COVER CRACKED");
    ASSERT_EQ(manhole.GetImageSize(), 2);
    EXPECT_EQ(manhole.GetImages()[0].FileName, L"MH01.JPG");
    EXPECT_EQ(manhole.GetImages()[0].Number1, 3.0);
    EXPECT_EQ(manhole.GetImages()[0].Number2, 7.0);
    EXPECT_EQ(manhole.GetImages()[1].Number1, 1.0);
    EXPECT_EQ(manhole.GetImages()[1].Number2, 1.0);
    EXPECT_EQ(engine.GetPointIdx(L"GHOST"), -1);
}
