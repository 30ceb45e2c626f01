#pragma once
// Where a download keeps what the instrument sent, and how the user keeps a copy.
//
// Decision: the temporary raw file "OUTTEMP.$$$" lies in a folder of the user's own in the
// temporary directory, "sxnedit-UID" ($TMPDIR, else /tmp), made readable by the user alone:
// a fixed name straight in a shared /tmp could be taken or linked by another user. It is
// not deleted after a download; the next one overwrites it.

#include <string>

namespace nedit {

constexpr const char* kTemporaryRawFileName = "OUTTEMP.$$$";

/// The path of the temporary raw file; its folder is made when missing. Empty when the
/// folder cannot be made or is not the user's own.
std::string TemporaryRawFile();

/// Replaces `to` with a copy of the raw file `from`, whole or not at all. False when `from`
/// cannot be read or `to` cannot be written.
bool CopyRawFile(const std::string& from, const std::string& to);

}  // namespace nedit
