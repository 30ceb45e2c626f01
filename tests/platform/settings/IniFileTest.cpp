#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

#include "../../support/TestSupport.h"
#include "platform/settings/IniFile.h"

using nedit::IniFile;
using nedit::test::TempDir;

TEST(IniFile, MissingFileSectionOrKeyGivesTheFallback) {
    TempDir dir;
    EXPECT_EQ(IniFile(dir.File("none.ini")).ReadString(L"TITLE", L"COLID", L"dflt"), L"dflt");
    dir.Write("a.ini", "[TITLE]\nCOLID=Point\n[OUTPUT]\n");
    IniFile ini(dir.File("a.ini"));
    EXPECT_EQ(ini.ReadString(L"OTHER", L"COLID", L"dflt"), L"dflt");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"COLLN", L"dflt"), L"dflt");
    // A key of another section is not found through this one.
    EXPECT_EQ(ini.ReadString(L"OUTPUT", L"COLID"), L"");
    // A directory in place of the file reads as no file.
    std::filesystem::create_directory(dir.File("d.ini"));
    EXPECT_EQ(IniFile(dir.File("d.ini")).ReadString(L"TITLE", L"COLID", L"dflt"), L"dflt");
}

TEST(IniFile, ReadsValuesAsWritten) {
    TempDir dir;
    const std::string long_value(10000, 'x');
    dir.Write("a.ini",
              "; labels of the report\r\n"
              "[title]\r\n"
              "  colid = PointID\r\n"
              "COLHA=Horiz    \r\n"
              "EXPR=a=b=c\r\n"
              "BLANKS=   \r\n"
              "EMPTY=\r\n"
              "COLID=second one is never read\r\n"
              "LONG=" +
                  long_value +
                  "\r\n"
                  "[DISTUNIT]\n"
                  "M=M\xC3\xA8tres \xC2\xB0\n"
                  "F=Feet");
    IniFile ini(dir.File("a.ini"));
    // Names match without regard to case or the blanks around them; the value after '='
    // keeps its own blanks, the line end (CR LF here) is not part of it.
    EXPECT_EQ(ini.ReadString(L"TITLE", L"COLID"), L" PointID");
    EXPECT_EQ(ini.ReadString(L"Title", L"colha"), L"Horiz    ");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"EXPR"), L"a=b=c");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"BLANKS", L"dflt"), L"   ");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"EMPTY", L"dflt"), L"");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"LONG"), std::wstring(255, L'x'));
    EXPECT_EQ(ini.ReadString(L"DISTUNIT", L"M"), L"M\u00E8tres \u00B0");
    EXPECT_EQ(ini.ReadString(L"DISTUNIT", L"F"), L"Feet");  // last line without a line end
}

TEST(IniFile, WritingKeepsEveryOtherLine) {
    TempDir dir;
    const std::string original =
        "; kept\n"
        "[OUTPUT]\n"
        "order=ID,HA\n"
        "Other = x \n"
        "\n"
        "[VIEWPOS]\n"
        "FRAMEPOS=1,2,3,4,\n";
    dir.Write("a.ini", original);
    IniFile ini(dir.File("a.ini"));

    // Replacing keeps the key as the file spells it.
    ASSERT_TRUE(ini.WriteString(L"Output", L"ORDER", L"ID,LN=2"));
    EXPECT_EQ(dir.Read("a.ini"),
              "; kept\n[OUTPUT]\norder=ID,LN=2\nOther = x \n\n[VIEWPOS]\nFRAMEPOS=1,2,3,4,\n");
    // A new key goes after the section's last line, before the blank that parts it from the next.
    ASSERT_TRUE(ini.WriteString(L"OUTPUT", L"PAGE", L"55"));
    EXPECT_EQ(dir.Read("a.ini"),
              "; kept\n[OUTPUT]\norder=ID,LN=2\nOther = x \nPAGE=55\n\n[VIEWPOS]\n"
              "FRAMEPOS=1,2,3,4,\n");
    // A new section goes at the end, after a blank line.
    ASSERT_TRUE(ini.WriteString(L"TITLE", L"COLID", L"Punkt \u00FC"));
    EXPECT_EQ(dir.Read("a.ini"),
              "; kept\n[OUTPUT]\norder=ID,LN=2\nOther = x \nPAGE=55\n\n[VIEWPOS]\n"
              "FRAMEPOS=1,2,3,4,\n\n[TITLE]\nCOLID=Punkt \xC3\xBC\n");
    EXPECT_EQ(ini.ReadString(L"TITLE", L"COLID"), L"Punkt \u00FC");

    // A CR LF file without a last line end gets CR LF lines.
    dir.Write("crlf.ini", "[A]\r\nX=1");
    IniFile crlf(dir.File("crlf.ini"));
    ASSERT_TRUE(crlf.WriteString(L"A", L"Y", L"2"));
    ASSERT_TRUE(crlf.WriteString(L"B", L"Z", L" 3 "));
    EXPECT_EQ(dir.Read("crlf.ini"), "[A]\r\nX=1\r\nY=2\r\n\r\n[B]\r\nZ= 3 \r\n");
    EXPECT_EQ(crlf.ReadString(L"B", L"Z"), L" 3 ");

    // What would not read back as one key line is refused, and the file stays.
    EXPECT_FALSE(crlf.WriteString(L"A", L"X", L"two\nlines"));
    EXPECT_FALSE(crlf.WriteString(L"A", L"K=V", L"1"));
    EXPECT_FALSE(crlf.WriteString(L"A", L"", L"1"));
    EXPECT_EQ(crlf.ReadString(L"A", L"X"), L"1");
}

TEST(IniFile, WritingMakesTheFileAndItsDirectory) {
    TempDir dir;
    IniFile ini(dir.File("new/deeper/NEDIT.INI"));
    ASSERT_TRUE(ini.WriteString(L"OUTPUT", L"ORDER", L"ID"));
    EXPECT_EQ(dir.Read("new/deeper/NEDIT.INI"), "[OUTPUT]\nORDER=ID\n");
    // No temporary file is left beside it.
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(dir.File("new/deeper")),
                            std::filesystem::directory_iterator()),
              1);
    // Through a link the file it names is written, and the link stays a link.
    std::filesystem::create_symlink(dir.File("new/deeper/NEDIT.INI"), dir.File("link.ini"));
    ASSERT_TRUE(IniFile(dir.File("link.ini")).WriteString(L"OUTPUT", L"ORDER", L"HA"));
    EXPECT_TRUE(std::filesystem::is_symlink(dir.File("link.ini")));
    EXPECT_EQ(dir.Read("new/deeper/NEDIT.INI"), "[OUTPUT]\nORDER=HA\n");
}

TEST(IniFile, AFailedWriteLeavesTheOlderText) {
    TempDir dir;
    // A parent that is a file: no directory can be made, whoever runs the test.
    dir.Write("plain", "not a directory");
    EXPECT_FALSE(IniFile(dir.File("plain/NEDIT.INI")).WriteString(L"A", L"B", L"C"));
    EXPECT_EQ(dir.Read("plain"), "not a directory");
    // A directory where the file should be cannot be replaced by one.
    std::filesystem::create_directory(dir.File("taken.ini"));
    EXPECT_FALSE(IniFile(dir.File("taken.ini")).WriteString(L"A", L"B", L"C"));
    EXPECT_TRUE(std::filesystem::is_directory(dir.File("taken.ini")));

    // A read-only file stays as it is; root may write to it anyway, so check only for others.
    dir.Write("ro.ini", "[A]\nB=old\n");
    ASSERT_EQ(chmod(dir.File("ro.ini").c_str(), 0444), 0);
    if (geteuid() != 0) {
        EXPECT_FALSE(IniFile(dir.File("ro.ini")).WriteString(L"A", L"B", L"new"));
        EXPECT_EQ(dir.Read("ro.ini"), "[A]\nB=old\n");
    }
    // A writable file keeps its mode through the replacement.
    dir.Write("mode.ini", "[A]\nB=old\n");
    ASSERT_EQ(chmod(dir.File("mode.ini").c_str(), 0640), 0);
    ASSERT_TRUE(IniFile(dir.File("mode.ini")).WriteString(L"A", L"B", L"new"));
    struct stat st {};
    ASSERT_EQ(stat(dir.File("mode.ini").c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 0777, 0640u);
}
