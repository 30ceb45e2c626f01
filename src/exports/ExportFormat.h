#pragma once
// The formats a job is exported to, by the word that names each on the command line, and
// the files each one writes for an output path.
//
// A Shapefile holds one kind of geometry, so an export writes two: the points under the
// name given (OUT.shp with its .shx, .dbf, .cpg and .prj) and the lines, arcs, circles and
// polylines beside it (OUT_lines.shp and the rest). The .prj files come only with a
// coordinate system.

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace nedit {

/// The files of an export, each path with its whole text, before any is written.
using ExportFiles = std::vector<std::pair<std::string, std::string>>;

enum class ExportFormat { Csv, Dxf, GeoPackage, GeoJson, Shapefile, Kml, LandXml };

/// The format a word names, without regard to case: csv, dxf, gpkg, geojson, shp, kml,
/// landxml; nothing for another word.
std::optional<ExportFormat> ExportFormatNamed(std::string_view word);
/// The word of each format, in the order above.
std::vector<std::string> ExportFormatWords();
/// What the format is called in messages ("GeoPackage").
std::string ExportFormatTitle(ExportFormat format);

/// Every file an export to `output` may write: `output` itself, and for a Shapefile its
/// companions.
std::vector<std::string> ExportOutputs(ExportFormat format, const std::string& output);

/// A Shapefile's path without its ".shp" (any case), to which the companions' endings go.
std::string ShapefileStem(const std::string& output);

}  // namespace nedit
