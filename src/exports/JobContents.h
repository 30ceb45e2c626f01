#pragma once
// What an export takes from a job: its points, lines, arcs, circles and polylines with their
// layers, read once into memory in the order they were stored. Texts are UTF-8, as every
// output format wants them; coordinates are in the job's length unit.
//
// Decisions:
// - A layer filter keeps the objects whose own layer is named in it. An object with no layer
//   goes out only when there is no filter. A named layer the job does not have is an error,
//   so that a misspelt name does not give an empty file that looks right.
// - A line, arc or polyline goes out whole with the coordinates of its points, whatever the
//   layers of those points: the filter picks objects, not their vertices.

#include <string>
#include <utility>
#include <vector>

#include "platform/geometry/UWPoint.h"
#include "platform/units/Units.h"

class USurveyDoc;

namespace nedit {

/// A point of the job with its name; at.z is UWPoint::kNoHeight when it has no height.
struct JobVertex {
    std::string name;
    UWPoint at;
};

struct ExportPoint {
    JobVertex point;
    std::string code;
    std::string layer;
    std::string note;
    /// The point's attributes, name and value, in their stored order.
    std::vector<std::pair<std::string, std::string>> attributes;
};

struct ExportLine {
    JobVertex from;
    JobVertex to;
    std::string layer;
};

/// An arc from `start` to `end` about `centre`; bulge is tan(sweep / 4), positive for a
/// clockwise arc, as the job keeps bulges.
struct ExportArc {
    JobVertex start;
    JobVertex end;
    UWPoint centre;
    double radius = 0.0;
    double bulge = 0.0;
    std::string layer;
};

struct ExportCircle {
    JobVertex centre;
    double radius = 0.0;
    std::string layer;
};

/// A polyline's vertices; the bulge of a vertex shapes the leg to the next one. A closed
/// polyline ends on its first point again, as the job stores it.
struct ExportPolyline {
    std::string name;
    std::string layer;
    bool closed = false;
    std::vector<std::pair<JobVertex, double>> vertices;
};

struct JobContents {
    LengthUnit lengthUnit = LengthUnit::Metres;  // the unit of every coordinate
    std::vector<std::string> layers;  // the layers the objects below use, in the job's order
    std::vector<ExportPoint> points;
    std::vector<ExportLine> lines;
    std::vector<ExportArc> arcs;
    std::vector<ExportCircle> circles;
    std::vector<ExportPolyline> polylines;
};

/// The names of the job's layers, in the order they were made.
std::vector<std::string> JobLayerNames(USurveyDoc& job);

/// Reads the job's objects on the layers named (all when none are). Throws JobError when
/// the job cannot be read, and std::invalid_argument naming a layer the job does not have.
JobContents ReadJobContents(USurveyDoc& job, const std::vector<std::string>& layers);

}  // namespace nedit
