#pragma once
// Writing a whole file safely. What is done depends on what the target is:
// - a plain file (or none yet): the new text goes to a file beside it, which is then renamed
//   over it, so a reader sees the old file or the new one, never half of either, and a failed
//   write leaves the old file as it was. Its permissions, and its owner where that can be
//   kept, stay.
// - a device, a named pipe or a socket: written in place (a socket through a connection), as
//   a shell's redirection would. Renaming a file over it would put a plain file in its place
//   and the reader at the other end would get nothing. Opening a pipe waits for its reader.
// - a symbolic link: followed; the file it leads to is written as above and the link stays.
// Refused: a file without any write permission bit (even for root, who could write it: the
// user marked it read-only on purpose), a folder, and a file in a folder that does not exist.
//
// A file with other hard links is replaced under this name only; the other names keep the
// old text.

#include <functional>
#include <string>
#include <string_view>

namespace nedit {

/// Takes the next piece of what is written; false when it cannot be written.
using ByteSink = std::function<bool(std::string_view)>;

/// Writes `bytes` to `target` (a UTF-8 path) as said above. False when it cannot be written:
/// the target is then as it was.
bool ReplaceFile(const std::string& target, const std::string& bytes);
/// The same for text made piece by piece: `produce` gives the pieces, in order, to the sink
/// it is handed, and gives false when it or the sink failed. A large output is never held
/// whole in memory.
bool ReplaceFile(const std::string& target, const std::function<bool(const ByteSink&)>& produce);

/// Why ReplaceFile would refuse `target` ("it is read-only", "it is a folder", "the folder
/// /x does not exist", "its folder /x cannot be written"), or empty when it can be written.
std::string WhyNotWritable(const std::string& target);

}  // namespace nedit
