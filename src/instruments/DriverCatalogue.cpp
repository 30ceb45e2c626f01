#include "instruments/DriverCatalogue.h"

#include <cstdlib>
#include <type_traits>

#include "platform/plugins/PluginFiles.h"
#include "platform/plugins/PluginProbe.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

// The texts a driver names itself with, one after the other, each ended by a NUL.
bool CheckDriver(const PluginLibrary& library, std::string& payload, std::string& error) {
    DriverFunctions functions;
    if (!functions.Resolve(library, error)) return false;
    const unsigned version = functions.apiVersion();
    if (version < SXN_DRIVER_API_OLDEST || version > SXN_DRIVER_API_VERSION) {
        error = "it was built for version " + std::to_string(version) +
                " of the driver interface; this program takes versions " +
                std::to_string(SXN_DRIVER_API_OLDEST) + " to " +
                std::to_string(SXN_DRIVER_API_VERSION);
        return false;
    }
    const char* uploads = functions.CanUpload() ? "upload" : "";
    for (const char* text :
         {functions.name(), functions.description(), functions.extensions(), uploads}) {
        payload += text != nullptr ? text : "";
        payload += '\0';
    }
    if (payload.front() == '\0') {
        error = "it gives no instrument name";
        return false;
    }
    return true;
}

std::wstring NextText(const std::string& payload, std::size_t& at) {
    const std::size_t end = payload.find('\0', at);
    const std::string text = payload.substr(at, end - at);
    at = end == std::string::npos ? payload.size() : end + 1;
    return FromUtf8(text);
}

std::string FileName(const std::string& path) {
    return path.substr(path.find_last_of('/') + 1);
}

}  // namespace

bool DriverFunctions::Resolve(const PluginLibrary& library, std::string& error) {
    const auto take = [&](auto& function, const char* symbol) {
        if (!error.empty()) return;
        function = library.Get<std::remove_reference_t<decltype(function)>>(symbol);
        if (function == nullptr) error = std::string("it lacks the function ") + symbol;
    };
    error.clear();
    take(apiVersion, "sxn_driver_api_version");
    take(name, "sxn_driver_name");
    take(description, "sxn_driver_description");
    take(extensions, "sxn_driver_extensions");
    take(import, "sxn_driver_import");
    take(download, "sxn_driver_download");
    take(translate, "sxn_driver_translate");
    take(timeOut, "sxn_driver_time_out");
    take(finish, "sxn_driver_finish");
    take(abort, "sxn_driver_abort");
    if (!error.empty()) return false;
    if (apiVersion() >= 2) {
        upload = library.Get<decltype(upload)>("sxn_driver_upload");
        uploadPoint = library.Get<decltype(uploadPoint)>("sxn_driver_upload_point");
    }
    if (!CanUpload()) {
        upload = nullptr;
        uploadPoint = nullptr;
    }
    return true;
}

std::string DriverCatalogue::DefaultDirectory() {
    const char* directory = std::getenv("SXNEDIT_DRIVER_DIR");
    if (directory != nullptr && *directory != '\0') return directory;
    return ProgramDirectory() + "/drivers";
}

DriverCatalogue::DriverCatalogue(const std::string& directory) : directory_(directory) {
    for (const std::string& path : SharedLibrariesIn(directory)) {
        const ProbeResult probe = ProbePlugin(path, CheckDriver);
        if (!probe.ok) {
            refused_.push_back({FileName(path), probe.error});
            continue;
        }
        DriverInfo info;
        std::size_t at = 0;
        info.name = NextText(probe.payload, at);
        info.description = NextText(probe.payload, at);
        info.extensions = NextText(probe.payload, at);
        info.uploads = !NextText(probe.payload, at).empty();
        info.path = path;
        if (const DriverInfo* same = Find(info.name)) {
            refused_.push_back({FileName(path), "a driver of the same name, " + ToUtf8(info.name) +
                                                    ", was taken from " + FileName(same->path)});
            continue;
        }
        drivers_.push_back(std::move(info));
    }
}

const DriverInfo* DriverCatalogue::Find(const std::wstring& name) const {
    for (const DriverInfo& driver : drivers_) {
        if (EqualsIgnoreCase(driver.name, name)) return &driver;
    }
    return nullptr;
}

}  // namespace nedit
