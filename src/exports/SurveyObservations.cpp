#include "exports/SurveyObservations.h"

#include <cmath>
#include <stdexcept>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/UNeutralFileFormat.h"

namespace nedit {

namespace {

class SurveyReader {
  public:
    SurveyReader(const UJobSettings& settings, const std::wstring& definitionDir)
        : format_(&settings) {
        if (!format_.LoadNeutralFileDefinition(definitionDir))
            throw std::runtime_error(ToUtf8(format_.LastDefinitionError()));
    }

    Survey Read(const std::vector<std::wstring>& rows) {
        Survey survey;
        for (const std::wstring& row : rows) {
            const int type = format_.GetRecordType(row);
            if (type == rec::None || type == rec::Comment) continue;
            if (!format_.ProcessRecord(type, row, fields_)) continue;
            // INSHT and TARGETHT set the height that the records after them carry.
            const int stands_for = format_.GetFieldId(type);
            if (format_.IsKeyOfSingleField(type) && stands_for != type)
                format_.SetCurrentValue(stands_for, fields_[type]);
            if (type == rec::Stn) {
                SurveySetup setup;
                setup.station = Text(fld::ID);
                setup.code = Text(fld::CO);
                setup.instrumentHeight = Carried(fld::HI);
                survey.setups.push_back(std::move(setup));
            } else if (type == rec::Bkb && !survey.setups.empty()) {
                SurveySetup& setup = survey.setups.back();
                setup.backStation = Text(fld::ID);
                setup.backBearing = Number(fld::BkBearing);
                setup.backCircle = Number(fld::HA);
            } else if (type == rec::Bs || type == rec::Ss || type == rec::Ss2) {
                if (survey.setups.empty()) {
                    ++survey.withoutStation;
                    continue;
                }
                survey.setups.back().observations.push_back(Observation(type == rec::Bs));
            }
        }
        return survey;
    }

  private:
    SurveyObservation Observation(bool backsight) {
        SurveyObservation observation;
        observation.target = Text(fld::ID);
        observation.code = Text(fld::CO);
        observation.backsight = backsight;
        observation.horizontal = Number(fld::HA);
        const double vertical = Number(fld::VA);
        if (!std::isnan(vertical)) observation.zenith = format_.ConvertToZenithVA(vertical);
        observation.slope = Number(fld::SD);
        observation.targetHeight = Carried(fld::HT);
        return observation;
    }

    std::string Text(int id) {
        const auto field = fields_.find(id);
        return field == fields_.end() ? std::string() : ToUtf8(Trim(field->second));
    }

    static double Parsed(const std::wstring& text) {
        return TrimView(text).empty() ? kNoValue : TextToDouble(text);
    }

    // The record's own value.
    double Number(int id) {
        const auto field = fields_.find(id);
        return field == fields_.end() ? kNoValue : Parsed(field->second);
    }

    // The record's value, else the last one the file gave.
    double Carried(int id) {
        const double own = Number(id);
        return std::isnan(own) ? Parsed(format_.GetCurrentValue(id)) : own;
    }

    UNeutralFileFormat format_;
    FieldMap fields_;
};

}  // namespace

Survey ReadSurvey(const std::vector<std::wstring>& rows, const UJobSettings& settings,
                  const std::wstring& definitionDir) {
    return SurveyReader(settings, definitionDir).Read(rows);
}

}  // namespace nedit
