#include "ui/UReportView.h"

#include <QFileDialog>
#include <QFontDatabase>
#include <QMessageBox>
#include <QPainter>
#include <QPlainTextEdit>
#include <QPrintDialog>
#include <QPrinter>
#include <QToolBar>

#include "report/UNeditReport.h"

namespace nedit {

namespace {

const QChar kFormFeed(u'\f');

/// How a page break reads on the screen.
QString Rule() {
    return QStringLiteral("\n") + QString(72, QChar(u'\u2500')) + QStringLiteral("\n");
}

}  // namespace

UReportView::UReportView(QWidget* parent) : QMainWindow(parent), text_(new QPlainTextEdit(this)) {
    setObjectName(QStringLiteral("ReportView"));
    setWindowFlag(Qt::Window);
    text_->setReadOnly(true);
    text_->setLineWrapMode(QPlainTextEdit::NoWrap);
    text_->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    setCentralWidget(text_);
    QToolBar* tools = addToolBar(QStringLiteral("Report"));
    tools->setMovable(false);
    tools->setToolButtonStyle(Qt::ToolButtonTextOnly);
    tools->addAction(QStringLiteral("Save As Text..."), this, &UReportView::SaveAs);
    tools->addAction(QStringLiteral("Print..."), this, &UReportView::PrintWithDialog);
    resize(820, 640);
}

void UReportView::SetReport(const UNeditReport* report) {
    report_ = report;
    UpdateReport();
}

void UReportView::UpdateReport() {
    if (report_ == nullptr) {
        setWindowTitle(QStringLiteral("Raw Data Reduction Report"));
        text_->clear();
        return;
    }
    setWindowTitle(QString::fromStdWString(report_->GetReportTitle()));
    const QString text = QString::fromStdWString(report_->GetText());
    text_->setPlainText(QString(text).replace(kFormFeed, Rule()));
}

QString UReportView::Text() const {
    return report_ != nullptr ? QString::fromStdWString(report_->GetText()) : QString();
}

bool UReportView::SaveAsText(const QString& path) const {
    return report_ != nullptr && report_->SaveAsText(path.toStdString());
}

void UReportView::SaveAs() {
    const QString path = QFileDialog::getSaveFileName(this, QStringLiteral("Save Report As"), {},
                                                      QStringLiteral("Text files (*.txt)"));
    if (path.isEmpty()) return;
    if (!SaveAsText(path)) {
        QMessageBox::warning(this, QStringLiteral("SXNedit"),
                             QStringLiteral("%1 cannot be written.").arg(path));
    }
}

void UReportView::Print(QPrinter& printer) const {
    QPainter painter(&printer);
    QFont font = QFontDatabase::systemFont(QFontDatabase::FixedFont);
    font.setPointSize(9);
    painter.setFont(font);
    const QFontMetrics metrics(font, &printer);
    const int line_height = metrics.lineSpacing();
    const int lines_per_page = std::max(1, painter.viewport().height() / line_height);
    int y = metrics.ascent();
    int on_page = 0;
    for (const QString& line : Text().split(QLatin1Char('\n'))) {
        QString text = line;
        // A form feed, or a full page, starts a new page.
        if (text.startsWith(kFormFeed) || on_page == lines_per_page) {
            printer.newPage();
            y = metrics.ascent();
            on_page = 0;
            if (text.startsWith(kFormFeed)) text.remove(0, 1);
        }
        painter.drawText(0, y, text);
        y += line_height;
        ++on_page;
    }
}

void UReportView::PrintWithDialog() {
    QPrinter printer;
    QPrintDialog dialog(&printer, this);
    if (dialog.exec() == QDialog::Accepted) Print(printer);
}

}  // namespace nedit
