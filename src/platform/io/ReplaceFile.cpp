#include "platform/io/ReplaceFile.h"

#include <fcntl.h>
#include <signal.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <ctime>

namespace nedit {

namespace {

// The kernel gives up after this many links in a row; so do we.
constexpr int kMaxLinks = 40;

std::string FolderOf(const std::string& path) {
    const auto slash = path.find_last_of('/');
    if (slash == std::string::npos) return ".";
    return slash == 0 ? "/" : path.substr(0, slash);
}

// The path that the links at the end of `path` lead to, whether or not a file is there yet.
// A chain that goes round is given back as it stands; stat then fails on it.
std::string FollowLinks(std::string path) {
    for (int hop = 0; hop < kMaxLinks; ++hop) {
        struct stat info {};
        if (::lstat(path.c_str(), &info) != 0 || !S_ISLNK(info.st_mode)) return path;
        std::string link(static_cast<std::size_t>(info.st_size > 0 ? info.st_size : 4096), '\0');
        const ssize_t length = ::readlink(path.c_str(), link.data(), link.size());
        if (length <= 0) return path;
        link.resize(static_cast<std::size_t>(length));
        path = link[0] == '/' ? link : FolderOf(path) + "/" + link;
    }
    return path;
}

bool HasWriteBit(const struct stat& info) {
    return (info.st_mode & (S_IWUSR | S_IWGRP | S_IWOTH)) != 0;
}

bool WriteAll(int fd, std::string_view bytes, bool socket) {
    std::size_t written = 0;
    while (written < bytes.size()) {
        const char* from = bytes.data() + written;
        const std::size_t count = bytes.size() - written;
        const ssize_t n = socket ? ::send(fd, from, count, MSG_NOSIGNAL) : ::write(fd, from, count);
        if (n < 0 && errno == EINTR) continue;
        if (n <= 0) return false;
        written += static_cast<std::size_t>(n);
    }
    return true;
}

// The pieces of `produce`, gathered into writes of a good size.
bool WritePieces(int fd, bool socket, const std::function<bool(const ByteSink&)>& produce) {
    constexpr std::size_t kWriteSize = 1 << 16;
    std::string buffer;
    buffer.reserve(kWriteSize);
    const ByteSink sink = [&](std::string_view piece) {
        if (buffer.size() + piece.size() > kWriteSize) {
            if (!WriteAll(fd, buffer, socket)) return false;
            buffer.clear();
        }
        if (piece.size() >= kWriteSize) return WriteAll(fd, piece, socket);
        buffer.append(piece);
        return true;
    };
    return produce(sink) && WriteAll(fd, buffer, socket);
}

// A reader of a pipe that goes away must fail the write, not end the program: SIGPIPE is
// held back while this lives, and one that came meanwhile is taken away unseen.
class PipeSignalHold {
  public:
    PipeSignalHold() {
        sigemptyset(&pipe_);
        sigaddset(&pipe_, SIGPIPE);
        sigset_t pending;
        sigpending(&pending);
        already_pending_ = sigismember(&pending, SIGPIPE) == 1;
        pthread_sigmask(SIG_BLOCK, &pipe_, &old_);
    }
    ~PipeSignalHold() {
        sigset_t pending;
        sigpending(&pending);
        if (!already_pending_ && sigismember(&pending, SIGPIPE) == 1) {
            const timespec now{0, 0};
            sigtimedwait(&pipe_, nullptr, &now);
        }
        pthread_sigmask(SIG_SETMASK, &old_, nullptr);
    }
    PipeSignalHold(const PipeSignalHold&) = delete;
    PipeSignalHold& operator=(const PipeSignalHold&) = delete;

  private:
    sigset_t pipe_{};
    sigset_t old_{};
    bool already_pending_ = false;
};

int ConnectSocket(const std::string& path) {
    sockaddr_un address{};
    if (path.size() >= sizeof address.sun_path) return -1;
    address.sun_family = AF_UNIX;
    path.copy(address.sun_path, path.size());
    const int fd = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (fd < 0) return -1;
    if (::connect(fd, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0) {
        ::close(fd);
        return -1;
    }
    return fd;
}

bool WriteInPlace(const std::string& path, const std::function<bool(const ByteSink&)>& produce,
                  const struct stat& info) {
    const bool socket = S_ISSOCK(info.st_mode);
    const int fd =
        socket ? ConnectSocket(path) : ::open(path.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC);
    if (fd < 0) return false;
    bool ok;
    {
        PipeSignalHold hold;
        ok = WritePieces(fd, socket, produce);
    }
    if (::close(fd) != 0) ok = false;
    return ok;
}

bool WriteBesideAndRename(const std::string& path,
                          const std::function<bool(const ByteSink&)>& produce,
                          const struct stat* old_stat) {
    std::string temporary;
    int fd = -1;
    for (int attempt = 0; attempt < 100 && fd < 0; ++attempt) {
        temporary = path + ".~" + std::to_string(::getpid()) + "-" + std::to_string(attempt);
        fd = ::open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
        if (fd < 0 && errno != EEXIST) return false;
    }
    if (fd < 0) return false;
    bool ok = WritePieces(fd, false, produce);
    if (ok && old_stat != nullptr) {
        // Only root may give a file away; anyone else keeps the file as their own.
        if (::fchown(fd, old_stat->st_uid, old_stat->st_gid) != 0) {
            (void)::fchown(fd, static_cast<uid_t>(-1), old_stat->st_gid);
        }
        ok = ::fchmod(fd, old_stat->st_mode & 07777) == 0;
    }
    if (ok) ok = ::fsync(fd) == 0;
    if (::close(fd) != 0) ok = false;
    if (ok) ok = std::rename(temporary.c_str(), path.c_str()) == 0;
    if (!ok) ::unlink(temporary.c_str());
    return ok;
}

}  // namespace

std::string WhyNotWritable(const std::string& target) {
    const std::string path = FollowLinks(target);
    const std::string folder = FolderOf(path);
    struct stat info {};
    if (::stat(path.c_str(), &info) == 0) {
        if (S_ISDIR(info.st_mode)) return "it is a folder";
        if (!HasWriteBit(info) || ::access(path.c_str(), W_OK) != 0) return "it is read-only";
        if (S_ISREG(info.st_mode) && ::access(folder.c_str(), W_OK | X_OK) != 0) {
            return "its folder " + folder + " cannot be written";
        }
        return {};
    }
    if (errno == ELOOP) return "its links lead round in a circle";
    struct stat folder_info {};
    if (::stat(folder.c_str(), &folder_info) != 0 || !S_ISDIR(folder_info.st_mode)) {
        return "the folder " + folder + " does not exist";
    }
    if (::access(folder.c_str(), W_OK | X_OK) != 0)
        return "its folder " + folder + " cannot be written";
    return {};
}

bool ReplaceFile(const std::string& target, const std::string& bytes) {
    return ReplaceFile(target, [&bytes](const ByteSink& write) { return write(bytes); });
}

bool ReplaceFile(const std::string& target, const std::function<bool(const ByteSink&)>& produce) {
    if (!WhyNotWritable(target).empty()) return false;
    const std::string path = FollowLinks(target);
    struct stat info {};
    const bool exists = ::stat(path.c_str(), &info) == 0;
    if (exists && !S_ISREG(info.st_mode)) return WriteInPlace(path, produce, info);
    return WriteBesideAndRename(path, produce, exists ? &info : nullptr);
}

}  // namespace nedit
