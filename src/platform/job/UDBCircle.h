#pragma once
// A circle of the job about one of its points.

#include "platform/job/UDBLinework.h"

class UDBCircle : public UDBLinework {
  public:
    explicit UDBCircle(USurveyDoc* job, long id = 0);

    bool Load(long id) override;
    /// False (LastError) when the centre is not a point of the job, the radius is not above
    /// 0, or the stored circle is locked.
    bool Save(int undoFlag = 0, bool redraw = false, bool select = false) override;

    long GetCentreId() const { return centre_; }
    void SetCentreId(long centre) { centre_ = centre; }
    double GetRadius() const { return radius_; }
    void SetRadius(double radius) { radius_ = radius; }

  protected:
    const char* AreaQuery() const override;

  private:
    long centre_ = 0;
    double radius_ = 0.0;
};
