#pragma once
// The observation model of one reduction run: occupied stations, the targets observed
// from them, and the single measurements of each target. The engine owns every node; a
// run builds them afresh from the rows.
//
// Nodes live in blocks of the engine (a station, a target, a list of measurements is no heap
// block of its own), and their names and codes are NameTexts of the engine's tables, which
// read as std::wstring_view: a node, a name and a pointer between nodes are good until the
// engine's next run.

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "platform/text/NameTable.h"

/// A height at or below this means the point has no height; it passes through unchanged.
constexpr double kNoHeight = -10000.0;

/// The number of a name in the engine's table of names.
using NameId = nedit::NameTable::Id;
constexpr NameId kNoName = nedit::NameTable::kNone;

/// One measurement of a target, in file order under its target. Angles in degrees, lengths
/// in working units.
struct MEASSTRUCT {
    double HtTarget = 0.0;
    double HAng = 0.0;   // reading + swing + horizontal correction, within one turn
    double VAng = 0.0;   // zenith reading + vertical correction
    double SDist = 0.0;  // slope distance times the station's scale factor
};

/// The measurements of one target. A forward target shares them with its side shot.
using MeasurementList = std::vector<MEASSTRUCT>;

/// One check shot, folded to face 1.
struct SSCheck {
    std::wstring SSName;
    std::wstring SSCode;
    double HAng = 0.0;
    double VAng = 0.0;
    double SDist = 0.0;
    double HtTarget = 0.0;
    double OffsetAlong = 0.0;
    double OffsetUp = 0.0;
    double OffsetRight = 0.0;
    int RecordNo = 0;
};

/// A list that costs one pointer while it is empty, as most of the lists of a node are.
template <typename T>
class SparseList {
  public:
    SparseList() = default;
    SparseList(const SparseList& other) { *this = other; }
    SparseList& operator=(const SparseList& other) {
        if (this != &other)
            Items = other.empty() ? nullptr : std::make_unique<std::vector<T>>(*other.Items);
        return *this;
    }
    SparseList(SparseList&&) noexcept = default;
    SparseList& operator=(SparseList&&) noexcept = default;
    SparseList& operator=(std::vector<T>&& items) {
        Items = items.empty() ? nullptr : std::make_unique<std::vector<T>>(std::move(items));
        return *this;
    }

    bool empty() const { return !Items || Items->empty(); }
    std::size_t size() const { return Items ? Items->size() : 0; }
    const T* begin() const { return Items ? Items->data() : nullptr; }
    const T* end() const { return Items ? Items->data() + Items->size() : nullptr; }
    void push_back(T item) { List().push_back(std::move(item)); }
    const T& back() const { return Items->back(); }
    T& back() { return Items->back(); }
    /// Appends `items` in their order.
    template <typename Range>
    void append(const Range& items) {
        for (const T& item : items) push_back(item);
    }
    void clear() { Items.reset(); }

    friend bool operator==(const SparseList& list, const std::vector<T>& items) {
        return list.empty() ? items.empty() : *list.Items == items;
    }
    friend bool operator==(const std::vector<T>& items, const SparseList& list) {
        return list == items;
    }

  private:
    std::vector<T>& List() {
        if (!Items) Items = std::make_unique<std::vector<T>>();
        return *Items;
    }

    std::unique_ptr<std::vector<T>> Items;
};

struct STNSTRUCT;

/// An observed target under a station: one node per target name and list.
struct SSSTRUCT {
    double OffsetAlong = 0.0;
    double OffsetUp = 0.0;
    double OffsetRight = 0.0;
    nedit::NameText SSName;
    nedit::NameText SSCode;
    double HAng = 0.0;  // means, face 1
    double VAng = 0.0;
    double SDist = 0.0;
    double HtTarget = 0.0;
    double AngleFromBS = 0.0;
    int MeanValid = 0;
    int AngleValid = 0;
    MeasurementList* Meas = nullptr;  // owned by the engine; shared by a forward copy
    STNSTRUCT* Stn = nullptr;
    int ForwardFlag = 0;
    int SkipMean = 0;
    int RecordNo = 0;                  // the row that last observed the target, counted from 1
    NameId Name = kNoName;             // the id of SSName
    SparseList<std::wstring> PtNames;  // names of PT records filed before this observation
    SparseList<SSCheck> ChkShots;      // check shots filed before it
};

/// The targets of one list of a station, in order.
class TargetList {
  public:
    /// The target of that name, by a walk down the list.
    SSSTRUCT* Find(std::wstring_view name) const;
    void Append(SSSTRUCT* target) { Targets.push_back(target); }
    void Clear() { Targets.clear(); }

    bool empty() const { return Targets.empty(); }
    std::size_t size() const { return Targets.size(); }
    SSSTRUCT* front() const { return Targets.front(); }
    SSSTRUCT* at(std::size_t i) const { return Targets[i]; }
    auto begin() const { return Targets.begin(); }
    auto end() const { return Targets.end(); }

  private:
    std::vector<SSSTRUCT*> Targets;
};

/// An occupied station, or a node that links a forward observation backwards. A node that
/// only carries a point's coordinates (PointOnly) is kept by the engine in a smaller form and
/// shown as one of these where the station list is walked.
struct STNSTRUCT {
    short Sighted = 0;
    nedit::NameText StnName;
    nedit::NameText StnCode;
    nedit::NameText BkStnName;
    wchar_t HMode = L'A';
    wchar_t VMode = L'Z';
    double HtInst = 0.0;
    double BkBearing = 0.0;
    double BkAngle = 0.0;
    double Swing = 0.0;
    int CoordKnown = 0;
    int PointOnly = 0;
    int ReverseStn = 0;
    int BkBearingGiven = 0;
    int BkStnGiven = 0;
    double East = 0.0;
    double North = 0.0;
    double Height = 0.0;
    wchar_t AngleUnit = L'S';
    wchar_t LengthUnit = L'M';
    int CoordFixed = 0;
    TargetList BSList;
    TargetList FSList;
    TargetList SSList;
    bool SwingOpen = true;
    bool HasCheck = false;
    NameId Name = kNoName;             // the id of StnName
    std::uint32_t Place = 0;           // its place among the engine's stations
    SparseList<std::wstring> PtNames;  // names of PT records filed before the station
    SparseList<SSCheck> ChkShots;      // check shots that end the station
};

/// A directed line between two names with its bearing in degrees.
struct ULINEBEAR_STRUCT {
    std::wstring FromName;
    std::wstring ToName;
    double Bearing = 0.0;
};
