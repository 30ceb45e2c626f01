#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/text/TextLines.h"

using nedit::TextLines;

namespace {

std::vector<std::string> All(const TextLines& lines) {
    std::vector<std::string> out;
    for (std::size_t i = 0; i < lines.size(); ++i) out.emplace_back(lines[i]);
    return out;
}

}  // namespace

TEST(TextLines, KeepsLinesInOrderThroughInsertsReplacementsAndErasures) {
    TextLines lines;
    EXPECT_TRUE(lines.empty());
    lines.push_back("B");
    lines.insert(0, "A");
    lines.insert(2, "D");
    lines.insert(2, std::vector<std::string>{"C1", "C2"});
    EXPECT_EQ(All(lines), (std::vector<std::string>{"A", "B", "C1", "C2", "D"}));
    lines.replace(1, "Bee");
    lines.erase(2, 2);
    EXPECT_EQ(All(lines), (std::vector<std::string>{"A", "Bee", "D"}));
    lines.push_back("");
    EXPECT_EQ(lines.back(), "");
    EXPECT_EQ(lines.size(), 4u);
    lines.clear();
    EXPECT_TRUE(lines.empty());
}

TEST(TextLines, AnEmptyLineMayComeFirst) {
    TextLines lines;
    lines.push_back("");
    lines.push_back("A");
    EXPECT_EQ(All(lines), (std::vector<std::string>{"", "A"}));
}

TEST(TextLines, ALineMayBeCopiedFromAnotherLine) {
    TextLines lines;
    lines.push_back("SS        ID=P1");
    for (int i = 0; i < 1000; ++i) lines.push_back(lines[0]);
    lines.replace(0, lines[1000]);
    EXPECT_EQ(lines[0], "SS        ID=P1");
    EXPECT_EQ(lines[1000], "SS        ID=P1");
}

TEST(TextLines, ManyReplacementsLeaveTheTextWhole) {
    // Each replacement leaves bytes behind until they outweigh the live text and are dropped;
    // here they do so many times over, across blocks.
    TextLines lines;
    for (int i = 0; i < 100; ++i) lines.push_back("ROW " + std::to_string(i));
    for (int round = 0; round < 5000; ++round) {
        for (int i = 0; i < 100; ++i) {
            lines.replace(static_cast<std::size_t>(i),
                          "ROW " + std::to_string(i) + " ROUND " + std::to_string(round));
        }
    }
    for (int i = 0; i < 100; ++i)
        EXPECT_EQ(lines[static_cast<std::size_t>(i)], "ROW " + std::to_string(i) + " ROUND 4999");
}

TEST(TextLines, LinesSharedWithAnotherStayAsTheyWereWhateverItDoesAfter) {
    TextLines list;
    for (int i = 0; i < 1000; ++i) list.push_back("ROW " + std::to_string(i));
    TextLines kept = TextLines::SharingBlocksOf(list);
    kept.PushShared(list, 3);
    kept.push_back("OWN");
    kept.PushShared(list, 999);
    // The list goes on: lines appended to its last block, replaced, erased, compacted.
    for (int i = 0; i < 1000; ++i) list.push_back("MORE " + std::to_string(i));
    for (int round = 0; round < 3000; ++round) list.replace(3, std::string(700, 'x'));
    list.erase(0, 10);
    EXPECT_EQ(All(kept), (std::vector<std::string>{"ROW 3", "OWN", "ROW 999"}));
    EXPECT_EQ(list[0], "ROW 10");
}
