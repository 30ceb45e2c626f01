#pragma once
// The window of a running download: what comes from where, how many records and bytes have
// arrived, the last record, and how long the link has been quiet against the time-out that
// will end the download. Abort (or Escape, or closing the window) stops the download after
// its current step; what arrived stays. The window is the document's progress sink for the
// download: the loop's every step refreshes it and keeps the program answering.

#include <QDialog>
#include <QElapsedTimer>

#include "platform/messages/ProgressSink.h"

class QLabel;
class QProgressBar;
class QPushButton;
class UDeviceManager;
class UListCtrl;

namespace nedit {

class DownloadProgressWindow : public QDialog, public ProgressSink {
    Q_OBJECT
  public:
    /// A download of `source` ("Leica GSI on COM1") into `list` through `manager`, whose
    /// time-out period says how long the link may be quiet.
    DownloadProgressWindow(const UListCtrl& list, const UDeviceManager& manager,
                           const QString& source, QWidget* parent);

    void Update(int percent, const std::wstring& text) override;

    QLabel* RecordsLabel() const { return records_; }
    QPushButton* AbortButton() const { return abort_; }

  public slots:
    /// Abort, Escape and closing the window.
    void reject() override;

  private:
    void Refresh();

    const UListCtrl& list_;
    const UDeviceManager& manager_;
    QLabel* records_;
    QLabel* bytes_;
    QLabel* last_;
    QLabel* quiet_;
    QProgressBar* bar_;
    QPushButton* abort_;
    QElapsedTimer since_pump_;
    QElapsedTimer since_record_;
    int rows_seen_ = -1;
};

}  // namespace nedit
