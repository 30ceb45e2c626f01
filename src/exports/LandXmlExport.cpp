#include "exports/LandXmlExport.h"

#include <cmath>
#include <pugixml.hpp>
#include <set>
#include <sstream>

#include "exports/ExportText.h"
#include "exports/JobCrs.h"
#include "transfer/PointTransfer.h"

namespace nedit {

namespace {

void SetNumber(pugi::xml_node node, const char* name, double value) {
    if (!std::isnan(value)) node.append_attribute(name) = ExactNumber(value).c_str();
}

void Units(pugi::xml_node root, LengthUnit unit) {
    pugi::xml_node units = root.append_child("Units");
    pugi::xml_node system = units.append_child(unit == LengthUnit::Metres ? "Metric" : "Imperial");
    if (unit == LengthUnit::Metres) {
        system.append_attribute("areaUnit") = "squareMeter";
        system.append_attribute("linearUnit") = "meter";
        system.append_attribute("volumeUnit") = "cubicMeter";
    } else {
        system.append_attribute("areaUnit") = "squareFoot";
        system.append_attribute("linearUnit") = unit == LengthUnit::Feet ? "foot" : "USSurveyFoot";
        system.append_attribute("volumeUnit") = "cubicFeet";
    }
    system.append_attribute("angularUnit") = "decimal degrees";
    system.append_attribute("directionUnit") = "decimal degrees";
}

class SurveyWriter {
  public:
    SurveyWriter(const JobContents& contents, pugi::xml_node survey) : survey_(survey) {
        for (const ExportPoint& point : contents.points) points_.insert(point.point.name);
    }

    void Write(const std::string& name, const Survey& survey) {
        survey_.append_child("SurveyHeader").append_attribute("name") = name.c_str();
        int number = 0;
        for (const SurveySetup& setup : survey.setups) {
            const std::string id = "IS" + std::to_string(++number);
            Setup(id, setup);
            pugi::xml_node group = survey_.append_child("ObservationGroup");
            group.append_attribute("id") = ("OG" + std::to_string(number)).c_str();
            group.append_attribute("setupID") = id.c_str();
            for (const SurveyObservation& observation : setup.observations)
                Observation(group, id, observation);
        }
    }

  private:
    // By the job's point when it has one, under the name it keeps ("0012" is its 12).
    void Refer(pugi::xml_node node, const std::string& point) {
        if (point.empty()) return;
        const std::string stripped = ToUtf8(PointTransfer::StrippedName(FromUtf8(point)));
        for (const std::string* name : {&point, &stripped}) {
            if (points_.count(*name) != 0) {
                node.append_attribute("pntRef") = name->c_str();
                return;
            }
        }
        node.append_attribute("name") = point.c_str();
    }

    void Setup(const std::string& id, const SurveySetup& setup) {
        pugi::xml_node node = survey_.append_child("InstrumentSetup");
        node.append_attribute("id") = id.c_str();
        node.append_attribute("stationName") = setup.station.c_str();
        node.append_attribute("instrumentHeight") =
            ExactNumber(std::isnan(setup.instrumentHeight) ? 0.0 : setup.instrumentHeight).c_str();
        Refer(node.append_child("InstrumentPoint"), setup.station);
        if (setup.backStation.empty()) return;
        pugi::xml_node back = node.append_child("Backsight");
        SetNumber(back, "azimuth", setup.backBearing);
        SetNumber(back, "circle", setup.backCircle);
        Refer(back.append_child("BacksightPoint"), setup.backStation);
    }

    void Observation(pugi::xml_node group, const std::string& setup,
                     const SurveyObservation& observation) {
        pugi::xml_node node = group.append_child("RawObservation");
        node.append_attribute("setupID") = setup.c_str();
        node.append_attribute("purpose") = observation.backsight ? "backsight" : "normal";
        SetNumber(node, "horizAngle", observation.horizontal);
        SetNumber(node, "zenithAngle", observation.zenith);
        SetNumber(node, "slopeDistance", observation.slope);
        SetNumber(node, "targetHeight", observation.targetHeight);
        pugi::xml_node target = node.append_child("TargetPoint");
        Refer(target, observation.target);
        if (!observation.code.empty()) target.append_attribute("desc") = observation.code.c_str();
    }

    pugi::xml_node survey_;
    std::set<std::string> points_;
};

}  // namespace

std::string LandXmlText(const JobContents& contents, const std::string& crs,
                        const LandXmlSurvey& survey, const std::string& stamp) {
    pugi::xml_document document;
    pugi::xml_node declaration = document.append_child(pugi::node_declaration);
    declaration.append_attribute("version") = "1.0";
    declaration.append_attribute("encoding") = "UTF-8";
    pugi::xml_node root = document.append_child("LandXML");
    root.append_attribute("xmlns") = "http://www.landxml.org/schema/LandXML-1.2";
    root.append_attribute("version") = "1.2";
    root.append_attribute("date") = stamp.substr(0, 10).c_str();
    root.append_attribute("time") = stamp.substr(11).c_str();
    Units(root, contents.lengthUnit);
    if (IsEpsgCode(crs))
        root.append_child("CoordinateSystem").append_attribute("epsgCode") =
            std::to_string(EpsgNumber(crs)).c_str();
    root.append_child("Application").append_attribute("name") = "SXNedit";

    pugi::xml_node points = root.append_child("CgPoints");
    for (const ExportPoint& point : contents.points) {
        pugi::xml_node node = points.append_child("CgPoint");
        node.append_attribute("name") = point.point.name.c_str();
        if (!point.code.empty()) node.append_attribute("code") = point.code.c_str();
        if (!point.note.empty()) node.append_attribute("desc") = point.note.c_str();
        const UWPoint& at = point.point.at;
        std::string text = ExactNumber(at.y) + " " + ExactNumber(at.x);
        if (at.HasHeight()) text += " " + ExactNumber(at.z);
        node.text() = text.c_str();
    }
    if (survey.survey != nullptr)
        SurveyWriter(contents, root.append_child("Survey")).Write(survey.name, *survey.survey);

    std::ostringstream out;
    document.save(out, "  ", pugi::format_default, pugi::encoding_utf8);
    return out.str();
}

}  // namespace nedit
