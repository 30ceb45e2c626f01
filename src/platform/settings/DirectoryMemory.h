#pragma once
// The host's memory of the folders the user last opened files in, by key
// ("LastOpenDirectoryNeutral"), kept in the application profile's section "Directories".

#include <string>

namespace nedit {

/// The folder remembered under `key`; the user's home folder when none is.
std::string GetInitialOpenDir(const std::wstring& key);
/// Remembers the folder of the file `path` under `key`.
void SetLastOpenDir(const std::wstring& key, const std::string& path);

}  // namespace nedit
