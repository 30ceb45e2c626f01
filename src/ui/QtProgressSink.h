#pragma once
// Progress of long work (loading, reduction, import) in the window: the stage's text and a
// progress bar in the status bar, and an Abort button that sets the document's abort flag.
// The work runs on the main thread; Update keeps the window alive by handling its waiting
// events, at most every few hundredths of a second so that a million updates cost little.

#include <QElapsedTimer>
#include <QObject>
#include <QString>

#include "platform/messages/ProgressSink.h"

class QLabel;
class QProgressBar;
class QToolButton;

namespace nedit {

class QtProgressSink : public QObject, public ProgressSink {
    Q_OBJECT
  public:
    /// The widgets belong to the status bar; the sink shows and hides them.
    QtProgressSink(QLabel* text, QProgressBar* bar, QToolButton* abort, QObject* parent = nullptr);

    void Update(int percent, const std::wstring& text) override;

    /// Long work begins: the bar and the Abort button show, the abort flag is cleared.
    void Begin(const QString& stage);
    /// Long work has ended: the bar and the button go away.
    void End();
    bool IsRunning() const { return running_; }

  signals:
    void abortRequested();

  private:
    void Pump();

    QLabel* text_;
    QProgressBar* bar_;
    QToolButton* abort_;
    QElapsedTimer since_pump_;
    bool running_ = false;
};

}  // namespace nedit
