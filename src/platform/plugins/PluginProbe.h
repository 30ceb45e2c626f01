#pragma once
// Trying a shared library before the program trusts it. Opening a library runs its
// constructors, and a faulty one may crash or hang the process that opens it. A probe
// therefore opens the library in a child process and runs the caller's check there; only
// the child suffers a crash, and one that hangs is killed when its time is up.

#include <chrono>
#include <functional>
#include <string>

#include "platform/plugins/PluginLibrary.h"

namespace nedit {

struct ProbeResult {
    bool ok = false;
    std::string payload;  // what the check gave, when ok
    std::string error;    // why not, when not ok: a phrase that can follow "refused: "
};

/// The check runs in the child on the opened library: true with a payload for the parent,
/// or false with the reason in `error`.
using PluginCheck =
    std::function<bool(const PluginLibrary& library, std::string& payload, std::string& error)>;

/// Opens `path` in a child process and runs `check` there. A library that cannot be opened,
/// a check that fails, a child that crashes (the signal is named), that ends the program or
/// that has not finished within `limit` (it is killed), all give ok = false.
ProbeResult ProbePlugin(const std::string& path, const PluginCheck& check,
                        std::chrono::milliseconds limit = std::chrono::seconds(5));

}  // namespace nedit
