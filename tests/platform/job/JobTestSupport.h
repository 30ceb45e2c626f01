#pragma once
// A test with a job file of its own in a temporary folder.

#include <gtest/gtest.h>
#include <stdlib.h>
#include <sys/stat.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>

#include "../../support/TestSupport.h"
#include "platform/job/USurveyDoc.h"

namespace nedit::test {

/// The repository's data folder (default code library, schema scripts).
inline std::string DataDir() {
    return std::string(SXNEDIT_TEST_DATA) + "/../../data";
}

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
