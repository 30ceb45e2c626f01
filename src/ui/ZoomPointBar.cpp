#include "ui/ZoomPointBar.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QToolButton>
#include <cmath>

#include "ui/forms/UEdit.h"

namespace nedit {

ZoomPointBar::ZoomPointBar(QWidget* parent)
    : QFrame(parent),
      number_(new QLineEdit(this)),
      scale_(new UEdit(UEdit::Kind::Double, nullptr, this)),
      lock_(new QCheckBox(QStringLiteral("Lock"), this)) {
    setObjectName(QStringLiteral("ZoomPointBar"));
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(6, 3, 6, 3);
    layout->addWidget(new QLabel(QStringLiteral("Zoom a Point"), this));
    layout->addWidget(new QLabel(QStringLiteral("Point No."), this));
    number_->setMaximumWidth(120);
    layout->addWidget(number_);
    layout->addWidget(new QLabel(QStringLiteral("Scale 1:"), this));
    scale_->setMaximumWidth(90);
    layout->addWidget(scale_);
    layout->addWidget(lock_);
    auto* zoom = new QPushButton(QStringLiteral("Zoom"), this);
    zoom->setDefault(true);
    layout->addWidget(zoom);
    auto* close = new QToolButton(this);
    close->setText(QStringLiteral("\u2715"));
    close->setAutoRaise(true);
    close->setToolTip(QStringLiteral("Close (Esc)"));
    layout->addWidget(close);
    layout->addStretch();
    connect(zoom, &QPushButton::clicked, this, &ZoomPointBar::Finish);
    connect(number_, &QLineEdit::returnPressed, this, &ZoomPointBar::Finish);
    connect(scale_, &QLineEdit::returnPressed, this, &ZoomPointBar::Finish);
    connect(close, &QToolButton::clicked, this, [this] {
        hide();
        emit closed();
    });
    hide();
}

void ZoomPointBar::Start(const QString& number, double scale) {
    SetNumber(number);
    scale_->SetValue(std::round(scale));
    lock_->setChecked(false);
    show();
    raise();
    number_->setFocus();
    number_->selectAll();
}

void ZoomPointBar::SetNumber(const QString& number) {
    number_->setText(number);
}

QString ZoomPointBar::Number() const {
    return number_->text().trimmed();
}

double ZoomPointBar::Scale() const {
    return scale_->Value();
}

bool ZoomPointBar::IsLocked() const {
    return lock_->isChecked();
}

void ZoomPointBar::SetLocked(bool locked) {
    lock_->setChecked(locked);
}

void ZoomPointBar::Finish() {
    emit zoomRequested(Number(), Scale());
}

void ZoomPointBar::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape) {
        hide();
        emit closed();
        return;
    }
    QFrame::keyPressEvent(event);
}

}  // namespace nedit
