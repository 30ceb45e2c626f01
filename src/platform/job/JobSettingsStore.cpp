#include "platform/job/JobSettingsStore.h"

#include "platform/job/SettingsTable.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {
namespace {

const wchar_t* const kSection = L"job";

// A whole number in [low, high] from the stored text, else `fallback`.
int Bounded(const std::map<std::wstring, std::wstring>& values, const wchar_t* key, int low,
            int high, int fallback) {
    const auto found = values.find(key);
    if (found == values.end()) return fallback;
    const std::wstring text = Trim(found->second);
    // Only a whole number counts: "forty" is no 0.
    if (text.empty() || text.find_first_not_of(L"-0123456789") != std::wstring::npos)
        return fallback;
    const int value = TextToInt(text);
    return value < low || value > high ? fallback : value;
}

wchar_t Letter(const std::map<std::wstring, std::wstring>& values, const wchar_t* key,
               wchar_t fallback) {
    const auto found = values.find(key);
    const std::wstring text = found == values.end() ? L"" : Trim(found->second);
    return text.empty() ? fallback : text[0];
}

std::wstring Number(int value) {
    return std::to_wstring(value);
}

}  // namespace

UJobSettings LoadJobSettings(JobDatabase& job) {
    const auto values = ReadSettings(job, kSection);
    UJobSettings settings;
    settings.SetLengthUnit(LengthUnitFromLetter(Letter(values, L"length_unit", L'M')));
    settings.SetAngleUnit(AngleUnitFromLetter(Letter(values, L"angle_unit", L'S')));
    settings.SetLengthDecimals(
        Bounded(values, L"length_decimals", 0, 9, settings.GetLengthDecimals()));
    settings.SetAngleDecimals(
        Bounded(values, L"angle_decimals", 0, 9, settings.GetAngleDecimals()));
    settings.SetCoordinateOrder(
        Bounded(values, L"coordinate_order", 0, 1, settings.GetCoordinateOrder()));
    settings.SetPickAperture(Bounded(values, L"pick_aperture", 0, 2, settings.GetPickAperture()));
    settings.SetShowHeight(Bounded(values, L"show_height", 0, 1, 0) == 1);
    settings.SetAngleFormat(Bounded(values, L"angle_format", 0, 1, settings.GetAngleFormat()));
    settings.SetFootFormat(Bounded(values, L"foot_format", 0, 1, settings.GetFootFormat()));
    const int precision =
        Bounded(values, L"foot_inch_precision", 2, 64, settings.GetFootInchPrecision());
    // Only powers of two make inch fractions.
    if ((precision & (precision - 1)) == 0) settings.SetFootInchPrecision(precision);
    return settings;
}

void SaveJobSettings(JobDatabase& job, const UJobSettings& settings) {
    WriteSettings(job, kSection,
                  {{L"length_unit", std::wstring(1, LetterOf(settings.GetLengthUnit()))},
                   {L"angle_unit", std::wstring(1, LetterOf(settings.GetAngleUnit()))},
                   {L"length_decimals", Number(settings.GetLengthDecimals())},
                   {L"angle_decimals", Number(settings.GetAngleDecimals())},
                   {L"coordinate_order", Number(settings.GetCoordinateOrder())},
                   {L"pick_aperture", Number(settings.GetPickAperture())},
                   {L"show_height", Number(settings.GetShowHeight() ? 1 : 0)},
                   {L"angle_format", Number(settings.GetAngleFormat())},
                   {L"foot_format", Number(settings.GetFootFormat())},
                   {L"foot_inch_precision", Number(settings.GetFootInchPrecision())}});
}

}  // namespace nedit
