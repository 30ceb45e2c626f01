#include "exports/CsvPointsExport.h"

#include "exports/ExportText.h"
#include "exports/PointAttributes.h"
#include "platform/job/Csv.h"

namespace nedit {

namespace {}  // namespace

std::string PointsCsvText(const JobContents& contents) {
    const std::vector<std::string> attributes = AttributeColumns(contents.points);
    std::string out = "name,east,north,height,code,layer,note";
    for (const std::string& name : attributes) out += "," + CsvField(name);
    out += "\n";
    for (const ExportPoint& point : contents.points) {
        const UWPoint& at = point.point.at;
        out += CsvField(point.point.name) + "," + ExactNumber(at.x) + "," + ExactNumber(at.y) +
               "," + (at.HasHeight() ? ExactNumber(at.z) : "") + "," + CsvField(point.code) + "," +
               CsvField(point.layer) + "," + CsvField(point.note);
        for (const std::string& name : attributes)
            out += "," + CsvField(AttributeValue(point, name));
        out += "\n";
    }
    return out;
}

}  // namespace nedit
