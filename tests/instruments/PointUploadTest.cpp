// Points sent through a driver: into a file's bytes, or over a serial link to an instrument
// on a pseudo-terminal, which must receive the same bytes.

#include <gtest/gtest.h>

#include "../support/FakeInstrument.h"
#include "instruments/PointUpload.h"
#include "instruments/UDeviceManager.h"
#include "platform/messages/ProgressSink.h"
#include "platform/text/WideText.h"

namespace {

using namespace std::chrono_literals;

std::vector<nedit::UploadPoint> Points(int count) {
    std::vector<nedit::UploadPoint> points;
    for (int i = 1; i <= count; ++i) {
        nedit::UploadPoint point;
        point.name = std::to_wstring(i);
        point.east = 1000.0 + i;
        point.north = 2000.0 - i;
        point.height = 50.0;
        point.hasHeight = true;
        points.push_back(point);
    }
    return points;
}

class PointUploadTest : public ::testing::Test {
  protected:
    UDeviceManager manager{L"", 0, false, SXNEDIT_TEST_DRIVER_DIR};
};

TEST_F(PointUploadTest, TheLinkCarriesWhatTheFileWouldHold) {
    ASSERT_EQ(manager.LoadDLL(L"Leica GSI"), 1);
    // Enough points to fill the pseudo-terminal's buffer, so the upload waits for the reader.
    const std::vector<nedit::UploadPoint> points = Points(2000);
    std::string file;
    nedit::PointUpload upload(manager, nedit::LengthUnit::Metres);
    const nedit::UploadOutcome written = upload.Run(points, &file, nullptr);
    EXPECT_EQ(written.sent, 2000);
    EXPECT_FALSE(written.failed);
    EXPECT_EQ(file.substr(0, 49), "*110001+0000000000000001 81...6+0000000010010000 ");

    FakeInstrument instrument;
    std::string received;
    instrument.Play([&](FakeInstrument& link) { received = link.Receive(3000ms); });
    ASSERT_EQ(manager.OpenPort(nedit::FromUtf8(instrument.Port()), nedit::SerialSettings{}), 1)
        << nedit::ToUtf8(manager.GetLastError());
    const nedit::UploadOutcome sent = upload.Run(points, nullptr, nullptr);
    manager.ClosePort();
    instrument.Join();
    EXPECT_EQ(sent.sent, 2000);
    EXPECT_FALSE(sent.failed);
    EXPECT_EQ(received.size(), file.size());
    EXPECT_TRUE(received == file);
}

TEST_F(PointUploadTest, ADriverThatCannotUploadOrNoPortIsRefusedAndAnAbortStops) {
    nedit::PointUpload upload(manager, nedit::LengthUnit::Metres);
    ASSERT_EQ(manager.LoadDLL(L"Carlson RW5"), 1);
    nedit::UploadOutcome outcome = upload.Run(Points(1), nullptr, nullptr);
    EXPECT_TRUE(outcome.failed);
    ASSERT_EQ(outcome.messages.size(), 1u);
    EXPECT_EQ(outcome.messages[0], L"The driver Carlson RW5 cannot upload points.");

    ASSERT_EQ(manager.LoadDLL(L"Leica GSI"), 1);
    outcome = upload.Run(Points(1), nullptr, nullptr);
    EXPECT_TRUE(outcome.failed);
    EXPECT_EQ(outcome.messages.at(0), L"No port is open.");

    nedit::ProgressSink stopped;
    stopped.RequestAbort();
    std::string file;
    outcome = upload.Run(Points(3), &file, &stopped);
    EXPECT_TRUE(outcome.aborted);
    EXPECT_EQ(outcome.sent, 0);
    EXPECT_TRUE(file.empty());
}

TEST_F(PointUploadTest, ALinkThatClosesEndsTheUploadAsFailed) {
    ASSERT_EQ(manager.LoadDLL(L"Neutral"), 1);
    manager.SetTimeOutPeriod(500ms);
    FakeInstrument instrument;
    ASSERT_EQ(manager.OpenPort(nedit::FromUtf8(instrument.Port()), nedit::SerialSettings{}), 1);
    instrument.Close();
    nedit::PointUpload upload(manager, nedit::LengthUnit::Metres);
    const nedit::UploadOutcome outcome = upload.Run(Points(5000), nullptr, nullptr);
    manager.ClosePort();
    EXPECT_TRUE(outcome.failed);
    EXPECT_LT(outcome.sent, 5000);
    EXPECT_FALSE(outcome.messages.empty());
}

}  // namespace
