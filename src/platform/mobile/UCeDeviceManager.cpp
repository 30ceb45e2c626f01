#include "platform/mobile/UCeDeviceManager.h"

#include <filesystem>
#include <system_error>

bool IsMobileDeviceFileName(const std::string& path) {
    return path.rfind("mtp://", 0) == 0 || path.find("/gvfs/mtp:") != std::string::npos;
}

int UCeDeviceManager::TransferRawFile(const std::string& devicePath, const std::string& localPath,
                                      int, int, const std::wstring&, int) {
    std::error_code error;
    std::filesystem::copy_file(devicePath, localPath,
                               std::filesystem::copy_options::overwrite_existing, error);
    return error ? 0 : 1;
}

int UCeDeviceManager::ConvertRawFile(const std::string& localPath, const std::wstring&,
                                     const std::wstring&, int, const std::wstring&,
                                     std::string& outPath) {
    outPath = localPath;
    return 1;
}
