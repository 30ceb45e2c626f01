#include "TraverseRequest.h"

#include <charconv>
#include <cmath>
#include <fstream>
#include <functional>
#include <map>
#include <nlohmann/json.hpp>

#include "platform/text/WideText.h"
#include "reduction/ObservationModel.h"

namespace {

using Json = nlohmann::json;

std::wstring Wide(const std::string& text) {
    return nedit::FromUtf8(text);
}

/// The comma-separated parts of `text`.
std::vector<std::string> Split(const std::string& text) {
    std::vector<std::string> parts;
    std::size_t start = 0;
    for (std::size_t comma; (comma = text.find(',', start)) != std::string::npos; start = comma + 1)
        parts.push_back(text.substr(start, comma - start));
    parts.push_back(text.substr(start));
    return parts;
}

/// The whole text as a finite number, blanks around it allowed.
bool ReadNumber(const std::string& text, double& value) {
    const std::string number = nedit::ToUtf8(nedit::Trim(Wide(text)));
    const char* end = number.data() + number.size();
    const auto result = std::from_chars(number.data(), end, value);
    return result.ec == std::errc() && result.ptr == end && std::isfinite(value);
}

/// E,N or E,N,H into the three fields.
bool ReadCoordinates(const std::string& text, const char* flag, std::optional<double>& e,
                     std::optional<double>& n, std::optional<double>& h, std::string& error) {
    const std::vector<std::string> parts = Split(text);
    double values[3] = {0.0, 0.0, kNoHeight};
    bool good = parts.size() == 2 || parts.size() == 3;
    for (std::size_t i = 0; good && i < parts.size(); ++i) good = ReadNumber(parts[i], values[i]);
    if (!good) {
        error = std::string(flag) + " wants E,N or E,N,H: '" + text + "'";
        return false;
    }
    e = values[0];
    n = values[1];
    h = values[2];
    return true;
}

bool ReadAngle(const std::string& text, const char* flag, std::optional<double>& angle,
               std::string& error) {
    double value = 0.0;
    if (!ReadNumber(text, value)) {
        error = std::string(flag) + " wants decimal degrees: '" + text + "'";
        return false;
    }
    angle = value;
    return true;
}

/// How each field of a parameters file is read into the request.
using FieldReader = std::function<bool(const Json&, TraverseRequest&)>;

FieldReader Name(std::optional<std::wstring> TraverseRequest::*field) {
    return [field](const Json& value, TraverseRequest& request) {
        if (!value.is_string()) return false;
        request.*field = Wide(value.get<std::string>());
        return true;
    };
}

FieldReader Number(std::optional<double> TraverseRequest::*field, bool height = false) {
    return [field, height](const Json& value, TraverseRequest& request) {
        if (height && value.is_null()) {
            request.*field = kNoHeight;
            return true;
        }
        if (!value.is_number()) return false;
        request.*field = value.get<double>();
        return true;
    };
}

FieldReader Switch(std::optional<int> TraverseRequest::*field) {
    return [field](const Json& value, TraverseRequest& request) {
        if (value.is_boolean()) {
            request.*field = value.get<bool>() ? 1 : 0;
            return true;
        }
        if (!value.is_number_integer()) return false;
        request.*field = value.get<int>();
        return true;
    };
}

bool ReadRoute(const Json& value, TraverseRequest& request) {
    if (!value.is_array()) return false;
    for (const Json& name : value) {
        if (!name.is_string()) return false;
        request.route.push_back(Wide(name.get<std::string>()));
    }
    return true;
}

const std::map<std::string, FieldReader>& FieldReaders() {
    using R = TraverseRequest;
    static const std::map<std::string, FieldReader> readers = {
        {"route", ReadRoute},
        {"Start", Name(&R::Start)},
        {"EndStn", Name(&R::EndStn)},
        {"StartX", Number(&R::StartX)},
        {"StartY", Number(&R::StartY)},
        {"StartZ", Number(&R::StartZ, true)},
        {"BSName", Name(&R::BSName)},
        {"UseBSCoord", Switch(&R::UseBSCoord)},
        {"BSX", Number(&R::BSX)},
        {"BSY", Number(&R::BSY)},
        {"StartBearing", Number(&R::StartBearing)},
        {"FixedPt", Name(&R::FixedPt)},
        {"FixedX", Number(&R::FixedX)},
        {"FixedY", Number(&R::FixedY)},
        {"FixedZ", Number(&R::FixedZ, true)},
        {"AdjustAngle", Switch(&R::AdjustAngle)},
        {"ChkPt", Name(&R::ChkPt)},
        {"ClosePt", Name(&R::ClosePt)},
        {"UseCloseCoord", Switch(&R::UseCloseCoord)},
        {"CloseX", Number(&R::CloseX)},
        {"CloseY", Number(&R::CloseY)},
        {"CloseBearing", Number(&R::CloseBearing)},
        {"Transit", Switch(&R::Transit)},
        {"AdjustElevations", Switch(&R::AdjustElevations)},
        {"AdjustAngles", Switch(&R::AdjustAngles)},
    };
    return readers;
}

}  // namespace

bool ReadTraverseRequest(const std::string& path, TraverseRequest& request, std::string& error) {
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        error = "cannot read " + path;
        return false;
    }
    const Json document = Json::parse(file, nullptr, false);
    if (document.is_discarded() || !document.is_object()) {
        error = path + " is no JSON object";
        return false;
    }
    for (const auto& [name, value] : document.items()) {
        const auto reader = FieldReaders().find(name);
        if (reader == FieldReaders().end()) {
            error = path + ": no parameter is named \"" + name + "\"";
            return false;
        }
        if (!reader->second(value, request)) {
            error = path + ": \"" + name + "\" has a value of the wrong kind";
            return false;
        }
    }
    return true;
}

bool RequestFromFlags(const TraverseFlags& flags, TraverseRequest& request, std::string& error) {
    if (!flags.route.empty()) {
        for (const std::string& name : Split(flags.route)) {
            if (!name.empty()) request.route.push_back(Wide(name));
        }
    }
    if (!flags.start.empty()) request.Start = Wide(flags.start);
    if (!flags.start_coords.empty() &&
        !ReadCoordinates(flags.start_coords, "--start-coords", request.StartX, request.StartY,
                         request.StartZ, error)) {
        return false;
    }
    if (!flags.start_bearing.empty()) {
        if (!ReadAngle(flags.start_bearing, "--start-bearing", request.StartBearing, error))
            return false;
        request.UseBSCoord = 0;
    }
    if (!flags.backsight.empty()) {
        request.BSName = Wide(flags.backsight);
        request.UseBSCoord = 1;
    }
    if (!flags.fixed.empty()) request.FixedPt = Wide(flags.fixed);
    if (!flags.fixed_coords.empty() &&
        !ReadCoordinates(flags.fixed_coords, "--fixed-coords", request.FixedX, request.FixedY,
                         request.FixedZ, error)) {
        return false;
    }
    if (flags.adjust_angles) request.AdjustAngle = request.AdjustAngles = 1;
    if (!flags.check_point.empty()) request.ChkPt = Wide(flags.check_point);
    if (!flags.close_bearing.empty()) {
        if (!ReadAngle(flags.close_bearing, "--close-bearing", request.CloseBearing, error))
            return false;
        request.UseCloseCoord = 0;
    }
    if (!flags.rule.empty()) request.Transit = flags.rule == "transit" ? 1 : 0;
    if (flags.adjust_elevations) request.AdjustElevations = 1;
    return true;
}
