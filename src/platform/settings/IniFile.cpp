#include "platform/settings/IniFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <vector>

#include "platform/io/ReplaceFile.h"
#include "platform/text/WideText.h"

namespace nedit {
namespace {

// A line as it stands in the file, with its own line end, so that lines we do not change are
// written back byte for byte (CR LF files stay CR LF, a last line without an end stays so).
struct RawLine {
    std::string text;
    std::string end;
};

struct Contents {
    bool bom = false;
    std::vector<RawLine> lines;
};

constexpr char kBom[] = "\xEF\xBB\xBF";

// False when the file cannot be read (missing, a directory, a read error). A line ends at
// LF, CR LF or a lone CR.
bool Load(const std::string& path, Contents& out) {
    std::FILE* file = std::fopen(path.c_str(), "rb");
    if (file == nullptr) return false;
    std::string bytes;
    char block[8192];
    std::size_t got = 0;
    while ((got = std::fread(block, 1, sizeof block, file)) > 0) bytes.append(block, got);
    const bool failed = std::ferror(file) != 0;
    std::fclose(file);
    if (failed) return false;
    std::size_t pos = 0;
    if (bytes.compare(0, 3, kBom) == 0) {
        out.bom = true;
        pos = 3;
    }
    while (pos < bytes.size()) {
        const std::size_t stop = bytes.find_first_of("\r\n", pos);
        RawLine line;
        if (stop == std::string::npos) {
            line.text = bytes.substr(pos);
            pos = bytes.size();
        } else {
            line.text = bytes.substr(pos, stop - pos);
            const bool crlf =
                bytes[stop] == '\r' && stop + 1 < bytes.size() && bytes[stop + 1] == '\n';
            line.end = bytes.substr(stop, crlf ? 2 : 1);
            pos = stop + line.end.size();
        }
        out.lines.push_back(std::move(line));
    }
    return true;
}

// What a line is to the reader: a section head, a key line, or anything else (blank lines,
// comments starting ';' or '#', stray text), which is kept but never matched.
struct Parsed {
    enum class Kind { Other, Section, Key } kind = Kind::Other;
    std::wstring name;   // the section name, or the key as written (trimmed)
    std::wstring value;  // everything after the first '=', blanks kept
    bool blank = false;
};

Parsed Parse(const std::string& raw) {
    const std::wstring line = DecodeTextLine(raw);
    const std::wstring_view trimmed = TrimView(line);
    Parsed parsed;
    parsed.blank = trimmed.empty();
    if (trimmed.empty() || trimmed[0] == L';' || trimmed[0] == L'#') return parsed;
    if (trimmed[0] == L'[') {
        const std::size_t close = trimmed.find(L']');
        parsed.kind = Parsed::Kind::Section;
        parsed.name = Trim(trimmed.substr(1, close == std::wstring_view::npos ? close : close - 1));
        return parsed;
    }
    const std::size_t equals = line.find(L'=');
    if (equals == std::wstring::npos) return parsed;
    parsed.kind = Parsed::Kind::Key;
    parsed.name = Trim(std::wstring_view(line).substr(0, equals));
    parsed.value = line.substr(equals + 1);
    return parsed;
}

// Where a key stands. Only the first section of a name counts, and in it the first line of
// the key, for reading and writing alike.
struct Place {
    long section = -1;      // line of the head
    long key = -1;          // line of the key
    long last_filled = -1;  // last line of the section that is not blank
    std::wstring key_as_written;
};

Place Find(const Contents& contents, std::wstring_view section, std::wstring_view key) {
    Place place;
    for (std::size_t i = 0; i < contents.lines.size(); ++i) {
        const Parsed parsed = Parse(contents.lines[i].text);
        const long index = static_cast<long>(i);
        if (parsed.kind == Parsed::Kind::Section) {
            if (place.section >= 0) break;
            if (EqualsIgnoreCase(parsed.name, section)) place.section = place.last_filled = index;
            continue;
        }
        if (place.section < 0) continue;
        if (!parsed.blank) place.last_filled = index;
        if (parsed.kind == Parsed::Kind::Key && place.key < 0 &&
            EqualsIgnoreCase(parsed.name, key)) {
            place.key = index;
            place.key_as_written = parsed.name;
        }
    }
    return place;
}

bool HasLineBreak(std::wstring_view text) {
    return text.find_first_of(L"\r\n") != std::wstring_view::npos;
}

}  // namespace

IniFile::IniFile(std::string path) : path_(std::move(path)) {}

std::wstring IniFile::ReadString(const std::wstring& section, const std::wstring& key,
                                 const std::wstring& fallback) const {
    Contents contents;
    if (!Load(path_, contents)) return fallback;
    const Place place = Find(contents, TrimView(section), TrimView(key));
    if (place.key < 0) return fallback;
    return Left(Parse(contents.lines[static_cast<std::size_t>(place.key)].text).value, kValueLimit);
}

bool IniFile::WriteString(const std::wstring& section, const std::wstring& key,
                          const std::wstring& value) const {
    // What the file could not hold as one line, or would read back under another name.
    const std::wstring_view section_name = TrimView(section);
    const std::wstring_view key_name = TrimView(key);
    if (HasLineBreak(section) || HasLineBreak(key) || HasLineBreak(value) || key_name.empty() ||
        key_name.find(L'=') != std::wstring_view::npos || key_name[0] == L'[' ||
        key_name[0] == L';' || key_name[0] == L'#' ||
        section_name.find(L']') != std::wstring_view::npos) {
        return false;
    }

    namespace fs = std::filesystem;
    std::error_code error;
    std::string target = path_;
    // Write through a link to the file it names, rather than replacing the link.
    struct stat link {};
    if (::lstat(target.c_str(), &link) == 0 && S_ISLNK(link.st_mode)) {
        target = fs::weakly_canonical(target, error).string();
        if (error) return false;
    }
    Contents contents;
    if (::access(target.c_str(), F_OK) == 0) {
        // A file the user has made read-only stays as it is, and one we cannot read would
        // lose its other lines.
        if (::access(target.c_str(), W_OK) != 0 || !Load(target, contents)) return false;
    }
    std::string newline = "\n";
    for (const RawLine& line : contents.lines) {
        if (!line.end.empty()) {
            newline = line.end;
            break;
        }
    }
    const Place place = Find(contents, section_name, key_name);
    auto& lines = contents.lines;
    if (place.key >= 0) {
        lines[static_cast<std::size_t>(place.key)].text =
            ToUtf8(place.key_as_written + L"=" + value);
    } else {
        // A new key goes after the last filled line of its section, so that a blank line
        // before the next section stays there; a new section goes at the end after a blank.
        std::vector<RawLine> added;
        std::size_t at = lines.size();
        if (place.section >= 0) {
            at = static_cast<std::size_t>(place.last_filled) + 1;
        } else {
            if (!lines.empty() && !Parse(lines.back().text).blank) added.push_back({"", newline});
            added.push_back({ToUtf8(L"[" + std::wstring(section_name) + L"]"), newline});
        }
        added.push_back({ToUtf8(std::wstring(key_name) + L"=" + value), newline});
        if (at > 0 && lines[at - 1].end.empty()) lines[at - 1].end = newline;
        lines.insert(lines.begin() + static_cast<long>(at), added.begin(), added.end());
    }

    std::string bytes = contents.bom ? kBom : "";
    for (const RawLine& line : lines) bytes += line.text + line.end;
    const fs::path parent = fs::path(target).parent_path();
    if (!parent.empty()) fs::create_directories(parent, error);
    if (error) return false;
    return ReplaceFile(target, bytes);
}

}  // namespace nedit
