#pragma once
// A text report: lines written piece by piece, kept together on pages, saved as plain text.
// A page holds the page length in lines; the line after a full page, or a block that would
// not fit on the rest of one (KeepLines), begins the next page. A page break stands as a form
// feed at the start of the first line of the new page.
//
// Finished lines are kept as UTF-8 in one block of text (TextLines), the line being written
// as wide text; a report of a large survey takes about the size of its text. A report whose
// text nobody will read (SetKeepText(false)) keeps none: it still counts its lines and pages.

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/text/TextLines.h"

class UReportDoc {
  public:
    /// Lines per page when none is set: a printed A4 or letter page at six lines an inch.
    static constexpr int kDefaultPageLength = 66;

    explicit UReportDoc(std::wstring title = L"");
    virtual ~UReportDoc();
    UReportDoc(const UReportDoc&) = delete;
    UReportDoc& operator=(const UReportDoc&) = delete;

    void SetReportTitle(const std::wstring& title) { Title = title; }
    const std::wstring& GetReportTitle() const { return Title; }
    /// Lines per page; 0 or less writes one endless page.
    void SetPageLength(int lines) { PageLength = lines; }
    int GetPageLength() const { return PageLength; }
    /// Whether the text is kept (it is unless told otherwise).
    void SetKeepText(bool keep) { KeepText = keep; }
    bool KeepsText() const { return KeepText; }

    /// `linesBefore` line ends, then `text` appended to the current line, then `linesAfter`
    /// line ends.
    void WriteText(const std::wstring& text, int linesBefore, int linesAfter, int unused = 0);
    void NewLines(int count);
    /// The next `count` lines belong together: a new page starts if fewer are left on this one.
    void KeepLines(int count);
    virtual void Clear();

    /// The lines written so far, as a copy; the last one is the line being written.
    std::vector<std::wstring> Lines() const;
    /// The whole report: lines joined by line feeds, a form feed before each new page.
    std::wstring GetText() const;
    /// The same text in UTF-8, given piece by piece to `write`, which gives false to stop;
    /// false when it stopped.
    bool WriteUtf8(const std::function<bool(std::string_view)>& write) const;
    /// Writes the text to a file (UTF-8); false when it cannot be written.
    bool SaveAsText(const std::string& path) const;

  private:
    /// The line being written begins a new page.
    void BreakPage();
    int LinesOnPage() const { return static_cast<int>(Finished) - PageStart; }

    std::wstring Title;
    int PageLength = kDefaultPageLength;
    bool KeepText = true;
    nedit::TextLines Done;                // the finished lines, when the text is kept
    std::size_t Finished = 0;             // how many lines are finished
    std::wstring Current;                 // the line being written
    std::vector<std::size_t> PageBreaks;  // lines that begin a page, after the first
    int PageStart = 0;
};
