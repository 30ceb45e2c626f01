#pragma once
// The job as LandXML 1.2, written with pugixml: its units, its coordinate system when one is
// set, the points as CgPoints ("northing easting elevation", as the schema orders them), and
// with a document its observations under Survey:
//   Survey / SurveyHeader (the document's name)
//          / InstrumentSetup (id "IS1", ..., stationName, instrumentHeight)
//              / InstrumentPoint, Backsight / BacksightPoint
//          / ObservationGroup (setupID) / RawObservation (purpose "normal" or "backsight",
//              horizAngle, zenithAngle, slopeDistance, targetHeight) / TargetPoint
//
// Decisions:
// - Angles and directions are decimal degrees; lengths in the job's unit (Metric, or
//   Imperial in feet or US survey feet).
// - A set-up, back sight or target names its point by pntRef when the job has a point of
//   that name, or of that name as a transfer keeps it (without leading blanks and zeros): a
//   CgPoint of this file. Else by name alone: a reference must not dangle.
// - A point without a height has two coordinates.
// - A set-up without an instrument height has 0, which the schema requires.

#include <string>
#include <vector>

#include "exports/JobContents.h"
#include "exports/SurveyObservations.h"

namespace nedit {

struct LandXmlSurvey {
    std::string name;  // the document's
    const Survey* survey = nullptr;
};

/// The file's text. `stamp` is the time of the export, "YYYY-MM-DDTHH:MM:SS".
std::string LandXmlText(const JobContents& contents, const std::string& crs,
                        const LandXmlSurvey& survey, const std::string& stamp);

}  // namespace nedit
