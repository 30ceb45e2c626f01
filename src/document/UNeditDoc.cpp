#include "document/UNeditDoc.h"

#include "platform/job/USurveyDoc.h"

UNeditDoc::UNeditDoc(USurveyDoc* job) : UNeutralFileFormat(&Settings), SurveyDoc(job) {
    if (SurveyDoc != nullptr) Settings = SurveyDoc->GetSettings();
    SetFlagsFromOrder(OutputParameters, nedit::ReadOrderKey());
    TakeJobUnits();
}

UNeditDoc::~UNeditDoc() = default;

void UNeditDoc::UpdateDisplaySettings() {
    if (SurveyDoc != nullptr) Settings = SurveyDoc->GetSettings();
    TakeJobUnits();
}

void UNeditDoc::TakeJobUnits() {
    switch (Settings.GetAngleUnit()) {
        case nedit::AngleUnit::Degrees: OutputParameters.AngularUnit = 1; break;
        case nedit::AngleUnit::Gons: OutputParameters.AngularUnit = 2; break;
        default: OutputParameters.AngularUnit = 0;
    }
    switch (Settings.GetLengthUnit()) {
        case nedit::LengthUnit::Feet: OutputParameters.LinearUnit = 1; break;
        case nedit::LengthUnit::USFeet: OutputParameters.LinearUnit = 2; break;
        default: OutputParameters.LinearUnit = 0;
    }
}
