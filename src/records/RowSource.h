#pragma once
// The rows of a document as the engine sees them: record texts in order, which a run reads
// and into which it writes the rows it adds (coordinates it was given, adjusted points). The
// record list implements it; the engine needs nothing else of the list.

#include <string>
#include <vector>

namespace nedit {

class RowSource {
  public:
    virtual ~RowSource() = default;

    virtual int GetItemCount() const = 0;
    /// The row's text; empty for a row that does not exist.
    virtual std::wstring GetItemText(int row) const = 0;
    /// All rows, in order, for readers that walk the whole list.
    virtual const std::vector<std::wstring>& GetRows() const = 0;

    /// Puts `text` through the gate of every row (NormaliseRow) and, when the result is not
    /// empty, inserts it at `row` (a row past the end appends). Gives the row, or -1.
    virtual int AddRecord(int row, const std::wstring& text) = 0;
    /// Puts `text` through the gate and, when the result is not empty and `row` exists,
    /// replaces the row's text. Gives the row, or -1.
    virtual int SetRecord(int row, const std::wstring& text) = 0;
    /// Removes the row; a row that does not exist is left alone.
    virtual void DeleteItem(int row) = 0;
    virtual void DeleteAllItems() = 0;
};

}  // namespace nedit
