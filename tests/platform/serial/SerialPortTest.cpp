// The serial port on a pseudo-terminal: the values reach the terminal's settings and read
// back, and failures say what went wrong.

#include <gtest/gtest.h>

#include <chrono>

#include "../../support/FakeInstrument.h"
#include "platform/serial/SerialPort.h"

namespace {

using nedit::FlowControl;
using nedit::Parity;
using nedit::SerialSettings;
using nedit::StopBits;

class SerialValues : public ::testing::TestWithParam<SerialSettings> {};

// A pseudo-terminal keeps the rate, the stop bits and the flow control; it always runs eight
// data bits without parity, whatever it is told, so those two are a real port's to show.
TEST_P(SerialValues, ReachThePortAndReadBack) {
    FakeInstrument terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Port())) << port.LastError();
    ASSERT_TRUE(port.Apply(GetParam())) << port.LastError();
    SerialSettings current;
    ASSERT_TRUE(port.Current(current));
    EXPECT_EQ(current.baud, GetParam().baud);
    EXPECT_EQ(current.stopBits, GetParam().stopBits);
    EXPECT_EQ(current.flow, GetParam().flow);
}

SerialSettings Values(int baud, int bits, StopBits stop, Parity parity, FlowControl flow) {
    SerialSettings settings;
    settings.baud = baud;
    settings.dataBits = bits;
    settings.stopBits = stop;
    settings.parity = parity;
    settings.flow = flow;
    return settings;
}

INSTANTIATE_TEST_SUITE_P(
    EachValue, SerialValues,
    ::testing::Values(Values(9600, 8, StopBits::One, Parity::None, FlowControl::None),
                      Values(110, 7, StopBits::Two, Parity::Even, FlowControl::XonXoff),
                      Values(1200, 6, StopBits::One, Parity::Odd, FlowControl::Hardware),
                      Values(19200, 5, StopBits::Two, Parity::Mark, FlowControl::None),
                      Values(921600, 8, StopBits::One, Parity::Space, FlowControl::XonXoff)));

TEST(SerialPort, OneAndAHalfStopBitsAreTheLongStop) {
    FakeInstrument terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Port()));
    ASSERT_TRUE(port.Apply(Values(4800, 5, StopBits::OneAndHalf, Parity::None, FlowControl::None)));
    SerialSettings current;
    ASSERT_TRUE(port.Current(current));
    EXPECT_EQ(current.stopBits, StopBits::Two);
}

TEST(SerialPort, ValuesThePortCannotTakeAreRefusedWithAReason) {
    FakeInstrument terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Port()));
    EXPECT_FALSE(port.Apply(Values(14400, 8, StopBits::One, Parity::None, FlowControl::None)));
    EXPECT_EQ(port.LastError(),
              "The serial port " + terminal.Port() + " cannot run at 14400 baud.");
    EXPECT_FALSE(port.Apply(Values(9600, 4, StopBits::One, Parity::None, FlowControl::None)));
    EXPECT_EQ(port.LastError(),
              "The serial port " + terminal.Port() + " cannot send words of 4 data bits.");
}

TEST(SerialPort, ReadsWithATimeOutWritesAndSeesTheLinkClose) {
    FakeInstrument terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Port()));
    ASSERT_TRUE(port.Apply(SerialSettings{}));
    unsigned char bytes[16];
    EXPECT_EQ(port.Read(bytes, sizeof bytes, 20), 0);
    terminal.Send("AB\r");
    ASSERT_EQ(port.Read(bytes, sizeof bytes, 1000), 3);
    EXPECT_EQ(std::string(reinterpret_cast<char*>(bytes), 3), "AB\r");  // no CR translation
    const unsigned char answer[] = {0x06};
    EXPECT_EQ(port.Write(answer, 1), 1);
    EXPECT_EQ(terminal.Receive(std::chrono::milliseconds(100)), "\x06");
    terminal.Close();
    EXPECT_EQ(port.Read(bytes, sizeof bytes, 1000), -1);
    EXPECT_EQ(port.LastError(), "The link on " + terminal.Port() + " has closed.");
}

TEST(SerialPort, OnlyOneProgramHoldsAPortAndOthersAreToldWhy) {
    FakeInstrument terminal;
    nedit::SerialPort first;
    nedit::SerialPort second;
    ASSERT_TRUE(first.Open(terminal.Port()));
    EXPECT_FALSE(second.Open(terminal.Port()));
    EXPECT_EQ(second.LastError(),
              "The serial port " + terminal.Port() + " is in use by another program.");
    first.Close();
    first.Close();
    EXPECT_TRUE(second.Open(terminal.Port()));
    EXPECT_FALSE(first.Open("/nonexistent/ttyS0"));
    EXPECT_EQ(first.LastError(), "There is no serial port /nonexistent/ttyS0.");
    EXPECT_FALSE(first.Open("/dev/null"));
    EXPECT_EQ(first.LastError(), "/dev/null is not a serial port.");
    unsigned char byte = 0;
    EXPECT_EQ(first.Read(&byte, 1, 0), -1);
}

}  // namespace
