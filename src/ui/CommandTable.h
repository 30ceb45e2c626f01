#pragma once
// The command table of the raw-data window: every command by its number, with its menu,
// its text, its shortcut, when it is enabled, and whether this build can carry it out.
// Menus, toolbars, the context menu and the routing are all made from this one table, so
// a command that becomes available later is switched on here, in its one line.

#include <vector>

namespace nedit {

/// When a command can be given.
enum class Enabling {
    Always,
    /// The plan accepts mouse input and no abortable process (a download) runs.
    WhenIdle,
    /// At least one row of the list is selected.
    WhenSelection,
};

struct CommandInfo {
    int id = 0;
    /// The menu path, parts joined by '/' ("Insert/Header Record"); null for a command
    /// without a menu entry.
    const char* menu = nullptr;
    /// The menu entry's text; also the undo text of a command that changes rows.
    const char* text = "";
    /// The short text of a text-only toolbar button; null for an icon.
    const char* toolText = nullptr;
    const char* shortcut = nullptr;
    Enabling enabling = Enabling::Always;
    /// The command works on an open document; without one it is disabled.
    bool needsDocument = true;
    /// False while the part of the system behind the command is not built: the command is
    /// shown, disabled, with kNotAvailableTip.
    bool available = true;
    /// The record type a command of the Insert menu inserts; 0 for other commands.
    int recordType = 0;
    /// The status tip, and the toolbar's tooltip.
    const char* tip = "";
};

/// The status tip of a command that this build cannot carry out.
constexpr const char* kNotAvailableTip = "This function is not available in this build.";

/// Every command, in menu order within each menu. An entry with id 0 is a separator of
/// its menu.
const std::vector<CommandInfo>& Commands();
/// The command of that number; null for an unknown one.
const CommandInfo* FindCommand(int id);

/// The top-level menus in their order on the menu bar.
const std::vector<const char*>& MenuOrder();

/// Toolbars and the context menu as command numbers; 0 is a separator.
const std::vector<int>& CommonToolbar();
const std::vector<int>& RawDataToolbar();
const std::vector<int>& ContextMenu();

}  // namespace nedit
