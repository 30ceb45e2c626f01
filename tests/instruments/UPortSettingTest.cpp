// The rules of the port settings and the [Ports] store.

#include <gtest/gtest.h>

#include "../support/FakeInstrument.h"
#include "../support/TestSupport.h"
#include "instruments/PortStores.h"
#include "instruments/UPortSetting.h"
#include "platform/settings/IniFile.h"

namespace {

struct BaudCase {
    int given;
    int taken;
};

class Baud : public ::testing::TestWithParam<BaudCase> {};

TEST_P(Baud, IsNormalised) {
    EXPECT_EQ(UPortSetting::GetBaud(GetParam().given), GetParam().taken);
}

INSTANTIATE_TEST_SUITE_P(ListedShortenedAndUnknown, Baud,
                         ::testing::Values(BaudCase{110, 110}, BaudCase{9600, 9600},
                                           BaudCase{921600, 921600}, BaudCase{12, 1200},
                                           BaudCase{24, 2400}, BaudCase{48, 4800},
                                           BaudCase{192, 19200}, BaudCase{384, 38400},
                                           BaudCase{576, 57600}, BaudCase{1152, 115200},
                                           BaudCase{2304, 230400}, BaudCase{4608, 460800},
                                           BaudCase{9216, 921600}, BaudCase{14400, 9600},
                                           BaudCase{0, 9600}, BaudCase{-300, 9600}));

TEST(UPortSetting, CharactersAndTextsOfTheValues) {
    for (int bits : {5, 6, 7, 8}) EXPECT_EQ(UPortSetting::GetDataBit(bits), bits);
    EXPECT_EQ(UPortSetting::GetDataBit(4), 8);
    EXPECT_EQ(UPortSetting::GetDataBit(9), 8);
    EXPECT_EQ(UPortSetting::GetParity(L'E'), 2);
    EXPECT_EQ(UPortSetting::GetParity(L'e'), 2);
    EXPECT_EQ(UPortSetting::GetParity(L'm'), 3);
    EXPECT_EQ(UPortSetting::GetParity(L'O'), 1);
    EXPECT_EQ(UPortSetting::GetParity(L's'), 4);
    EXPECT_EQ(UPortSetting::GetParity(L'n'), 0);
    EXPECT_EQ(UPortSetting::GetParity(L'x'), 0);
    EXPECT_EQ(UPortSetting::GetCtrls(L'P'), 2);
    EXPECT_EQ(UPortSetting::GetCtrls(L'x'), 1);
    EXPECT_EQ(UPortSetting::GetCtrls(L' '), 0);
    EXPECT_EQ(UPortSetting::GetStopBit(L"1"), 0);
    EXPECT_EQ(UPortSetting::GetStopBit(L"1.5"), 1);
    EXPECT_EQ(UPortSetting::GetStopBit(L"2"), 2);
    EXPECT_EQ(UPortSetting::GetStopBit(L""), 2);
    EXPECT_EQ(UPortSetting::GetDataReady(0), 1);
    EXPECT_EQ(UPortSetting::ParityChar(L"SPACE"), L's');
    EXPECT_EQ(UPortSetting::FlowChar(L"HARDWARE"), L'p');
    EXPECT_EQ(UPortSetting::FlowChar(L"NONE"), L' ');
}

TEST(UPortSetting, TokensDropBlanksWhereverTheyStand) {
    const std::wstring text = L"9600, n ,8";
    EXPECT_EQ(UPortSetting::GetString(text, 0), L"9600");
    EXPECT_EQ(UPortSetting::GetString(text, 1), L"N");
    EXPECT_EQ(UPortSetting::GetString(text, 2), L"8");
    EXPECT_EQ(UPortSetting::GetString(text, 3), L"");
    EXPECT_EQ(UPortSetting::GetString(L"COM1,9600,n,8,1.5,x", 4), L"1.5");
}

class PortsEntries : public ::testing::Test {
  protected:
    void Load(const std::wstring& port) {
        UPortSetting::LoadCommSetting(port, baud, data_bits, stop_bits, parity, ctrl);
    }
    std::wstring Entry(const std::wstring& port) const {
        return nedit::IniFile(dir.File("ports.ini")).ReadString(L"Ports", port + L":", L"none");
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    int baud = 0, data_bits = 0, stop_bits = 0, parity = 0, ctrl = 0;
};

TEST_F(PortsEntries, AMissingEntryReadsAsTheDefaults) {
    Load(L"COM1");
    EXPECT_EQ(baud, 9600);
    EXPECT_EQ(parity, 0);
    EXPECT_EQ(data_bits, 8);
    EXPECT_EQ(stop_bits, 2);
    EXPECT_EQ(ctrl, 0);
}

TEST_F(PortsEntries, AreWrittenInTheirFormatAndReadBack) {
    ASSERT_EQ(UPortSetting::SaveCommSetting(L"COM2", L"4800", L"7", L"1.5", L"EVEN", L"XON/XOFF"),
              1);
    EXPECT_EQ(Entry(L"COM2"), L"4800,e,7,1.5,x");
    Load(L"COM2");
    EXPECT_EQ(baud, 4800);
    EXPECT_EQ(data_bits, 7);
    EXPECT_EQ(stop_bits, 1);
    EXPECT_EQ(parity, 2);
    EXPECT_EQ(ctrl, 1);
    // No flow control is a blank behind the last comma, which reads as none; four data bits
    // go in as 4 and read back as 8.
    ASSERT_EQ(UPortSetting::SaveCommSetting(L"COM3", L"1200", L"4", L"2", L"NONE", L"NONE"), 1);
    EXPECT_EQ(Entry(L"COM3"), L"1200,n,4,2, ");
    Load(L"COM3");
    EXPECT_EQ(data_bits, 8);
    EXPECT_EQ(ctrl, 0);
    // Only the first character of the parity counts.
    nedit::PortsStore().WriteEntry(L"COM4", L"2400,Even,8,1,P");
    Load(L"COM4");
    EXPECT_EQ(parity, 2);
    EXPECT_EQ(ctrl, 2);
}

TEST_F(PortsEntries, PortNamesMapToDevices) {
    const nedit::PortsStore store;
    EXPECT_EQ(store.DevicePath(L"COM1"), "/dev/ttyS0");
    EXPECT_EQ(store.DevicePath(L"com4"), "/dev/ttyS3");
    EXPECT_EQ(store.DevicePath(L"COM5"), "/dev/ttyUSB0");
    EXPECT_EQ(store.DevicePath(L"COM8"), "/dev/ttyUSB3");
    EXPECT_EQ(store.DevicePath(L"COM9"), "COM9");
    EXPECT_EQ(store.DevicePath(L"/dev/rfcomm0"), "/dev/rfcomm0");
    ASSERT_TRUE(store.SetDevicePath(L"com2", "/dev/ttyACM0"));
    EXPECT_EQ(store.DevicePath(L"COM2"), "/dev/ttyACM0");
}

TEST_F(PortsEntries, OpenCommAndThePortRule) {
    FakeInstrument far_end;
    ASSERT_TRUE(nedit::PortsStore().SetDevicePath(L"COM6", far_end.Port()));
    nedit::SerialPort port;
    ASSERT_EQ(UPortSetting::OpenComm(L"COM6", port), 1);
    ASSERT_EQ(UPortSetting::SetCommPort(port, 19200, 8, 0, 0, 1), 1);
    nedit::SerialSettings state;
    ASSERT_EQ(UPortSetting::GetCommPort(port, baud, data_bits, stop_bits, parity, state), 1);
    EXPECT_EQ(baud, 19200);
    EXPECT_EQ(stop_bits, 0);
    EXPECT_EQ(state.flow, nedit::FlowControl::XonXoff);
    EXPECT_EQ(UPortSetting::OpenComm(L"COM7", port), 0);
    EXPECT_EQ(port.LastError(), "There is no serial port /dev/ttyUSB2.");
}

}  // namespace
