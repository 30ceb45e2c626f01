// The blocks of the reduction report, each in its fixed-width layout.

#include <algorithm>
#include <cmath>
#include <ctime>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UAngle.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "report/OutParamStruct.h"
#include "report/ReportContext.h"
#include "report/UNeditReport.h"

using nedit::Format;
using nedit::Translate;

namespace {

constexpr const wchar_t* kLabel = L"%-29s : %s";

}  // namespace

// ---- Head lines ------------------------------------------------------------------------

void UNeditReport::PrintHeadCtrlString(const std::wstring& key, const std::wstring& section,
                                       wchar_t letter) {
    W(Format(kLabel, GetTitleText(key), Unit_Text(section, letter)), 0, 1);
}

void UNeditReport::PrintHeadString(const std::wstring& key, const std::wstring& value) {
    W(Format(kLabel, GetTitleText(key), value), 0, 1);
}

void UNeditReport::PrintHeadInt(const std::wstring& key, int value) {
    W(Format(L"%-29s : %d", GetTitleText(key), value), 0, 1);
}

void UNeditReport::PrintHeadDVal(const std::wstring& key, double value) {
    std::wstring label = GetTitleText(key);
    if (label.empty()) label = key;
    W(Format(L"%-29s : %-15s", label, Dist(value)), 0, 1);
}

void UNeditReport::PrintHeadHDegree(const std::wstring& key, double value, bool titled) {
    std::wstring label;
    if (titled) {
        label = GetTitleText(key);
        if (label.empty()) label = key;
    }
    W(Format(L"%-29s : %10s", label, FormatAngle(value)), 0, 1);
}

void UNeditReport::PrintHeadVDegree(const std::wstring& key, double value) {
    W(Format(kLabel, GetTitleText(key), nedit::Trim(dmsString(ConvertToDisplayVA(value)))), 0, 1);
}

void UNeditReport::PrintHeadCoord(double e, double n, double h) {
    const wchar_t* format = XYFlag ? L"%-29s : E %s   N %s   H %s" : L"%-29s : N %s   E %s   H %s";
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    W(Format(format, GetTitleText(L"COORD"), first, second, Height(h)), 0, 1);
}

void UNeditReport::PrintEdmHead() {
    W(Format(kLabel, GetTitleText(L"EDMTYPE"), Unit_Text(L"EDMTYPE", EdmType)), 0, 1);
    PrintHeadDVal(L"EDMSCALE", EdmScale);
}

void UNeditReport::PrintMainReportHead() {
    IniCache.clear();
    if (Context != nullptr) TakeOutputUnits();
    KeepLines(4);
    W(Translate(L"Main Report"), 2, 2);
    if (Context != nullptr) {
        PrintHeadCtrlString(L"INUL", L"DISTUNIT", Context->GetRecordFormat().GetFileLengthLetter());
        PrintHeadCtrlString(L"INUA", L"ANGUNIT", Context->GetRecordFormat().GetFileAngleLetter());
    }
    W(Format(kLabel, GetTitleText(L"OUTUL"), Unit_Text(L"DISTUNIT", OutUL)), 0, 1);
    W(Format(kLabel, GetTitleText(L"OUTUA"), Unit_Text(L"ANGUNIT", OutUA)), 0, 1);
    W(Format(kLabel, GetTitleText(L"TEMP"), Unit_Text(L"MISCUNIT", L'T')), 0, 1);
    W(Format(kLabel, GetTitleText(L"PRES"), Unit_Text(L"MISCUNIT", L'P')), 0, 1);
    if (Context != nullptr) {
        PrintHeadCtrlString(L"HANGMODE", L"HAMODE", Context->GetRecordFormat().GetHModeLetter());
        PrintHeadCtrlString(L"VANGMODE", L"VAMODE", Context->GetRecordFormat().GetVModeLetter());
    }
}

// ---- Stations and their observations ------------------------------------------------------

void UNeditReport::PrintOccStnBlk(const std::vector<double>& backReadings, const std::wstring& name,
                                  double e, double n, double h, const std::wstring& code,
                                  double insHt, double scale, const std::wstring& backStn,
                                  double backBearing, double backAngle) {
    KeepLines(10);
    NewLines(3);
    PrintHeadString(L"OCCSTN", name);
    PrintHeadCoord(e, n, h);
    W(Format(L"%-29s : %-15.8f", Translate(L"Scale Factor"), scale), 0, 1);
    PrintHeadString(L"CODE", code);
    PrintHeadDVal(L"INSHT", insHt);
    if (backStn.empty()) return;
    PrintHeadString(L"BACKSTN", backStn);
    PrintHeadHDegree(L"BSBEARING", backBearing, true);
    bool first = true;
    for (const double reading : backReadings) {
        PrintHeadHDegree(L"BSOBS", reading, first);
        first = false;
    }
    PrintHeadHDegree(L"BSANGLE", backAngle, true);
}

void UNeditReport::PrintSSHead() {
    KeepLines(3);
    struct Head {
        int option;
        const wchar_t* key;
        const wchar_t* format;
    };
    const Head east{opt::EC, L"COLEC", L"%14s"};
    const Head north{opt::NC, L"COLNC", L"%14s"};
    const Head heads[] = {
        {opt::ID, L"COLID", L"%s"},   {opt::LN, L"COLLN", L" %s"},  {opt::HA, L"COLHA", L"%13s"},
        {opt::VA, L"COLVA", L"%13s"}, {opt::SD, L"COLSD", L"%8s"},  {opt::HD, L"COLHD", L"%8s"},
        {opt::VD, L"COLVD", L"%8s"},  {opt::HT, L"COLHT", L"%7s"},  XYFlag ? east : north,
        XYFlag ? north : east,        {opt::HC, L"COLHC", L"%10s"}, {opt::CO, L"COLCO", L" %s"},
    };
    // Without a context the reduced set of columns stands.
    const int reduced[] = {opt::ID, opt::HA, opt::VA, opt::SD, opt::HT,
                           opt::EC, opt::NC, opt::HC, opt::CO};
    for (const Head& head : heads) {
        const bool shown = Context != nullptr ? IsOn(head.option)
                                              : std::find(std::begin(reduced), std::end(reduced),
                                                          head.option) != std::end(reduced);
        if (shown)
            W(Format(head.format, GetTitleText(head.key)), head.option == opt::ID ? 1 : 0, 0);
    }
    NewLines(2);
}

void UNeditReport::PrintSSLine(const std::wstring& id, double ha, double va, double sd, double ht,
                               double e, double n, double h, const std::wstring& code, int lineNo,
                               bool full) {
    const std::wstring horizontal = Dist(std::fabs(std::sin(va * kRadiansPerDegree) * sd));
    const std::wstring vertical = Dist(std::cos(va * kRadiansPerDegree) * sd);
    const std::wstring vertical_angle = dmsString(ConvertToDisplayVA(va));
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    const bool with_context = Context != nullptr;
    auto column = [&](int option, bool without_context, const std::wstring& text) {
        if (with_context ? IsOn(option) : without_context) W(text, 0, 0);
    };
    column(opt::ID, true, Format(L"%7s", id));
    column(opt::LN, false, full ? Format(L"%5d", lineNo) : Format(L"%5c", L' '));
    column(opt::HA, true, Format(L"%13s", FormatAngle(ha)));
    column(opt::VA, true, Format(L"%13s", vertical_angle));
    column(opt::SD, true, Format(L"%8s", Dist(sd)));
    column(opt::HD, false, Format(L"%8s", horizontal));
    column(opt::VD, false, Format(L"%8s", vertical));
    column(opt::HT, true, Format(L"%7s", Dist(ht)));
    if (full) {
        column(XYFlag ? opt::EC : opt::NC, true, Format(L"%14s", first));
        column(XYFlag ? opt::NC : opt::EC, true, Format(L"%14s", second));
        column(opt::HC, true, Format(L"%10s", Height(h)));
        column(opt::CO, true, Format(L" %s", code));
    }
    NewLines(1);
}

int UNeditReport::PrintOffset(double r, double t, double v) {
    W(Format(L"%s%43s R%10s   T%10s V%8s", Translate(L"OFFSETS"), L" ", Dist(r), Dist(t), Dist(v)),
      0, 1);
    return 1;
}

void UNeditReport::PrintPTHeader() {
    KeepLines(3);
    W(GetTitleText(L"COLID"), 1, 0);
    const auto [first, second] = InOrder(GetTitleText(L"COLEC"), GetTitleText(L"COLNC"));
    W(Format(L"%14s", first), 0, 0);
    W(Format(L"%14s", second), 0, 0);
    W(Format(L"%13s", GetTitleText(L"COLHC")), 0, 0);
    W(Format(L"     %s", GetTitleText(L"COLCO")), 0, 0);
    NewLines(2);
}

void UNeditReport::PrintPTRecord(const std::wstring& name, double e, double n, double h,
                                 const std::wstring& code) {
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    W(Format(L"%7s", name), 0, 0);
    W(Format(L"%14s", first), 0, 0);
    W(Format(L"%14s", second), 0, 0);
    W(Format(L"%13s", Height(h)), 0, 0);
    W(Format(L"     %s", code), 0, 0);
    NewLines(1);
}

// ---- Traverses -------------------------------------------------------------------------------

int UNeditReport::PrintTravHead(const std::wstring& title, bool elevAdj) {
    UpdateSettings();
    KeepLines(4);
    W(title.empty() ? Translate(L"Traverse") : title, 3, 2);
    const auto [first, second] = InOrder(Translate(L"Easting"), Translate(L"Northing"));
    std::wstring line = Format(L"%7s%15s%15s%11s%17s%15s%15s", Translate(L"Point"),
                               Translate(L"Hor Ang"), Translate(L"Azimuth"), Translate(L"Hz Dist"),
                               first, second, Translate(L"Elevation"));
    if (elevAdj) line += Format(L" %15s", Translate(L"Elev Adjustment"));
    W(line, 0, 2);
    return 1;
}

int UNeditReport::PrintTravHead(int adjusted) {
    return PrintTravHead(adjusted ? Translate(L"Adjusted Traverse") : std::wstring(), false);
}

int UNeditReport::PrintCoord(const std::wstring& name, double e, double n, double h) {
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    W(Format(L"%-6s%44s%15s%15s%15s", name, L" ", first, second, Height(h)), 0, 1);
    return 1;
}

int UNeditReport::PrintCoord(const std::wstring& name, double e, double n) {
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    W(Format(L"%-6s%44s%15s%15s", name, L" ", first, second), 0, 1);
    return 1;
}

int UNeditReport::PrintLine(const std::wstring& name, double ha, double brg, double dist, double e,
                            double n, double h, bool elevAdj, double adj) {
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    std::wstring height = GetTitleText(L"MSGHC");
    std::wstring adjustment;
    if (h > -10000.0) {
        height = Dist(Is_Zero(h, false) ? 0.0 : h);
        adjustment = Format(L"%15s", Dist(Is_Zero(adj, false) ? 0.0 : adj));
    }
    std::wstring line = Format(L"%-6s %15s%15s %10s  %15s%15s%15s", name, FormatAngle(ha),
                               FormatAngle(brg), Dist(dist), first, second, height);
    if (elevAdj) line += adjustment;
    W(line, 0, 1);
    return 1;
}

int UNeditReport::PrintLine(const std::wstring& name, double ha, double brg, double dist, double e,
                            double n) {
    const auto [first, second] = InOrder(Dist(e), Dist(n));
    W(Format(L"%-6s %15s%15s %10s  %15s%15s", name, dmsString(ConvertToAngleDisplayUnit(ha)),
             dmsString(ConvertToAngleDisplayUnit(brg)), Dist(dist), first, second),
      0, 1);
    return 1;
}

int UNeditReport::PrintTraverseInfo(double dE, double dN, double dH, double brg, double dist,
                                    double area, double length, int setups,
                                    const std::wstring& accuracy, bool elevError, bool angle,
                                    double angErr, double perStn, double known, double observed) {
    // Lengths here follow the job's settings, not the report's output unit.
    const UJobSettings& job = Settings();
    KeepLines(7);
    using namespace nedit::length;
    const std::wstring east =
        job.LengthToString(dE, kNoUnit, kNoSign, 3, kJobInchFraction, kCoordinate, kUnused);
    const std::wstring north =
        job.LengthToString(dN, kNoUnit, kNoSign, 3, kJobInchFraction, kCoordinate, kUnused);
    // Heights and areas are in the job's unit already, as the job shows them.
    const std::wstring height = job.UnitLengthToString(Is_Zero(dH, false) ? 0.0 : dH, kNoUnit,
                                                       kNoSign, 3, kJobInchFraction, kUnused);
    W(Translate(XYFlag ? L"                               East Diff            North Diff          "
                         L" Elev Diff"
                       : L"                               North Diff           East Diff           "
                         L" Elev Diff"),
      2, 1);
    const auto [first, second] = InOrder(east, north);
    W(Format(L"Coordinate Misclose            %-20s %-20s %-20s", first, second, height), 0, 2);
    auto angle_text = [&job](double value) {
        std::wstring text;
        ConvertAngleToDisplay(job, value, text, 0);
        return nedit::TrimLeft(text);
    };
    W(Format(L"%s               %-20s %s             %-20s", Translate(L"Misclose Bearing"),
             angle_text(brg), Translate(L"Distance"),
             job.DistanceToString(dist, kNoUnit, kNoSign, 3, kJobInchFraction, kUnused, kUnused)),
      0, 1);
    W(Format(L"%s                  %-20.3f %s      %-20s", Translate(L"Enclosed Area"),
             area > 0.0 ? area : 0.0, Translate(L"Traverse Length"),
             job.DistanceToString(length, kNoUnit, kNoSign, 3, kJobInchFraction, kUnused, kUnused)),
      0, 1);
    W(Format(L"%s                  %-20d %s             %-20s", Translate(L"No  of Setups"), setups,
             Translate(L"Accuracy"), accuracy),
      0, 1);
    if (elevError)
        W(Format(L"%s                %-20s", Translate(L"Elevation Error"), height), 0, 1);
    if (angle) {
        W(Format(L"%s                  %-20s %s     %-20s", Translate(L"Known Bearing"),
                 angle_text(known), Translate(L"Observed Bearing"), angle_text(observed)),
          1, 1);
        W(Format(L"%s                  %-20s %s           %-20s", Translate(L"Angular Error"),
                 angle_text(angErr), Translate(L"PerStation"), angle_text(perStn)),
          0, 1);
    }
    return 1;
}

int UNeditReport::PrintMisclose(double dist, double brg, double accuracy, double area,
                                double total) {
    KeepLines(7);
    const double bearing = ConvertToAngleDisplayUnit(brg);
    const std::wstring accuracy_text =
        accuracy > 100000.0 ? std::wstring(L"100000+") : Format(L"%d", static_cast<int>(accuracy));
    W(Translate(L"Misclose {1} Direction {2}", {Dist(dist), Format(L"%.3f", bearing)}), 2, 1);
    if (total > 0.0) W(Translate(L"Total Distance {1}", {Dist(total)}), 0, 1);
    if (area > 0.0)
        W(Format(L"%s           %-15.3f", Translate(L"Area"), ConvertToAreaDisplayUnit(area)), 0,
          1);
    W(Format(L"%s    1:%s", Translate(L"Error"), accuracy_text), 0, 4);
    return 1;
}

int UNeditReport::PrintAdjustedSideShotsHead(const std::wstring& text) {
    KeepLines(9);
    W(text, 3, 1);
    return 1;
}

// ---- Check shots -----------------------------------------------------------------------------

void UNeditReport::PrintChkStn(const std::wstring& id, double ha, double va, double sd, double ht,
                               const std::wstring& code, int lineNo) {
    const std::wstring horizontal = Dist(std::fabs(std::sin(va * kRadiansPerDegree) * sd));
    const std::wstring vertical = Dist(std::fabs(std::cos(va * kRadiansPerDegree) * sd));
    const bool with_context = Context != nullptr;
    auto column = [&](int option, bool without_context, const std::wstring& text) {
        if (with_context ? IsOn(option) : without_context) W(text, 0, 0);
    };
    column(opt::ID, true, Format(L"%7s", id));
    column(opt::LN, false, Format(L" %4d", lineNo));
    column(opt::HA, true, Format(L"%13s", FormatAngle(ha)));
    column(opt::VA, true, Format(L"%13s", dmsString(ConvertToDisplayVA(va))));
    column(opt::SD, true, Format(L"%8s", Dist(sd)));
    column(opt::HD, false, Format(L"%8s", horizontal));
    column(opt::VD, false, Format(L"%8s", vertical));
    column(opt::HT, true, Format(L"%7s", Dist(ht)));
    W(Format(L" %-36s", GetTitleText(L"COLCHECK")), 0, 0);
    column(opt::CO, true, Format(L" %s", code));
    NewLines(1);
}

void UNeditReport::PrintChkStnBlk(const std::wstring& /*stn*/, const std::wstring& target, double e,
                                  double n, double h, double knownE, double knownN, double knownH,
                                  double brg, double knownBrg, double brgDiff, double dist,
                                  double knownDist, double distDiff) {
    const std::wstring pad(target.size() < 7 ? 7 - target.size() : 0, L' ');
    auto line = [&](const std::wstring& text) { W(pad + text, 0, 1); };
    constexpr const wchar_t* kRow = L"%-16s%16s%16s%16s";
    KeepLines(10);
    line(Format(L"*********************** %s ****************************",
                Translate(L"CHECK POINT")));
    line(Translate(L"                        Observed         Known        Difference"));
    const std::wstring east_row =
        Format(kRow, Translate(L"Easting"), Dist(e), Dist(knownE), Dist(e - knownE));
    const std::wstring north_row =
        Format(kRow, Translate(L"Northing"), Dist(n), Dist(knownN), Dist(n - knownN));
    line(XYFlag ? east_row : north_row);
    line(XYFlag ? north_row : east_row);
    line(Format(kRow, Translate(L"Height"), Dist(h), Dist(knownH), Dist(h - knownH)));
    line(Format(kRow, Translate(L"Bearing"), FormatAngle(brg), FormatAngle(knownBrg),
                FormatAngle(brgDiff)));
    line(Format(kRow, Translate(L"Distance"), Dist(dist), Dist(knownDist), Dist(distDiff)));
    line(L"****************************************************************");
}

// ---- Codes and the end -------------------------------------------------------------------------

void UNeditReport::PrintUndefinedCodeHead() {
    KeepLines(4);
    W(Translate(L"Undefined Codes"), 3, 1);
    W(L"~~~~~~~~~~~~~~~", 0, 1);
}

void UNeditReport::PrintUndefined(const std::wstring& text) {
    W(text, 0, 1);
}

void UNeditReport::PrintPartOfArc(const std::wstring& name) {
    W(Translate(L"***Point {1} is Part of Arc & will not be Adjusted...", {name}), 0, 1);
}

void UNeditReport::PrintEndFile() {
    KeepLines(5);
    const std::time_t now = std::time(nullptr);
    wchar_t clock[16] = L"";
    std::wcsftime(clock, sizeof clock / sizeof clock[0], L"%H:%M:%S", std::localtime(&now));
    W(Format(L"%s %s", Translate(L"Time Finished"), std::wstring(clock)), 2, 1);
    W(Translate(L"         --- END of file ---"), 0, 1);
}

void UNeditReport::PrintPageHead(const std::wstring& /*text*/, int /*page*/) {}
