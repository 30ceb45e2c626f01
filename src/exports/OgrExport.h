#pragma once
// The job for GIS, written through GDAL/OGR: GeoPackage, GeoJSON, Shapefile and KML.
//
// Two layers: "points" (each point with its name, code, layer, note, height and a column per
// attribute name) and "linework" (lines, arcs, circles and polylines, each with its kind,
// name and layer). A GeoJSON file holds one collection, so there both go into one, "job".
// A Shapefile holds one kind of geometry: the points go to OUT.shp, the linework to
// OUT_lines.shp (see ExportFormat.h).
//
// Decisions:
// - Arcs are curves where the format has them (GeoPackage: a circular string in a compound
//   curve, a circle a closed circular string); elsewhere they are densified so that no
//   chord strays from the arc by more than kDensifyTolerance (1 mm or 0.001 ft) nor spans
//   more than 22.5 degrees.
// - A point without a height is a 2D point, and its height column is empty; a linework
//   object is 3D when every one of its points has a height, else 2D.
// - The coordinate system is the job's ("EPSG:NNNN") when one is set; axes are East, North.
//   KML is always longitude and latitude, to which GDAL turns the coordinates, so KML
//   without a coordinate system is refused rather than written with local coordinates
//   read as degrees.
// - GDAL writes into memory (/vsimem) and the files are handed back whole, to be written as
//   every output is. GDAL's own warnings (a Shapefile column name cut short) go to the
//   messages.

#include <string>
#include <vector>

#include "exports/ExportFormat.h"
#include "exports/JobContents.h"

namespace nedit {

constexpr double kDensifyTolerance = 0.001;

/// The files of the export of `contents` to `output`. Throws std::runtime_error when GDAL
/// cannot write them or the coordinate system is unknown.
ExportFiles OgrFiles(const JobContents& contents, ExportFormat format, const std::string& output,
                     const std::string& crs, std::vector<std::string>& messages);

/// Empty when GDAL knows the coordinate system "EPSG:NNNN", else why not.
std::string WhyUnknownCrs(const std::string& crs);

}  // namespace nedit
