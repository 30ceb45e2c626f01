#pragma once
// Where the program's shipped data lies: the record definition, the default NEDIT.INI, the
// default survey codes.

#include <string>

namespace nedit {

/// $SXNEDIT_DATA_DIR when set and not empty, else the data/ directory of the build.
std::string DataDirectory();

}  // namespace nedit
