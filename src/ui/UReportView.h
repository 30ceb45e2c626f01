#pragma once
// The reduction report in its own window: the text of the document's report in a fixed
// font, with page breaks shown as rules, saved as text or printed page by page. The window
// lives as long as its document's pane and shows the report of the last run.

#include <QMainWindow>

class QPlainTextEdit;
class QPrinter;
class UNeditReport;

namespace nedit {

class UReportView : public QMainWindow {
    Q_OBJECT
  public:
    explicit UReportView(QWidget* parent = nullptr);

    /// Shows `report` (null: nothing) as it is now.
    void SetReport(const UNeditReport* report);
    /// Reads the report's text again.
    void UpdateReport();
    QString Text() const;
    /// Prints the report's pages, one printed page per report page.
    void Print(QPrinter& printer) const;
    /// The report's text written to `path` (UTF-8); false when it cannot be written.
    bool SaveAsText(const QString& path) const;

  private:
    void SaveAs();
    void PrintWithDialog();

    const UNeditReport* report_ = nullptr;
    QPlainTextEdit* text_;
};

}  // namespace nedit
