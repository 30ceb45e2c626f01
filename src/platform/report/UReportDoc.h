#pragma once
// A text report: lines written piece by piece, kept together on pages, saved as plain text.
// A page holds the page length in lines; the line after a full page, or a block that would
// not fit on the rest of one (KeepLines), begins the next page. A page break stands as a form
// feed at the start of the first line of the new page.

#include <string>
#include <vector>

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

    /// `linesBefore` line ends, then `text` appended to the current line, then `linesAfter`
    /// line ends.
    void WriteText(const std::wstring& text, int linesBefore, int linesAfter, int unused = 0);
    void NewLines(int count);
    /// The next `count` lines belong together: a new page starts if fewer are left on this one.
    void KeepLines(int count);
    virtual void Clear();

    /// The lines written so far; the last one is the line being written.
    const std::vector<std::wstring>& Lines() const { return Text; }
    /// The whole report: lines joined by line feeds, a form feed before each new page.
    std::wstring GetText() const;
    /// Writes GetText to a file (UTF-8); false when it cannot be written.
    bool SaveAsText(const std::string& path) const;

  private:
    /// The line being written begins a new page.
    void BreakPage();
    int LinesOnPage() const { return static_cast<int>(Text.size()) - 1 - PageStart; }

    std::wstring Title;
    int PageLength = kDefaultPageLength;
    std::vector<std::wstring> Text{L""};
    std::vector<std::size_t> PageBreaks;  // lines that begin a page, after the first
    int PageStart = 0;
};
