// The port dialog and the download dialog as logic objects: their starting values, stores,
// rules and refusals.

#include <gtest/gtest.h>

#include "../support/FakeInstrument.h"
#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "instruments/PortStores.h"
#include "instruments/UDeviceManager.h"
#include "instruments/UNEDownload.h"
#include "instruments/USetComm.h"
#include "platform/settings/IniFile.h"

namespace {

class PortDialogs : public ::testing::Test {
  protected:
    PortDialogs() { nedit::PortsStore().SetDevicePath(L"COM1", instrument.Port()); }

    std::wstring PortsEntry(const std::wstring& port) const {
        return nedit::IniFile(dir.File("ports.ini")).ReadString(L"Ports", port + L":", L"none");
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    nedit::HeadlessDialogHost host;
    FakeInstrument instrument;  // the device behind COM1
    UDeviceManager manager{L"", 0, false, SXNEDIT_TEST_DRIVER_DIR};
};

TEST_F(PortDialogs, SetCommHoldsItsPortAndWritesThePortsEntry) {
    {
        USetComm dialog(&host);
        dialog.OnInitDialog();
        EXPECT_TRUE(dialog.GetHandle().IsOpen());
        EXPECT_EQ(dialog.Port, L"COM1");
        EXPECT_EQ(dialog.Baud, L"9600");
        EXPECT_EQ(dialog.DataBits, L"8");
        EXPECT_EQ(dialog.StopBits, L"2");
        EXPECT_EQ(dialog.Parity, L"NONE");
        EXPECT_EQ(dialog.Flow, L"NONE");
        EXPECT_EQ(dialog.GetItems(USetComm::kPortList).size(), 4u);
        // Nobody else gets the port while the dialog is open.
        nedit::SerialPort other;
        EXPECT_FALSE(other.Open(instrument.Port()));

        EXPECT_TRUE(dialog.SetComboBoxFld(USetComm::kBaudList, L"19200"));
        EXPECT_FALSE(dialog.SetComboBoxFld(USetComm::kBaudList, L"14400"));
        dialog.Parity = L"EVEN";
        dialog.StopBits = L"1";
        dialog.Flow = L"XON/XOFF";
        ASSERT_TRUE(dialog.OnOK());
        EXPECT_EQ(PortsEntry(L"COM1"), L"19200,e,8,1,x");
        nedit::SerialSettings current;
        ASSERT_TRUE(dialog.GetHandle().Current(current));
        EXPECT_EQ(current.baud, 19200);
        EXPECT_EQ(current.flow, nedit::FlowControl::XonXoff);

        // Another port: the first keeps what it was shown and is let go.
        dialog.OnSelendokCoCombo1(L"COM2");
        EXPECT_FALSE(dialog.GetHandle().IsOpen());
        EXPECT_EQ(dialog.Baud, L"9600");
        nedit::SerialPort again;
        EXPECT_TRUE(again.Open(instrument.Port()));
    }
    nedit::SerialPort after;
    EXPECT_TRUE(after.Open(instrument.Port()));
}

TEST_F(PortDialogs, SetCommRefusesValuesLongerThanTheirLists) {
    USetComm dialog(&host);
    dialog.Baud = L"115200";
    EXPECT_FALSE(dialog.OnOK());
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_EQ(host.Messages()[0].text, L"Please enter no more than 5 characters.");
    EXPECT_EQ(PortsEntry(L"COM1"), L"none");
    // The data-bit item 4 goes into [Ports] as 4 and reads back as 8.
    dialog.Baud = L"4800";
    dialog.DataBits = L"4";
    ASSERT_TRUE(dialog.OnOK());
    EXPECT_EQ(PortsEntry(L"COM1"), L"4800,n,4,2, ");
    dialog.SetPort(L"COM1");
    EXPECT_EQ(dialog.DataBits, L"8");
}

TEST_F(PortDialogs, DownloadStartsFromTheLinkTextsAndThePortsEntry) {
    UNEDownload dialog(&host, &manager);
    dialog.OnInitDialog();
    std::vector<std::wstring> names;
    manager.GetNameList(names);
    EXPECT_EQ(dialog.GetItems(UNEDownload::kInstrumentList), names);
    EXPECT_EQ(dialog.GetItems(UNEDownload::kPortList).size(), 8u);
    EXPECT_EQ(dialog.GetItems(UNEDownload::kBaudList).back(), L"");
    EXPECT_EQ(dialog.Instrument, names.front());  // "KVR-6:" is not in the list
    EXPECT_EQ(dialog.Comm, L"COM2");
    EXPECT_EQ(dialog.Baud, L"9600");
    EXPECT_EQ(dialog.Parity, L"NONE");
    EXPECT_EQ(dialog.DataBits, L"8");
    EXPECT_EQ(dialog.StopBits, L"2");
    EXPECT_EQ(dialog.Flow, L"NONE");
    EXPECT_EQ(dialog.SaveRaw, 1);
    EXPECT_EQ(dialog.AckNak, 0);
    EXPECT_FALSE(dialog.IsAckNakEnabled());
}

TEST_F(PortDialogs, DownloadRefusesRatesOfSixDigits) {
    UNEDownload dialog(&host, &manager);
    dialog.OnInitDialog();
    dialog.Baud = L"115200";
    EXPECT_FALSE(dialog.OnOK());
    EXPECT_EQ(host.Messages().back().text, L"No more than 5 characters please");
    EXPECT_EQ(dialog.GetFocusId(), UNEDownload::kBaudList);
    EXPECT_FALSE(nedit::InstrumentProfile().HasDownloadSettings());
}

TEST_F(PortDialogs, DownloadWritesBothStoresAndTheNextDialogReadsThem) {
    {
        UNEDownload dialog(&host, &manager);
        dialog.OnInitDialog();
        dialog.Instrument = L"Neutral";
        dialog.Comm = L"COM1";
        dialog.Baud = L"4800";
        dialog.Parity = L"ODD";
        dialog.StopBits = L"1.5";
        dialog.Flow = L"HARDWARE";
        dialog.SaveRaw = 0;
        ASSERT_TRUE(dialog.OnOK());
    }
    EXPECT_EQ(PortsEntry(L"COM1"), L"4800,o,8,1.5,p");
    const nedit::InstrumentProfile profile;
    EXPECT_EQ(profile.ReadCurrent().instrument, L"Neutral");
    EXPECT_EQ(profile.ReadCurrent().saveRaw, 0);
    EXPECT_EQ(profile.ReadPortSettings(L"Neutral"), L"COM1,4800,o,8,1.5,p");

    UNEDownload dialog(&host, &manager);
    dialog.OnInitDialog();
    EXPECT_EQ(dialog.Instrument, L"Neutral");
    EXPECT_EQ(dialog.Comm, L"COM1");
    EXPECT_EQ(dialog.Baud, L"4800");
    EXPECT_EQ(dialog.Parity, L"ODD");
    EXPECT_EQ(dialog.StopBits, L"1.5");
    EXPECT_EQ(dialog.Flow, L"HARDWARE");
    EXPECT_EQ(dialog.SaveRaw, 0);  // the stored value replaces the link text's

    // Choosing another instrument keeps the settings of the first and takes its own.
    profile.WritePortSettings(L"Leica GSI", L"COM9,2400,e,7,2,x");
    dialog.Baud = L"1200";
    dialog.OnSelchangeInstrument(L"Leica GSI");
    EXPECT_EQ(profile.ReadPortSettings(L"Neutral"), L"COM1,1200,o,8,1.5,p");
    EXPECT_EQ(dialog.Comm, L"COM1");  // COM9 is not a port of the list
    EXPECT_EQ(dialog.Baud, L"2400");
    EXPECT_EQ(dialog.Parity, L"EVEN");
    EXPECT_EQ(dialog.Flow, L"XON/XOFF");
}

struct AckNakCase {
    const wchar_t* instrument;
    int before;
    int after;
    bool enabled;
};

class AckNakRule : public ::testing::TestWithParam<AckNakCase> {};

TEST_P(AckNakRule, DecidesByTheFirstNameItHolds) {
    int ack_nak = GetParam().before;
    EXPECT_EQ(UNEDownload::ApplyAckNakRule(GetParam().instrument, ack_nak), GetParam().enabled);
    EXPECT_EQ(ack_nak, GetParam().after);
}

INSTANTIATE_TEST_SUITE_P(
    InOrder, AckNakRule,
    ::testing::Values(AckNakCase{L"KVR-3 TOTAL", 0, 1, true}, AckNakCase{L"KVR-200", 0, 0, true},
                      AckNakCase{L"KVR-200", 1, 1, true}, AckNakCase{L"KVR-2", 0, 1, true},
                      AckNakCase{L"DQ-5", 1, 1, true}, AckNakCase{L"DQ-2", 0, 0, true},
                      AckNakCase{L"Leica GSI", 1, 0, false}));

}  // namespace
