#pragma once
// The fixed items of the port settings' lists, shared by the download dialog and the port
// dialog.

#include <string>
#include <vector>

namespace nedit {

/// "COM1" to "COM<count>".
std::vector<std::wstring> PortItems(int count);
/// 110 to 921600, and one empty item.
const std::vector<std::wstring>& BaudItems();
/// 4 to 8.
const std::vector<std::wstring>& DataBitItems();
/// "1", "1.5", "2".
const std::vector<std::wstring>& StopBitItems();
/// "NONE", "ODD", "EVEN", "MARK", "SPACE".
const std::vector<std::wstring>& ParityItems();
/// "NONE", "XON/XOFF", "HARDWARE".
const std::vector<std::wstring>& FlowItems();

/// The place of `text` among `items` without regard to case, or -1.
int FindItem(const std::vector<std::wstring>& items, const std::wstring& text);

}  // namespace nedit
