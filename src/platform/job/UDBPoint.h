#pragma once
// One point of the job: name, East, North, an optional height, code, layer, colour, point
// mark, symbol with three symbol values and extra symbols, flags word, status word and note.
// A height of -10000 (UWPoint::kNoHeight) means "no height": the job stores none and gives
// -10000 back.

#include <string>
#include <vector>

#include "platform/geometry/UWPoint.h"
#include "platform/job/UDBObject.h"

/// A further symbol drawn at a point: the symbol's index, its two scales and its rotation
/// in degrees.
struct UExtraSymbol {
    int Symbol = 0;
    double ScaleX = 1.0;
    double ScaleY = 1.0;
    double Rotation = 0.0;
};

class UDBPoint : public UDBObject {
  public:
    /// Bit of the status word that a transfer sets before the first save of a point in a run.
    static constexpr unsigned kStatusTransferred = 1;

    /// A point of the job; with an identifier other than 0 it is loaded (and stays new and
    /// empty when there is no such point).
    explicit UDBPoint(USurveyDoc* job, long id = 0);
    /// A new point at `at`; z of kNoHeight gives a point without height.
    UDBPoint(USurveyDoc* job, const UWPoint& at);

    bool Load(long id) override;
    /// Back to a new, empty point of the same job.
    void ReInit();
    /// Stores the point. False (LastError) for an empty name, a name another point has, a
    /// locked point, an unknown layer, coordinates that are not finite numbers.
    bool Save(int undoFlag = 0, bool redraw = false, bool select = false) override;

    const std::wstring& GetName() const { return name_; }
    void SetName(const std::wstring& name) { name_ = name; }
    double GetEast() const { return east_; }
    double GetNorth() const { return north_; }
    /// -10000 when the point has no height.
    double GetHeight() const { return height_; }
    bool HasHeight() const { return height_ > UWPoint::kNoHeight; }
    double GetX() const { return east_; }
    double GetY() const { return north_; }
    double GetZ() const { return height_; }
    void SetEast(double east) { east_ = east; }
    void SetNorth(double north) { north_ = north; }
    void SetX(double east) { east_ = east; }
    void SetY(double north) { north_ = north; }
    void SetHeight(double height) {
        height_ = height <= UWPoint::kNoHeight ? UWPoint::kNoHeight : height;
    }
    void ClearHeight() { height_ = UWPoint::kNoHeight; }
    UWPoint GetPoint() const { return UWPoint(east_, north_, height_); }

    const std::wstring& GetCode() const { return code_; }
    void SetCode(const std::wstring& code) { code_ = code; }
    int GetPointMark() const { return point_mark_; }
    void SetPointMark(int mark) { point_mark_ = mark; }
    int GetSymbol() const { return symbol_; }
    void SetSymbol(int symbol) { symbol_ = symbol; }
    /// Symbol values 1 to 3; the first is the symbol's scale.
    double GetSymbolValue(int which) const;
    void SetSymbolValues(double scale, double value2, double value3);
    unsigned GetStatus() const { return status_; }
    void SetStatus(unsigned status) { status_ = status; }
    const std::wstring& GetPointNote() const { return note_; }
    void SetPointNote(const std::wstring& note) { note_ = note; }

    /// Replaces the saved point's extra symbols; false when the point is not saved.
    bool SaveExtraSymbols(const std::vector<UExtraSymbol>& symbols);
    std::vector<UExtraSymbol> GetExtraSymbols() const;

  protected:
    const char* AreaQuery() const override;

  private:
    std::wstring name_;
    double east_ = 0.0;
    double north_ = 0.0;
    double height_ = UWPoint::kNoHeight;
    std::wstring code_;
    int point_mark_ = 0;
    int symbol_ = 0;
    double symbol_values_[3] = {1.0, 0.0, 0.0};
    unsigned status_ = 0;
    std::wstring note_;
};
