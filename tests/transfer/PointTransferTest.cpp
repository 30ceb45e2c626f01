// Points into the job: the name rules, each answer to a point the job holds with other
// coordinates, locked points, what a point takes from its code, and its attachments.

#include "TransferFixture.h"
#include "platform/text/WideText.h"
#include "transfer/PointTransfer.h"
#include "transfer/StringTransferSettings.h"

using namespace nedit;
using namespace nedit::test;

namespace {

class PointTransferTest : public TransferTest {};

}  // namespace

// Leading blanks and zeros go, nothing else: "0012" is the job's point 12, and a name of
// zeros only stops the run; what was written before it stays.
TEST_F(PointTransferTest, NamesLoseLeadingBlanksAndZerosAndZerosOnlyStopTheRun) {
    EXPECT_EQ(PointTransfer::StrippedName(L"0012"), L"12");
    EXPECT_EQ(PointTransfer::StrippedName(L" 0 07"), L"7");
    EXPECT_EQ(PointTransfer::StrippedName(L"P0012"), L"P0012");
    EXPECT_EQ(PointTransfer::StrippedName(L"10"), L"10");
    EXPECT_EQ(PointTransfer::StrippedName(L"0.50"), L".50");
    EXPECT_EQ(PointTransfer::StrippedName(L" 000 "), L"");

    const long twelve = JobPoint(L"12", 5, 5, 1.0);
    Point(L"0012", 5, 5, 1.0);  // the same coordinates: no question
    Point(L"007", 7, 7, 1.0);
    Point(L"000", 9, 9, 1.0);
    Point(L"P9", 9, 9, 1.0);
    EXPECT_EQ(Transfer(), 0);
    EXPECT_EQ(report.End, TransferEnd::Failed);
    EXPECT_TRUE(report.Kept);
    ASSERT_EQ(ReadTransfers(job->Database()).size(), 1u);
    EXPECT_FALSE(ReadTransfers(job->Database())[0].Complete);
    EXPECT_EQ(JobPointNamed(L"12").GetId(), twelve);
    EXPECT_EQ(JobPointNamed(L"7").GetX(), 7.0);
    EXPECT_EQ(JobPointNamed(L"P9").GetId(), 0);
    EXPECT_EQ(JobPointNamed(L"0012").GetId(), 0);
    EXPECT_EQ(report.PointsUpdated, 1);
    EXPECT_EQ(report.PointsAdded, 1);
    ASSERT_GE(host.Messages().size(), 2u);
    EXPECT_EQ(host.Messages()[0].text, L"Point ID=000, is invalid.");
    EXPECT_EQ(host.Messages()[1].text, L"Data Transfer Error !");
    EXPECT_EQ(duplicateQuestions, 0);
}

// A line to "0012" looks the raw name up, which the job does not hold: the line is left out,
// as the rule has it, and named with the point that is missing.
TEST_F(PointTransferTest, LineToANameWithLeadingZerosIsLeftOutAndNamed) {
    Point(L"0012", 5, 5, 1.0);
    Point(L"P1", 0, 0, 1.0);
    Line(L"P1", L"0012");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(Count("line"), 0);
    ASSERT_EQ(report.Left.size(), 1u);
    EXPECT_EQ(report.Left[0].Kind, L"line");
    EXPECT_EQ(report.Left[0].Name, L"P1-0012");
    EXPECT_EQ(report.Left[0].Reason, L"point 0012 is not in the job");
}

// Each answer to a point of the job with other coordinates, and the message that asks.
TEST_F(PointTransferTest, EachAnswerToAPointWithOtherCoordinates) {
    const long p1 = JobPoint(L"P1", 0, 0, 1.0);
    JobPoint(L"Q", 50, 50, 1.0);
    Point(L"P1", 1, 2, 1.0);
    Point(L"Q", 50, 50, 1.0);
    Line(L"Q", L"P1");
    std::wstring asked;
    host.SetFace<DuplicatePtsDlg>([&](DuplicatePtsDlg& dialog) {
        asked = dialog.Message;
        EXPECT_EQ(dialog.Mode, DuplicatePtsDlg::kOverwrite);
        EXPECT_FALSE(dialog.IsPrefixEditEnabled());
        EXPECT_EQ(dialog.Prefix, L"NEW");
        EXPECT_EQ(dialog.NewNumber, L"1");
        return static_cast<int>(mb::IdOk);
    });
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(asked,
              L"Point P1's reduced coordinates are different to its coordinates in database.\n\n"
              L"How would you like to deal with this point:  Overwrite / Create New / Abort ?");
    EXPECT_EQ(JobPointNamed(L"P1").GetId(), p1);
    EXPECT_EQ(JobPointNamed(L"P1").GetY(), 2.0);

    // Create new with a prefix: NEWP1, and the line follows the point to its new name.
    points[0].y = 3.0;
    AnswerDuplicates(DuplicatePtsDlg::kPrefix, L" NEW ");
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(JobPointNamed(L"P1").GetY(), 2.0);
    EXPECT_EQ(JobPointNamed(L"NEWP1").GetY(), 3.0);
    ASSERT_EQ(report.Renamed.size(), 1u);
    EXPECT_EQ(report.Renamed[0].JobName, L"NEWP1");
    EXPECT_EQ(Count("line"), 2);
    auto ends = job->Database().Query(
        "SELECT count(*) FROM line JOIN point ON point.id = line.end_id WHERE point.name = "
        "'NEWP1'");
    ASSERT_TRUE(ends->Step());
    EXPECT_EQ(ends->Int(0), 1);

    // NEWP1 now taken: the prefix is refused, "Invalid Prefix !", and the dialog stays open;
    // the test then takes a new number: the job's next free number.
    points[0].y = 4.0;
    int tries = 0;
    host.SetFace<DuplicatePtsDlg>([&](DuplicatePtsDlg& dialog) {
        dialog.Choose(DuplicatePtsDlg::kPrefix);
        if (++tries == 1) {
            EXPECT_FALSE(dialog.OnOK());
            EXPECT_EQ(dialog.Refusal(), L"Point NEWP1 already exists !");
        }
        dialog.Choose(DuplicatePtsDlg::kNewNumber);
        dialog.Prefix = L"";
        EXPECT_TRUE(dialog.OnOK());
        return dialog.EndCode();
    });
    ASSERT_EQ(Transfer(), 1);
    EXPECT_TRUE(Told(L"Invalid Prefix ! Point NEWP1 already exists !"));
    EXPECT_EQ(JobPointNamed(L"1").GetY(), 4.0);

    // Abort: what was written before it stays (R, new, and Q, written again as it stands, come
    // before P1), the rest is not written.
    points[0].y = 5.0;
    Point(L"R", 70, 70, 1.0);
    std::swap(points[0], points[2]);  // R first, then Q, then P1
    host.SetFace<DuplicatePtsDlg>([](DuplicatePtsDlg&) { return static_cast<int>(mb::IdCancel); });
    const long before = Count("point");
    EXPECT_EQ(Transfer(), 1);
    EXPECT_EQ(report.End, TransferEnd::Aborted);
    EXPECT_TRUE(report.Kept);
    EXPECT_EQ(Count("point"), before + 1);
    EXPECT_NE(JobPointNamed(L"R").GetId(), 0);
    EXPECT_EQ(JobPointNamed(L"1").GetY(), 4.0);
    EXPECT_TRUE(
        Told(L"The transfer was stopped: what was written before the stop (2 points, "
             L"0 lines, 0 arcs, 0 circles, 0 polylines) is kept in the job, the rest was "
             L"not written."));
}

// "Apply this method to the rest of the process" with Overwrite: a locked point still asks
// once, with the LOCKED line; from then on no question. Locked points written over, and one
// of equal coordinates rewritten without a question, are named.
TEST_F(PointTransferTest, LockedPointsAskOnceAndAreNamedWhenWrittenOver) {
    JobPoint(L"A", 0, 0, 1.0);
    JobPoint(L"B", 0, 0, 1.0, true);
    JobPoint(L"C", 0, 0, 1.0, true);
    JobPoint(L"D", 5, 5, 1.0, true);
    Point(L"A", 1, 1, 1.0);
    Point(L"B", 1, 1, 1.0);
    Point(L"C", 1, 1, 1.0);
    Point(L"D", 5, 5, 1.0);
    std::vector<std::wstring> messages;
    host.SetFace<DuplicatePtsDlg>([&](DuplicatePtsDlg& dialog) {
        messages.push_back(dialog.Message);
        dialog.ApplyAll = true;
        return static_cast<int>(mb::IdOk);
    });
    ASSERT_EQ(Transfer(), 1);
    ASSERT_EQ(messages.size(), 2u);
    EXPECT_NE(messages[1].find(L"Point B is also LOCKED.\n\nHow would"), std::wstring::npos);
    EXPECT_EQ(JobPointNamed(L"C").GetX(), 1.0);
    EXPECT_EQ(report.LockedRewritten, (std::vector<std::wstring>{L"B", L"C", L"D"}));
    EXPECT_FALSE(JobPointNamed(L"C").IsLocked());  // "Locked" is off: the lock goes
    EXPECT_TRUE(Told(L"Points locked in the job and written over: B, C, D"));

    // Run again: every point is equal and rewritten without a question.
    messages.clear();
    ASSERT_EQ(Transfer(), 1);
    EXPECT_TRUE(messages.empty());
    EXPECT_EQ(report.PointsUpdated, 4);
}

// What a point takes from its code: the layer, made when new; colour and mark; the code text
// or the description; the four flags; the lock; no height for a derived point; and a point
// whose coordinates the reduction took from the job is left as the job has it.
TEST_F(PointTransferTest, PointTakesItsLookAndFlagsFromItsCode) {
    USvyCode flagged = Code(L"CTL", L"CONTROL", 0);
    flagged.PointMark = L"7";
    flagged.PointFlag1 = 1;
    flagged.PointFlag4 = 1;
    flagged.UseInSurface = 1;
    job->GetJobCodeLibrary()->SetSvyCode(flagged);
    Point(L"K1", 1, 1, 3.5, L"CTL");
    points.emplace_back(L"CENTERX-Y", 2, 2, 0.0, L"KB", UNeditPt::kInterpolated);
    Point(L"U1", 3, 3, 1.0, L"ZZZ");  // undefined: added to the job's codes from the default
    JobPoint(L"J1", 9, 9, 9.0);
    Point(L"J1", 8, 8, 8.0);
    dbCoordNames.insert(L"J1");
    StringTransferSettings settings;
    settings.Locked = 1;
    ASSERT_TRUE(SetStringTransferSettings(settings));
    ASSERT_EQ(Transfer(), 1);

    const UDBPoint k1 = JobPointNamed(L"K1");
    EXPECT_EQ(k1.GetCode(), L"CTL");
    EXPECT_EQ(k1.GetLayer(), job->GetLayerId(L"CONTROL"));
    EXPECT_EQ(k1.GetColour(), 3);
    EXPECT_EQ(k1.GetPointMark(), 7);
    EXPECT_EQ(k1.GetFlags(), 0x10u | 0x4000u | 0x800u | UDBObject::kLocked);
    EXPECT_EQ(k1.GetStatus() & UDBPoint::kStatusTransferred, UDBPoint::kStatusTransferred);
    EXPECT_EQ(k1.GetHeight(), 3.5);
    EXPECT_FALSE(JobPointNamed(L"CENTERX-Y").HasHeight());
    EXPECT_EQ(JobPointNamed(L"U1").GetLayer(), job->GetLayerId(L"$$DEFAULT"));
    EXPECT_NE(job->GetJobCodeLibrary()->GetSvyCode(L"ZZZ"), nullptr);
    EXPECT_EQ(JobPointNamed(L"J1").GetX(), 9.0);
    ASSERT_EQ(report.Left.size(), 1u);
    EXPECT_EQ(report.Left[0].Name, L"J1");
    EXPECT_EQ(report.Left[0].Reason,
              L"the reduction took its coordinates from the job, which stand");

    // With "Description" the point code is the code's description.
    settings.SaveDescription = 1;
    settings.Locked = 1;
    SetStringTransferSettings(settings);
    ASSERT_EQ(Transfer(), 1);
    EXPECT_EQ(JobPointNamed(L"K1").GetCode(), L"CTL description");
    EXPECT_TRUE(JobPointNamed(L"K1").IsLocked());
}

// The point code text from the groups: string numbers joined on the side the grammar puts
// them, later groups only with their numbers or with commands, then commands and comment.
TEST_F(PointTransferTest, PointCodeTextJoinsTheGroups) {
    std::vector<CodeGroup> groups(3);
    groups[0].Code = L"KB";
    groups[0].StrNo = L"01";
    groups[0].Commands = L"*AS";
    groups[0].Comment = L"/EDGE";
    groups[1].Code = L"FN";
    groups[2].Code = L"TREE";
    groups[2].StrNo = L"3";
    StringTransferSettings settings;
    EXPECT_EQ(PointTransfer::PointCodeText(groups, settings, false), L"KB01*TREE3");
    EXPECT_EQ(PointTransfer::PointCodeText(groups, settings, true), L"01KB*3TREE");
    settings.IncludeStringNumbers = 0;
    EXPECT_EQ(PointTransfer::PointCodeText(groups, settings, false), L"KB");
    settings.IncludeCommands = 1;
    settings.IncludeComments = 1;
    EXPECT_EQ(PointTransfer::PointCodeText(groups, settings, false), L"KB*FN*TREE*AS/EDGE");
}

// Attributes, a note and images go with the point; an image that will not load asks whether
// to load the rest, and No stops the images for the rest of the run.
TEST_F(PointTransferTest, AttributesNoteAndImagesGoWithThePoint) {
    dir.Write("photo.jpg", "JPEG");
    UNeditPt& first = Point(L"P1", 1, 1, 1.0, L"TREE");
    first.SetPointAttribute(L"SPECIES", L"TEXT", L"OAK");
    first.SetNote(L"LEANS NORTH");
    first.SetImage(3, 4, nedit::FromUtf8(dir.File("photo.jpg")));
    Point(L"P2", 2, 2, 1.0, L"TREE").SetImage(0, 0, L"/no/such.jpg");
    Point(L"P3", 3, 3, 1.0, L"TREE").SetImage(0, 0, L"/no/other.jpg");
    host.QueueAnswer(mb::IdNo);
    ASSERT_EQ(Transfer(), 1);
    const UDBPoint p1 = JobPointNamed(L"P1");
    ASSERT_EQ(p1.GetAttributes().size(), 1u);
    EXPECT_EQ(p1.GetAttributes()[0].Value, L"OAK");
    EXPECT_EQ(p1.GetPointNote(), L"LEANS NORTH");
    EXPECT_EQ(p1.LoadExtendedData(UDBObject::kNoteData), L"LEANS NORTH");
    ASSERT_EQ(p1.GetImages().size(), 1u);
    EXPECT_EQ(p1.GetImages()[0].Number2, 4.0);
    EXPECT_TRUE(Told(L"Images for point: P2 could not be loaded.  Load remaining images ?"));
    EXPECT_FALSE(Told(L"Images for point: P3"));
    ASSERT_EQ(report.Left.size(), 1u);
    EXPECT_EQ(report.Left[0].Kind, L"images");
    EXPECT_EQ(report.Left[0].Name, L"P2");
}
