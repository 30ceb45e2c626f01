#include "exports/ExportFormat.h"

#include <array>
#include <cctype>
#include <utility>

namespace nedit {

namespace {

struct FormatName {
    ExportFormat format;
    const char* word;
    const char* title;
};

constexpr std::array<FormatName, 7> kFormats = {{{ExportFormat::Csv, "csv", "CSV"},
                                                 {ExportFormat::Dxf, "dxf", "DXF"},
                                                 {ExportFormat::GeoPackage, "gpkg", "GeoPackage"},
                                                 {ExportFormat::GeoJson, "geojson", "GeoJSON"},
                                                 {ExportFormat::Shapefile, "shp", "Shapefile"},
                                                 {ExportFormat::Kml, "kml", "KML"},
                                                 {ExportFormat::LandXml, "landxml", "LandXML"}}};

constexpr std::array<const char*, 5> kShapefileEndings = {".shp", ".shx", ".dbf", ".cpg", ".prj"};

std::string Lower(std::string_view text) {
    std::string lower(text);
    for (char& c : lower) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return lower;
}

}  // namespace

std::optional<ExportFormat> ExportFormatNamed(std::string_view word) {
    const std::string lower = Lower(word);
    for (const FormatName& name : kFormats) {
        if (lower == name.word) return name.format;
    }
    return std::nullopt;
}

std::vector<std::string> ExportFormatWords() {
    std::vector<std::string> words;
    for (const FormatName& name : kFormats) words.emplace_back(name.word);
    return words;
}

std::string ExportFormatTitle(ExportFormat format) {
    for (const FormatName& name : kFormats) {
        if (name.format == format) return name.title;
    }
    return {};
}

std::string ShapefileStem(const std::string& output) {
    const std::size_t size = output.size();
    if (size > 4 && Lower(output.substr(size - 4)) == ".shp") return output.substr(0, size - 4);
    return output;
}

std::vector<std::string> ExportOutputs(ExportFormat format, const std::string& output) {
    if (format != ExportFormat::Shapefile) return {output};
    std::vector<std::string> outputs;
    const std::string stem = ShapefileStem(output);
    for (const std::string& base : {stem, stem + "_lines"}) {
        for (const char* ending : kShapefileEndings) outputs.push_back(base + ending);
    }
    return outputs;
}

}  // namespace nedit
