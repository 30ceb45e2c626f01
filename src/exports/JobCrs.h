#pragma once
// The job's coordinate system for exports, as "EPSG:NNNN", kept in the job's settings table
// (section "Coordinate System", key "CRS") so that every later export uses it. Empty when
// none was set: the files then say nothing of a coordinate system.

#include <string>

namespace nedit {

class JobDatabase;

std::string ReadJobCrs(JobDatabase& job);
/// Stores it in one transaction; throws JobError on a job that cannot be written.
void WriteJobCrs(JobDatabase& job, const std::string& crs);

/// True for "EPSG:" and a number (any case, no blanks), the only form taken.
bool IsEpsgCode(const std::string& crs);
/// The number of an EPSG code; 0 when `crs` is none.
int EpsgNumber(const std::string& crs);

}  // namespace nedit
