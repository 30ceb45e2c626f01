#pragma once
// An arc of the job through three of its points. ArcType bit 0 set: the third point lies on
// the arc; clear: it is the centre. Bit 1 is the sense bit.

#include "platform/job/UDBLinework.h"

class UDBArc : public UDBLinework {
  public:
    explicit UDBArc(USurveyDoc* job, long id = 0);

    bool Load(long id) override;
    /// False (LastError) when a point is not in the job, two of the points are one, or the
    /// stored arc is locked.
    bool Save(int undoFlag = 0, bool redraw = false, bool select = false) override;

    long GetStartPointId() const { return start_; }
    long GetEndPointId() const { return end_; }
    long GetThirdPointId() const { return third_; }
    void SetPoints(long start, long end, long third) {
        start_ = start;
        end_ = end;
        third_ = third;
    }
    int GetArcType() const { return arc_type_; }
    void SetArcType(int type) { arc_type_ = type; }

  protected:
    const char* AreaQuery() const override;

  private:
    long start_ = 0;
    long end_ = 0;
    long third_ = 0;
    int arc_type_ = 0;
};
