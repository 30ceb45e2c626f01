#pragma once
// Writing a whole file safely: the new text goes to a file beside the target, which is then
// renamed over it, so a reader sees the old file or the new one, never half of either, and a
// failed write leaves the old file as it was.

#include <string>

namespace nedit {

/// Replaces the file at `target` (UTF-8 path) with `bytes`, keeping the permissions of the
/// file it replaces. False, with the old file untouched, when it cannot be written.
bool ReplaceFile(const std::string& target, const std::string& bytes);

}  // namespace nedit
