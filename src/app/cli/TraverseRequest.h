#pragma once
// What the user asks of a traverse computation: fields of the route dialog and of the
// misclose dialog, by the names the dialogs give them, each set only when given. A field left
// out keeps the dialog's default from the reduced data. Angles are decimal degrees,
// coordinates in the job's length unit.
//
// It comes from a JSON file (--params P.json: {"route": ["A","B","C","A"], "FixedX": 1000, ...})
// or from the flags of the command (--route, --start, ...).

#include <optional>
#include <string>
#include <vector>

struct TraverseRequest {
    std::vector<std::wstring> route;
    std::optional<std::wstring> Start, EndStn, BSName, FixedPt, ChkPt, ClosePt;
    std::optional<double> StartX, StartY, StartZ, BSX, BSY, StartBearing;
    std::optional<double> FixedX, FixedY, FixedZ, CloseX, CloseY, CloseBearing;
    std::optional<int> UseBSCoord, AdjustAngle, UseCloseCoord, Transit, AdjustElevations;
    /// 1: "Angles" is pressed before "Coordinates".
    std::optional<int> AdjustAngles;
};

/// Reads a parameters file; false, with the reason in `error`, when it cannot be read, is no
/// JSON object, or holds a field of an unknown name or of the wrong kind. A height may be
/// null: no height.
bool ReadTraverseRequest(const std::string& path, TraverseRequest& request, std::string& error);

/// The flags of the command line, as given (empty when not given).
struct TraverseFlags {
    std::string route;
    std::string start;
    std::string start_coords;
    std::string start_bearing;
    std::string backsight;
    std::string fixed;
    std::string fixed_coords;
    bool adjust_angles = false;
    std::string check_point;
    std::string close_bearing;
    std::string rule;
    bool adjust_elevations = false;
};

/// The request of the flags; false, with the reason in `error`, for a value that is no
/// number or a list of coordinates of another length than two or three.
bool RequestFromFlags(const TraverseFlags& flags, TraverseRequest& request, std::string& error);
