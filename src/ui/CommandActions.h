#pragma once
// The window's actions, menus, toolbars and context menu, all made from the command table.
// Each action carries its command number; triggering one emits commandTriggered.

#include <QObject>
#include <map>

class QAction;
class QMainWindow;
class QMenu;
class QToolBar;

namespace nedit {

class CommandActions : public QObject {
    Q_OBJECT
  public:
    /// Makes an action for every command, owned by `window`.
    explicit CommandActions(QMainWindow* window);

    /// The menus on the window's menu bar and the two toolbars.
    void BuildMenus(QMainWindow* window);
    void BuildToolbars(QMainWindow* window);
    QMenu* BuildContextMenu(QWidget* parent) const;

    QAction* Action(int id) const;
    const std::map<int, QAction*>& All() const { return actions_; }
    /// The menu of recent jobs, filled by the window.
    QMenu* RecentJobsMenu() const { return recent_; }
    QToolBar* CommonBar() const { return common_; }
    QToolBar* RawDataBar() const { return raw_data_; }

  signals:
    void commandTriggered(int id);

  private:
    QMenu* MenuAt(QMainWindow* window, const QString& path);
    QToolBar* MakeToolbar(QMainWindow* window, const QString& name, const std::vector<int>& ids);

    std::map<int, QAction*> actions_;
    std::map<QString, QMenu*> menus_;
    QMenu* recent_ = nullptr;
    QToolBar* common_ = nullptr;
    QToolBar* raw_data_ = nullptr;
};

}  // namespace nedit
