#pragma once
// A format service loaded with the shipped record definition, for tests of the records.

#include <gtest/gtest.h>

#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"

class RecordFixture : public ::testing::Test {
  protected:
    void SetUp() override { ASSERT_TRUE(format.LoadNeutralFileDefinition(L"" SXNEDIT_DATA_DIR)); }

    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    FieldMap fields;
};
