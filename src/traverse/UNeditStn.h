#pragma once
// One set-up of the route search: an STN record whose station the run could position, with
// the records of its block that the search reads. The same station occupied twice gives two.

#include <string>
#include <utility>

#include "traverse/NameList.h"

class UNeditStn {
  public:
    UNeditStn(std::wstring name, int index) : StnName(std::move(name)), Index(index) {}

    const std::wstring& GetStnName() const { return StnName; }
    /// The row of the STN record.
    int GetIndex() const { return Index; }
    /// Observations of this set-up that lead to another occupied station: the edges.
    const nedit::NameList& GetStnList() const { return StnList; }
    /// Every side-shot record of the set-up, edge or not.
    const nedit::NameList& GetSSList() const { return SSList; }
    const nedit::NameList& GetBSList() const { return BSList; }
    const nedit::NameList& GetBKBList() const { return BKBList; }

    // Pairs are appended as they come; a name observed twice stands twice.
    void AddStn(const std::wstring& name, int row) { StnList.push_back({name, row}); }
    void AddSS(const std::wstring& name, int row) { SSList.push_back({name, row}); }
    void AddBS(const std::wstring& name, int row) { BSList.push_back({name, row}); }
    void AddBKB(const std::wstring& name, int row) { BKBList.push_back({name, row}); }

  private:
    std::wstring StnName;
    int Index;
    nedit::NameList StnList;
    nedit::NameList SSList;
    nedit::NameList BSList;
    nedit::NameList BKBList;
};
