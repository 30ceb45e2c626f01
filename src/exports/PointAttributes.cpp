#include "exports/PointAttributes.h"

#include <set>

namespace nedit {

std::vector<std::string> AttributeColumns(const std::vector<ExportPoint>& points) {
    std::vector<std::string> columns;
    std::set<std::string> seen;
    for (const ExportPoint& point : points) {
        for (const auto& attribute : point.attributes) {
            if (seen.insert(attribute.first).second) columns.push_back(attribute.first);
        }
    }
    return columns;
}

std::string AttributeValue(const ExportPoint& point, const std::string& name) {
    for (const auto& [key, value] : point.attributes) {
        if (key == name) return value;
    }
    return {};
}

}  // namespace nedit
