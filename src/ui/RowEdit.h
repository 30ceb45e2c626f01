#pragma once
// One change to the rows of a list, as the undo history keeps it: rows put in, rows taken
// out, or a row's text replaced, with the text on both sides so that it can be undone and
// done again exactly, past the list's gate.

#include <string>
#include <vector>

class UListCtrl;

namespace nedit {

struct RowEdit {
    enum class Kind { Insert, Remove, Change };
    Kind kind;
    int row;
    /// Insert and Remove: the rows from `row` on. Change: the text before, then after.
    std::vector<std::wstring> texts;

    /// Does the edit again on `list`.
    void Apply(UListCtrl& list) const;
    /// Takes the edit back on `list`.
    void Revert(UListCtrl& list) const;
};

}  // namespace nedit
