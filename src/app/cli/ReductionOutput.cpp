#include "ReductionOutput.h"

#include <CLI/CLI.hpp>
#include <cmath>
#include <cstdio>

#include "Commands.h"
#include "ConsoleDialogHost.h"
#include "JsonLayout.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "reduction/UNeditDatabase.h"
#include "report/UNeditReport.h"

namespace {

// Names beyond this many are left to the report.
constexpr std::size_t kNamesTold = 10;

bool IsFinite(const UWPoint& point) {
    return std::isfinite(point.x) && std::isfinite(point.y) && std::isfinite(point.z);
}

bool IsFinite(const UWCircle& circle) {
    return IsFinite(circle.GetCentre()) && std::isfinite(circle.GetRadius());
}

// Tells of what came out as no finite numbers; true when something did.
bool TellNonFinite(const UNeditDatabase& engine, ConsoleDialogHost& host) {
    std::wstring names;
    std::size_t points = 0;
    for (const UNeditPt& point : engine.GetPointList()) {
        if (IsFinite(point)) continue;
        if (++points <= kNamesTold) names += (points > 1 ? L", " : L"") + point.GetID();
    }
    if (points > kNamesTold) names += L", \u2026";
    std::size_t circles = 0;
    for (const UWCircle& circle : engine.GetCircleList()) circles += IsFinite(circle) ? 0 : 1;
    if (points > 0) {
        nedit::AppMessageBox(&host,
                             nedit::Translate(L"{1} points have coordinates that are not finite "
                                              L"numbers ({2}); they are left out.",
                                              {std::to_wstring(points), names}),
                             nedit::mb::IconExclamation);
    }
    if (circles > 0) {
        nedit::AppMessageBox(&host,
                             nedit::Translate(L"{1} circles have a centre or radius that is not a "
                                              L"finite number; they are left out.",
                                              {std::to_wstring(circles)}),
                             nedit::mb::IconExclamation);
    }
    return points + circles > 0;
}

// Standard output, a piece at a time.
bool Print(std::string_view text) {
    return std::fwrite(text.data(), 1, text.size(), stdout) == text.size();
}

// The reduced points of a run whose coordinates are finite numbers, in the order of the point
// store, one at a time.
void EachReducedPoint(const UNeditDatabase& engine,
                      const std::function<void(const PointRow&)>& take) {
    for (const UNeditPt& point : engine.GetPointList()) {
        if (!IsFinite(point)) continue;
        take({point.GetID(), point.x, point.y, point.z > kNoHeight, point.z, point.GetCode()});
    }
}

// A position as {"e", "n", "h"}, the height null when there is none.
json::Value Position(double e, double n, double h) {
    return {{"e", e}, {"n", n}, {"h", h > kNoHeight ? json::Value(h) : json::Value(nullptr)}};
}

// A reduced point as the JSON of a run gives it: the members of a point, whether it was
// derived by computation, and what is attached to it, on the points that have it.
std::string ReducedPointJson(const UNeditPt& point) {
    json::Value row = {{"id", json::Text(point.GetID())},
                       {"e", point.x},
                       {"n", point.y},
                       {"h", point.z > kNoHeight ? json::Value(point.z) : json::Value(nullptr)},
                       {"code", json::Text(point.GetCode())},
                       {"derived", point.IsPTInterpolated()}};
    if (point.GetPointAttributeSize() > 0) {
        json::Value attributes = json::Value::array();
        for (const UAttributeObject& attribute : point.GetPointAttributes()) {
            attributes.push_back({{"name", json::Text(attribute.Name)},
                                  {"type", json::Text(attribute.Type)},
                                  {"value", json::Text(attribute.Value)}});
        }
        row["attributes"] = attributes;
    }
    if (point.GetImageSize() > 0) {
        json::Value images = json::Value::array();
        for (const UAttachedImageFile& image : point.GetImages()) {
            images.push_back({{"file", json::Text(image.FileName)},
                              {"number1", image.Number1},
                              {"number2", image.Number2}});
        }
        row["images"] = images;
    }
    if (!point.GetNote().empty()) row["notes"] = json::Value::array({json::Text(point.GetNote())});
    return json::Inline(row);
}

// The report on standard output, ended by a line feed. Like a C string, it ends at a NUL.
void PrintReport(const UNeditReport& report) {
    char last = '\n';
    bool any = false;
    const bool whole = report.WriteUtf8([&](std::string_view piece) {
        const std::size_t nul = piece.find('\0');
        const std::string_view kept = piece.substr(0, nul);
        if (!kept.empty()) {
            Print(kept);
            last = kept.back();
            any = true;
        }
        return nul == std::string_view::npos;
    });
    if (whole && any && last != '\n') Print("\n");
}

}  // namespace

bool WriteReductionJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages,
                        const std::function<bool(std::string_view)>& write) {
    // Rows are written out as they are laid out, a few at a time.
    constexpr std::size_t kPiece = 1 << 16;
    std::string out = "{\n  \"points\": ";
    bool ok = true;
    auto flush = [&](bool always) {
        if (always || out.size() >= kPiece) {
            ok = ok && write(out);
            out.clear();
        }
    };
    {
        json::RowWriter points(out, 2);
        for (const UNeditPt& point : engine.GetPointList()) {
            if (!IsFinite(point)) continue;
            points.Row(ReducedPointJson(point));
            flush(false);
        }
        points.End();
    }
    // A member that is an array of rows; an item that gives no row is left out.
    auto member = [&](const char* name, const auto& items, auto row) {
        out += ",\n  \"";
        out += name;
        out += "\": ";
        json::RowWriter rows(out, 2);
        for (const auto& item : items) {
            const std::string text = row(item);
            if (text.empty()) continue;
            rows.Row(text);
            flush(false);
        }
        rows.End();
    };
    member("strings", engine.GetStrings(), [&engine](const CStrNoList& string) {
        // A string names the points of the JSON: none that was not reduced or left out.
        json::Value names = json::Value::array();
        for (const CStrList& element : string.StrList) {
            const int index = engine.GetPointIdx(element.PtName);
            if (index >= 0 && IsFinite(engine.GetPointList()[static_cast<std::size_t>(index)]))
                names.push_back(json::Text(element.PtName));
        }
        return json::Inline({{"code", json::Text(string.Code)},
                             {"number", json::Text(string.StrNo)},
                             {"points", names}});
    });
    member("lines", engine.GetLineList(), [](const UNeditLine& line) {
        return json::Inline({{"from", json::Text(line.GetFromPt())},
                             {"to", json::Text(line.GetToPt())},
                             {"station_line", line.GetStationLine() != 0},
                             {"code", json::Text(line.GetCode())}});
    });
    member("arcs", engine.GetArcList(), [](const UNeditArc& arc) {
        const UWPoint centre = arc.ComputeCentre();
        if (!IsFinite(centre) || !std::isfinite(arc.ComputeRadius())) return std::string();
        return json::Inline({{"start", json::Text(arc.GetStartPt())},
                             {"end", json::Text(arc.GetEndPt())},
                             {"third", json::Text(arc.GetThirdPt())},
                             {"type", arc.GetArcType()},
                             {"centre", {{"e", centre.x}, {"n", centre.y}}},
                             {"radius", arc.ComputeRadius()},
                             {"code", json::Text(arc.GetCode())}});
    });
    member("circles", engine.GetCircleList(), [](const UNeditCircle& circle) {
        if (!IsFinite(circle)) return std::string();
        return json::Inline({{"e", circle.GetCentre().x},
                             {"n", circle.GetCentre().y},
                             {"radius", circle.GetRadius()},
                             {"centre", {{"e", circle.GetCentre().x}, {"n", circle.GetCentre().y}}},
                             {"code", json::Text(circle.GetCode())}});
    });
    member("checks", engine.GetChecks(), [](const CheckResult& check) {
        const bool finite = std::isfinite(check.E) && std::isfinite(check.N) &&
                            std::isfinite(check.KnownE) && std::isfinite(check.KnownN);
        if (!finite) return std::string();
        json::Value row = {{"id", json::Text(check.Id)},
                           {"station", json::Text(check.Station)},
                           {"point", json::Text(check.KnownName)},
                           {"observed", Position(check.E, check.N, check.H)}};
        // A known point that could not be had has no known position and no differences.
        if (check.Known) {
            const bool heights = check.H > kNoHeight && check.KnownH > kNoHeight;
            row["known"] = Position(check.KnownE, check.KnownN, check.KnownH);
            row["differences"] = {
                {"e", check.E - check.KnownE},
                {"n", check.N - check.KnownN},
                {"h", heights ? json::Value(check.H - check.KnownH) : json::Value(nullptr)},
                {"bearing", check.BearingDiff},
                {"distance", check.DistanceDiff}};
            row["bearing"] = check.Bearing;
            row["known_bearing"] = check.KnownBearing;
            row["distance"] = check.Distance;
            row["known_distance"] = check.KnownDistance;
        }
        return json::Inline(row);
    });
    json::Value said = json::Value::array();
    for (const std::wstring& message : messages) said.push_back(json::Text(message));
    out += ",\n  \"error\": " + std::to_string(engine.GetErrorCode());
    out += ",\n  \"messages\": " + json::Inline(said) + "\n}\n";
    flush(true);
    return ok;
}

void CheckOutputOptions(const std::string& reportPath, bool json) {
    if (json && reportPath == "-") {
        throw CLI::ValidationError("--json and --report - both want standard output");
    }
}

bool WriteReport(const UNeditReport* report, const std::string& path) {
    if (report == nullptr || path.empty()) return true;
    if (path == "-") {
        PrintReport(*report);
        return true;
    }
    if (report->SaveAsText(path)) return true;
    std::fprintf(stderr, "sxnedit: cannot write %s\n", path.c_str());
    return false;
}

int WriteReductionOutput(const UNeditDatabase& engine, const UNeditReport* report,
                         const ReductionOutputs& outputs, ConsoleDialogHost& host) {
    const bool left_out = TellNonFinite(engine, host);
    if (!WriteReport(report, outputs.report)) return exit_status::Failed;
    if (outputs.json) {
        WriteReductionJson(engine, host.Messages(), Print);
    } else if (outputs.report != "-") {
        Print(PointsTableHead());
        EachReducedPoint(
            engine, [&](const PointRow& point) { Print(PointsTableRow(point, outputs.decimals)); });
    }
    if (!outputs.points.empty() &&
        !WritePointsCsv(outputs.points,
                        [&engine](const std::function<void(const PointRow&)>& take) {
                            EachReducedPoint(engine, take);
                        })) {
        return exit_status::Failed;
    }
    return left_out ? exit_status::Failed : exit_status::Ok;
}
