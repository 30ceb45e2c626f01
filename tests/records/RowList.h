#pragma once
// Rows for tests of the rooms beneath the record list: a plain list of record texts behind
// the same gate as the record list's, kept as wide text and as UTF-8 side by side.

#include <string>
#include <vector>

#include "platform/text/WideText.h"
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
    std::string_view GetRowUtf8(int row) const override {
        return InRange(row) ? std::string_view(utf8_[static_cast<std::size_t>(row)])
                            : std::string_view();
    }
    const std::vector<std::wstring>& GetRows() const { return rows_; }
    int AddRecord(int row, const std::wstring& text) override {
        std::wstring normalised = NormaliseRow(*format_, text);
        if (normalised.empty()) return -1;
        if (row < 0 || row > GetItemCount()) row = GetItemCount();
        utf8_.insert(utf8_.begin() + row, ToUtf8(normalised));
        rows_.insert(rows_.begin() + row, std::move(normalised));
        RowsChanged();
        return row;
    }
    int AddRecordUtf8(int row, std::string_view text) override {
        return AddRecord(row, FromUtf8(text));
    }
    int SetRecord(int row, const std::wstring& text) override {
        std::wstring normalised = NormaliseRow(*format_, text);
        if (normalised.empty() || !InRange(row)) return -1;
        utf8_[static_cast<std::size_t>(row)] = ToUtf8(normalised);
        rows_[static_cast<std::size_t>(row)] = std::move(normalised);
        RowsChanged();
        return row;
    }
    void DeleteItem(int row) override {
        if (!InRange(row)) return;
        rows_.erase(rows_.begin() + row);
        utf8_.erase(utf8_.begin() + row);
        RowsChanged();
    }
    void DeleteAllItems() override {
        rows_.clear();
        utf8_.clear();
        RowsChanged();
    }

  private:
    bool InRange(int row) const { return row >= 0 && row < GetItemCount(); }

    const UNeutralFileFormat* format_;
    std::vector<std::wstring> rows_;
    std::vector<std::string> utf8_;
};

}  // namespace nedit::test
