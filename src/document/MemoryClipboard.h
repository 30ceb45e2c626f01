#pragma once
// A clipboard that lives in the process: the command line and the tests use it where the
// desktop gives the system's clipboard.

#include <optional>
#include <string>

#include "document/ListInterfaces.h"

namespace nedit {

class MemoryClipboard : public UClipboard {
  public:
    /// False until text has been set, as an empty system clipboard.
    bool GetText(std::wstring& text) override;
    bool SetText(const std::wstring& text) override;

    /// Stands for a clipboard that another program holds open: every call fails.
    void SetAvailable(bool available) { available_ = available; }

  private:
    std::optional<std::wstring> text_;
    bool available_ = true;
};

}  // namespace nedit
