#pragma once
// The rows a run reads, one at a time: the rows Generate was given while it runs, otherwise
// those of the record list. The list's rows are held as UTF-8, so a row's wide text is made
// when it is asked for and nothing is copied for the whole list.

#include <cstddef>
#include <string>
#include <vector>

#include "records/RowSource.h"

namespace nedit {

class RunRows {
  public:
    explicit RunRows(const std::vector<std::wstring>& rows) : Given(&rows) {}
    explicit RunRows(const RowSource& rows) : Source(&rows) {}

    std::size_t size() const {
        return Given != nullptr ? Given->size() : static_cast<std::size_t>(Source->GetItemCount());
    }
    std::wstring operator[](std::size_t row) const {
        return Given != nullptr ? (*Given)[row] : Source->GetItemText(static_cast<int>(row));
    }

  private:
    const std::vector<std::wstring>* Given = nullptr;
    const RowSource* Source = nullptr;
};

}  // namespace nedit
