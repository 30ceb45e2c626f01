#include "transfer/StringTransferSettings.h"

#include <string>
#include <utility>
#include <vector>

#include "platform/settings/ConfigDirectory.h"
#include "platform/settings/IniFile.h"
#include "platform/text/NumberText.h"

namespace {

using nedit::IniFile;

const wchar_t* const kSection = L"String Transfer Settings";

// Every member with its key in the profile.
const std::vector<std::pair<const wchar_t*, int StringTransferSettings::*>>& Members() {
    static const std::vector<std::pair<const wchar_t*, int StringTransferSettings::*>> members = {
        {L"IncludeStringNumbers", &StringTransferSettings::IncludeStringNumbers},
        {L"IncludeComments", &StringTransferSettings::IncludeComments},
        {L"IncludeCommands", &StringTransferSettings::IncludeCommands},
        {L"SaveDescription", &StringTransferSettings::SaveDescription},
        {L"SaveFeatureCode", &StringTransferSettings::SaveFeatureCode},
        {L"Locked", &StringTransferSettings::Locked},
        {L"TransferImages", &StringTransferSettings::TransferImages},
        {L"TransferAttributes", &StringTransferSettings::TransferAttributes},
        {L"UseCodeFlags", &StringTransferSettings::UseCodeFlags},
        {L"TransferNotes", &StringTransferSettings::TransferNotes}};
    return members;
}

IniFile Profile() {
    return IniFile(nedit::ConfigFile("sxnedit.ini"));
}

}  // namespace

bool StringTransferSettings::operator==(const StringTransferSettings& other) const {
    for (const auto& member : Members()) {
        if (this->*member.second != other.*member.second) return false;
    }
    return true;
}

StringTransferSettings GetStringTransferSettings() {
    StringTransferSettings settings;
    const IniFile profile = Profile();
    for (const auto& [key, member] : Members()) {
        const std::wstring value = profile.ReadString(kSection, key);
        if (!value.empty()) settings.*member = nedit::TextToInt(value);
    }
    return settings;
}

bool SetStringTransferSettings(const StringTransferSettings& settings) {
    const IniFile profile = Profile();
    for (const auto& [key, member] : Members()) {
        if (!profile.WriteString(kSection, key, std::to_wstring(settings.*member))) return false;
    }
    return true;
}
