#include "ui/QtProgressSink.h"

#include <QCoreApplication>
#include <QLabel>
#include <QProgressBar>
#include <QToolButton>

namespace nedit {

namespace {
// A human does not see faster changes, and each pump costs a pass over the event queue.
constexpr int kPumpIntervalMs = 40;
}  // namespace

QtProgressSink::QtProgressSink(QLabel* text, QProgressBar* bar, QToolButton* abort, QObject* parent)
    : QObject(parent), text_(text), bar_(bar), abort_(abort) {
    bar_->setRange(0, 100);
    bar_->hide();
    abort_->hide();
    connect(abort_, &QToolButton::clicked, this, [this] {
        RequestAbort();
        emit abortRequested();
    });
}

void QtProgressSink::Begin(const QString& stage) {
    ClearAbort();
    running_ = true;
    text_->setText(stage);
    bar_->setValue(0);
    bar_->show();
    abort_->show();
    since_pump_.start();
    QCoreApplication::processEvents();
}

void QtProgressSink::End() {
    running_ = false;
    bar_->hide();
    abort_->hide();
    text_->clear();
}

void QtProgressSink::Update(int percent, const std::wstring& text) {
    if (!running_) return;
    if (percent != bar_->value()) bar_->setValue(percent);
    if (!text.empty()) text_->setText(QString::fromStdWString(text));
    if (!since_pump_.isValid() || since_pump_.elapsed() >= kPumpIntervalMs) Pump();
}

void QtProgressSink::Pump() {
    since_pump_.restart();
    QCoreApplication::processEvents();
}

}  // namespace nedit
