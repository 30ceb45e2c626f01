#pragma once
// The system's clipboard for the record list: plain Unicode text.

#include "document/ListInterfaces.h"

namespace nedit {

class QtClipboard : public UClipboard {
  public:
    bool GetText(std::wstring& text) override;
    bool SetText(const std::wstring& text) override;
};

}  // namespace nedit
