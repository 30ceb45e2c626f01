#include "platform/settings/DirectoryMemory.h"

#include <cstdlib>

#include "platform/settings/ConfigDirectory.h"
#include "platform/settings/IniFile.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

constexpr const wchar_t* kSection = L"Directories";

IniFile Profile() {
    return IniFile(ConfigFile("sxnedit.ini"));
}

}  // namespace

std::string GetInitialOpenDir(const std::wstring& key) {
    const std::wstring folder = Profile().ReadString(kSection, key);
    if (!folder.empty()) return ToUtf8(folder);
    const char* home = std::getenv("HOME");
    return home != nullptr ? home : "/";
}

void SetLastOpenDir(const std::wstring& key, const std::string& path) {
    const std::size_t slash = path.find_last_of('/');
    const std::string folder =
        slash == std::string::npos ? "." : path.substr(0, slash == 0 ? 1 : slash);
    Profile().WriteString(kSection, key, FromUtf8(folder));
}

}  // namespace nedit
