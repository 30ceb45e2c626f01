#include "platform/serial/SerialPort.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/file.h>
#include <sys/ioctl.h>
#include <termios.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <utility>

namespace nedit {

namespace {

constexpr std::pair<int, speed_t> kRates[] = {
    {50, B50},       {75, B75},         {110, B110},       {134, B134},       {150, B150},
    {200, B200},     {300, B300},       {600, B600},       {1200, B1200},     {1800, B1800},
    {2400, B2400},   {4800, B4800},     {9600, B9600},     {19200, B19200},   {38400, B38400},
    {57600, B57600}, {115200, B115200}, {230400, B230400}, {460800, B460800}, {921600, B921600},
};

bool SpeedOf(int baud, speed_t& speed) {
    for (const auto& [rate, constant] : kRates) {
        if (rate == baud) {
            speed = constant;
            return true;
        }
    }
    return false;
}

int RateOf(speed_t speed) {
    for (const auto& [rate, constant] : kRates) {
        if (constant == speed) return rate;
    }
    return 0;
}

std::string OpenFailure(const std::string& path, int error) {
    switch (error) {
        case ENOENT:
            return "There is no serial port " + path + ".";
        case EACCES:
        case EPERM:
            return "Permission denied to open the serial port " + path +
                   "; the user must be a member of the group that owns it (often dialout).";
        case EBUSY:
            return "The serial port " + path + " is in use by another program.";
        default:
            return "Cannot open the serial port " + path + ": " + std::strerror(error) + ".";
    }
}

}  // namespace

SerialPort::~SerialPort() {
    Close();
}

bool SerialPort::Fail(const std::string& what) {
    error_ = what;
    return false;
}

bool SerialPort::Open(const std::string& path) {
    Close();
    path_ = path;
    const int fd = open(path.c_str(), O_RDWR | O_NOCTTY | O_NONBLOCK | O_CLOEXEC);
    if (fd < 0) return Fail(OpenFailure(path, errno));
    if (!isatty(fd)) {
        close(fd);
        return Fail(path + " is not a serial port.");
    }
    if (flock(fd, LOCK_EX | LOCK_NB) != 0) {
        const int error = errno == EWOULDBLOCK ? EBUSY : errno;
        close(fd);
        return Fail(OpenFailure(path, error));
    }
    ioctl(fd, TIOCEXCL);
    fd_ = fd;
    error_.clear();
    return true;
}

bool SerialPort::Apply(const SerialSettings& settings) {
    if (!IsOpen()) return Fail("The serial port is not open.");
    termios state{};
    if (tcgetattr(fd_, &state) != 0)
        return Fail("Cannot read the settings of " + path_ + ": " + std::strerror(errno) + ".");
    speed_t speed = B9600;
    if (!SpeedOf(settings.baud, speed))
        return Fail("The serial port " + path_ + " cannot run at " + std::to_string(settings.baud) +
                    " baud.");
    if (settings.dataBits < 5 || settings.dataBits > 8)
        return Fail("The serial port " + path_ + " cannot send words of " +
                    std::to_string(settings.dataBits) + " data bits.");
    state.c_iflag &= ~static_cast<tcflag_t>(IGNBRK | BRKINT | PARMRK | ISTRIP | INLCR | IGNCR |
                                            ICRNL | IXON | IXOFF | IXANY | INPCK);
    state.c_oflag &= ~static_cast<tcflag_t>(OPOST);
    state.c_lflag &= ~static_cast<tcflag_t>(ECHO | ECHONL | ICANON | ISIG | IEXTEN);
    state.c_cflag &= ~static_cast<tcflag_t>(CSIZE | PARENB | PARODD | CMSPAR | CSTOPB | CRTSCTS);
    const tcflag_t sizes[] = {CS5, CS6, CS7, CS8};
    state.c_cflag |= sizes[settings.dataBits - 5] | CREAD | CLOCAL;
    switch (settings.parity) {
        case Parity::Odd:
            state.c_cflag |= PARENB | PARODD;
            break;
        case Parity::Even:
            state.c_cflag |= PARENB;
            break;
        case Parity::Mark:
            state.c_cflag |= PARENB | PARODD | CMSPAR;
            break;
        case Parity::Space:
            state.c_cflag |= PARENB | CMSPAR;
            break;
        case Parity::None:
            break;
    }
    if (settings.parity != Parity::None) state.c_iflag |= INPCK;
    if (settings.stopBits != StopBits::One) state.c_cflag |= CSTOPB;
    if (settings.flow == FlowControl::Hardware) state.c_cflag |= CRTSCTS;
    if (settings.flow == FlowControl::XonXoff) state.c_iflag |= IXON | IXOFF;
    state.c_cc[VSTART] = 17;
    state.c_cc[VSTOP] = 19;
    state.c_cc[VMIN] = 1;
    state.c_cc[VTIME] = 0;
    cfsetispeed(&state, speed);
    cfsetospeed(&state, speed);
    if (tcsetattr(fd_, TCSANOW, &state) != 0)
        return Fail("The serial port " + path_ + " refused its settings: " + std::strerror(errno) +
                    ".");
    if (settings.flow != FlowControl::Hardware) {
        // A pseudo-terminal has no modem lines; that is no failure.
        const int lines = TIOCM_DTR | TIOCM_RTS;
        ioctl(fd_, TIOCMBIS, &lines);
    }
    return true;
}

bool SerialPort::Current(SerialSettings& settings) const {
    termios state{};
    if (!IsOpen() || tcgetattr(fd_, &state) != 0) return false;
    settings.baud = RateOf(cfgetospeed(&state));
    const tcflag_t size = state.c_cflag & CSIZE;
    settings.dataBits = size == CS5 ? 5 : size == CS6 ? 6 : size == CS7 ? 7 : 8;
    settings.stopBits = (state.c_cflag & CSTOPB) != 0 ? StopBits::Two : StopBits::One;
    if ((state.c_cflag & PARENB) == 0) {
        settings.parity = Parity::None;
    } else if ((state.c_cflag & CMSPAR) != 0) {
        settings.parity = (state.c_cflag & PARODD) != 0 ? Parity::Mark : Parity::Space;
    } else {
        settings.parity = (state.c_cflag & PARODD) != 0 ? Parity::Odd : Parity::Even;
    }
    settings.flow = (state.c_cflag & CRTSCTS) != 0 ? FlowControl::Hardware
                    : (state.c_iflag & IXON) != 0  ? FlowControl::XonXoff
                                                   : FlowControl::None;
    return true;
}

long SerialPort::Read(unsigned char* bytes, std::size_t size, int wait_ms) {
    if (!IsOpen()) {
        Fail("The serial port is not open.");
        return -1;
    }
    pollfd wait{fd_, POLLIN, 0};
    const int ready = poll(&wait, 1, wait_ms);
    if (ready < 0) {
        if (errno == EINTR) return 0;
        Fail("Reading " + path_ + " failed: " + std::strerror(errno) + ".");
        return -1;
    }
    if (ready == 0) return 0;
    const ssize_t count = read(fd_, bytes, size);
    if (count > 0) return static_cast<long>(count);
    if (count < 0 && (errno == EAGAIN || errno == EINTR)) return 0;
    // A pseudo-terminal whose other end has closed, or an adapter pulled out, ends here.
    Fail(count == 0 || errno == EIO
             ? "The link on " + path_ + " has closed."
             : "Reading " + path_ + " failed: " + std::strerror(errno) + ".");
    return -1;
}

long SerialPort::Write(const unsigned char* bytes, std::size_t size) {
    if (!IsOpen()) return -1;
    const ssize_t count = write(fd_, bytes, size);
    if (count >= 0) return static_cast<long>(count);
    if (errno == EAGAIN) return 0;
    Fail("Writing to " + path_ + " failed: " + std::strerror(errno) + ".");
    return -1;
}

long SerialPort::WriteAll(const unsigned char* bytes, std::size_t size, int wait_ms) {
    std::size_t written = 0;
    while (written < size) {
        const long count = Write(bytes + written, size - written);
        if (count < 0) return -1;
        written += static_cast<std::size_t>(count);
        if (written == size) break;
        pollfd wait{fd_, POLLOUT, 0};
        const int ready = poll(&wait, 1, wait_ms);
        if (ready < 0 && errno == EINTR) continue;
        if (ready <= 0 || (wait.revents & (POLLERR | POLLHUP)) != 0) {
            Fail("The link on " + path_ + " took nothing for " + std::to_string(wait_ms / 1000) +
                 " s.");
            return -1;
        }
    }
    return static_cast<long>(written);
}

bool SerialPort::Drain(int wait_ms) {
    constexpr int kStepMs = 10;
    for (int waited = 0; IsOpen(); waited += kStepMs) {
        int pending = 0;
        if (ioctl(fd_, TIOCOUTQ, &pending) != 0 || pending == 0) return true;
        if (waited >= wait_ms) break;
        usleep(kStepMs * 1000);
    }
    return Fail("What was written to " + path_ + " did not leave the port in time.");
}

bool SerialPort::Purge() {
    return IsOpen() && tcflush(fd_, TCIOFLUSH) == 0;
}

void SerialPort::Close() {
    if (!IsOpen()) return;
    tcflush(fd_, TCIFLUSH);
    close(fd_);
    fd_ = -1;
}

}  // namespace nedit
