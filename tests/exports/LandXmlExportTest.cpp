#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <pugixml.hpp>
#include <set>

#include "ExportFixture.h"
#include "exports/JobExport.h"
#include "exports/LandXmlExport.h"

namespace nedit::test {
namespace {

// The elements this file uses, each with the children LandXML 1.2 allows it among them (in
// the schema's order where it fixes one) and the attributes the schema requires of it.
struct SchemaElement {
    std::vector<std::string> children;
    std::vector<std::string> required;
};

const std::map<std::string, SchemaElement>& Schema() {
    static const std::map<std::string, SchemaElement> schema = {
        {"LandXML",
         {{"Units", "CoordinateSystem", "Application", "CgPoints", "Survey"},
          {"date", "time", "version"}}},
        {"Units", {{"Metric", "Imperial"}, {}}},
        {"Metric", {{}, {"areaUnit", "linearUnit", "volumeUnit"}}},
        {"Imperial", {{}, {"areaUnit", "linearUnit", "volumeUnit"}}},
        {"CoordinateSystem", {{}, {}}},
        {"Application", {{}, {"name"}}},
        {"CgPoints", {{"CgPoint"}, {}}},
        {"CgPoint", {{}, {}}},
        {"Survey", {{"SurveyHeader", "InstrumentSetup", "ObservationGroup"}, {}}},
        {"SurveyHeader", {{}, {}}},
        {"InstrumentSetup", {{"InstrumentPoint", "Backsight"}, {"id", "instrumentHeight"}}},
        {"InstrumentPoint", {{}, {}}},
        {"Backsight", {{"BacksightPoint"}, {}}},
        {"BacksightPoint", {{}, {}}},
        {"ObservationGroup", {{"RawObservation"}, {}}},
        {"RawObservation", {{"TargetPoint"}, {}}},
        {"TargetPoint", {{}, {}}}};
    return schema;
}

void ExpectSchemaStructure(const pugi::xml_node& node) {
    const auto found = Schema().find(node.name());
    ASSERT_NE(found, Schema().end()) << node.name() << " is no element of this subset";
    for (const std::string& attribute : found->second.required)
        EXPECT_TRUE(node.attribute(attribute.c_str())) << node.name() << " lacks " << attribute;
    for (const pugi::xml_node& child : node.children()) {
        if (child.type() != pugi::node_element) continue;
        const auto& allowed = found->second.children;
        EXPECT_NE(std::find(allowed.begin(), allowed.end(), child.name()), allowed.end())
            << child.name() << " inside " << node.name();
        ExpectSchemaStructure(child);
    }
}

class LandXmlTest : public ExportTest {
  protected:
    pugi::xml_node Export(const ExportDocument* document) {
        ExportRequest request;
        request.format = ExportFormat::LandXml;
        request.output = dir.File("site.xml");
        request.crs = "EPSG:27700";
        request.document = document;
        request.stamp = "2026-11-23T18:30:05";
        result = ExportJob(*job, request);
        EXPECT_TRUE(result.written);
        EXPECT_TRUE(xml.load_file(request.output.c_str()));
        return xml.child("LandXML");
    }

    ExportResult result;
    pugi::xml_document xml;
};

TEST_F(LandXmlTest, PointsAreNorthingEastingElevation) {
    const pugi::xml_node root = Export(nullptr);
    ExpectSchemaStructure(root);
    EXPECT_STREQ(root.attribute("xmlns").value(), "http://www.landxml.org/schema/LandXML-1.2");
    EXPECT_STREQ(root.attribute("date").value(), "2026-11-23");
    EXPECT_STREQ(root.attribute("time").value(), "18:30:05");
    EXPECT_STREQ(root.child("Units").child("Metric").attribute("linearUnit").value(), "meter");
    EXPECT_STREQ(root.child("CoordinateSystem").attribute("epsgCode").value(), "27700");
    std::vector<std::string> points;
    for (const auto& point : root.child("CgPoints").children("CgPoint"))
        points.push_back(std::string(point.attribute("name").value()) + "=" + point.text().get());
    EXPECT_EQ(points, (std::vector<std::string>{"P1=2000 1000 50", "P2=2000 1010 51",
                                                "P3=2010 1010", "P4=2010 1000 52"}));
    EXPECT_TRUE(root.child("Survey").empty());
    ASSERT_EQ(result.messages.size(), 1u);
    EXPECT_EQ(result.messages[0],
              "LandXML holds the points and the survey only; not in it: 4 lines, arcs, "
              "circles and polylines");
}

// Angles in ddd.mmss come out in decimal degrees: 270.3000 is 270.5, 91.1500 is 91.25.
TEST_F(LandXmlTest, TheDocumentsObservationsGoUnderSurvey) {
    ExportDocument document{
        "DAY 1",
        {L"#VERSION-1.0 NEUTRAL FILE", L"UNIT      UL=M,UA=S",
         L"SS        ID=LOST,HA=1.0000,VA=90.0000,SD=5.000", L"STN       ID=P1,HI=1.550,CO=STN",
         L"BKB       ID=P2,BRG=90.0000,HA=0.0000",
         L"BS        ID=00P2,HA=0.0000,VA=90.0000,SD=10.000,HT=1.600",
         L"SS        ID=P4,HA=270.3000,VA=88.3000,SD=10.004,CO=TREE", L"TARGETHT  2.000",
         L"SS        ID=X9,HA=300.0000,VA=91.1500,SD=12.345", L"STN       ID=P4"}};
    const pugi::xml_node root = Export(&document);
    ExpectSchemaStructure(root);
    const pugi::xml_node survey = root.child("Survey");
    EXPECT_STREQ(survey.child("SurveyHeader").attribute("name").value(), "DAY 1");

    const pugi::xml_node first = survey.child("InstrumentSetup");
    EXPECT_STREQ(first.attribute("id").value(), "IS1");
    EXPECT_STREQ(first.attribute("stationName").value(), "P1");
    EXPECT_DOUBLE_EQ(first.attribute("instrumentHeight").as_double(), 1.55);
    EXPECT_STREQ(first.child("InstrumentPoint").attribute("pntRef").value(), "P1");
    const pugi::xml_node back = first.child("Backsight");
    EXPECT_DOUBLE_EQ(back.attribute("azimuth").as_double(), 90.0);
    EXPECT_STREQ(back.child("BacksightPoint").attribute("pntRef").value(), "P2");
    // The second set-up carries the instrument height on, as the field does.
    EXPECT_DOUBLE_EQ(
        first.next_sibling("InstrumentSetup").attribute("instrumentHeight").as_double(), 1.55);

    const pugi::xml_node group = survey.child("ObservationGroup");
    EXPECT_STREQ(group.attribute("setupID").value(), "IS1");
    std::vector<pugi::xml_node> shots;
    for (const auto& shot : group.children("RawObservation")) shots.push_back(shot);
    ASSERT_EQ(shots.size(), 3u);
    EXPECT_STREQ(shots[0].attribute("purpose").value(), "backsight");
    EXPECT_STREQ(shots[0].child("TargetPoint").attribute("pntRef").value(), "P2");  // 00P2
    EXPECT_STREQ(shots[1].attribute("purpose").value(), "normal");
    EXPECT_DOUBLE_EQ(shots[1].attribute("horizAngle").as_double(), 270.5);
    EXPECT_DOUBLE_EQ(shots[1].attribute("zenithAngle").as_double(), 88.5);
    EXPECT_DOUBLE_EQ(shots[1].attribute("slopeDistance").as_double(), 10.004);
    EXPECT_DOUBLE_EQ(shots[1].attribute("targetHeight").as_double(), 1.6);
    EXPECT_STREQ(shots[1].child("TargetPoint").attribute("pntRef").value(), "P4");
    EXPECT_STREQ(shots[1].child("TargetPoint").attribute("desc").value(), "TREE");
    EXPECT_DOUBLE_EQ(shots[2].attribute("zenithAngle").as_double(), 91.25);
    EXPECT_DOUBLE_EQ(shots[2].attribute("targetHeight").as_double(), 2.0);
    // X9 is no point of the job: named, not referred to.
    EXPECT_FALSE(shots[2].child("TargetPoint").attribute("pntRef"));
    EXPECT_STREQ(shots[2].child("TargetPoint").attribute("name").value(), "X9");

    EXPECT_EQ(result.observations, 3);
    EXPECT_EQ(result.messages.back(),
              "1 observation before the first set-up (STN) of DAY 1: not in the file");
}

}  // namespace
}  // namespace nedit::test
