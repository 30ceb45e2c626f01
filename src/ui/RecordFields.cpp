#include "ui/RecordFields.h"

#include "platform/text/WideText.h"

namespace nedit {

RecordFields RecordFields::Split(const std::wstring& text) {
    RecordFields record;
    const std::wstring row = Trim(text);
    if (row.empty() || row[0] == L'#') return record;
    const std::size_t key_end = row.find_first_of(L" ,");
    record.key = row.substr(0, key_end);
    if (key_end == std::wstring::npos) return record;
    const std::wstring rest = Trim(std::wstring_view(row).substr(key_end));
    if (rest.empty()) return record;
    std::size_t start = 0;
    while (start <= rest.size()) {
        std::size_t stop = rest.find(L',', start);
        if (stop == std::wstring::npos) stop = rest.size();
        const std::wstring piece = rest.substr(start, stop - start);
        const std::size_t equals = piece.find(L'=');
        if (equals == std::wstring::npos) {
            record.fields.push_back({L"", Trim(piece)});
        } else {
            record.fields.push_back({Trim(std::wstring_view(piece).substr(0, equals)),
                                     Trim(std::wstring_view(piece).substr(equals + 1))});
        }
        start = stop + 1;
    }
    return record;
}

std::wstring RecordFields::Join() const {
    std::wstring text = key;
    for (std::size_t i = 0; i < fields.size(); ++i) {
        text += i == 0 ? L" " : L",";
        if (!fields[i].name.empty()) text += fields[i].name + L"=";
        text += fields[i].value;
    }
    return text;
}

}  // namespace nedit
