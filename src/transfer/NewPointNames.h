#pragma once
// The checks of a name that a point would take in the job when the user asks for new ones.

#include <string>
#include <vector>

class UNeditPt;
class USurveyDoc;

namespace nedit {

/// 0 when the job has a point named `prefix` (trimmed) followed by the name of one of the
/// points from index `start` on, else 1; 1 without a job. The names are taken as the
/// reduction gave them, leading zeros included.
int CheckPtNewID(USurveyDoc* job, const std::vector<UNeditPt>& points, const std::wstring& prefix,
                 int start);

/// `out` becomes `prefix` followed by `name`. The identifier of the job's point of exactly
/// that name, 0 when there is none, -1 without a job.
long GetNewName(USurveyDoc* job, std::wstring& out, const std::wstring& prefix,
                const std::wstring& name);

}  // namespace nedit
