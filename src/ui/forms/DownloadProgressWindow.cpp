#include "ui/forms/DownloadProgressWindow.h"

#include <QCoreApplication>
#include <QFontDatabase>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QVBoxLayout>

#include "document/UListCtrl.h"
#include "instruments/UDeviceManager.h"

namespace nedit {

namespace {
// As the status bar's progress: a human does not see faster changes.
constexpr int kPumpIntervalMs = 40;
}  // namespace

DownloadProgressWindow::DownloadProgressWindow(const UListCtrl& list, const UDeviceManager& manager,
                                               const QString& source, QWidget* parent)
    : QDialog(parent),
      list_(list),
      manager_(manager),
      records_(new QLabel(this)),
      bytes_(new QLabel(this)),
      last_(new QLabel(this)),
      quiet_(new QLabel(this)),
      bar_(new QProgressBar(this)),
      abort_(new QPushButton(QStringLiteral("Abort"), this)) {
    setObjectName(QStringLiteral("Downloading"));
    setWindowTitle(QStringLiteral("Downloading"));
    setWindowModality(Qt::ApplicationModal);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(new QLabel(QStringLiteral("Downloading from <b>%1</b>").arg(source), this));
    bar_->setRange(0, 0);  // no end is known: the bar shows that work goes on
    bar_->setTextVisible(false);
    layout->addWidget(bar_);
    auto* figures = new QFormLayout();
    figures->addRow(QStringLiteral("Records received:"), records_);
    figures->addRow(QStringLiteral("Bytes received:"), bytes_);
    figures->addRow(QStringLiteral("Last record:"), last_);
    layout->addLayout(figures);
    layout->addWidget(quiet_);
    last_->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    last_->setMinimumWidth(last_->fontMetrics().horizontalAdvance(QLatin1Char('0')) * 80);
    auto* buttons = new QHBoxLayout();
    buttons->addStretch(1);
    buttons->addWidget(abort_);
    layout->addLayout(buttons);
    connect(abort_, &QPushButton::clicked, this, &DownloadProgressWindow::reject);
    since_pump_.start();
    since_record_.start();
    Refresh();
}

void DownloadProgressWindow::Update(int /*percent*/, const std::wstring& /*text*/) {
    if (since_pump_.elapsed() < kPumpIntervalMs) return;
    since_pump_.restart();
    Refresh();
    QCoreApplication::processEvents();
}

void DownloadProgressWindow::Refresh() {
    const int rows = list_.GetItemCount();
    if (rows != rows_seen_) {
        rows_seen_ = rows;
        since_record_.restart();
        last_->setText(rows > 0 ? QString::fromStdWString(list_.GetItemText(rows - 1)) : QString());
    }
    records_->setText(QString::number(rows));
    bytes_->setText(QString::number(manager_.GetBytesReceived()));
    const qint64 quiet = since_record_.elapsed() / 1000;
    if (AbortRequested()) {
        quiet_->setText(QStringLiteral("Stopping; the records received stay."));
    } else if (quiet >= 2) {
        quiet_->setText(QStringLiteral("Waiting for data: %1 s of %2 s before the download stops.")
                            .arg(quiet)
                            .arg(manager_.GetTimeOutPeriod().count() / 1000));
    } else {
        quiet_->setText(QStringLiteral("Receiving."));
    }
}

void DownloadProgressWindow::reject() {
    RequestAbort();
    abort_->setEnabled(false);
    Refresh();
}

}  // namespace nedit
