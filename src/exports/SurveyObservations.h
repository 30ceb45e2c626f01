#pragma once
// A raw-data document's observations as a survey: each instrument set-up (a STN record) with
// its back sight (BKB) and the observations made from it (BS back sight readings, SS and SS2
// shots), values in working units (angles in degrees, vertical angles from the zenith,
// lengths in the job's unit), read through the record definition so that the file's UNIT,
// AMODE, INSHT and TARGETHT records count as they do in a reduction.
//
// A value a record does not give is NaN (and then left out of the output), except the
// instrument and target heights, which carry on from the last one given, as they do in the
// field. Observations before the first set-up have no station: they are counted, not kept.

#include <limits>
#include <string>
#include <vector>

#include "platform/job/UJobSettings.h"

namespace nedit {

constexpr double kNoValue = std::numeric_limits<double>::quiet_NaN();

struct SurveyObservation {
    std::string target;
    std::string code;
    bool backsight = false;  // a BS reading on the back station
    double horizontal = kNoValue;
    double zenith = kNoValue;
    double slope = kNoValue;
    double targetHeight = kNoValue;
};

struct SurveySetup {
    std::string station;
    std::string code;
    double instrumentHeight = kNoValue;
    std::string backStation;  // empty: no BKB record
    double backBearing = kNoValue;
    double backCircle = kNoValue;
    std::vector<SurveyObservation> observations;
};

struct Survey {
    std::vector<SurveySetup> setups;
    int withoutStation = 0;  // observations before the first set-up
};

/// Reads the survey from the rows. Throws std::runtime_error when the record definition
/// (NeutralRecords.def of `definitionDir`) cannot be read.
Survey ReadSurvey(const std::vector<std::wstring>& rows, const UJobSettings& settings,
                  const std::wstring& definitionDir);

}  // namespace nedit
