#include <gtest/gtest.h>

#include "../job/JobTestSupport.h"
#include "platform/storage/UStorage.h"
#include "platform/storage/UStreamFile.h"

using namespace nedit;
using UStorageTest = nedit::test::JobTest;

namespace {

std::vector<std::wstring> Names(const UStorage& storage, int type) {
    std::vector<std::wstring> names;
    for (const auto& element : storage.EnumElements()) {
        if (element.Type == type) names.push_back(element.Name);
    }
    return names;
}

std::vector<std::wstring> Lines(UStorage& storage, const std::wstring& name) {
    UStreamFile stream;
    std::vector<std::wstring> lines;
    if (stream.OpenStream(storage, name, stgm::ShareExclusive | stgm::ReadWrite) == 0)
        return {L"<none>"};
    std::wstring line;
    while (stream.ReadString(line)) lines.push_back(line);
    return lines;
}

// A raw-data document as the system keeps it: its own data is the text of its records.
class RawDataDocument : public UDocument {
  public:
    int SaveData() override {
        UStreamFile stream;
        if (stream.CreateStream(*GetStorage(), L"NeutralData", 4113) == 0) return 0;
        for (const auto& row : rows) stream.WriteString(row);
        stream.Close();
        return 1;
    }
    std::vector<std::wstring> rows;
};

}  // namespace

TEST_F(UStorageTest, ATransactedStorageKeepsItsStreamsUntilCommit) {
    UStorage& root = *job->GetStorage();
    UStorage data;
    ASSERT_EQ(data.Create(root, L"Data1", 69650), 1);
    EXPECT_TRUE(data.IsTransacted());
    {
        UStreamFile stream;
        ASSERT_EQ(stream.CreateStream(data, L"NeutralData", 4113), 1);
        stream.WriteString(L"#VERSION-1.0 NEUTRAL FILE");
        stream.WriteString(L"STN       ID=É1,HI=1.550");
        stream.Close();
    }
    // Seen through the storage that holds it, not yet in the job.
    EXPECT_EQ(Lines(data, L"NeutralData").size(), 2u);
    {
        UStorage other;
        ASSERT_EQ(other.Open(root, L"Data1", stgm::ReadWrite), 1);
        EXPECT_TRUE(Names(other, UStorageElement::kStream).empty());
    }
    ASSERT_EQ(data.Commit(), 1);
    data.Release();

    // A second stream, written but released without commit, is forgotten.
    ASSERT_EQ(data.Open(root, L"Data1", 69650 & ~stgm::Create), 1);
    {
        UStreamFile stream;
        ASSERT_EQ(stream.CreateStream(data, L"Settings", 4113), 1);
        stream.WriteString(L"1=1");
        stream.Close();
    }
    data.Release();

    Reopen();
    UStorage& again = *job->GetStorage();
    EXPECT_EQ(Names(again, UStorageElement::kStorage), std::vector<std::wstring>{L"Data1"});
    ASSERT_EQ(data.Open(again, L"Data1", 18), 1);
    EXPECT_EQ(Names(data, UStorageElement::kStream), std::vector<std::wstring>{L"NeutralData"});
    EXPECT_EQ(
        Lines(data, L"NeutralData"),
        (std::vector<std::wstring>{L"#VERSION-1.0 NEUTRAL FILE", L"STN       ID=É1,HI=1.550"}));
    EXPECT_EQ(Lines(data, L"Settings"), std::vector<std::wstring>{L"<none>"});

    // Create without the create flag does not replace; with it, it does, emptying the storage.
    UStorage same;
    EXPECT_EQ(same.Create(again, L"Data1", stgm::ReadWrite), 0);
    ASSERT_EQ(same.Create(again, L"Data1", stgm::Create | stgm::ReadWrite), 1);
    EXPECT_TRUE(same.EnumElements().empty());
    EXPECT_EQ(same.Open(again, L"Data9", stgm::ReadWrite), 0);
}

TEST_F(UStorageTest, StreamsReadByLineAndBlockAndAnAbortedWriteLeavesTheOldText) {
    UStorage& root = *job->GetStorage();
    UStorage data;
    ASSERT_EQ(data.Create(root, L"Data1", stgm::Create | stgm::ReadWrite), 1);  // not transacted
    {
        UStreamFile stream;
        ASSERT_EQ(stream.CreateStream(data, L"NeutralData", 4113), 1);
        const std::string bytes = "A\r\nB\n\nlast without end";
        stream.Write(bytes.data(), bytes.size());
        stream.Close();
    }
    EXPECT_EQ(Lines(data, L"NeutralData"),
              (std::vector<std::wstring>{L"A", L"B", L"", L"last without end"}));
    {
        UStreamFile stream;
        ASSERT_EQ(stream.OpenStream(data, L"NeutralData", 18), 1);
        EXPECT_EQ(stream.GetLength(), 22u);
        char block[8];
        EXPECT_EQ(stream.Read(block, sizeof block), 8u);
        EXPECT_EQ(std::string(block, 8), "A\r\nB\n\nla");
        EXPECT_EQ(stream.GetPosition(), 8u);
    }
    {
        UStreamFile stream;
        ASSERT_EQ(stream.CreateStream(data, L"NeutralData", 4113), 1);
        stream.WriteString(L"half");
        stream.Abort();  // as a failed write does
    }
    {
        UStreamFile stream;
        ASSERT_EQ(stream.CreateStream(data, L"NeutralData", 4113), 1);
        stream.WriteString(L"dropped");
    }  // destroyed without Close: nothing written either
    EXPECT_EQ(Lines(data, L"NeutralData").front(), L"A");
    {
        UStreamFile empty;
        ASSERT_EQ(empty.CreateStream(data, L"Empty", 4113), 1);
        empty.Close();  // an empty stream is a stream
    }
    EXPECT_EQ(Names(data, UStorageElement::kStream),
              (std::vector<std::wstring>{L"Empty", L"NeutralData"}));
    UStreamFile missing;
    EXPECT_EQ(missing.OpenStream(data, L"Nothing", 18), 0);
    std::wstring line;
    EXPECT_EQ(missing.ReadString(line), 0);

    EXPECT_EQ(data.RenameElement(L"Empty", L"NeutralData"), 0);  // taken
    ASSERT_EQ(data.RenameElement(L"Empty", L"Views"), 1);
    ASSERT_EQ(data.DestroyElement(L"Views"), 1);
    EXPECT_EQ(data.DestroyElement(L"Views"), 0);
    EXPECT_EQ(Names(data, UStorageElement::kStream), std::vector<std::wstring>{L"NeutralData"});
}

TEST_F(UStorageTest, RawDataDocumentsLiveInChildStoragesOfTheirContainer) {
    UDocument container;
    ASSERT_EQ(container.CreateDocument(L"RawData", job.get()), 1);
    ASSERT_EQ(container.SaveDocument(), 1);
    EXPECT_EQ(container.GetSurveyDocument(), job.get());
    EXPECT_EQ(container.GetJobSettings(), &job->GetSettings());

    RawDataDocument first;
    ASSERT_EQ(first.CreateDocument(L"Data1", &container), 1);
    first.rows = {L"#VERSION-1.0 NEUTRAL FILE", L"STN       ID=A"};
    first.SetModified(1);
    ASSERT_EQ(first.SaveDocument(), 1);
    EXPECT_EQ(first.GetModified(), 0);
    RawDataDocument second;
    ASSERT_EQ(second.CreateDocument(L"Data2", &container), 1);
    second.rows = {L"#VERSION-1.0 NEUTRAL FILE"};
    second.CloseDocument();  // never saved: its storage stays empty

    // Renamed by saving under another name.
    ASSERT_EQ(first.SaveAsDocument(L"Monday"), 1);
    EXPECT_EQ(first.GetName(), L"Monday");
    EXPECT_EQ(container.Delete(L"Data2"), true);
    EXPECT_EQ(container.Delete(L"Data2"), false);

    Reopen();
    UDocument reopened;
    ASSERT_EQ(reopened.OpenDocument(L"RawData", job.get()), 1);
    EXPECT_EQ(Names(*reopened.GetStorage(), UStorageElement::kStorage),
              std::vector<std::wstring>{L"Monday"});
    RawDataDocument monday;
    EXPECT_EQ(monday.OpenDocument(L"Data1", &reopened), 0);
    ASSERT_EQ(monday.OpenDocument(L"Monday", &reopened), 1);
    EXPECT_EQ(Lines(*monday.GetStorage(), L"NeutralData"),
              (std::vector<std::wstring>{L"#VERSION-1.0 NEUTRAL FILE", L"STN       ID=A"}));
}
