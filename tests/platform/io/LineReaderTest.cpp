#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "platform/io/LineReader.h"

using nedit::LineReader;

namespace {

std::string WriteTemp(const std::string& name, const std::string& bytes) {
    const std::string path = ::testing::TempDir() + name;
    std::ofstream(path, std::ios::binary) << bytes;
    return path;
}

std::vector<std::string> ReadAll(const std::string& path, std::size_t max_line = 64 * 1024) {
    LineReader reader(max_line);
    EXPECT_TRUE(reader.Open(path));
    std::vector<std::string> lines;
    for (std::string line; reader.ReadLine(line);) lines.push_back(line);
    return lines;
}

}  // namespace

TEST(LineReader, EveryKindOfLineEndAndTheByteOrderMark) {
    const auto lines = ReadAll(WriteTemp("ends.txt",
                                         "\xEF\xBB\xBF"
                                         "a\r\nb\rc\n\nd"));
    EXPECT_EQ(lines, (std::vector<std::string>{"a", "b", "c", "", "d"}));
    EXPECT_TRUE(ReadAll(WriteTemp("empty.txt", "")).empty());
    EXPECT_EQ(ReadAll(WriteTemp("bom.txt", "\xEF\xBB\xBF")).size(), 0u);
}

TEST(LineReader, CrLfSplitAcrossBlocksIsOneLineEnd) {
    // The reader's block is 64 KiB: put the CR as the last byte of the first block.
    std::string bytes(65535, 'x');
    bytes += "\r\nnext\n";
    const auto lines = ReadAll(WriteTemp("split.txt", bytes));
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0].size(), 65535u);
    EXPECT_EQ(lines[1], "next");
}

TEST(LineReader, LongLinesAreCutAndTheRestSkipped) {
    const std::string bytes = std::string(200000, 'y') + "\nshort\n";
    const auto lines = ReadAll(WriteTemp("long.txt", bytes), 300);
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0], std::string(300, 'y'));
    EXPECT_EQ(lines[1], "short");
}

TEST(LineReader, MissingFilesAndDirectoriesDoNotOpen) {
    LineReader reader;
    EXPECT_FALSE(reader.Open(::testing::TempDir() + "no-such-file.neu"));
    LineReader directory;
    EXPECT_FALSE(directory.Open(::testing::TempDir()));
    std::string line;
    EXPECT_FALSE(directory.ReadLine(line));
}
