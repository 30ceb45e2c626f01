#pragma once
// Where plug-ins lie: the program's own directory and the shared libraries in a directory.

#include <string>
#include <vector>

namespace nedit {

/// The directory of the running program, without a trailing '/'; empty when the system
/// does not say.
std::string ProgramDirectory();

/// The regular files named *.so in `directory`, sorted by name, as full paths; none when
/// the directory cannot be read.
std::vector<std::string> SharedLibrariesIn(const std::string& directory);

}  // namespace nedit
