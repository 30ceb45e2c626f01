#pragma once
// One set-up of the route search: an STN record whose station the run could position, with
// the records of its block that the search reads. The same station occupied twice gives two.

#include <string>
#include <utility>
#include <vector>

#include "platform/text/NameTable.h"
#include "traverse/NameList.h"

/// A side-shot record of a set-up: its target, as the number of the target's upper-cased name
/// in the search's table of side-shot names, and its row. A survey has millions of them, so
/// each is two numbers rather than a copy of the name.
struct ShotEntry {
    nedit::NameTable::Id Target = nedit::NameTable::kNone;
    int Row = 0;
};

class UNeditStn {
  public:
    UNeditStn(std::wstring name, int index) : StnName(std::move(name)), Index(index) {}

    const std::wstring& GetStnName() const { return StnName; }
    /// The row of the STN record.
    int GetIndex() const { return Index; }
    /// Observations of this set-up that lead to another occupied station: the edges.
    const nedit::NameList& GetStnList() const { return StnList; }
    /// Every side-shot record of the set-up, edge or not.
    const std::vector<ShotEntry>& GetShots() const { return Shots; }

    // Entries are appended as they come; a name observed twice stands twice.
    void AddStn(const std::wstring& name, int row) { StnList.push_back({name, row}); }
    void AddShot(nedit::NameTable::Id target, int row) { Shots.push_back({target, row}); }

  private:
    std::wstring StnName;
    int Index;
    nedit::NameList StnList;
    std::vector<ShotEntry> Shots;
};
