#pragma once
// The record list: the master copy of a document's records while it is open. Each row is
// one neutral record held as text; there is no parsed form behind a row.

#include <string>
#include <vector>

class UNeutralFileFormat;

class UListCtrl {
public:
    /// The format service normalises every row that enters; it must outlive the list.
    explicit UListCtrl(const UNeutralFileFormat* format);

    /// Normalises `text` and, when the result is not empty, inserts it at `row` (a row past
    /// the end appends). Gives the row it went in at, or -1.
    int AddRecord(int row, const std::wstring& text);
    /// Normalises `text` and, when the result is not empty and `row` exists, replaces the
    /// row's text. Gives the row, or -1.
    int SetRecord(int row, const std::wstring& text);
    /// The gate of every row: trimmed and upper-cased; an empty text or a comment as it is; a known key
    /// laid out by the format; an unknown key made a comment with "# " in front. The
    /// result is cut to the row limit of 255 characters.
    std::wstring NormaliseRecord(const std::wstring& text) const;

    int GetItemCount() const { return static_cast<int>(rows_.size()); }
    /// The row's text; empty for a row that does not exist.
    std::wstring GetItemText(int row) const;
    void DeleteAllItems() { rows_.clear(); }
    /// Removes the row; a row that does not exist is left alone.
    void DeleteItem(int row);
    void Reserve(std::size_t rows) { rows_.reserve(rows); }
    /// All rows, in order, for readers that walk the whole list.
    const std::vector<std::wstring>& GetRows() const { return rows_; }

private:
    const UNeutralFileFormat* format_;
    std::vector<std::wstring> rows_;
};
