#include "ui/StartPage.h"

#include <QFileInfo>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

#include "ui/CommandIds.h"

namespace nedit {

StartPage::StartPage(QWidget* parent)
    : QWidget(parent),
      heading_(new QLabel(this)),
      text_(new QLabel(this)),
      new_job_(new QPushButton(QStringLiteral("New Job..."), this)),
      open_job_(new QPushButton(QStringLiteral("Open Job..."), this)),
      new_doc_(new QPushButton(QStringLiteral("New Raw Data"), this)),
      open_doc_(new QPushButton(QStringLiteral("Open Raw Data..."), this)),
      recent_label_(new QLabel(QStringLiteral("Recent jobs"), this)),
      recent_(new QListWidget(this)) {
    setObjectName(QStringLiteral("StartPage"));
    QFont big = heading_->font();
    big.setPointSizeF(big.pointSizeF() * 1.6);
    big.setBold(true);
    heading_->setFont(big);
    text_->setWordWrap(true);
    auto* column = new QVBoxLayout();
    column->addWidget(heading_);
    column->addWidget(text_);
    for (QPushButton* button : {new_job_, open_job_, new_doc_, open_doc_})
        column->addWidget(button);
    column->addSpacing(12);
    column->addWidget(recent_label_);
    column->addWidget(recent_);
    recent_->setMaximumHeight(180);
    recent_->setMinimumWidth(460);
    recent_->setTextElideMode(Qt::ElideMiddle);
    recent_->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    auto* outer = new QHBoxLayout(this);
    outer->addStretch();
    outer->addLayout(column);
    outer->addStretch();
    column->insertStretch(0);
    column->addStretch();
    connect(new_job_, &QPushButton::clicked, this, [this] { emit commandWanted(cmd::NewJob); });
    connect(open_job_, &QPushButton::clicked, this, [this] { emit commandWanted(cmd::OpenJob); });
    connect(new_doc_, &QPushButton::clicked, this, [this] { emit commandWanted(cmd::FileNew); });
    connect(open_doc_, &QPushButton::clicked, this, [this] { emit commandWanted(cmd::FileOpen); });
    connect(recent_, &QListWidget::itemActivated, this, [this](QListWidgetItem* item) {
        emit recentJobWanted(item->data(Qt::UserRole).toString());
    });
}

void StartPage::Show(const QString& job, const QStringList& recent) {
    const bool have_job = !job.isEmpty();
    heading_->setText(have_job ? QFileInfo(job).fileName() : QStringLiteral("SXNedit"));
    text_->setText(have_job ? QStringLiteral("Open the job's raw data, make a new document, or "
                                             "drop a neutral file (.neu) on the window to bring "
                                             "it into the job.")
                            : QStringLiteral("Raw survey data: field records, their reduction "
                                             "and the plan. Open a job, make a new one, or drop "
                                             "a neutral file (.neu) on the window."));
    new_doc_->setVisible(have_job);
    open_doc_->setVisible(have_job);
    recent_->clear();
    for (const QString& path : recent) {
        auto* item = new QListWidgetItem(QFileInfo(path).fileName() + QStringLiteral("  \u2014  ") +
                                             QFileInfo(path).absolutePath(),
                                         recent_);
        item->setData(Qt::UserRole, path);
    }
    recent_label_->setVisible(!have_job && !recent.isEmpty());
    recent_->setVisible(!have_job && !recent.isEmpty());
}

}  // namespace nedit
