// kill -9 at random moments of the commands that change a job (a document's import and
// rename, an import of points, a transfer of a reduced survey): afterwards the job passes
// PRAGMA integrity_check and holds the state before the command or the state after it, whole.
// And two programs importing into one job at once: each document keeps a name of its own.
// The program under test is the sxnedit that the build made (SXNEDIT_PROGRAM), or another one
// named by the variable of that name.

#include <fcntl.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <random>
#include <set>
#include <string>
#include <thread>
#include <vector>

#include "../support/TestSupport.h"
#include "platform/job/JobDatabase.h"

namespace {

using Clock = std::chrono::steady_clock;

// Kills per command: enough to land in every stage of a run of a second or less.
constexpr int kTries = 12;
// Rows of the neutral file and points of the CSV file: enough for a run to take a while.
constexpr int kRows = 40000;
constexpr int kPoints = 20000;

std::string Program() {
    const char* named = std::getenv("SXNEDIT_PROGRAM");
    return named != nullptr ? named : SXNEDIT_PROGRAM;
}

pid_t Start(const std::vector<std::string>& args) {
    const pid_t child = fork();
    if (child != 0) return child;
    const int quiet = ::open("/dev/null", O_WRONLY);
    dup2(quiet, STDOUT_FILENO);
    dup2(quiet, STDERR_FILENO);
    std::vector<char*> argv;
    const std::string program = Program();
    argv.push_back(const_cast<char*>(program.c_str()));
    for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    execv(program.c_str(), argv.data());
    _exit(127);
}

/// Runs the program to its end; its exit status.
int RunToEnd(const std::vector<std::string>& args) {
    int status = 0;
    waitpid(Start(args), &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

/// What a test compares: the check of the file, the documents with their streams (a stream
/// by its length and a hash of its bytes), and sums over the points.
std::vector<std::string> StateOf(const std::string& path) {
    nedit::JobDatabase job = nedit::JobDatabase::Open(path);  // rolls back what was left
    std::vector<std::string> state;
    auto check = job.Query("PRAGMA integrity_check");
    while (check->Step()) state.push_back(check->Bytes(0));
    auto streams = job.Query(
        "SELECT storage.name, stream.name, stream.data FROM storage "
        "LEFT JOIN stream ON stream.storage_id = storage.id ORDER BY 1, 2");
    while (streams->Step()) {
        const std::string bytes = streams->Bytes(2);
        state.push_back(streams->Bytes(0) + "|" + streams->Bytes(1) + "|" +
                        std::to_string(bytes.size()) + "|" +
                        std::to_string(std::hash<std::string>{}(bytes)));
    }
    auto points = job.Query("SELECT count(*), total(east), total(north) FROM point");
    if (points->Step()) {
        state.push_back(points->Bytes(0) + "|" + points->Bytes(1) + "|" + points->Bytes(2));
    }
    return state;
}

class CrashSafety : public ::testing::Test {
  protected:
    void SetUp() override {
        const unsigned seed = std::random_device{}();
        random.seed(seed);
        RecordProperty("seed", static_cast<int>(seed));
        std::ofstream neutral(dir.File("field.neu"));
        neutral << "#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=A,HI=1.5\n";
        for (int row = 0; row < kRows; ++row) {
            neutral << "SS ID=P" << row << ",HA=" << row % 360 << ",VA=90,SD=" << 10 + row % 50
                    << ",HT=1.5,CO=FC01\n";
        }
        std::ofstream points(dir.File("points.csv"));
        points << "name,east,north,height,code\n";
        for (int point = 0; point < kPoints; ++point) {
            points << "Q" << point << "," << 1000 + point << ".25," << 2000 - point << ",,KB\n";
        }
    }

    /// Kills `args` at random moments, each time on a fresh copy of `before`, and checks
    /// that the job is then in the state of `before` or of a whole run.
    void KillAtRandom(const std::string& before, const std::vector<std::string>& args) {
        const std::string job = dir.File("work.job");
        auto fresh = [&] {
            std::filesystem::copy_file(before, job,
                                       std::filesystem::copy_options::overwrite_existing);
        };
        const std::vector<std::string> old_state = StateOf(before);
        fresh();
        const Clock::time_point start = Clock::now();
        ASSERT_EQ(RunToEnd(args), 0) << "the command fails without being killed";
        const auto whole =
            std::chrono::duration_cast<std::chrono::microseconds>(Clock::now() - start);
        const std::vector<std::string> new_state = StateOf(job);
        ASSERT_NE(new_state, old_state);

        std::uniform_int_distribution<long> moment(0, whole.count() * 6 / 5);
        int old_seen = 0;
        for (int attempt = 0; attempt < kTries; ++attempt) {
            fresh();
            const long after = moment(random);
            const pid_t child = Start(args);
            std::this_thread::sleep_for(std::chrono::microseconds(after));
            kill(child, SIGKILL);
            waitpid(child, nullptr, 0);
            const std::vector<std::string> state = StateOf(job);
            ASSERT_EQ(state.front(), "ok") << "killed after " << after << " us";
            ASSERT_TRUE(state == old_state || state == new_state)
                << "killed after " << after << " us, the job holds half a change";
            old_seen += state == old_state ? 1 : 0;
        }
        RecordProperty("old_states", old_seen);
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    std::mt19937 random;
};

}  // namespace

TEST_F(CrashSafety, DocImport) {
    const std::string job = dir.File("before.job");
    ASSERT_EQ(RunToEnd({"job", "new", job}), 0);
    ASSERT_EQ(RunToEnd({"doc", "list", job}), 0);  // the container is made on first opening
    KillAtRandom(job, {"doc", "import", dir.File("work.job"), dir.File("field.neu")});
}

TEST_F(CrashSafety, DocRename) {
    const std::string job = dir.File("before.job");
    ASSERT_EQ(RunToEnd({"job", "new", job}), 0);
    ASSERT_EQ(RunToEnd({"doc", "import", job, dir.File("field.neu"), "--name", "OLD"}), 0);
    KillAtRandom(job, {"doc", "rename", dir.File("work.job"), "OLD", "NEW"});
}

TEST_F(CrashSafety, JobImportPoints) {
    const std::string job = dir.File("before.job");
    ASSERT_EQ(RunToEnd({"job", "new", job}), 0);
    KillAtRandom(job, {"job", "import-points", dir.File("work.job"), dir.File("points.csv")});
}

TEST_F(CrashSafety, Transfer) {
    const std::string job = dir.File("before.job");
    ASSERT_EQ(RunToEnd({"job", "new", job}), 0);
    KillAtRandom(job, {"transfer", dir.File("field.neu"), "--job", dir.File("work.job")});
}

TEST_F(CrashSafety, TwoImportsAtOnceTakeTwoNames) {
    const std::string job = dir.File("shared.job");
    ASSERT_EQ(RunToEnd({"job", "new", job}), 0);
    for (int attempt = 0; attempt < 3; ++attempt) {
        const pid_t first = Start({"doc", "import", job, dir.File("field.neu")});
        const pid_t second = Start({"doc", "import", job, dir.File("field.neu")});
        for (const pid_t child : {first, second}) {
            int status = 0;
            waitpid(child, &status, 0);
            EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
        }
    }
    // Six documents of one content, each under a name of its own.
    const std::vector<std::string> state = StateOf(job);
    std::set<std::string> names;
    std::set<std::string> contents;
    for (const std::string& row : state) {
        if (row.find("|NeutralData|") == std::string::npos) continue;
        names.insert(row.substr(0, row.find('|')));
        contents.insert(row.substr(row.find("|NeutralData|")));
    }
    EXPECT_EQ(names.size(), 6u);
    EXPECT_EQ(contents.size(), 1u);
}
