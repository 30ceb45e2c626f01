#include "platform/job/UJobSettings.h"

bool UJobSettings::operator==(const UJobSettings& other) const {
    return length_unit_ == other.length_unit_ && angle_unit_ == other.angle_unit_ &&
           length_decimals_ == other.length_decimals_ && angle_decimals_ == other.angle_decimals_ &&
           coordinate_order_ == other.coordinate_order_ && pick_aperture_ == other.pick_aperture_ &&
           show_height_ == other.show_height_ && angle_format_ == other.angle_format_ &&
           foot_format_ == other.foot_format_ && foot_inch_precision_ == other.foot_inch_precision_;
}
