#include "platform/report/UReportDoc.h"

#include "platform/io/ReplaceFile.h"
#include "platform/text/WideText.h"

UReportDoc::UReportDoc(std::wstring title) : Title(std::move(title)) {}

UReportDoc::~UReportDoc() = default;

void UReportDoc::NewLines(int count) {
    std::string line;
    for (int i = 0; i < count; ++i) {
        if (KeepText) {
            line.clear();
            nedit::AppendUtf8(line, Current);
            Done.push_back(line);
        }
        Current.clear();
        ++Finished;
        if (PageLength > 0 && LinesOnPage() >= PageLength) BreakPage();
    }
}

void UReportDoc::BreakPage() {
    PageStart = static_cast<int>(Finished);
    PageBreaks.push_back(Finished);
}

void UReportDoc::WriteText(const std::wstring& text, int linesBefore, int linesAfter,
                           int /*unused*/) {
    NewLines(linesBefore);
    Current += text;
    NewLines(linesAfter);
}

void UReportDoc::KeepLines(int count) {
    if (PageLength <= 0 || LinesOnPage() == 0 || LinesOnPage() + count <= PageLength) return;
    BreakPage();
}

void UReportDoc::Clear() {
    Done.clear();
    Finished = 0;
    Current.clear();
    PageBreaks.clear();
    PageStart = 0;
}

std::vector<std::wstring> UReportDoc::Lines() const {
    std::vector<std::wstring> lines;
    lines.reserve(Done.size() + 1);
    for (std::size_t i = 0; i < Done.size(); ++i) lines.push_back(nedit::FromUtf8(Done[i]));
    lines.push_back(Current);
    return lines;
}

bool UReportDoc::WriteUtf8(const std::function<bool(std::string_view)>& write) const {
    const std::string current = nedit::ToUtf8(Current);
    const std::size_t count = Done.size() + 1;
    std::size_t next_break = 0;
    for (std::size_t i = 0; i < count; ++i) {
        const std::string_view line = i < Done.size() ? Done[i] : std::string_view(current);
        if (i > 0 && !write("\n")) return false;
        // A page that ends the report full has nothing behind it.
        const bool empty_end = i + 1 == count && line.empty();
        if (next_break < PageBreaks.size() && PageBreaks[next_break] == i) {
            if (!empty_end && !write("\f")) return false;
            ++next_break;
        }
        if (!line.empty() && !write(line)) return false;
    }
    return true;
}

std::wstring UReportDoc::GetText() const {
    std::string text;
    WriteUtf8([&text](std::string_view piece) {
        text += piece;
        return true;
    });
    return nedit::FromUtf8(text);
}

bool UReportDoc::SaveAsText(const std::string& path) const {
    return nedit::ReplaceFile(path,
                              [this](const nedit::ByteSink& write) { return WriteUtf8(write); });
}
