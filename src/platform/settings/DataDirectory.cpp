#include "platform/settings/DataDirectory.h"

#include <cstdlib>

namespace nedit {

std::string DataDirectory() {
    const char* configured = std::getenv("SXNEDIT_DATA_DIR");
    return configured != nullptr && *configured != '\0' ? configured : SXNEDIT_DATA_DIR;
}

}  // namespace nedit
