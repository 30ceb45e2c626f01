// The serial port on a pseudo-terminal: the values reach the terminal's settings and read
// back, and failures say what went wrong.

#include <gtest/gtest.h>
#include <pty.h>
#include <unistd.h>

#include "platform/serial/SerialPort.h"

namespace {

// A pseudo-terminal; the port opens its far end.
class PseudoTerminal {
  public:
    PseudoTerminal() {
        int slave = -1;
        char name[256] = {};
        if (openpty(&master_, &slave, name, nullptr, nullptr) == 0) {
            path_ = name;
            close(slave);
        }
    }
    ~PseudoTerminal() { Close(); }
    const std::string& Path() const { return path_; }
    void Send(const std::string& bytes) {
        ASSERT_EQ(write(master_, bytes.data(), bytes.size()), static_cast<ssize_t>(bytes.size()));
    }
    std::string Receive() {
        char buffer[64];
        const ssize_t n = read(master_, buffer, sizeof buffer);
        return n > 0 ? std::string(buffer, static_cast<std::size_t>(n)) : std::string();
    }
    void Close() {
        if (master_ >= 0) close(master_);
        master_ = -1;
    }

  private:
    int master_ = -1;
    std::string path_;
};

using nedit::FlowControl;
using nedit::Parity;
using nedit::SerialSettings;
using nedit::StopBits;

class SerialValues : public ::testing::TestWithParam<SerialSettings> {};

// A pseudo-terminal keeps the rate, the stop bits and the flow control; it always runs eight
// data bits without parity, whatever it is told, so those two are a real port's to show.
TEST_P(SerialValues, ReachThePortAndReadBack) {
    PseudoTerminal terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Path())) << port.LastError();
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
    PseudoTerminal terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Path()));
    ASSERT_TRUE(port.Apply(Values(4800, 5, StopBits::OneAndHalf, Parity::None, FlowControl::None)));
    SerialSettings current;
    ASSERT_TRUE(port.Current(current));
    EXPECT_EQ(current.stopBits, StopBits::Two);
}

TEST(SerialPort, ValuesThePortCannotTakeAreRefusedWithAReason) {
    PseudoTerminal terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Path()));
    EXPECT_FALSE(port.Apply(Values(14400, 8, StopBits::One, Parity::None, FlowControl::None)));
    EXPECT_EQ(port.LastError(),
              "The serial port " + terminal.Path() + " cannot run at 14400 baud.");
    EXPECT_FALSE(port.Apply(Values(9600, 4, StopBits::One, Parity::None, FlowControl::None)));
    EXPECT_EQ(port.LastError(),
              "The serial port " + terminal.Path() + " cannot send words of 4 data bits.");
}

TEST(SerialPort, ReadsWithATimeOutWritesAndSeesTheLinkClose) {
    PseudoTerminal terminal;
    nedit::SerialPort port;
    ASSERT_TRUE(port.Open(terminal.Path()));
    ASSERT_TRUE(port.Apply(SerialSettings{}));
    unsigned char bytes[16];
    EXPECT_EQ(port.Read(bytes, sizeof bytes, 20), 0);
    terminal.Send("AB\r");
    ASSERT_EQ(port.Read(bytes, sizeof bytes, 1000), 3);
    EXPECT_EQ(std::string(reinterpret_cast<char*>(bytes), 3), "AB\r");  // no CR translation
    const unsigned char answer[] = {0x06};
    EXPECT_EQ(port.Write(answer, 1), 1);
    EXPECT_EQ(terminal.Receive(), "\x06");
    terminal.Close();
    EXPECT_EQ(port.Read(bytes, sizeof bytes, 1000), -1);
    EXPECT_EQ(port.LastError(), "The link on " + terminal.Path() + " has closed.");
}

TEST(SerialPort, OnlyOneProgramHoldsAPortAndOthersAreToldWhy) {
    PseudoTerminal terminal;
    nedit::SerialPort first;
    nedit::SerialPort second;
    ASSERT_TRUE(first.Open(terminal.Path()));
    EXPECT_FALSE(second.Open(terminal.Path()));
    EXPECT_EQ(second.LastError(),
              "The serial port " + terminal.Path() + " is in use by another program.");
    first.Close();
    first.Close();
    EXPECT_TRUE(second.Open(terminal.Path()));
    EXPECT_FALSE(first.Open("/nonexistent/ttyS0"));
    EXPECT_EQ(first.LastError(), "There is no serial port /nonexistent/ttyS0.");
    EXPECT_FALSE(first.Open("/dev/null"));
    EXPECT_EQ(first.LastError(), "/dev/null is not a serial port.");
    unsigned char byte = 0;
    EXPECT_EQ(first.Read(&byte, 1, 0), -1);
}

}  // namespace
