// Reading a neutral text file into the record list.

#include "platform/io/LineReader.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "records/NamelessCoordinates.h"
#include "records/RecordText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

namespace {

// Progress is reported every so many lines, enough for a smooth bar at little cost.
constexpr int kProgressEvery = 4096;

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
    for (int lines_read = 0; reader.ReadLine(bytes); ++lines_read) {
        if (lines_read % kProgressEvery == 0 && reader.Size() > 0) {
            UpdateProgress(static_cast<unsigned>(100 * reader.Position() / reader.Size()),
                           L"Loading");
        }
        const std::wstring decoded = nedit::DecodeTextLine(bytes);
        const std::wstring_view trimmed = nedit::TrimView(decoded);
        if (trimmed.empty()) continue;
        const std::wstring line = Doc->MakeUpperCaseString(std::wstring(trimmed));

        if (!header_found) {
            if (!Doc->IsFileHeader(line)) {
                nedit::AppMessageBox(Host, nedit::Translate(L"Neutral file header not found."),
                                     nedit::mb::IconStop);
                break;
            }
            header_found = true;
        }

        std::wstring row;
        int type = rec::None;
        if (line[0] == L'#') {
            row = line;
        } else {
            if (!Doc->ExtractRecord(line, row)) continue;
            Doc->FindRecordKey(row.substr(0, row.find_first_of(L" ,")), type);  // token 0
        }
        row = nedit::Left(row, kMaxRowLength);

        if ((type == rec::Unit || type == rec::Unit2) && AngleTypeHandler) {
            AngleTypeHandler(::GetAngleType(row));
        }
        row = coordinates.Complete(*Doc, type, row);

        if (Rows->AddRecord(next_row, row) >= 0) ++next_row;
    }

    if (Rows->GetItemCount() == 0) return 0;
    Output = true;
    return 1;
}
