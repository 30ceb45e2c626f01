#pragma once
// The observation model of one reduction run: occupied stations, the targets observed
// from them, and the single measurements of each target. The engine owns every node; a
// run builds them afresh from the rows.

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

/// A height at or below this means the point has no height; it passes through unchanged.
constexpr double kNoHeight = -10000.0;

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

struct STNSTRUCT;

/// An observed target under a station: one node per target name and list.
struct SSSTRUCT {
    double OffsetAlong = 0.0;
    double OffsetUp = 0.0;
    double OffsetRight = 0.0;
    std::wstring SSName;
    std::wstring SSCode;
    double HAng = 0.0;  // means, face 1
    double VAng = 0.0;
    double SDist = 0.0;
    double HtTarget = 0.0;
    double AngleFromBS = 0.0;
    int MeanValid = 0;
    int AngleValid = 0;
    std::shared_ptr<MeasurementList> Meas = std::make_shared<MeasurementList>();
    STNSTRUCT* Stn = nullptr;
    int ForwardFlag = 0;
    int SkipMean = 0;
    int RecordNo = 0;                   // the row that last observed the target, counted from 1
    std::vector<std::wstring> PtNames;  // names of PT records filed before this observation
    std::vector<SSCheck> ChkShots;      // check shots filed before it
};

/// The targets of one list of a station, in order. Short lists are searched in order; a
/// list that grows long gets an index by name, so a station with many shots stays linear
/// to fill.
class TargetList {
  public:
    SSSTRUCT* Find(const std::wstring& name) const;
    void Append(std::unique_ptr<SSSTRUCT> target);
    /// Puts `fresh` where `old` stands and gives `old` back to the caller.
    std::unique_ptr<SSSTRUCT> Replace(SSSTRUCT* old, std::unique_ptr<SSSTRUCT> fresh);
    void Clear();

    bool empty() const { return targets_.empty(); }
    std::size_t size() const { return targets_.size(); }
    SSSTRUCT* front() const { return targets_.front().get(); }
    SSSTRUCT* at(std::size_t i) const { return targets_[i].get(); }
    auto begin() const { return targets_.begin(); }
    auto end() const { return targets_.end(); }

  private:
    static constexpr std::size_t kIndexFrom = 16;
    std::size_t PositionOf(const std::wstring& name) const;

    std::vector<std::unique_ptr<SSSTRUCT>> targets_;
    std::unique_ptr<std::unordered_map<std::wstring, std::size_t>> by_name_;
};

/// An occupied station, or a node that only carries a point's coordinates or links a
/// forward observation backwards.
struct STNSTRUCT {
    short Sighted = 0;
    std::wstring StnName;
    std::wstring StnCode;
    std::wstring BkStnName;
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
    std::vector<std::wstring> PtNames;  // names of PT records filed before the station
    std::vector<SSCheck> ChkShots;      // check shots that end the station
    STNSTRUCT* NextSameName = nullptr;  // the engine's chain of nodes that share a name,
    STNSTRUCT* LastSameName = nullptr;  // and, on its first node, the chain's end
};

/// A directed line between two names with its bearing in degrees.
struct ULINEBEAR_STRUCT {
    std::wstring FromName;
    std::wstring ToName;
    double Bearing = 0.0;
};
