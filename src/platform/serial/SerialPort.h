#pragma once
// A serial port on a terminal device (termios): opened exclusively, set to raw bytes with
// the link's values, read with a time-out, purged and closed. Every failure leaves a message
// that names the device and the cause, for the user.
//
// Decisions where termios and the port settings differ:
// - 1.5 stop bits set the UART's long stop (CSTOPB), which is 1.5 bits at 5 data bits and 2
//   otherwise, as serial chips have always done it.
// - Word lengths below 5 and rates that the system has no constant for are refused.
// - The limits at which XON and XOFF are sent are the driver's own; XON is 17 and XOFF 19.
// - With software flow control the XON and XOFF bytes that come in are taken by the system
//   and never reach the reader.
// - Two programs never share a port: the device is locked (flock) and set exclusive.

#include <cstddef>
#include <string>

#include "platform/serial/SerialSettings.h"

namespace nedit {

class SerialPort {
  public:
    SerialPort() = default;
    ~SerialPort();
    SerialPort(const SerialPort&) = delete;
    SerialPort& operator=(const SerialPort&) = delete;

    /// Opens the terminal device at `path` for reading and writing, for this program alone.
    /// False, with LastError(), when it does not exist, is no terminal, may not be opened or
    /// is in use. An open port is closed first.
    bool Open(const std::string& path);
    bool IsOpen() const { return fd_ >= 0; }
    const std::string& Path() const { return path_; }

    /// Applies the values: raw bytes, receiver on, modem lines ignored except for hardware
    /// flow control, DTR and RTS raised. False, with LastError(), when the port refuses them.
    bool Apply(const SerialSettings& settings);
    /// The values the port is set to; false when it cannot tell.
    bool Current(SerialSettings& settings) const;

    /// Reads what has come, waiting up to `wait_ms` for the first byte. Gives the count, 0
    /// when nothing came in time (or the wait was interrupted by a signal), -1 when the link
    /// has closed or failed (LastError() says which).
    long Read(unsigned char* bytes, std::size_t size, int wait_ms);
    /// Writes without waiting; gives the count taken, or -1.
    long Write(const unsigned char* bytes, std::size_t size);
    /// Writes all of `bytes`, waiting up to `wait_ms` at a time for the link to take more (a
    /// receiver that holds the flow back). Gives the count, or -1 (LastError() says why)
    /// when the link fails or takes nothing for that long.
    long WriteAll(const unsigned char* bytes, std::size_t size, int wait_ms);
    /// Waits, up to `wait_ms`, until what was written has left the port. False, with
    /// LastError(), when it has not left in time.
    bool Drain(int wait_ms);
    /// Throws away what is waiting in both directions.
    bool Purge();
    /// Throws away what came in and was not read, and closes; what was written still goes
    /// out (an upload's last points). Nothing happens when the port is not open.
    void Close();

    const std::string& LastError() const { return error_; }

  private:
    bool Fail(const std::string& what);

    int fd_ = -1;
    std::string path_;
    std::string error_;
};

}  // namespace nedit
