// The job as a source of coordinates.

#include "platform/job/UDBPoint.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"

bool UNeditDatabase::JobHasPoint(const std::wstring& name) const {
    return SurveyDoc != nullptr && SurveyDoc->GetPointId(UPointNumber(name)) != 0;
}

int UNeditDatabase::GetCoordFromSvyDoc(const std::wstring& name, double& e, double& n, double& z,
                                       std::wstring& code) const {
    if (SurveyDoc == nullptr) return 0;
    const long id = SurveyDoc->GetPointId(UPointNumber(name));
    if (id == 0) return 0;
    UDBPoint point(SurveyDoc, 0);
    // A point that does not load counts as not in the job.
    if (!point.Load(id)) return 0;
    e = point.GetEast();
    n = point.GetNorth();
    z = point.GetHeight();
    code = point.GetCode();
    return 1;
}

bool UNeditDatabase::CoordsOrderXY() const {
    return SurveyDoc == nullptr || SurveyDoc->CoordsOrderXY();
}
