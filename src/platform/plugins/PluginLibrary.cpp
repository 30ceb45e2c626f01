#include "platform/plugins/PluginLibrary.h"

#include <dlfcn.h>

namespace nedit {

std::unique_ptr<PluginLibrary> PluginLibrary::Open(const std::string& path, std::string& error) {
    void* handle = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (handle == nullptr) {
        const char* reason = dlerror();
        error = reason != nullptr ? reason : "it cannot be loaded";
        return nullptr;
    }
    return std::unique_ptr<PluginLibrary>(new PluginLibrary(path, handle));
}

PluginLibrary::~PluginLibrary() {
    dlclose(handle_);
}

void* PluginLibrary::Symbol(const char* name) const {
    return dlsym(handle_, name);
}

}  // namespace nedit
