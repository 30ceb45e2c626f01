// Reading a neutral text file into the record list. Lines are read as UTF-8 (or Latin-1, then
// made UTF-8) and go into the list through its UTF-8 gate, so that a row is never widened.

#include "platform/io/LineReader.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/NamelessCoordinates.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/ProgressPercent.h"
#include "reduction/UNeditDatabase.h"

namespace {

// Progress is reported every so many lines, enough for a smooth bar at little cost.
constexpr int kProgressEvery = 4096;

// The record in an upper-cased line: its control characters blanked and its ends trimmed, in
// place. False when nothing is left. Bytes of UTF-8 sequences are never control characters.
bool ExtractRecord(std::string& line) {
    for (char& c : line) {
        if ((c >= 0 && c < 0x20) || c == 0x7F) c = ' ';
    }
    const std::string_view trimmed = nedit::TrimView(line);
    if (trimmed.size() != line.size()) line.assign(trimmed.data(), trimmed.size());
    return !line.empty();
}

}  // namespace

int UNeditDatabase::LoadNeFile(const std::wstring& path) {
    if (Rows == nullptr || Doc == nullptr) return 0;
    Rows->DeleteAllItems();

    nedit::LineReader reader;
    if (!reader.Open(nedit::ToUtf8(path))) {
        nedit::AppMessageBox(Host, nedit::Translate(L"Failed to open {1}.", {path}),
                             nedit::mb::IconStop);
        return 0;
    }

    int next_row = 0;
    bool header_found = false;
    NamelessCoordinates coordinates;
    std::string bytes;
    std::string decoded;
    std::string line;
    std::string row;
    for (int lines_read = 0; reader.ReadLine(bytes); ++lines_read) {
        if (lines_read % kProgressEvery == 0 && reader.Size() > 0)
            UpdateProgress(ProgressPercent(reader.Position(), reader.Size()), L"Loading");
        const std::string_view trimmed = nedit::TrimView(nedit::TextLineAsUtf8(bytes, decoded));
        if (trimmed.empty()) continue;
        nedit::ToUpperUtf8(trimmed, line);

        if (!header_found) {
            if (!Doc->IsFileHeader(nedit::FromUtf8(line))) {
                nedit::AppMessageBox(Host, nedit::Translate(L"Neutral file header not found."),
                                     nedit::mb::IconStop);
                break;
            }
            header_found = true;
        }

        int type = rec::None;
        if (line[0] != '#') {
            if (!ExtractRecord(line)) continue;
            Doc->FindRecordKeyUtf8(std::string_view(line).substr(0, line.find_first_of(" ,")),
                                   type);
        }
        // No more characters than bytes: only a long line can be too long.
        if (line.size() > static_cast<std::size_t>(kMaxRowLength))
            line.resize(nedit::LeftUtf8(line, kMaxRowLength).size());

        if ((type == rec::Unit || type == rec::Unit2) && AngleTypeHandler) {
            AngleTypeHandler(::GetAngleType(nedit::FromUtf8(line)));
        }
        if (Rows->AddRecordUtf8(next_row, coordinates.CompleteUtf8(*Doc, type, line, row)) >= 0)
            ++next_row;
    }

    if (Rows->GetItemCount() == 0) return 0;
    Output = true;
    return 1;
}
