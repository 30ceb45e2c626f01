#pragma once
// A line of the job between two of its points, with layer, colour, line style, thickness and
// flags.

#include "platform/job/UDBLinework.h"

class UDBLine : public UDBLinework {
  public:
    /// A line of the job; with an identifier other than 0 it is loaded.
    explicit UDBLine(USurveyDoc* job, long id = 0);

    bool Load(long id) override;
    /// False (LastError) when an end is not a point of the job, both ends are one point, or
    /// the stored line is locked.
    bool Save(int undoFlag = 0, bool redraw = false, bool select = false) override;

    long GetStartPointId() const { return start_; }
    long GetEndPointId() const { return end_; }
    void SetPoints(long start, long end) {
        start_ = start;
        end_ = end;
    }

  protected:
    const char* AreaQuery() const override;

  private:
    long start_ = 0;
    long end_ = 0;
};
