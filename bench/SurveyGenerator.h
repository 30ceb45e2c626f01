#pragma once
// Surveys as field crews record them, made up from a seed: a chain of set-ups, each oriented
// on the station before it, that observes its back sight and the next station in rounds on
// both faces, and 20 side shots on both faces with codes, some of them with offsets. The
// observations are worked out from true positions, with a few seconds and millimetres of
// noise, so a reduction gives points close to where they were made. The same shape and seed
// give the same survey, byte for byte, on every machine.
//
// Two odd shapes can be mixed in, each at every n-th station: a back station that nothing
// knows (a reference mark with no coordinates, so the user is asked), and a station that
// nothing positions (the station before does not observe it, so the user is asked for its
// coordinates).

#include <cstdint>
#include <functional>
#include <string>

namespace nedit {

struct SurveyShape {
    int stations = 1000;
    int sideShots = 20;
    /// Rounds of the back sight and the forward sight, each on both faces.
    int rounds = 2;
    /// With false every observation is made once, on face 1.
    bool bothFaces = true;
    /// An offset record follows every n-th side shot; 0 for none.
    int offsetEvery = 10;
    /// Every n-th station is oriented on a back station that nothing knows; 0 for none.
    int unknownBackEvery = 0;
    /// Every n-th station is positioned by nothing in the file; 0 for none.
    int unpositionedEvery = 0;
    /// With n above 0 the side shots are coded into n strings, one shot to each in turn
    /// ("KB1", "FE1", "BLD1", "WL1", "KB2", ...), with tangent arcs, two-point rectangles,
    /// offset runs and circles by radius among them; the positions stay those of the survey
    /// with the plain codes.
    int strings = 0;
    std::uint32_t seed = 1;
};

/// Gives every line of the survey, in order, without its line end.
void GenerateSurvey(const SurveyShape& shape, const std::function<void(const std::string&)>& line);

/// Writes the survey to `path`, each line ended by a line feed; false when it cannot.
bool WriteSurvey(const SurveyShape& shape, const std::string& path);

}  // namespace nedit
