#pragma once
// The record list: the master copy of a document's records while it is open. Each row is
// one neutral record held as text; there is no parsed form behind a row. Beside the rows the
// list keeps a multi-selection and a focused row, and carries out the list's commands (copy,
// paste, delete, comment, find, drag, keys, printing) on them. Painting is the widget's; it
// follows the list through nedit::ListEvents. The engine reads and writes it as its
// nedit::RowSource.
//
// Decisions where the behaviour of the list is otherwise open:
// - A copy that cannot reach the clipboard is no copy: CopyFrom keeps its value, so a paste
//   that follows still counts as "before any copy".
// - Pasted text is split at CR LF, a lone CR and a lone LF alike (other programs on this
//   system end lines with LF). Empty pieces are skipped and each piece is cut to the row
//   limit; otherwise pasted rows go in unchanged, without the gate.
// - A drag move deletes the original run only when the paste put in exactly as many rows as
//   the run had, so a clipboard that fails half-way duplicates rows but never loses one.
//   For the same reason Ctrl+X deletes only rows that reached the clipboard.
// - DeleteRows with nothing selected asks nothing and does nothing. With several runs
//   selected, the row selected afterwards is the one that follows the last deleted row.
// - UncommentRow puts the old text back only when a form exists and refuses the new one;
//   without a form (the command line) the uncommented row stays.
// - FindText for an empty text does nothing and shows no message: every row would match.
// - An empty list prints one page holding only its heading.

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "document/ListInterfaces.h"
#include "platform/text/TextLines.h"
#include "records/RowSource.h"

class UNeutralFileFormat;

namespace nedit {

class DialogHost;

/// The keys the list reacts to; every other key is Other.
enum class ListKey {
    Other,
    Control,
    Shift,
    Delete,
    Insert,
    Enter,
    Up,
    Down,
    PageUp,
    PageDown,
    C,
    V,
    X
};

/// One printed page of the list as text: the heading on the first line, the rows from
/// kFirstRowLine on, one line each.
struct ListPage {
    static constexpr int kFirstRowLine = 3;
    std::wstring heading;  // "Page %d of %d"
    int firstRow = 0;      // row index of rows[0]
    std::vector<std::wstring> rows;

    /// The page as it is laid out: heading, two empty lines, the rows. Empty for no page.
    std::vector<std::wstring> Lines() const;
};

}  // namespace nedit

class UListCtrl : public nedit::RowSource {
  public:
    /// The column header before any row has been selected.
    static constexpr const wchar_t* kInitialHeader = L"Neutral File Records";

    /// The format service normalises every row that enters; it must outlive the list.
    explicit UListCtrl(const UNeutralFileFormat* format);

    // ---- Collaborators. Each may be null (none at all is the engine's and the command
    // line's case); the list then leaves out what would go to it.
    void SetRecordForm(URecordForm* form) { form_ = form; }
    URecordForm* GetRecordForm() const { return form_; }
    void SetGraphicView(UGraphicPointView* view) { graphic_ = view; }
    void SetClipboard(UClipboard* clipboard) { clipboard_ = clipboard; }
    /// Asks the delete confirmation and shows "not found"; without a host the default
    /// button's answer holds.
    void SetDialogHost(nedit::DialogHost* host) { host_ = host; }
    void SetEvents(nedit::ListEvents* events) { events_ = events; }
    /// Tells whether a long operation that can be aborted (a download) is running; the
    /// document owns that flag, the list only asks. Without a query it is never set.
    void SetAbortProcessQuery(std::function<bool()> query) { abort_query_ = std::move(query); }
    bool IsAbortProcessOn() const { return abort_query_ && abort_query_(); }

    // ---- Rows.
    /// Normalises `text` and, when the result is not empty, inserts it at `row` (a row past
    /// the end appends). Gives the row it went in at, or -1. A row that went in is shown in
    /// the form, except while a long operation runs.
    int AddRecord(int row, const std::wstring& text) override;
    /// The same for UTF-8 text.
    int AddRecordUtf8(int row, std::string_view text) override;
    /// Normalises `text` and, when the result is not empty and `row` exists, replaces the
    /// row's text. Gives the row, or -1.
    int SetRecord(int row, const std::wstring& text) override;
    /// The gate of every row (NormaliseRow) with this list's format.
    std::wstring NormaliseRecord(const std::wstring& text) const;

    int GetItemCount() const override { return static_cast<int>(rows_.size()); }
    /// The row's text; empty for a row that does not exist.
    std::wstring GetItemText(int row) const override;
    std::string_view GetRowUtf8(int row) const override;
    const nedit::TextLines* GetLines() const override { return &rows_; }
    /// Removes every row, with the selection and the focus.
    void DeleteAllItems() override;
    /// Removes the row; a row that does not exist is left alone.
    void DeleteItem(int row) override;
    void Reserve(std::size_t rows);
    /// All rows as wide text, made when asked for and kept until the rows change: for tests
    /// and short lists. Readers of many rows take GetRowUtf8, which copies nothing.
    const std::vector<std::wstring>& GetRows() const;
    /// Puts rows back exactly as they were, past the gate, as an undo does: `texts` go in
    /// before `row` (0 to the row count), unselected. False, with nothing changed, for a row
    /// out of range.
    bool RestoreRows(int row, std::vector<std::wstring> texts);
    /// Gives `row` back the text it had, past the gate. False for a row that does not exist.
    bool RestoreRowText(int row, std::wstring text);

    // ---- Selection and focus. Rows that do not exist are ignored by the setters.
    int GetSelectedCount() const;
    bool IsSelected(int row) const;
    /// The lowest selected row, or -1.
    int GetFirstSelected() const;
    /// The lowest selected row after `row`, or -1.
    int GetNextSelected(int row) const;
    std::vector<int> GetSelectedRows() const;
    void SetSelected(int row, bool selected);
    /// Exactly these rows become selected.
    void SetSelection(const std::vector<int>& rows);
    void ClearSelection();
    /// The focused row, or -1.
    int GetFocusRow() const { return focus_; }
    void SetFocusRow(int row);
    const std::wstring& GetHeaderText() const { return header_; }
    /// First row of the run copied or dragged last; -1 until then.
    int GetCopyFrom() const { return copy_from_; }

    // ---- Commands.
    /// For a non-empty `text` and a form: shows the record in the form and gives the list the
    /// focus back. Gives the form's answer (1 shown), else 0.
    int ShowRecord(const std::wstring& text, int row);
    /// With no rows gives 0, with no selection 1. Else the header becomes "Rec.No:%d" of the
    /// first selected row (counted from 0, so the file's header line is 0), the row goes to
    /// the form, and the form's answer is given.
    int UpdateHeader();
    /// Scrolls to `row` and selects it as a left click on it would; a row out of range is
    /// ignored, and so is the click while a long operation runs.
    void SelectRow(int row);
    /// Puts the contiguous run that starts at the first selected row on the clipboard, last
    /// row first, each row ended by CR LF, and remembers the run's start. Rows selected behind
    /// a gap are not copied. Gives the number of rows copied.
    int CopyRows();
    /// Inserts the clipboard's rows at the first selected row; needs a copy in this list
    /// first. Bottom-first text comes out top first again. The new rows are selected, the
    /// header is updated and the form marked modified. Gives the number of rows put in.
    int PasteRows();
    /// After the user confirms "Confirm Delete Record" with OK, deletes the selected rows and
    /// selects the row that took the place of the last one deleted (or the new last row).
    /// Gives the number of rows deleted.
    int DeleteRows();
    /// Makes the first selected row a comment ("#" in front) unless it is one.
    void CommentRow();
    /// Takes the '#' and the blanks behind it off the first selected row, which then passes
    /// the gate again; the old text comes back if the form cannot show the new one.
    void UncommentRow();
    /// Moves the selection from the first selected row to the next row below of the same
    /// type (comments are one type). Gives 0 with no selection or at the last row, else 1,
    /// whether or not such a row was found. Does not wrap.
    int NextOfType();
    /// The same upward; gives 0 with no selection or at row 0.
    int PreviousOfType();
    /// Finds `text` in the rows from the selected row on, wrapping round once, and selects
    /// the row it is in. With `wholeWord` the match must stand between " ,=" or the row's
    /// ends; only the first occurrence in a row is tested. Gives 1 when found; else shows
    /// "{1} not found." and gives 0. An empty list or text gives 0 at once.
    ///
    /// Going down the search runs from the row after the selected one to the end, then from
    /// row 0 to the selected row. Going up it runs from the row before the selected one to
    /// row 0, then from the row after the selected one downward to the end, so upward the
    /// selected row itself is not searched (except row 0, where the search starts at the
    /// end). With nothing selected it starts at row 0 and does not wrap, so an upward search
    /// sees row 0 only.
    int FindText(const std::wstring& text, bool down, bool matchCase, bool wholeWord);
    /// Asks the graphic view to select and show the point named by the first selected row's
    /// "ID=" field. A field that is not ended by a comma names nothing.
    void HighlightRecordPoint();

    // ---- Dragging rows.
    /// Begins a drag on the first selected row: a move, or with `copy` a copy. False with
    /// nothing selected.
    bool BeginDrag(bool copy);
    /// The mouse is over `row`: it becomes the focused row and the drop target.
    void DragOver(int row);
    /// Ends the drag over `row`. On a row that exists and is not selected, the run copied
    /// from the drag's start goes in before it; a move then takes the run away from where it
    /// was. Gives the number of rows put in; 0 when the drop did nothing.
    int Drop(int row);
    /// Ends a drag without a drop.
    void CancelDrag();
    bool IsDragging() const { return drag_move_ || drag_copy_; }
    bool IsDragCopy() const { return drag_copy_; }
    /// The row the drag is over, or -1.
    int GetDropTarget() const { return drop_target_; }

    // ---- Keys and mouse, as the widget passes them on.
    /// Delete deletes; Up, Down, Page Up and Page Down move the selection (with `extend` the
    /// selection grows from its anchor), update the header and, with exactly one row
    /// selected, show its point; Enter moves the focus to the form.
    void OnKeyDown(nedit::ListKey key, bool extend = false);
    /// With Ctrl down since the last key came up: Insert or C copies, V pastes, X copies and
    /// deletes. With Shift down so: Insert pastes. Every key that comes up clears both.
    void OnKeyUp(nedit::ListKey key);
    /// How many rows Page Up and Page Down move; the widget sets it from its height.
    void SetVisibleRowCount(int rows) { visible_rows_ = rows > 0 ? rows : 1; }
    /// A left click on `row` (-1 for none): selects as a list does (Ctrl toggles, Shift takes
    /// the range from the anchor), updates the header and shows the point. Ignored while a
    /// long operation runs.
    void OnLButtonDown(int row, bool ctrl = false, bool shift = false);
    /// A double click on `row`: selects it and asks for the record dialog on it. Ignored
    /// while a long operation runs.
    void OnLButtonDblClk(int row);

    // ---- Printing.
    /// The number of pages: rows over `pageSize`, rounded up, at least 1; 1 when no page size
    /// is known (0 or less).
    int OnPreparePrinting(int pageSize) const;
    /// Page `page` (from 1): "Page %d of %d" and its rows; without a page size every row is
    /// on page 1. A page out of range gives an empty page.
    nedit::ListPage PrintPage(int page, int pageSize) const;

  private:
    bool InRange(int row) const { return row >= 0 && row < GetItemCount(); }
    /// A row that has passed the gate goes in at `row` (a row past the end appends).
    int InsertRecord(int row, std::string_view normalised);
    /// Inserts rows as they are, unselected, keeping selection and focus on their rows.
    void InsertRows(int row, std::vector<std::wstring> texts);
    void InsertRow(int row, std::string_view text);
    /// Selection, focus and listeners follow `count` rows put in at `row`.
    void RowsAdded(int row, int count);
    /// Removes `count` rows from `row` on.
    void RemoveRows(int row, int count);
    void ReplaceRow(int row, const std::wstring& text);
    /// Only `row` selected and focused, or nothing selected for a row out of range.
    void SelectOnly(int row);
    void NotifySelection();
    /// First and last row of the contiguous selected run around `row`.
    int RunStart(int row) const;
    int RunEnd(int row) const;
    /// Inserts the clipboard's rows at `row`, selects them and focuses the top one.
    int PasteAt(int row);
    /// 0 for a comment, else the row's record type.
    int RowType(int row) const;
    /// The selection leaves `from` for `to`, which is shown, focused and highlighted.
    void StepTo(int from, int to);
    void MoveByKey(int delta, bool extend);
    void MarkFormModified();

    const UNeutralFileFormat* format_;
    nedit::TextLines rows_;  // UTF-8
    std::string gate_;       // the row that passed the gate last
    mutable std::vector<std::wstring> wide_rows_;
    mutable std::uint64_t wide_rows_revision_ = ~std::uint64_t{0};
    std::vector<char> selected_;  // beside rows_, one flag per row
    int focus_ = -1;
    int anchor_ = -1;  // where a Shift selection starts
    std::wstring header_ = kInitialHeader;
    int copy_from_ = -1;
    bool drag_move_ = false;
    bool drag_copy_ = false;
    int drop_target_ = -1;
    bool ctrl_down_ = false;
    bool shift_down_ = false;
    int visible_rows_ = 10;

    URecordForm* form_ = nullptr;
    UGraphicPointView* graphic_ = nullptr;
    UClipboard* clipboard_ = nullptr;
    nedit::DialogHost* host_ = nullptr;
    nedit::ListEvents* events_ = nullptr;
    std::function<bool()> abort_query_;
};
