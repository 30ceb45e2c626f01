#pragma once
// The icons of the toolbar commands, drawn as vector shapes at whatever size and density
// the screen asks for, so that they stay sharp on a high-density screen and need no image
// files.

#include <QIcon>

namespace nedit {

class ToolIcons {
  public:
    /// The icon of a command; a null icon for a command without one.
    static QIcon Icon(int id);
    /// True when the command has an icon.
    static bool HasIcon(int id);
};

}  // namespace nedit
