#include <fcntl.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <future>
#include <string>

#include "../../support/TestSupport.h"
#include "platform/io/ReplaceFile.h"

using nedit::test::TempDir;

namespace {

mode_t ModeOf(const std::string& path) {
    struct stat info {};
    EXPECT_EQ(::lstat(path.c_str(), &info), 0) << path;
    return info.st_mode;
}

// What is waiting to be read from `fd` (non-blocking), up to its end or what is there now.
std::string ReadWaiting(int fd) {
    std::string bytes;
    char buffer[256];
    for (ssize_t n; (n = ::read(fd, buffer, sizeof buffer)) > 0;) {
        bytes.append(buffer, static_cast<std::size_t>(n));
    }
    return bytes;
}

}  // namespace

TEST(ReplaceFile, APlainFileIsReplacedWholeAndKeepsItsMode) {
    TempDir dir;
    dir.Write("report.txt", "old text that is longer than the new");
    ASSERT_EQ(::chmod(dir.File("report.txt").c_str(), 0640), 0);
    ASSERT_TRUE(nedit::ReplaceFile(dir.File("report.txt"), "new"));
    EXPECT_EQ(dir.Read("report.txt"), "new");
    EXPECT_EQ(ModeOf(dir.File("report.txt")) & 07777, 0640u);
    // A new file comes into being; nothing is left beside it.
    ASSERT_TRUE(nedit::ReplaceFile(dir.File("new.txt"), "made"));
    EXPECT_EQ(dir.Read("new.txt"), "made");
    int entries = 0;
    for (const auto& entry : std::filesystem::directory_iterator(dir.Path())) {
        ++entries;
        (void)entry;
    }
    EXPECT_EQ(entries, 2);
}

TEST(ReplaceFile, ANamedPipeIsWrittenInPlaceAndStaysAPipe) {
    TempDir dir;
    const std::string pipe = dir.File("points.fifo");
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    // The reader is there first, as a program reading the pipe would be.
    const int reader = ::open(pipe.c_str(), O_RDONLY | O_NONBLOCK);
    ASSERT_GE(reader, 0);
    ASSERT_TRUE(nedit::ReplaceFile(pipe, "P1,1,2,,\n"));
    EXPECT_EQ(ReadWaiting(reader), "P1,1,2,,\n");
    ::close(reader);
    EXPECT_TRUE(S_ISFIFO(ModeOf(pipe)));
}

TEST(ReplaceFile, ASocketIsWrittenThroughAConnection) {
    TempDir dir;
    const std::string path = dir.File("report.sock");
    const int listener = ::socket(AF_UNIX, SOCK_STREAM, 0);
    ASSERT_GE(listener, 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    ASSERT_LT(path.size(), sizeof address.sun_path);
    path.copy(address.sun_path, path.size());
    ASSERT_EQ(::bind(listener, reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
    ASSERT_EQ(::listen(listener, 1), 0);
    std::future<std::string> received = std::async(std::launch::async, [listener] {
        pollfd waiting{listener, POLLIN, 0};
        if (::poll(&waiting, 1, 5000) != 1) return std::string("nobody connected");
        const int connection = ::accept(listener, nullptr, nullptr);
        std::string bytes;
        char buffer[256];
        for (ssize_t n; (n = ::read(connection, buffer, sizeof buffer)) > 0;) {
            bytes.append(buffer, static_cast<std::size_t>(n));
        }
        ::close(connection);
        return bytes;
    });
    ASSERT_TRUE(nedit::ReplaceFile(path, "report"));
    EXPECT_EQ(received.get(), "report");
    EXPECT_TRUE(S_ISSOCK(ModeOf(path)));
    ::close(listener);
}

TEST(ReplaceFile, ALinkIsFollowedAndItsTargetReplaced) {
    TempDir dir;
    dir.Write("target.csv", "old");
    ASSERT_EQ(::symlink("target.csv", dir.File("link.csv").c_str()), 0);
    ASSERT_TRUE(nedit::ReplaceFile(dir.File("link.csv"), "new"));
    EXPECT_TRUE(S_ISLNK(ModeOf(dir.File("link.csv"))));
    EXPECT_EQ(dir.Read("target.csv"), "new");
    // A link to a file not yet there makes that file.
    ASSERT_EQ(::symlink("later.csv", dir.File("ahead.csv").c_str()), 0);
    ASSERT_TRUE(nedit::ReplaceFile(dir.File("ahead.csv"), "made"));
    EXPECT_TRUE(S_ISLNK(ModeOf(dir.File("ahead.csv"))));
    EXPECT_EQ(dir.Read("later.csv"), "made");
}

TEST(ReplaceFile, RefusesAReadOnlyFileAFolderAndAMissingFolder) {
    TempDir dir;
    dir.Write("kept.neu", "field data");
    ASSERT_EQ(::chmod(dir.File("kept.neu").c_str(), 0444), 0);
    // Refused even for root, who could write it: the user marked it read-only on purpose.
    EXPECT_EQ(nedit::WhyNotWritable(dir.File("kept.neu")), "it is read-only");
    EXPECT_FALSE(nedit::ReplaceFile(dir.File("kept.neu"), "lost"));
    EXPECT_EQ(dir.Read("kept.neu"), "field data");
    EXPECT_EQ(ModeOf(dir.File("kept.neu")) & 07777, 0444u);
    // A link to it is refused alike.
    ASSERT_EQ(::symlink("kept.neu", dir.File("link.neu").c_str()), 0);
    EXPECT_FALSE(nedit::ReplaceFile(dir.File("link.neu"), "lost"));
    EXPECT_EQ(dir.Read("kept.neu"), "field data");

    EXPECT_EQ(nedit::WhyNotWritable(dir.Path()), "it is a folder");
    EXPECT_FALSE(nedit::ReplaceFile(dir.Path(), "text"));
    EXPECT_EQ(nedit::WhyNotWritable(dir.File("no/such.txt")),
              "the folder " + dir.File("no") + " does not exist");
    EXPECT_FALSE(nedit::ReplaceFile(dir.File("no/such.txt"), "text"));
    EXPECT_EQ(nedit::WhyNotWritable(dir.File("fine.txt")), "");
}
