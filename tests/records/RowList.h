#pragma once
// Rows for tests of the rooms beneath the record list: a plain list of record texts behind
// the same gate as the record list's.

#include <string>
#include <vector>

#include "records/RecordText.h"
#include "records/RowSource.h"

namespace nedit::test {

class RowList : public RowSource {
  public:
    explicit RowList(const UNeutralFileFormat* format) : format_(format) {}

    int GetItemCount() const override { return static_cast<int>(rows_.size()); }
    std::wstring GetItemText(int row) const override {
        return InRange(row) ? rows_[static_cast<std::size_t>(row)] : std::wstring();
    }
    const std::vector<std::wstring>& GetRows() const override { return rows_; }
    int AddRecord(int row, const std::wstring& text) override {
        std::wstring normalised = NormaliseRow(*format_, text);
        if (normalised.empty()) return -1;
        if (row < 0 || row > GetItemCount()) row = GetItemCount();
        rows_.insert(rows_.begin() + row, std::move(normalised));
        return row;
    }
    int SetRecord(int row, const std::wstring& text) override {
        std::wstring normalised = NormaliseRow(*format_, text);
        if (normalised.empty() || !InRange(row)) return -1;
        rows_[static_cast<std::size_t>(row)] = std::move(normalised);
        return row;
    }
    void DeleteItem(int row) override {
        if (InRange(row)) rows_.erase(rows_.begin() + row);
    }
    void DeleteAllItems() override { rows_.clear(); }

  private:
    bool InRange(int row) const { return row >= 0 && row < GetItemCount(); }

    const UNeutralFileFormat* format_;
    std::vector<std::wstring> rows_;
};

}  // namespace nedit::test
