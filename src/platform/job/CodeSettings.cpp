#include "platform/job/CodeSettings.h"

#include <map>
#include <utility>
#include <vector>

#include "platform/job/SettingsTable.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {
namespace {

const wchar_t* const kSection = L"codes";

// The text members with their stored keys, so that loading and saving cannot drift apart.
std::vector<std::pair<const wchar_t*, std::wstring CodeSettings::*>> TextMembers() {
    return {{L"comment_mark", &CodeSettings::CommentMark},
            {L"code_separator", &CodeSettings::CodeSeparator},
            {L"arc_start", &CodeSettings::ArcStartCmd},
            {L"arc_end", &CodeSettings::ArcEndCmd},
            {L"rect_width", &CodeSettings::RectWidthCmd},
            {L"close", &CodeSettings::CloseCmd},
            {L"keyword6", &CodeSettings::Keyword6},
            {L"check_shot", &CodeSettings::ChkShotCmd},
            {L"keyword8", &CodeSettings::Keyword8},
            {L"keyword9", &CodeSettings::Keyword9},
            {L"keyword10", &CodeSettings::Keyword10},
            {L"keyword11", &CodeSettings::Keyword11},
            {L"offset_string", &CodeSettings::OffsetStringCmd},
            {L"circle_radius", &CodeSettings::CircleRadiusCmd},
            {L"circle_circumference", &CodeSettings::CircleCircumCmd}};
}

std::vector<std::pair<const wchar_t*, int CodeSettings::*>> IntMembers() {
    return {{L"string_number_first", &CodeSettings::StrNoFirst},
            {L"contour_digit", &CodeSettings::ContourDigit},
            {L"contour_digit_first", &CodeSettings::ContourDigitFirst}};
}

}  // namespace

std::wstring CodeSettings::Keyword(int position) const {
    const std::wstring* keywords[kKeywordCount] = {
        &CodeSeparator, &ArcStartCmd, &ArcEndCmd, &RectWidthCmd, &CloseCmd, &Keyword6,
        &ChkShotCmd,    &Keyword8,    &Keyword9,  &Keyword10,    &Keyword11};
    if (position < 1 || position > kKeywordCount) return {};
    return *keywords[position - 1];
}

bool CodeSettings::operator==(const CodeSettings& other) const {
    for (const auto& member : TextMembers()) {
        if (this->*member.second != other.*member.second) return false;
    }
    for (const auto& member : IntMembers()) {
        if (this->*member.second != other.*member.second) return false;
    }
    return StrNoDigits == other.StrNoDigits;
}

CodeSettings LoadCodeSettings(JobDatabase& job) {
    const auto values = ReadSettings(job, kSection);
    CodeSettings settings;
    for (const auto& [key, member] : TextMembers()) {
        const auto found = values.find(key);
        if (found != values.end()) settings.*member = found->second;
    }
    for (const auto& [key, member] : IntMembers()) {
        const auto found = values.find(key);
        if (found != values.end()) settings.*member = TextToInt(found->second) != 0 ? 1 : 0;
    }
    const auto digits = values.find(L"string_number_digits");
    if (digits != values.end()) {
        const int value = TextToInt(digits->second);
        if (value >= 0 && value <= 9) settings.StrNoDigits = static_cast<short>(value);
    }
    return settings;
}

void SaveCodeSettings(JobDatabase& job, const CodeSettings& settings) {
    std::map<std::wstring, std::wstring> values;
    for (const auto& [key, member] : TextMembers()) values[key] = settings.*member;
    for (const auto& [key, member] : IntMembers()) values[key] = std::to_wstring(settings.*member);
    values[L"string_number_digits"] = std::to_wstring(settings.StrNoDigits);
    WriteSettings(job, kSection, values);
}

}  // namespace nedit
