#pragma once
// What the record list needs of the things around it: the record form beneath it, the plan
// view beside it, the clipboard, and the widget that paints it. Each is an interface, so the
// list's logic runs the same under the desktop, the command line and the tests.

#include <string>

/// The form that shows the current record and lets the user edit its fields.
class URecordForm {
  public:
    virtual ~URecordForm() = default;
    /// Shows `text` as the record of `row`; gives 1 when it could be shown, else 0.
    virtual int ShowRecord(const std::wstring& text, int row) = 0;
    /// Records have been changed since the last reduction.
    virtual void SetModified() = 0;
};

/// The part of the plan view that the list asks to show the point of a record.
class UGraphicPointView {
  public:
    virtual ~UGraphicPointView() = default;
    /// Selects the point of that name; false when there is no such point.
    virtual bool SetSelectedPoint(const std::wstring& name) = 0;
    /// Brings the selected point into view.
    virtual void ViewSelectedPoint() = 0;
};

/// Plain Unicode text shared between programs. Either call may fail when the clipboard
/// cannot be opened; nothing is then changed.
class UClipboard {
  public:
    virtual ~UClipboard() = default;
    /// The text on the clipboard; false when it holds no text or cannot be read.
    virtual bool GetText(std::wstring& text) = 0;
    /// Replaces the clipboard's contents by `text`; false when it cannot be written.
    virtual bool SetText(const std::wstring& text) = 0;
};

namespace nedit {

/// What the widget of the list hears from the logic. Every call comes after the change
/// it reports, except the "about to" calls, which come before it while the rows are still
/// as they were; the defaults ignore them all, so a face overrides only what it shows.
class ListEvents {
  public:
    virtual ~ListEvents() = default;
    virtual void RowsAboutToBeInserted(int /*first*/, int /*count*/) {}
    virtual void RowsAboutToBeRemoved(int /*first*/, int /*count*/) {}
    virtual void RowAboutToChange(int /*row*/) {}
    virtual void RowsAboutToBeCleared() {}
    virtual void RowsInserted(int /*first*/, int /*count*/) {}
    virtual void RowsRemoved(int /*first*/, int /*count*/) {}
    virtual void RowChanged(int /*row*/) {}
    /// All rows went at once.
    virtual void RowsCleared() {}
    /// The selection or the focused row changed.
    virtual void SelectionChanged() {}
    virtual void HeaderChanged(const std::wstring& /*text*/) {}
    /// Scroll so that `row` can be seen.
    virtual void EnsureVisible(int /*row*/) {}
    /// Keyboard focus to the list, or to the record form.
    virtual void FocusList() {}
    virtual void FocusForm() {}
    /// A double click asks for the record dialog on this row's text.
    virtual void EditRecordRequested(const std::wstring& /*text*/, int /*row*/) {}
};

}  // namespace nedit
