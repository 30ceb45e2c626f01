#pragma once
// Where the program keeps its settings files: NEDIT.INI, the application profile, the
// office-wide survey code library.

#include <string>

namespace nedit {

/// $SXNEDIT_CONFIG when set and not empty (tests and scripts use a temporary one), else
/// $XDG_CONFIG_HOME/sxnedit, else $HOME/.config/sxnedit. The directory may not exist yet.
std::string ConfigDirectory();

/// The file of that name in ConfigDirectory().
std::string ConfigFile(const std::string& name);

}  // namespace nedit
