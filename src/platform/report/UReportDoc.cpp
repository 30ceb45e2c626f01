#include "platform/report/UReportDoc.h"

#include "platform/io/ReplaceFile.h"
#include "platform/text/WideText.h"

UReportDoc::UReportDoc(std::wstring title) : Title(std::move(title)) {}

UReportDoc::~UReportDoc() = default;

void UReportDoc::NewLines(int count) {
    for (int i = 0; i < count; ++i) {
        Text.emplace_back();
        if (PageLength > 0 && LinesOnPage() >= PageLength) BreakPage();
    }
}

void UReportDoc::BreakPage() {
    PageStart = static_cast<int>(Text.size()) - 1;
    PageBreaks.push_back(Text.size() - 1);
}

void UReportDoc::WriteText(const std::wstring& text, int linesBefore, int linesAfter,
                           int /*unused*/) {
    NewLines(linesBefore);
    Text.back() += text;
    NewLines(linesAfter);
}

void UReportDoc::KeepLines(int count) {
    if (PageLength <= 0 || LinesOnPage() == 0 || LinesOnPage() + count <= PageLength) return;
    BreakPage();
}

void UReportDoc::Clear() {
    Text.assign(1, L"");
    PageBreaks.clear();
    PageStart = 0;
}

std::wstring UReportDoc::GetText() const {
    std::wstring out;
    std::size_t next_break = 0;
    for (std::size_t i = 0; i < Text.size(); ++i) {
        if (i > 0) out += L'\n';
        // A page that ends the report full has nothing behind it.
        const bool empty_end = i + 1 == Text.size() && Text[i].empty();
        if (next_break < PageBreaks.size() && PageBreaks[next_break] == i) {
            if (!empty_end) out += L'\f';
            ++next_break;
        }
        out += Text[i];
    }
    return out;
}

bool UReportDoc::SaveAsText(const std::string& path) const {
    return nedit::ReplaceFile(path, nedit::ToUtf8(GetText()));
}
