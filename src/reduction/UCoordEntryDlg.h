#pragma once
// "Control Point Coordinate": the user chooses where a point's coordinates come from, the
// job, the field records, or values typed in. The logic is here; a DialogHost shows it.

#include <string>

#include "platform/messages/DialogHost.h"

class UCoordEntryDlg : public nedit::UDialogLogic {
  public:
    /// Dialog forms: Easting before Northing, or Northing first.
    static constexpr int kEastFirstId = 8115;
    static constexpr int kNorthFirstId = 8112;

    enum class Source { Database, Field, Enter };

    /// One row of the dialog: three coordinates and a code.
    struct Row {
        double East = 0.0;
        double North = 0.0;
        double Height = -10000.0;
        std::wstring Code;
        bool Offered = false;
    };

    UCoordEntryDlg(int dialogId, nedit::DialogHost* host);

    std::wstring DialogName() const override { return L"Control Point Coordinate"; }
    /// Shows the name, disables the sources not offered and selects the best one offered.
    void OnInitDialog() override;
    /// Takes the values of the selected row.
    bool OnOK() override;

    /// The values of the "Enter Coordinate" row, as given or as typed.
    void InitXYZ(double e, double n, double z, const std::wstring& code);
    void InitXYZLocal(double e, double n, double z, const std::wstring& code);
    void InitXYZSvy(double e, double n, double z, const std::wstring& code);
    void SetHasFixedPointCheck() { HasFixedCheck = true; }
    bool HasFixedPointCheck() const { return HasFixedCheck; }
    bool IsFixedPoint() const { return Fixed; }
    void SetFixedPoint(bool fixed) { Fixed = fixed; }
    void SetName(const std::wstring& name) { Name = name; }
    const std::wstring& GetName() const { return Name; }
    int GetDialogId() const { return DialogId; }

    /// With `applyAll` set no dialog opens: the best source offered is taken. Otherwise the
    /// dialog is shown; OK with "Apply to All" ticked sets `applyAll`. Gives 1 for OK.
    int process(const std::wstring& name, bool& applyAll);
    /// The first branch of process, always: the best source offered, no dialog. Gives 1.
    int ProcessOnly(const std::wstring& name);

    /// Choosing a radio button. Entry fields are editable only for Source::Enter.
    void SelectSource(Source source);
    Source GetSelectedSource() const { return Selected; }
    bool IsOffered(Source source) const { return RowOf(source).Offered; }
    bool IsEntryEditable() const { return Selected == Source::Enter; }
    /// The row a source shows; an unoffered source shows blanks.
    const Row& RowOf(Source source) const;
    void SetApplyToAll(bool on) { ApplyToAll = on; }
    bool GetApplyToAll() const { return ApplyToAll; }

    double getEast() const { return Result.East; }
    double getNorth() const { return Result.North; }
    double getZ() const { return Result.Height; }
    const std::wstring& getCode() const { return Result.Code; }
    /// The source of the values given back.
    Source GetChosenSource() const { return Chosen; }

  private:
    Source BestOffered() const;
    void TakeSource(Source source);

    int DialogId;
    nedit::DialogHost* Host;
    std::wstring Name;
    Row Database;
    Row Field;
    Row Entered;
    Source Selected = Source::Enter;
    Source Chosen = Source::Enter;
    Row Result;
    bool ApplyToAll = false;
    bool HasFixedCheck = false;
    bool Fixed = true;
};
