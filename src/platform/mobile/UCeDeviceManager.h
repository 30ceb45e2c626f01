#pragma once
// Raw files on a mobile device (a data collector or phone). On this system such a device is
// mounted by the desktop over MTP (a path under ".../gvfs/mtp:host=..." or an "mtp://"
// address), so its files can be read in place; reading them over the link is slow and may
// break off, so an import copies the file to the computer first and reads the copy. The
// drivers read the instruments' own files, so nothing is converted.

#include <string>

/// True for a file on a mobile device as the desktop mounts it.
bool IsMobileDeviceFileName(const std::string& path);

class UCeDeviceManager {
  public:
    /// Nothing to load here: the desktop speaks to the device. Always 1.
    int LoadDll() { return 1; }
    /// Copies `devicePath` to `localPath` (made or replaced); 0 when either cannot be had.
    int TransferRawFile(const std::string& devicePath, const std::string& localPath, int, int,
                        const std::wstring& message, int);
    /// The file a driver reads: the copy itself, in `outPath`. Always 1.
    int ConvertRawFile(const std::string& localPath, const std::wstring&,
                       const std::wstring& extension, int, const std::wstring&,
                       std::string& outPath);
};
