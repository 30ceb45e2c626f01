#pragma once
// The rows of a document as the engine sees them: record texts in order, which a run reads
// and into which it writes the rows it adds (coordinates it was given, adjusted points). The
// record list implements it; the engine needs nothing else of the list.
//
// Rows are held as UTF-8. Readers that walk many rows take them as UTF-8 views, which cost
// nothing; the wide text of one row is made when it is asked for.

#include <cstdint>
#include <string>
#include <string_view>

#include "platform/text/TextLines.h"

namespace nedit {

class RowSource {
  public:
    virtual ~RowSource() = default;

    virtual int GetItemCount() const = 0;
    /// The row's text; empty for a row that does not exist.
    virtual std::wstring GetItemText(int row) const = 0;
    /// The row's text as UTF-8, good until the rows next change; empty for a row that does
    /// not exist.
    virtual std::string_view GetRowUtf8(int row) const = 0;
    /// The block of text that holds the rows, line for row, when the source keeps one: a
    /// reader that keeps many rows can share its bytes (TextLines::SharingBlocksOf). Null
    /// when the rows are kept otherwise.
    virtual const nedit::TextLines* GetLines() const { return nullptr; }

    /// Puts `text` through the gate of every row (NormaliseRow) and, when the result is not
    /// empty, inserts it at `row` (a row past the end appends). Gives the row, or -1.
    virtual int AddRecord(int row, const std::wstring& text) = 0;
    /// The same for UTF-8 text (a line of a file, of a stored stream).
    virtual int AddRecordUtf8(int row, std::string_view text) = 0;
    /// Puts `text` through the gate and, when the result is not empty and `row` exists,
    /// replaces the row's text. Gives the row, or -1.
    virtual int SetRecord(int row, const std::wstring& text) = 0;
    /// Removes the row; a row that does not exist is left alone.
    virtual void DeleteItem(int row) = 0;
    virtual void DeleteAllItems() = 0;

    /// Grows with every change of the rows, so that a reader that keeps something it made of
    /// them (an index) can tell whether it still holds.
    std::uint64_t GetRevision() const { return Revision; }

  protected:
    /// Every change of the rows calls it.
    void RowsChanged() { ++Revision; }

  private:
    std::uint64_t Revision = 0;
};

}  // namespace nedit
