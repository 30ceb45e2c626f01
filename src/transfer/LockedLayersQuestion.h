#pragma once
// The question before a transfer when layers that the points' codes name are locked in the
// job: OK unlocks them all and the transfer goes on, Cancel stops it before anything is
// written. It is a message with OK and Cancel; a host without a face of its own for it shows
// it as a dialog that OK accepts.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

namespace nedit {

class LockedLayersQuestion : public UDialogLogic {
  public:
    explicit LockedLayersQuestion(std::vector<std::wstring> layers);

    std::wstring DialogName() const override { return L"Locked Layers"; }
    const std::vector<std::wstring>& GetLayers() const { return Layers; }
    /// The names as "<NAME>", a new line behind the names at positions 5, 10, 15 and so on
    /// (counted from 0) and at the end, then "\" are Locked !!!" and the question.
    const std::wstring& GetMessage() const { return Message; }

  private:
    std::vector<std::wstring> Layers;
    std::wstring Message;
};

}  // namespace nedit
