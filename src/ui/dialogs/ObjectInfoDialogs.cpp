#include "ui/dialogs/ObjectInfoDialogs.h"

#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "codes/UNeditPt.h"
#include "platform/format/UFormatAngle.h"
#include "platform/geometry/UWBrgDst.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/Format.h"
#include "platform/units/Units.h"

namespace nedit {

namespace {

std::wstring Number(int value) {
    return std::to_wstring(value);
}

/// The name a job's table gives an index (a mark, a line style, a thickness), else the index.
std::wstring Named(USurveyDoc* job, std::wstring (USurveyDoc::*name_at)(int), int index) {
    const std::wstring name = job != nullptr ? (job->*name_at)(index) : std::wstring();
    return name.empty() ? Number(index) : name;
}

}  // namespace

UObjectInfoDlg::UObjectInfoDlg(std::wstring title, const InfoContext& context)
    : Context(context), Title(std::move(title)) {}

void UObjectInfoDlg::Add(const std::wstring& label, const std::wstring& value) {
    Rows.push_back({label, value});
}

std::wstring UObjectInfoDlg::ValueOf(const std::wstring& label) const {
    for (const Row& row : Rows) {
        if (row.label == label) return row.value;
    }
    return {};
}

std::wstring UObjectInfoDlg::Length(double value) const {
    const int decimals = Context.settings != nullptr ? Context.settings->GetLengthDecimals() : 3;
    return Format(L"%.*f", decimals, value);
}

std::wstring UObjectInfoDlg::Angle(double degrees) const {
    const int type = Context.settings != nullptr ? IndexOf(Context.settings->GetAngleUnit()) : 0;
    const int decimals = Context.settings != nullptr ? Context.settings->GetAngleDecimals() : 4;
    return UFormatAngle(type, decimals, 0).ConvertToDisplayString(Format(L"%f", degrees));
}

POINTDLG::POINTDLG(const UNeditPt& point, const InfoContext& context)
    : UObjectInfoDlg(L"Edit Point", context) {
    const bool north_first = context.settings != nullptr &&
                             context.settings->GetCoordinateOrder() != UJobSettings::kEastNorth;
    Add(L"Point No.", point.GetID());
    Add(L"Code", point.GetCode());
    Add(north_first ? L"Northing" : L"Easting", Length(north_first ? point.y : point.x));
    Add(north_first ? L"Easting" : L"Northing", Length(north_first ? point.x : point.y));
    Add(L"Elevation", point.HasHeight() ? Length(point.z) : std::wstring());
    Add(L"Use in Surface", point.GetContourFlag() != 0 ? L"Yes" : L"No");
    Add(L"Layer", point.GetLayer());
    Add(L"Color", context.job != nullptr ? Number(point.GetColor()) : std::wstring());
    Add(L"Mark", context.job != nullptr
                     ? Named(context.job, &USurveyDoc::SymbolName, point.GetMarker())
                     : std::wstring());
}

LINEDLG::LINEDLG(const UNeditLine& line, const InfoContext& context)
    : UObjectInfoDlg(L"Edit Line", context) {
    Heading = line.GetFromPt() + L" -> " + line.GetToPt();
    const UWBrgDst step(line.GetStart(), line.GetEnd());
    Add(L"Start Point", line.GetFromPt());
    Add(L"End point", line.GetToPt());
    Add(L"Bearing", Angle(step.bearing));
    Add(L"Distance", Length(step.distance));
    Add(L"Layer", line.GetLayer());
    Add(L"Color", Number(line.GetColor()));
    Add(L"Line Style", Named(context.job, &USurveyDoc::LineTypeName, line.GetLineType()));
    Add(L"Thickness", Named(context.job, &USurveyDoc::LineThicknessName, line.GetThickness()));
}

ARCDLG::ARCDLG(const UNeditArc& arc, const InfoContext& context)
    : UObjectInfoDlg(L"Edit Arc", context) {
    const UWBrgDst chord(arc.GetStart(), arc.GetEnd());
    Add(L"Start Point", arc.GetStartPt());
    Add(L"End point", arc.GetEndPt());
    Add(L"P3 Point", arc.GetThirdPt());
    Add(L"Radius", Length(arc.ComputeRadius()));
    Add(L"Arc Length", Length(arc.ComputeArcLength()));
    Add(L"Internal Angle", Angle(arc.ComputeAngle()));
    Add(L"Sector Area", Length(arc.ComputeSectorArea()));
    Add(L"Start Bearing", Angle(arc.ComputeStartBrg()));
    Add(L"End Bearing", Angle(arc.ComputeEndBrg()));
    Add(L"Chord Bearing", Angle(chord.bearing));
    Add(L"Chord Length", Length(chord.distance));
    Add(L"Line Style", Named(context.job, &USurveyDoc::LineTypeName, arc.GetLineType()));
    Add(L"Color", Number(arc.GetColor()));
    Add(L"Layer", arc.GetLayer());
}

}  // namespace nedit
