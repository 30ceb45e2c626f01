#pragma once
// UJobSettings in the job's settings table, section "job". Keys that are missing or hold
// a value out of range keep the default, so an older job or a hand-edited value never
// stops a job from opening.

#include "platform/job/UJobSettings.h"

namespace nedit {

class JobDatabase;

UJobSettings LoadJobSettings(JobDatabase& job);
void SaveJobSettings(JobDatabase& job, const UJobSettings& settings);

}  // namespace nedit
