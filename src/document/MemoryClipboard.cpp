#include "document/MemoryClipboard.h"

namespace nedit {

bool MemoryClipboard::GetText(std::wstring& text) {
    if (!available_ || !text_) return false;
    text = *text_;
    return true;
}

bool MemoryClipboard::SetText(const std::wstring& text) {
    if (!available_) return false;
    text_ = text;
    return true;
}

}  // namespace nedit
