#pragma once
// An instrument on the far end of a pseudo-terminal: the test's script writes what the
// instrument sends, pauses, reads what it is sent and may close the link, on a thread of its
// own while the download runs on the test's thread.

#include <fcntl.h>
#include <poll.h>
#include <pty.h>
#include <unistd.h>

#include <chrono>
#include <functional>
#include <string>
#include <thread>

class FakeInstrument {
  public:
    FakeInstrument() {
        int slave = -1;
        char name[256] = {};
        if (openpty(&master_, &slave, name, nullptr, nullptr) == 0) {
            port_ = name;
            close(slave);
        }
    }
    ~FakeInstrument() {
        if (thread_.joinable()) thread_.join();
        Close();
    }
    FakeInstrument(const FakeInstrument&) = delete;
    FakeInstrument& operator=(const FakeInstrument&) = delete;

    /// The device the download opens.
    const std::string& Port() const { return port_; }

    /// Runs `script` on the instrument's thread.
    void Play(std::function<void(FakeInstrument&)> script) {
        thread_ = std::thread([this, script] { script(*this); });
    }
    void Join() {
        if (thread_.joinable()) thread_.join();
    }

    void Send(const std::string& bytes) {
        std::size_t sent = 0;
        while (sent < bytes.size()) {
            const ssize_t n = write(master_, bytes.data() + sent, bytes.size() - sent);
            if (n <= 0) return;
            sent += static_cast<std::size_t>(n);
        }
    }
    /// Sends `text` line by line (lines end at CR), `pause` after each, as a slow link would.
    void SendLines(const std::string& text, std::chrono::milliseconds pause) {
        std::size_t start = 0;
        while (start < text.size()) {
            std::size_t end = text.find_first_of("\r\n", start);
            end = end == std::string::npos ? text.size() : text.find_first_not_of("\r\n", end);
            if (end == std::string::npos) end = text.size();
            Send(text.substr(start, end - start));
            Wait(pause);
            start = end;
        }
    }
    static void Wait(std::chrono::milliseconds pause) { std::this_thread::sleep_for(pause); }
    /// What the download sent within `wait`.
    std::string Receive(std::chrono::milliseconds wait) {
        std::string bytes;
        const auto deadline = std::chrono::steady_clock::now() + wait;
        while (std::chrono::steady_clock::now() < deadline) {
            pollfd ready{master_, POLLIN, 0};
            if (poll(&ready, 1, 10) > 0 && (ready.revents & POLLIN) != 0) {
                char buffer[256];
                const ssize_t n = read(master_, buffer, sizeof buffer);
                if (n > 0) bytes.append(buffer, static_cast<std::size_t>(n));
            }
        }
        return bytes;
    }
    /// Pulls the plug: the download's next read finds the link closed.
    void Close() {
        if (master_ >= 0) close(master_);
        master_ = -1;
    }

  private:
    int master_ = -1;
    std::string port_;
    std::thread thread_;
};
