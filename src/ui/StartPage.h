#pragma once
// What the window shows when no document is open: without a job, the ways to make or open
// one and the jobs opened last; with a job, how to bring raw data into it.

#include <QStringList>
#include <QWidget>

class QLabel;
class QListWidget;
class QPushButton;

namespace nedit {

class StartPage : public QWidget {
    Q_OBJECT
  public:
    explicit StartPage(QWidget* parent = nullptr);

    /// `job` is the open job's file name; empty for none.
    void Show(const QString& job, const QStringList& recent);

  signals:
    void commandWanted(int id);
    void recentJobWanted(const QString& path);

  private:
    QLabel* heading_;
    QLabel* text_;
    QPushButton* new_job_;
    QPushButton* open_job_;
    QPushButton* new_doc_;
    QPushButton* open_doc_;
    QLabel* recent_label_;
    QListWidget* recent_;
};

}  // namespace nedit
