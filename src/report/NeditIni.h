#pragma once
// NEDIT.INI, the report's settings file in the configuration directory: the column flags
// (OUTPUT/ORDER), the report's label texts (TITLE), the names of units and modes, and the
// pane's last position (VIEWPOS).

#include <string>

#include "platform/settings/IniFile.h"

namespace nedit {

/// NEDIT.INI in the configuration directory.
IniFile NeditIni();

/// Copies the default NEDIT.INI shipped in `dataDir` into the configuration directory when
/// none is there yet. False when a copy was needed and could not be made.
bool InstallDefaultNeditIni(const std::string& dataDir);

std::wstring ReadOrderKey();
void WriteOrderKey(const std::wstring& order);
/// The pane's rectangle, written as "%d,%d,%d,%d," of left, top, right and bottom.
void WriteFramePos(int left, int top, int right, int bottom);

/// Keeps NEDIT.INI writable while a document lives: the constructor remembers the file's
/// permissions and makes it writable by its owner, the destructor puts the remembered
/// permissions back. The remembered value is shared, so the last document opened wins.
class NeditIniGuard {
  public:
    NeditIniGuard();
    ~NeditIniGuard();
    NeditIniGuard(const NeditIniGuard&) = delete;
    NeditIniGuard& operator=(const NeditIniGuard&) = delete;
};

}  // namespace nedit
