#include "report/NeditIni.h"

#include <sys/stat.h>

#include <filesystem>

#include "platform/settings/ConfigDirectory.h"
#include "platform/text/Format.h"

namespace nedit {
namespace {

constexpr const char* kFileName = "NEDIT.INI";

// The permissions NEDIT.INI had when the last document was opened; -1 when unknown.
int g_saved_mode = -1;

}  // namespace

IniFile NeditIni() {
    return IniFile(ConfigFile(kFileName));
}

bool InstallDefaultNeditIni(const std::string& dataDir) {
    namespace fs = std::filesystem;
    const fs::path target = ConfigFile(kFileName);
    std::error_code error;
    if (fs::exists(target, error)) return true;
    fs::create_directories(target.parent_path(), error);
    return fs::copy_file(fs::path(dataDir) / kFileName, target, error);
}

std::wstring ReadOrderKey() {
    return NeditIni().ReadString(L"OUTPUT", L"ORDER");
}

void WriteOrderKey(const std::wstring& order) {
    NeditIni().WriteString(L"OUTPUT", L"ORDER", order);
}

void WriteFramePos(int left, int top, int right, int bottom) {
    NeditIni().WriteString(L"VIEWPOS", L"FRAMEPOS",
                           Format(L"%d,%d,%d,%d,", left, top, right, bottom));
}

NeditIniGuard::NeditIniGuard() {
    const std::string path = ConfigFile(kFileName);
    struct stat info {};
    if (stat(path.c_str(), &info) != 0) return;
    g_saved_mode = static_cast<int>(info.st_mode & 07777);
    chmod(path.c_str(), static_cast<mode_t>(g_saved_mode) | S_IRUSR | S_IWUSR);
}

NeditIniGuard::~NeditIniGuard() {
    if (g_saved_mode >= 0) chmod(ConfigFile(kFileName).c_str(), static_cast<mode_t>(g_saved_mode));
}

}  // namespace nedit
