#include "transfer/NewPointNames.h"

#include "codes/UNeditPt.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace nedit {

int CheckPtNewID(USurveyDoc* job, const std::vector<UNeditPt>& points, const std::wstring& prefix,
                 int start) {
    if (job == nullptr) return 1;
    const std::wstring trimmed = Trim(prefix);
    for (std::size_t i = start < 0 ? 0 : static_cast<std::size_t>(start); i < points.size(); ++i) {
        if (job->GetPointId(UPointNumber(trimmed + points[i].GetID())) != 0) return 0;
    }
    return 1;
}

long GetNewName(USurveyDoc* job, std::wstring& out, const std::wstring& prefix,
                const std::wstring& name) {
    if (job == nullptr) return -1;
    out = prefix + name;
    return job->GetPointId(UPointNumber(out));
}

}  // namespace nedit
