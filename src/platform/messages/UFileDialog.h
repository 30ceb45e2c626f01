#pragma once
// The suite's file dialog as a logic object: what the caller asks (open or save, the filter,
// the start folder, the default extension, the overwrite prompt) and the path the user chose.
// A host shows it: the desktop with its file dialog, tests by script.
//
// The filter is the system's own text: pairs of a description and its patterns separated by
// '|', the whole ended by "||" ("GSI (*.gsi)|*.gsi|All Files (*.*)|*.*||").

#include <string>

#include "platform/messages/DialogHost.h"

namespace nedit {

class UFileDialog : public UDialogLogic {
  public:
    enum class Mode { Open, Save };

    UFileDialog(Mode mode, std::wstring filter) : Filter(std::move(filter)), DialogMode(mode) {}

    std::wstring DialogName() const override {
        return DialogMode == Mode::Open ? L"Open File" : L"Save File";
    }
    /// Accepted only with a path chosen.
    bool OnOK() override { return !PathName.empty(); }

    Mode GetMode() const { return DialogMode; }

    std::wstring Filter;
    std::wstring DefaultExt;  // without the dot
    std::string InitialDir;
    bool HideReadOnly = true;
    bool OverwritePrompt = false;
    /// The path chosen (UTF-8); empty until then.
    std::string PathName;

  private:
    Mode DialogMode;
};

}  // namespace nedit
