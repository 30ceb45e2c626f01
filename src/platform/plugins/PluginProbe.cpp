#include "platform/plugins/PluginProbe.h"

#include <poll.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <exception>

namespace nedit {

namespace {

constexpr char kPassed = 'P';
constexpr char kFailed = 'F';

void WriteAll(int fd, const std::string& text) {
    std::size_t written = 0;
    while (written < text.size()) {
        const ssize_t n = write(fd, text.data() + written, text.size() - written);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) return;
        written += static_cast<std::size_t>(n);
    }
}

[[noreturn]] void RunChild(int fd, const std::string& path, const PluginCheck& check) {
    // A fault in the library ends the child by its signal, whatever handlers the program
    // (or a sanitizer runtime) installed, so the parent can name it.
    for (const int fault : {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT}) signal(fault, SIG_DFL);
    std::string payload;
    std::string error;
    bool passed = false;
    if (auto library = PluginLibrary::Open(path, error)) {
        try {
            passed = check(*library, payload, error);
        } catch (const std::exception& failure) {
            error = failure.what();
        }
        // The library is left open: its destructors are not run before _exit either way.
        library.release();
    }
    WriteAll(fd, (passed ? kPassed : kFailed) + (passed ? payload : error));
    _exit(0);
}

// Reads what the child writes until it closes the pipe or `deadline` passes; false on time-out.
bool ReadUntilClosed(int fd, std::string& text, std::chrono::steady_clock::time_point deadline) {
    char buffer[4096];
    for (;;) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(
            deadline - std::chrono::steady_clock::now());
        if (left.count() <= 0) return false;
        pollfd wait{fd, POLLIN, 0};
        const int ready = poll(&wait, 1, static_cast<int>(left.count()));
        if (ready < 0 && errno == EINTR) continue;
        if (ready == 0) return false;
        if (ready < 0) return true;
        const ssize_t n = read(fd, buffer, sizeof buffer);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) return true;
        text.append(buffer, static_cast<std::size_t>(n));
    }
}

std::string SignalName(int signal) {
    const char* name = strsignal(signal);
    return "signal " + std::to_string(signal) + (name != nullptr ? std::string(", ") + name : "");
}

}  // namespace

ProbeResult ProbePlugin(const std::string& path, const PluginCheck& check,
                        std::chrono::milliseconds limit) {
    ProbeResult result;
    int fds[2];
    if (pipe(fds) != 0) {
        result.error = std::string("no pipe to try it in: ") + std::strerror(errno);
        return result;
    }
    const pid_t child = fork();
    if (child < 0) {
        close(fds[0]);
        close(fds[1]);
        result.error = std::string("no process to try it in: ") + std::strerror(errno);
        return result;
    }
    if (child == 0) {
        close(fds[0]);
        RunChild(fds[1], path, check);
    }
    close(fds[1]);
    std::string text;
    const bool finished = ReadUntilClosed(fds[0], text, std::chrono::steady_clock::now() + limit);
    close(fds[0]);
    if (!finished) kill(child, SIGKILL);
    int status = 0;
    while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
    }
    if (!finished) {
        result.error = "it did not finish loading within " +
                       (limit.count() % 1000 == 0 ? std::to_string(limit.count() / 1000) + " s"
                                                  : std::to_string(limit.count()) + " ms");
    } else if (WIFSIGNALED(status)) {
        result.error = "it crashed while loading (" + SignalName(WTERMSIG(status)) + ")";
    } else if (text.empty()) {
        result.error = "it ended the program while loading";
    } else if (text[0] == kPassed) {
        result.ok = true;
        result.payload = text.substr(1);
    } else {
        result.error = text.substr(1);
    }
    return result;
}

}  // namespace nedit
