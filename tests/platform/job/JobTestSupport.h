#pragma once
// A temporary folder per test with a job file in it, removed with everything in it at the end.

#include <gtest/gtest.h>
#include <stdlib.h>
#include <sys/stat.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>

#include "platform/job/USurveyDoc.h"

namespace nedit::test {

/// The repository's data folder (default code library, schema scripts).
inline std::string DataDir() {
    return std::string(SXNEDIT_TEST_DATA) + "/../../data";
}

class TempDir {
  public:
    TempDir() {
        char pattern[] = "/tmp/sxnedit-job-XXXXXX";
        const char* made = mkdtemp(pattern);
        path_ = made != nullptr ? made : "";
    }
    ~TempDir() {
        if (path_.empty()) return;
        std::error_code ignored;
        namespace fs = std::filesystem;
        fs::permissions(path_, fs::perms::owner_all, fs::perm_options::add, ignored);
        for (const auto& entry : fs::recursive_directory_iterator(path_, ignored)) {
            fs::permissions(entry.path(), fs::perms::owner_all, fs::perm_options::add, ignored);
        }
        fs::remove_all(path_, ignored);
    }
    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;

    const std::string& Path() const { return path_; }
    std::string File(const std::string& name) const { return path_ + "/" + name; }
    void Write(const std::string& name, const std::string& bytes) const {
        std::ofstream(File(name), std::ios::binary) << bytes;
    }

  private:
    std::string path_;
};

/// A test with a fresh job of its own, holding the default code library.
class JobTest : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_FALSE(dir.Path().empty());
        path = dir.File("test.job");
        job = USurveyDoc::CreateJob(path, nullptr);
        job->SetSharedCodeLibraryPath(dir.File("no-shared-library.csv"));
    }
    /// Closes the job and opens it again, as another session would see it.
    void Reopen() {
        job.reset();
        job = USurveyDoc::OpenJob(path);
        job->SetSharedCodeLibraryPath(dir.File("no-shared-library.csv"));
    }

    TempDir dir;
    std::string path;
    std::unique_ptr<USurveyDoc> job;
};

}  // namespace nedit::test
