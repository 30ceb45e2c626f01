// Copy, paste, delete and drag in the record list: rows go through the clipboard bottom
// first, and no operation may lose a row.

#include <gtest/gtest.h>

#include "ListFixture.h"

using ListClipboard = ListFixture;
using nedit::ListKey;
using nedit::mb::IdCancel;
using nedit::mb::IdOk;
using NameList = std::vector<std::wstring>;

TEST_F(ListClipboard, CopiedRunComesBackInItsOwnOrder) {
    FillShots(12);
    list.SetSelection({3, 4, 5, 8});  // row 8 stands behind a gap and is not copied
    EXPECT_EQ(list.CopyRows(), 3);
    EXPECT_EQ(list.GetCopyFrom(), 3);
    std::wstring text;
    ASSERT_TRUE(clipboard.GetText(text));
    EXPECT_EQ(text, list.GetItemText(5) + L"\r\n" + list.GetItemText(4) + L"\r\n" +
                        list.GetItemText(3) + L"\r\n");

    list.SetSelection({9});
    EXPECT_EQ(list.PasteRows(), 3);
    EXPECT_EQ(Names(), (NameList{L"P0", L"P1", L"P2", L"P3", L"P4", L"P5", L"P6", L"P7", L"P8",
                                 L"P3", L"P4", L"P5", L"P9", L"P10", L"P11"}));
    // The pasted rows are selected beside the row that was, the top one focused.
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{9, 10, 11, 12}));
    EXPECT_EQ(list.GetFocusRow(), 9);
    EXPECT_EQ(list.GetHeaderText(), L"Rec.No:9");
    EXPECT_EQ(form.modified, 1);
}

TEST_F(ListClipboard, PasteNeedsACopyInThisListAndUsableText) {
    FillShots(3);
    clipboard.SetText(L"SS        ID=X1,HA=1\r\n");
    list.SetSelection({1});
    EXPECT_EQ(list.PasteRows(), 0);  // text from elsewhere, before any copy here
    EXPECT_EQ(list.GetItemCount(), 3);
    EXPECT_EQ(form.modified, 0);

    list.CopyRows();
    list.SetSelection({});
    EXPECT_EQ(list.PasteRows(), 0);  // nowhere to paste

    list.SetSelection({0});
    clipboard.SetText(L"");
    EXPECT_EQ(list.PasteRows(), 0);
    clipboard.SetAvailable(false);
    EXPECT_EQ(list.PasteRows(), 0);
    EXPECT_EQ(list.GetItemCount(), 3);

    // Pasted rows skip the gate, but lines end at LF too, blank lines are dropped and each
    // row keeps to the row limit.
    clipboard.SetAvailable(true);
    clipboard.SetText(L"lower case\n\r\n" + std::wstring(300, L'Z') + L"\rLAST");
    EXPECT_EQ(list.PasteRows(), 3);
    EXPECT_EQ(list.GetItemText(0), L"LAST");
    EXPECT_EQ(list.GetItemText(1), std::wstring(255, L'Z'));
    EXPECT_EQ(list.GetItemText(2), L"lower case");
}

TEST_F(ListClipboard, FailedCopyIsNoCopy) {
    FillShots(3);
    list.SetSelection({1});
    clipboard.SetAvailable(false);
    EXPECT_EQ(list.CopyRows(), 0);
    EXPECT_EQ(list.GetCopyFrom(), -1);

    list.SetClipboard(nullptr);
    EXPECT_EQ(list.CopyRows(), 0);
    EXPECT_EQ(list.PasteRows(), 0);

    // Ctrl+X with a clipboard that cannot take the rows must not delete them.
    list.OnKeyDown(ListKey::Control);
    list.OnKeyDown(ListKey::X);
    list.OnKeyUp(ListKey::X);
    EXPECT_EQ(list.GetItemCount(), 3);
    EXPECT_TRUE(host.Messages().empty());
}

TEST_F(ListClipboard, DeleteAsksAndSelectsTheRowThatTookThePlace) {
    FillShots(6);
    EXPECT_EQ(list.DeleteRows(), 0);  // nothing selected: not even a question
    EXPECT_TRUE(host.Messages().empty());

    list.SetSelection({2, 3});
    host.QueueAnswer(IdCancel);
    EXPECT_EQ(list.DeleteRows(), 0);
    ASSERT_EQ(host.Messages().size(), 1u);
    EXPECT_EQ(host.Messages()[0].text, L"Confirm Delete Record");
    EXPECT_EQ(host.Messages()[0].flags & nedit::mb::ButtonsMask, nedit::mb::OkCancel);
    EXPECT_EQ(list.GetItemCount(), 6);

    host.QueueAnswer(nedit::mb::IdNo);  // anything but OK ends it
    EXPECT_EQ(list.DeleteRows(), 0);

    host.QueueAnswer(IdOk);
    EXPECT_EQ(list.DeleteRows(), 2);
    EXPECT_EQ(Names(), (NameList{L"P0", L"P1", L"P4", L"P5"}));
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{2}));  // P4, where P3 stood
    EXPECT_EQ(form.modified, 1);

    list.SetSelection({0, 3});  // two runs; the last deleted row is P5, the last one
    EXPECT_EQ(list.DeleteRows(), 2);
    EXPECT_EQ(Names(), (NameList{L"P1", L"P4"}));
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{1}));  // the new last row

    list.SetSelection({1});
    list.OnKeyDown(ListKey::Delete);
    EXPECT_EQ(Names(), (NameList{L"P1"}));
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{0}));

    list.DeleteRows();
    EXPECT_EQ(list.GetItemCount(), 0);
    EXPECT_EQ(list.GetFirstSelected(), -1);
}

TEST_F(ListClipboard, KeysCopyPasteAndCutWhileTheModifierIsFresh) {
    FillShots(4);
    list.SetSelection({1});

    list.OnKeyDown(ListKey::Control);
    list.OnKeyDown(ListKey::C);
    list.OnKeyUp(ListKey::C);
    EXPECT_EQ(list.GetCopyFrom(), 1);

    // The C that came up cleared the flag: V without a new Ctrl does nothing.
    list.OnKeyDown(ListKey::V);
    list.OnKeyUp(ListKey::V);
    EXPECT_EQ(list.GetItemCount(), 4);

    list.OnKeyDown(ListKey::Shift);
    list.OnKeyDown(ListKey::Insert);
    list.OnKeyUp(ListKey::Insert);  // Shift+Insert pastes
    EXPECT_EQ(Names(), (NameList{L"P0", L"P1", L"P1", L"P2", L"P3"}));

    list.SetSelection({3});
    list.OnKeyDown(ListKey::Control);
    list.OnKeyDown(ListKey::Insert);
    list.OnKeyUp(ListKey::Insert);  // Ctrl+Insert copies
    list.SetSelection({0});
    list.OnKeyDown(ListKey::Control);
    list.OnKeyDown(ListKey::V);
    list.OnKeyUp(ListKey::V);
    EXPECT_EQ(Names(), (NameList{L"P2", L"P0", L"P1", L"P1", L"P2", L"P3"}));

    list.SetSelection({5});
    list.OnKeyDown(ListKey::Control);
    list.OnKeyDown(ListKey::X);
    list.OnKeyUp(ListKey::X);  // cut: copied, then deleted after the confirmation
    EXPECT_EQ(Names(), (NameList{L"P2", L"P0", L"P1", L"P1", L"P2"}));
    std::wstring text;
    clipboard.GetText(text);
    EXPECT_EQ(text, L"SS        ID=P3,HA=3\r\n");

    // Without Ctrl or Shift the same keys are plain keys.
    list.OnKeyUp(ListKey::C);
    list.OnKeyUp(ListKey::Insert);
    EXPECT_EQ(list.GetItemCount(), 5);
}

TEST_F(ListClipboard, DragMovesOrCopiesTheRunBeforeTheDropRow) {
    FillShots(8);
    EXPECT_FALSE(list.BeginDrag(false));  // nothing selected

    // Move downward: the run P2..P3 lands before P6.
    list.SetSelection({2, 3});
    ASSERT_TRUE(list.BeginDrag(false));
    EXPECT_EQ(list.GetCopyFrom(), 2);
    list.DragOver(6);
    EXPECT_EQ(list.GetDropTarget(), 6);
    EXPECT_EQ(list.GetFocusRow(), 6);
    EXPECT_EQ(list.Drop(6), 2);
    EXPECT_FALSE(list.IsDragging());
    EXPECT_EQ(list.GetDropTarget(), -1);
    EXPECT_EQ(Names(), (NameList{L"P0", L"P1", L"P4", L"P5", L"P2", L"P3", L"P6", L"P7"}));
    EXPECT_EQ(list.GetSelectedRows(), (std::vector<int>{4, 5}));

    // Move upward: the run P2..P3 lands before P0.
    ASSERT_TRUE(list.BeginDrag(false));
    EXPECT_EQ(list.Drop(0), 2);
    EXPECT_EQ(Names(), (NameList{L"P2", L"P3", L"P0", L"P1", L"P4", L"P5", L"P6", L"P7"}));

    // Copy with Ctrl: the original stays, the target row is focused.
    list.SetSelection({7});
    ASSERT_TRUE(list.BeginDrag(true));
    EXPECT_TRUE(list.IsDragCopy());
    EXPECT_EQ(list.Drop(3), 1);
    EXPECT_EQ(Names(), (NameList{L"P2", L"P3", L"P0", L"P7", L"P1", L"P4", L"P5", L"P6", L"P7"}));
    EXPECT_EQ(list.GetFocusRow(), 3);
    EXPECT_GE(form.modified, 3);
}

TEST_F(ListClipboard, DropThatCannotLandChangesNothing) {
    FillShots(6);
    const NameList before = Names();

    list.SetSelection({1, 2, 4});
    ASSERT_TRUE(list.BeginDrag(false));
    EXPECT_EQ(list.Drop(4), 0);  // a selected row, even one behind the gap
    EXPECT_FALSE(list.IsDragging());
    ASSERT_TRUE(list.BeginDrag(false));
    EXPECT_EQ(list.Drop(2), 0);  // inside the run itself
    ASSERT_TRUE(list.BeginDrag(false));
    EXPECT_EQ(list.Drop(17), 0);  // no row under the mouse
    EXPECT_EQ(list.Drop(0), 0);   // no drag under way
    ASSERT_TRUE(list.BeginDrag(false));
    list.CancelDrag();
    EXPECT_EQ(list.Drop(0), 0);
    EXPECT_EQ(Names(), before);

    // A clipboard that fails must not turn a move into a deletion.
    ASSERT_TRUE(list.BeginDrag(false));
    clipboard.SetAvailable(false);
    EXPECT_EQ(list.Drop(5), 0);
    EXPECT_EQ(Names(), before);
    EXPECT_EQ(form.modified, 0);
}
