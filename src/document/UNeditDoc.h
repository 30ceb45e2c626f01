#pragma once
// A raw-data document: the record-definition service for its records, the report
// parameters, and the link to its job. (The storage of its records in the job comes with
// the document's own operations.)

#include <string>

#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "report/NeditIni.h"
#include "report/OutParamStruct.h"

class USurveyDoc;

class UNeditDoc : public UNeutralFileFormat {
public:
    /// A document of `job` (may be null: the defaults of a new job hold). Reads the report's
    /// column flags from NEDIT.INI and takes the job's units as output units.
    explicit UNeditDoc(USurveyDoc* job);
    ~UNeditDoc() override;

    /// The report parameter of an option id (see OutParamStruct.h).
    int GetCheckOn(int id) const { return ::GetCheckOn(OutputParameters, id); }
    OutParamStruct& GetOutputParameters() { return OutputParameters; }
    int GetPageSize() const { return OutputParameters.PageSize; }
    /// True when the job shows easting before northing.
    bool IsENOrder() const { return Settings.GetCoordinateOrder() == UJobSettings::kEastNorth; }
    /// Takes the job's settings again, and its units as the report's output units.
    void UpdateDisplaySettings();

    USurveyDoc* GetSurveyDoc() const { return SurveyDoc; }
    const UJobSettings& GetSettings() const { return Settings; }
    bool GetAbortProcess() const { return AbortProcess; }
    void SetAbortProcess(bool abort) { AbortProcess = abort; }

private:
    void TakeJobUnits();

    UJobSettings Settings;  // the job's, copied; the record service reads its units here
    USurveyDoc* SurveyDoc;
    OutParamStruct OutputParameters;
    nedit::NeditIniGuard IniGuard;
    bool AbortProcess = false;
};
