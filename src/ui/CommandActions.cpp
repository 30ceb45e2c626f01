#include "ui/CommandActions.h"

#include <QAction>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QToolBar>
#include <QToolButton>

#include "ui/CommandIds.h"
#include "ui/CommandTable.h"
#include "ui/ToolIcons.h"

namespace nedit {

CommandActions::CommandActions(QMainWindow* window) : QObject(window) {
    for (const CommandInfo& info : Commands()) {
        if (info.id == 0) continue;
        auto* action = new QAction(QString::fromUtf8(info.text), window);
        action->setData(info.id);
        action->setObjectName(QStringLiteral("cmd%1").arg(info.id));
        action->setStatusTip(QString::fromUtf8(info.tip));
        action->setToolTip(info.available
                               ? QString::fromUtf8(info.text)
                               : QString::fromUtf8(info.text) + QStringLiteral(" (") +
                                     QString::fromUtf8(kNotAvailableTip) + QStringLiteral(")"));
        if (info.shortcut != nullptr) {
            action->setShortcut(QKeySequence(QString::fromLatin1(info.shortcut)));
            action->setShortcutContext(Qt::WindowShortcut);
        }
        // The record buttons name their record: the key is what a surveyor reads in the list.
        if (info.toolText != nullptr) action->setIconText(QString::fromLatin1(info.toolText));
        if (info.id == cmd::Redo)
            action->setShortcuts({QKeySequence::Redo, QKeySequence(QStringLiteral("Ctrl+Y"))});
        const QIcon icon = ToolIcons::Icon(info.id);
        if (!icon.isNull()) action->setIcon(icon);
        action->setIconVisibleInMenu(true);
        action->setEnabled(info.available);
        connect(action, &QAction::triggered, this,
                [this, id = info.id] { emit commandTriggered(id); });
        window->addAction(action);
        actions_[info.id] = action;
    }
}

QAction* CommandActions::Action(int id) const {
    const auto found = actions_.find(id);
    return found == actions_.end() ? nullptr : found->second;
}

QMenu* CommandActions::MenuAt(QMainWindow* window, const QString& path) {
    if (const auto found = menus_.find(path); found != menus_.end()) return found->second;
    const int slash = static_cast<int>(path.lastIndexOf(QLatin1Char('/')));
    QMenu* menu = nullptr;
    if (slash < 0) {
        menu = window->menuBar()->addMenu(QStringLiteral("&") + path);
    } else {
        menu = MenuAt(window, path.left(slash))->addMenu(path.mid(slash + 1));
    }
    menu->setObjectName(
        QStringLiteral("menu") +
        QString(path).remove(QLatin1Char(' ')).replace(QLatin1Char('/'), QLatin1Char('_')));
    menus_[path] = menu;
    return menu;
}

void CommandActions::BuildMenus(QMainWindow* window) {
    for (const char* top : MenuOrder()) MenuAt(window, QString::fromLatin1(top));
    for (const CommandInfo& info : Commands()) {
        if (info.menu == nullptr) continue;
        QMenu* menu = MenuAt(window, QString::fromLatin1(info.menu));
        if (info.id == 0) {
            menu->addSeparator();
            continue;
        }
        menu->addAction(Action(info.id));
        if (info.id == cmd::OpenJob) {
            recent_ = menu->addMenu(QStringLiteral("Recent Jobs"));
            recent_->setObjectName(QStringLiteral("menuRecentJobs"));
        }
    }
}

QToolBar* CommandActions::MakeToolbar(QMainWindow* window, const QString& name,
                                      const std::vector<int>& ids) {
    QToolBar* bar = window->addToolBar(name);
    bar->setObjectName(name);
    bar->setIconSize(QSize(20, 20));
    for (const int id : ids) {
        if (id == 0) {
            bar->addSeparator();
            continue;
        }
        QAction* action = Action(id);
        bar->addAction(action);
        if (FindCommand(id)->toolText == nullptr) continue;
        if (auto* button = qobject_cast<QToolButton*>(bar->widgetForAction(action)))
            button->setToolButtonStyle(Qt::ToolButtonTextOnly);
    }
    return bar;
}

void CommandActions::BuildToolbars(QMainWindow* window) {
    common_ = MakeToolbar(window, QStringLiteral("IDR_TOOLBAR_COMMON"), nedit::CommonToolbar());
    common_->setWindowTitle(QStringLiteral("Standard"));
    raw_data_ = MakeToolbar(window, QStringLiteral("27010"), nedit::RawDataToolbar());
    raw_data_->setWindowTitle(QStringLiteral("Raw Data"));
}

QMenu* CommandActions::BuildContextMenu(QWidget* parent) const {
    auto* menu = new QMenu(parent);
    for (const int id : ContextMenu()) {
        if (id == 0) {
            menu->addSeparator();
        } else {
            menu->addAction(Action(id));
        }
    }
    return menu;
}

}  // namespace nedit
