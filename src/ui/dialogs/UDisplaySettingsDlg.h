#pragma once
// "Display Settings": what the plan labels and how large. Seven controls bound to the
// seven values of the document's UNeditSettings; "Points", "Lines", "Symbols" and "Line
// Styles" are shown and cannot be changed (the plan always draws points and lines).

#include <array>
#include <string>

#include "document/UNeditSettings.h"
#include "platform/messages/DialogHost.h"

namespace nedit {

class UDisplaySettingsDlg : public UDialogLogic {
  public:
    static constexpr UNeditSettings::Id kAll[] = {
        UNeditSettings::ShowPoints,       UNeditSettings::ShowLines,
        UNeditSettings::ShowSymbols,      UNeditSettings::ShowLineStyles,
        UNeditSettings::ShowPointNumbers, UNeditSettings::ShowPointCodes,
        UNeditSettings::TextSize};

    explicit UDisplaySettingsDlg(UNeditSettings& settings);

    std::wstring DialogName() const override { return L"Display Settings"; }
    /// Takes the stored values into the controls.
    void OnInitDialog() override;
    /// Stores each value that differs from the stored one, and remembers that one did.
    bool OnOK() override;

    /// The label of a control ("Point Numbers"); the text size is a list.
    static const wchar_t* Label(UNeditSettings::Id id);
    static bool IsEditable(UNeditSettings::Id id);
    /// Every control but the text size is a check box.
    static bool IsCheckBox(UNeditSettings::Id id) { return id != UNeditSettings::TextSize; }
    /// The entries of "Display Text Size": "Normal", "Large".
    static const wchar_t* TextSizeEntry(int index) { return index == 1 ? L"Large" : L"Normal"; }

    int GetValue(UNeditSettings::Id id) const { return Values[Index(id)]; }
    void SetValue(UNeditSettings::Id id, int value) { Values[Index(id)] = value; }
    /// OK stored at least one changed value.
    bool HasChanged() const { return Changed; }

  private:
    static std::size_t Index(UNeditSettings::Id id) { return static_cast<std::size_t>(id - 1); }

    UNeditSettings& Settings;
    std::array<int, 7> Values{};
    bool Changed = false;
};

}  // namespace nedit
