#pragma once
// The instrument drivers found in a directory. Every shared library there is first tried in
// a child process (PluginProbe): it must open, export every function of version 1 of the
// driver interface, be of an interface version this program takes (SXN_DRIVER_API_OLDEST to
// SXN_DRIVER_API_VERSION) and give an instrument name that no driver before it gave. A
// driver of version 2 or later that exports both upload functions can upload. A library that fails
// any of that, or crashes or hangs on the way, is refused with the reason, by its file name; the
// others are listed.
//
// Drivers lie in $SXNEDIT_DRIVER_DIR when it is set and not empty, else in drivers/ beside
// the program.

#include <memory>
#include <string>
#include <vector>

#include "platform/plugins/PluginLibrary.h"
#include "sxnedit_driver.h"

namespace nedit {

struct DriverInfo {
    std::wstring name;
    std::wstring description;
    std::wstring extensions;  // comma-separated, without dots
    std::string path;
    bool uploads = false;  // it writes points for its instrument
};

struct RefusedDriver {
    std::string file;    // the library's file name
    std::string reason;  // "it lacks the function sxn_driver_translate"
};

/// The functions of the driver interface, as a loaded library gives them.
struct DriverFunctions {
    decltype(&sxn_driver_api_version) apiVersion = nullptr;
    decltype(&sxn_driver_name) name = nullptr;
    decltype(&sxn_driver_description) description = nullptr;
    decltype(&sxn_driver_extensions) extensions = nullptr;
    decltype(&sxn_driver_import) import = nullptr;
    decltype(&sxn_driver_download) download = nullptr;
    decltype(&sxn_driver_translate) translate = nullptr;
    decltype(&sxn_driver_time_out) timeOut = nullptr;
    decltype(&sxn_driver_finish) finish = nullptr;
    decltype(&sxn_driver_abort) abort = nullptr;
    // Optional, of version 2: both or neither.
    decltype(&sxn_driver_upload) upload = nullptr;
    decltype(&sxn_driver_upload_point) uploadPoint = nullptr;

    /// Takes every function of version 1 from `library`; false, naming the first missing one
    /// in `error`. The upload functions are taken when the library's version has them and it
    /// exports both.
    bool Resolve(const PluginLibrary& library, std::string& error);
    bool CanUpload() const { return upload != nullptr && uploadPoint != nullptr; }
};

class DriverCatalogue {
  public:
    /// The directory drivers are taken from, as the header says.
    static std::string DefaultDirectory();

    /// Tries every library in `directory`; a directory that cannot be read gives no drivers.
    explicit DriverCatalogue(const std::string& directory);

    const std::string& Directory() const { return directory_; }
    const std::vector<DriverInfo>& Drivers() const { return drivers_; }
    const std::vector<RefusedDriver>& Refused() const { return refused_; }
    /// The driver of that name, without regard to case; null when none.
    const DriverInfo* Find(const std::wstring& name) const;

  private:
    std::string directory_;
    std::vector<DriverInfo> drivers_;
    std::vector<RefusedDriver> refused_;
};

}  // namespace nedit
