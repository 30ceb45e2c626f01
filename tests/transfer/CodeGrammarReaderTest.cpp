#include <gtest/gtest.h>

#include "transfer/CodeGrammarReader.h"

TEST(CodeGrammarReader, ReadsGroupsAndCommandsAsTheReductionDoes) {
    const nedit::CodeGrammarReader reader{nedit::CodeSettings()};
    const std::vector<nedit::CodeGroup> groups = reader.Parse(L"KB01*AS FE02*OS1.5/old");
    ASSERT_EQ(groups.size(), 2u);
    EXPECT_EQ(groups[0].Code, L"KB");
    EXPECT_EQ(groups[0].StrNo, L"01");
    EXPECT_TRUE(reader.HasCommand(groups[0], L"AS"));
    EXPECT_FALSE(reader.HasCommand(groups[1], L"AS"));
    EXPECT_TRUE(reader.HasCommand(groups[1], L"OS"));
    EXPECT_EQ(groups[1].Comment, L"old");
    // An empty field is one empty group.
    ASSERT_EQ(reader.Parse(L"").size(), 1u);
    EXPECT_EQ(reader.Parse(L"")[0].Code, L"");
}
