// The report document: its settings, labels, and the conversion of stored values to the
// output units.

#include "report/UNeditReport.h"

#include <cmath>

#include "platform/format/UFormatAngle.h"
#include "platform/geometry/CoordinateGeometry.h"
#include "platform/messages/Translate.h"
#include "platform/text/Format.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "records/UNeutralFileFormat.h"
#include "report/NeditIni.h"
#include "report/OutParamStruct.h"
#include "report/ReportContext.h"

namespace {

// Feet in a metre, international and US survey, and metres in a link, as the report has
// always converted them.
constexpr double kFeetPerMetre = 3.280839895013123;
constexpr double kUsFeetPerMetre = 3.28083333333;
constexpr double kMetresPerLink = 0.201168;

// The labels that have a text of their own when NEDIT.INI gives none; the blanks pad the
// column heads.
const std::map<std::wstring, const wchar_t*>& TitleDefaults() {
    static const std::map<std::wstring, const wchar_t*> kDefaults = {
        {L"MSGHC", L"No Height"},   {L"COLID", L"PointID"},      {L"COLLN", L"Line"},
        {L"COLHA", L"Horiz    "},   {L"COLVA", L"Vert     "},    {L"COLSD", L"SDist  "},
        {L"COLHD", L"HDist  "},     {L"COLVD", L"VDist  "},      {L"COLHT", L"HTar  "},
        {L"COLNC", L"North      "}, {L"COLEC", L"East      "},   {L"COLHC", L"Height   "},
        {L"COLCO", L"  Code"},      {L"COLCHECK", L"CheckShot"},
    };
    return kDefaults;
}

// Whole seconds and minutes of 60 carry upwards; degrees past a full turn come back into one.
void CarrySexagesimal(long& d, long& m, long& s) {
    if (s > 59) {
        s %= 60;
        ++m;
    }
    if (m > 59) {
        m %= 60;
        ++d;
    }
    if (d > 359) d %= 360;
}

// The angle less the whole turns it holds once rounded to the second, as the carries of dms
// take them off: 359°59'59.6" is a full turn and shows as 0, not as 360.
double WithoutFullTurns(double degrees) {
    const double size = std::fabs(degrees);
    const double turns = std::floor(std::round(size * 3600.0) / (360.0 * 3600.0));
    return std::copysign(size - turns * 360.0, degrees);
}

bool IsFeet(wchar_t unit) {
    return unit == L'1' || unit == L'F' || unit == L'I';
}
bool IsUsFeet(wchar_t unit) {
    return unit == L'2' || unit == L'U';
}

}  // namespace

UNeditReport::UNeditReport(const nedit::ReportContext* context, const std::wstring& title)
    : UReportDoc(title) {
    Init(context, title);
}

UNeditReport::~UNeditReport() = default;

void UNeditReport::Init(const nedit::ReportContext* context, const std::wstring& title) {
    SetReportTitle(title);
    Context = context;
    EdmScale = 1.0;
    EdmType = L'0';
    OutUA = L'S';
    OutUL = L'M';
    XYFlag = 1;
    HeaderOutputed = false;
    IniCache.clear();
    const std::wstring page_length = IniValue(L"REPORT", L"PAGELENGTH");
    if (!page_length.empty()) SetPageLength(nedit::TextToInt(page_length));
    UpdateSettings();
}

void UNeditReport::Clear() {
    UReportDoc::Clear();
    HeaderOutputed = false;
}

void UNeditReport::UpdateSettings() {
    if (Context == nullptr) return;
    TakeOutputUnits();
    XYFlag = Context->IsENOrder() ? 1 : 0;
}

void UNeditReport::TakeOutputUnits() {
    const OutParamStruct& parameters = Context->GetOutputParameters();
    SetOutUA(GetCheckOn(parameters, opt::AngleDms));
    SetOutUL(GetCheckOn(parameters, opt::LengthMetres));
}

void UNeditReport::SetOutUA(int unit) {
    if (unit >= 0 && unit <= 2) OutUA = nedit::LetterOf(nedit::AngleUnitFromIndex(unit));
}

void UNeditReport::SetOutUL(int unit) {
    if (unit >= 0 && unit <= 2) OutUL = nedit::LetterOf(nedit::LengthUnitFromIndex(unit));
}

std::wstring UNeditReport::IniValue(const std::wstring& section, const std::wstring& key) const {
    const auto cached = IniCache.find({section, key});
    if (cached != IniCache.end()) return cached->second;
    std::wstring value = nedit::NeditIni().ReadString(section, key);
    IniCache.emplace(std::make_pair(section, key), value);
    return value;
}

std::wstring UNeditReport::GetTitleText(const std::wstring& key) const {
    std::wstring text = IniValue(L"TITLE", key);
    if (!text.empty()) return text;
    const auto found = TitleDefaults().find(key);
    return found == TitleDefaults().end() ? std::wstring() : nedit::Translate(found->second);
}

std::wstring UNeditReport::Unit_Text(const std::wstring& section, wchar_t letter) const {
    if (letter == L'I') letter = L'F';
    return IniValue(section, std::wstring(1, letter));
}

const UJobSettings& UNeditReport::Settings() const {
    static const UJobSettings kDefaults;
    return Context != nullptr ? Context->GetSettings() : kDefaults;
}

double UNeditReport::ToMetres(double length) const {
    return nedit::ConvertLength(length, Settings().GetLengthUnit(), nedit::LengthUnit::Metres);
}

std::wstring UNeditReport::ConvertToDistDisplayUnit(double length, int decimals) {
    const double metres = ToMetres(length);
    double value = metres;
    if (IsFeet(OutUL)) {
        value = metres * kFeetPerMetre;
    } else if (IsUsFeet(OutUL)) {
        value = metres * kUsFeetPerMetre;
    } else if (OutUL == L'L') {
        value = metres / kMetresPerLink;
    }
    if ((IsFeet(OutUL) || IsUsFeet(OutUL)) &&
        Settings().GetFootFormat() != UJobSettings::kDecimalFeet) {
        UJobSettings feet;
        feet.SetFootFormat(Settings().GetFootFormat());
        feet.SetFootInchPrecision(Settings().GetFootInchPrecision());
        feet.SetLengthUnit(nedit::LengthUnit::Feet);
        using namespace nedit::length;
        return feet.UnitLengthToString(value, kNoUnit, kNoSign, kJobDecimals, kJobInchFraction,
                                       kUnused);
    }
    return nedit::Format(L"%.*f", decimals, value);
}

double UNeditReport::ConvertToAreaDisplayUnit(double area) {
    const double metres = ToMetres(1.0);
    const double square_metres = area * metres * metres;
    if (IsFeet(OutUL)) return square_metres * kFeetPerMetre * kFeetPerMetre;
    if (IsUsFeet(OutUL)) return square_metres * kUsFeetPerMetre * kUsFeetPerMetre;
    if (OutUL == L'L') return square_metres / (kMetresPerLink * kMetresPerLink);
    return square_metres;
}

double UNeditReport::ConvertToAngleDisplayUnit(double degrees) const {
    if (OutUA == L'1' || OutUA == L'D') return degrees;
    if (OutUA == L'2' || OutUA == L'G') return degrees * 400.0 / 360.0;
    return dms(degrees);
}

double UNeditReport::ConvertToDisplayVA(double reading) const {
    if (Context == nullptr) return 0.0;
    return ConvertToAngleDisplayUnit(Context->GetRecordFormat().ConvertToZenithVA(reading));
}

double UNeditReport::dms(double degrees) {
    const double size = std::fabs(degrees);
    long d = static_cast<long>(size);
    const double minutes = (size - static_cast<double>(d)) * 60.0;
    long m = static_cast<long>(minutes);
    long s = static_cast<long>((minutes - static_cast<double>(m)) * 60.0 + 0.5);
    CarrySexagesimal(d, m, s);
    const double result =
        static_cast<double>(d) + static_cast<double>(m) / 100.0 + static_cast<double>(s) / 10000.0;
    return degrees < 0.0 ? -result : result;
}

bool UNeditReport::Sexagesimal() const {
    return AngleType() == 0;
}

std::wstring UNeditReport::dmsString(double value) const {
    // The digits are taken from the value rounded to four places as a whole number: taking
    // them by fractions would read 89.55, held as 89.54999..., as 89 54'100".
    const long long digits = std::llround(std::fabs(value) * 10000.0);
    long d = static_cast<long>(digits / 10000);
    long m = static_cast<long>(digits / 100 % 100);
    long s = static_cast<long>(digits % 100);
    std::wstring text;
    if (Sexagesimal()) {
        CarrySexagesimal(d, m, s);
        text = nedit::Format(L"%3d %2.2d'%2.2d%c", d, m, s, wchar_t{34});
    } else {
        text = nedit::Format(L"%3d.%2.2d%2.2d", d, m, s);
    }
    if (value < 0.0) text = L"-" + nedit::TrimLeft(text);
    return text;
}

std::wstring UNeditReport::deg2dmsString(double degrees) {
    const double packed = dms(degrees);
    const long long digits = std::llround(std::fabs(packed) * 10000.0);
    std::wstring text =
        nedit::Format(L" %3d %2.2d'%2.2d", static_cast<long>(digits / 10000),
                      static_cast<long>(digits / 100 % 100), static_cast<long>(digits % 100));
    if (degrees < 0.0) text[0] = L'-';
    return text;
}

int UNeditReport::AngleType() const {
    if (OutUA == L'1' || OutUA == L'D') return 1;
    if (OutUA == L'2' || OutUA == L'G') return 2;
    return 0;
}

std::wstring UNeditReport::FormatAngle(double degrees) const {
    const int type = AngleType();
    if (type == 0) degrees = WithoutFullTurns(degrees);
    std::wstring text =
        UFormatAngle(type, 4, 0).ConvertToDisplayString(nedit::Format(L"%f", degrees));
    if (type != 0 || text.size() < 2) return text;
    // ddd.mmss shows as ddd mm'ss".
    text.insert(text.size() - 2, 1, L'\'');
    text += wchar_t{34};
    const std::size_t point = text.find(L'.');
    if (point != std::wstring::npos) text[point] = L' ';
    return text;
}

void UNeditReport::geo_brgdst(double e1, double n1, double e2, double n2, double* brg,
                              double* dst) {
    nedit::geo_brgdst(e1, n1, e2, n2, brg, dst);
}

int UNeditReport::geo_zero(double value) {
    return nedit::geo_zero(value);
}

bool UNeditReport::IsOn(int option) const {
    return Context != nullptr && GetCheckOn(Context->GetOutputParameters(), option) != 0;
}

std::wstring UNeditReport::Height(double value) {
    return value > -10000.0 ? Dist(value) : GetTitleText(L"MSGHC");
}

std::pair<std::wstring, std::wstring> UNeditReport::InOrder(std::wstring east,
                                                            std::wstring north) const {
    if (XYFlag) return {std::move(east), std::move(north)};
    return {std::move(north), std::move(east)};
}
