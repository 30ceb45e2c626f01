// A coordinate record without a name takes the name of the station or back station before it,
// whether the rows come as wide text or as UTF-8.

#include <string>
#include <vector>

#include "RecordFixture.h"
#include "platform/text/WideText.h"
#include "records/NamelessCoordinates.h"

TEST_F(RecordFixture, NamelessCoordinatesTakeTheNameBeforeThemInWideAndUtf8Alike) {
    const std::vector<std::wstring> rows = {L"XYZ       E=1.000,N=2.000,H=3.000",
                                            L"STN       ID=Ä1,HI=1.500,CO=STN",
                                            L"XYZ       E=1.000,N=2.000,H=3.000",
                                            L"XYZ       ID=B,E=5,N=6,H=7",
                                            L"BKB       ID=RM 4,HA=0.0000",
                                            L"xyz       E=9,N=8",
                                            L"STN       P9",
                                            L"XYZ E=1",
                                            L"XYZ       E=1.000,N=2.000,H=3.000,CO=KEEP"};
    const std::vector<std::wstring> expected = {L"XYZ       ,E=1.000,N=2.000,H=3.000",
                                                L"STN       ID=Ä1,HI=1.500,CO=STN",
                                                L"XYZ       ID=Ä1,E=1.000,N=2.000,H=3.000",
                                                L"XYZ       ID=B,E=5,N=6,H=7",
                                                L"BKB       ID=RM 4,HA=0.0000",
                                                L"XYZ       4,E=9,N=8",
                                                L"STN       P9",
                                                L"XYZ E=1",
                                                L"XYZ       E=1.000,N=2.000,H=3.000,CO=KEEP"};
    NamelessCoordinates wide;
    NamelessCoordinates utf8;
    std::string out;
    for (std::size_t i = 0; i < rows.size(); ++i) {
        const int type = format.GetRecordType(rows[i]);
        EXPECT_EQ(wide.Complete(format, type, rows[i]), expected[i]) << i;
        const std::string row = nedit::ToUtf8(rows[i]);
        EXPECT_EQ(
            nedit::FromUtf8(utf8.CompleteUtf8(format, format.GetRecordTypeUtf8(row), row, out)),
            expected[i])
            << i;
    }
}
