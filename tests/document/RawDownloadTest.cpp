// Downloads end to end: a fake instrument on a pseudo-terminal plays a raw file into the
// document through the serial port, the driver manager and the GSI driver. The time-out is
// shortened for the tests; its rules are those of the ten seconds.

#include <chrono>

#include "../support/FakeInstrument.h"
#include "InstrumentDocFixture.h"
#include "instruments/PortStores.h"
#include "sxnedit_driver.h"

namespace {

using namespace std::chrono_literals;

class RawDownload : public InstrumentDocFixture {
  protected:
    RawDownload() {
        doc.SetDownloadTimeOut(300ms);
        rilievo = ReadFile(RawFixture("RILIEVO.gsi"));
    }

    /// Loads the GSI driver and opens the instrument's port with `settings`.
    void Connect(const nedit::SerialSettings& settings = {}) {
        ASSERT_FALSE(instrument.Port().empty());
        ASSERT_EQ(Manager().LoadDLL(L"Leica GSI"), 1);
        ASSERT_EQ(Manager().OpenPort(nedit::FromUtf8(instrument.Port()), settings), 1)
            << nedit::ToUtf8(Manager().GetLastError());
        ASSERT_EQ(Manager().SetTranslateMode(), 1);
    }
    int Download() { return doc.Download(nedit::FromUtf8(raw), &list); }

    std::string raw = dir.File("OUTTEMP.$$$");
    std::string rilievo;
    // Last, so that its thread, which reads the members above, is joined before they go.
    FakeInstrument instrument;
};

TEST_F(RawDownload, ABlockAtATimeThenTheTimeOutEndsIt) {
    Connect();
    instrument.Play([&](FakeInstrument& link) { link.SendLines(rilievo, 5ms); });
    const auto started = std::chrono::steady_clock::now();
    ASSERT_EQ(Download(), 1);
    EXPECT_GE(std::chrono::steady_clock::now() - started, 300ms);
    ASSERT_EQ(list.GetItemCount(), 25);
    EXPECT_EQ(Row(4), L"SS        ID=102,HA=119.132604,VA=93.241368,SD=5.165,CO=,HD=5.156");
    EXPECT_EQ(ReadFile(raw), rilievo);
    EXPECT_NE(MessagesShown().find(L"Timeout has occurred. Download stopped.\n (Timeout occurs "
                                   L"after 0.3 seconds.)"),
              std::wstring::npos);
    EXPECT_FALSE(Manager().IsPortOpen());
    EXPECT_EQ(doc.GetModified(), 1);
    EXPECT_FALSE(doc.GetAbortProcessOn());
}

TEST_F(RawDownload, TheTimeOutCountsFromTheLastRecord) {
    Connect();
    // Pauses of 200 ms are shorter than the 300 ms period, so nothing times out before the
    // last block; a device that sends nothing at all times out after one period.
    instrument.Play([&](FakeInstrument& link) { link.SendLines(rilievo.substr(0, 250), 200ms); });
    ASSERT_EQ(Download(), 1);
    EXPECT_EQ(list.GetItemCount(), 2 + 3);
}

TEST_F(RawDownload, ADeviceThatSendsNothingTimesOutWithAnEmptyList) {
    Connect();
    ASSERT_EQ(Download(), 1);
    EXPECT_EQ(list.GetItemCount(), 0);
    EXPECT_EQ(ReadFile(raw), "");
    EXPECT_NE(MessagesShown().find(L"Timeout has occurred."), std::wstring::npos);
}

TEST_F(RawDownload, ALinkThatClosesHalfWayKeepsWhatArrived) {
    Connect();
    const std::string half = rilievo.substr(0, rilievo.find("110011"));
    instrument.Play([&](FakeInstrument& link) {
        link.SendLines(half, 2ms);
        link.Wait(150ms);  // the download reads all before the plug is pulled
        link.Close();
    });
    ASSERT_EQ(Download(), 1);
    EXPECT_EQ(list.GetItemCount(), 2 + 10);
    EXPECT_EQ(ReadFile(raw), half);
    EXPECT_TRUE(Manager().LinkLost());
    EXPECT_NE(MessagesShown().find(L"has closed."), std::wstring::npos);
    EXPECT_EQ(MessagesShown().find(L"Timeout"), std::wstring::npos);
}

TEST_F(RawDownload, GarbageOnTheLineStandsAsCommentsBetweenTheBlocks) {
    Connect();
    std::string noise;
    for (int i = 0; i < 300; ++i) noise += static_cast<char>(i * 73 % 256);
    const std::string first = rilievo.substr(0, rilievo.find("110004"));
    const std::string rest = rilievo.substr(first.size());
    instrument.Play([&](FakeInstrument& link) {
        link.SendLines(first, 2ms);
        link.Send("\r" + noise + "\r");
        link.SendLines(rest, 2ms);
        link.Send("\x04");  // end of transmission
    });
    ASSERT_EQ(Download(), 1);
    int comments = 0;
    int observations = 0;
    for (const std::wstring& row : list.GetRows()) {
        comments += row.rfind(L"# GSI LINE", 0) == 0 ? 1 : 0;
        observations += row.rfind(L"SS ", 0) == 0 ? 1 : 0;
    }
    EXPECT_EQ(observations, 23);
    EXPECT_GE(comments, 1);
    EXPECT_EQ(ReadFile(raw), first + "\r" + noise + "\r" + rest + "\x04");
    EXPECT_EQ(MessagesShown().find(L"Timeout"), std::wstring::npos);  // the data ended it
    EXPECT_NE(MessagesShown().find(L"could not be read"), std::wstring::npos);
}

TEST_F(RawDownload, SoftwareFlowControlTakesXonAndXoffOffTheLine) {
    nedit::SerialSettings settings;
    settings.flow = nedit::FlowControl::XonXoff;
    Connect(settings);
    std::string paced;
    for (const char c : rilievo) paced += c == '\r' ? std::string("\r\x13\x11") : std::string(1, c);
    instrument.Play([&](FakeInstrument& link) {
        link.SendLines(paced, 2ms);
        link.Send("\x04");
    });
    ASSERT_EQ(Download(), 1);
    EXPECT_EQ(list.GetItemCount(), 25);
    EXPECT_EQ(ReadFile(raw), rilievo + "\x04");
}

TEST_F(RawDownload, AcknowledgementsGoBackWhenAsked) {
    Manager().SetAckNak(true);
    Connect();
    std::string acknowledged;
    instrument.Play([&](FakeInstrument& link) {
        link.Send("110001+00000001 21.102+00000000 22.102+10000000 31..00+00001000\r\n");
        link.Send("1100\r\n");
        acknowledged = link.Receive(200ms);
        link.Send("\x04");
    });
    ASSERT_EQ(Download(), 1);
    instrument.Join();
    EXPECT_EQ(acknowledged, "\x06\x15");
}

TEST_F(RawDownload, AnAbortKeepsTheRecordsAndTheRawFile) {
    AbortAtRows abort(list, 8);
    doc.SetProgressSink(&abort);
    Connect();
    instrument.Play([&](FakeInstrument& link) { link.SendLines(rilievo, 20ms); });
    ASSERT_EQ(Download(), 1);
    doc.SetProgressSink(nullptr);
    EXPECT_EQ(list.GetItemCount(), 8);
    EXPECT_FALSE(doc.GetAbortProcess());
    EXPECT_FALSE(doc.GetAbortProcessOn());
    EXPECT_EQ(doc.GetModified(), 1);
    EXPECT_EQ(rilievo.rfind(ReadFile(raw), 0), 0u);  // the raw file holds the start
    EXPECT_GT(ReadFile(raw).size(), 0u);
    EXPECT_EQ(MessagesShown().find(L"Timeout"), std::wstring::npos);
}

TEST_F(RawDownload, PortsThatCannotBeOpenedSayWhy) {
    EXPECT_EQ(Manager().OpenPort(L"/nonexistent/ttyS9"), 0);
    EXPECT_EQ(Manager().GetLastError(), L"There is no serial port /nonexistent/ttyS9.");
    EXPECT_EQ(Manager().OpenPort(L"/dev/null"), 0);
    EXPECT_EQ(Manager().GetLastError(), L"/dev/null is not a serial port.");
    // COM1 to COM8 reach their devices through the store.
    ASSERT_TRUE(nedit::PortsStore().SetDevicePath(L"COM3", "/nonexistent/ttyUSB7"));
    EXPECT_EQ(Manager().OpenPort(L"com3"), 0);
    EXPECT_EQ(Manager().GetLastError(), L"There is no serial port /nonexistent/ttyUSB7.");
    // A port already in use by this or another program is refused.
    ASSERT_EQ(Manager().OpenPort(nedit::FromUtf8(instrument.Port())), 1);
    nedit::SerialPort second;
    EXPECT_FALSE(second.Open(instrument.Port()));
    EXPECT_EQ(second.LastError(),
              "The serial port " + instrument.Port() + " is in use by another program.");
    // A download needs a driver and a port.
    EXPECT_EQ(Download(), 0);
}

}  // namespace
