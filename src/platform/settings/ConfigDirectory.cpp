#include "platform/settings/ConfigDirectory.h"

#include <cstdlib>

namespace nedit {
namespace {

// An unset variable and an empty one mean the same: fall through to the next choice.
const char* NonEmptyEnv(const char* name) {
    const char* value = std::getenv(name);
    return value != nullptr && *value != '\0' ? value : nullptr;
}

}  // namespace

std::string ConfigDirectory() {
    if (const char* config = NonEmptyEnv("SXNEDIT_CONFIG")) return config;
    if (const char* xdg = NonEmptyEnv("XDG_CONFIG_HOME")) return std::string(xdg) + "/sxnedit";
    const char* home = NonEmptyEnv("HOME");
    return std::string(home != nullptr ? home : ".") + "/.config/sxnedit";
}

std::string ConfigFile(const std::string& name) {
    return ConfigDirectory() + "/" + name;
}

}  // namespace nedit
