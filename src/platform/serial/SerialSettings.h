#pragma once
// The values that describe a serial link, in the numeric forms the port settings have always
// used: parity 0 none, 1 odd, 2 even, 3 mark, 4 space; stop bits 0 one, 1 one and a half,
// 2 two; flow control 0 none, 1 XON/XOFF, 2 hardware (RTS/CTS).

namespace nedit {

enum class Parity { None = 0, Odd = 1, Even = 2, Mark = 3, Space = 4 };
enum class StopBits { One = 0, OneAndHalf = 1, Two = 2 };
enum class FlowControl { None = 0, XonXoff = 1, Hardware = 2 };

struct SerialSettings {
    int baud = 9600;
    int dataBits = 8;
    StopBits stopBits = StopBits::One;
    Parity parity = Parity::None;
    FlowControl flow = FlowControl::None;

    bool operator==(const SerialSettings& other) const {
        return baud == other.baud && dataBits == other.dataBits && stopBits == other.stopBits &&
               parity == other.parity && flow == other.flow;
    }
};

}  // namespace nedit
