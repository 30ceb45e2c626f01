#pragma once
// "Edit Record Data", opened by a double click on a row: every field of one record, one
// under the other, each shown in the job's units (angles in its angle unit, the vertical
// angle as a zenith angle, lengths in its length unit). A unit record (UNIT) shows its linear
// and angular unit and an angular mode record (AMODE) its modes as choices. OK gives the
// record's text; the pane puts it into the row through the list's gate.
//
// Decisions:
// - Values are read in the units and vertical mode in force at the record's row and a
//   changed value is written back in them, so the row keeps meaning what its file says
//   whatever the job's units are. A value kept in the job's unit shows every place it has;
//   a changed value keeps the places typed, and at least the job's; a field that was not
//   changed keeps its text as it was, to the last digit.
// - A bare value (without "NAME=") is named by its place in the record's layout, and comes
//   back named so; a record of a single field ("SCALE     0.99960") has one field named by
//   its key and comes back as its key and the value.
// - The last value of a record counts like every other, whether a blank follows it or not.
// - The text goes into the row through the list's gate, as every change does, so the row is
//   laid out as all rows are; and the change marks the document modified and is a step of
//   the undo history, so that closing asks to save it and Ctrl+Z takes it back.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"
#include "ui/dialogs/FileUnits.h"

class UJobSettings;
class UNeutralFileFormat;

namespace nedit {

class UEditRecordDlg : public UDialogLogic {
  public:
    static constexpr int kDialogId = 8045;
    /// The control of a field, by its field id.
    enum class Control {
        Plain,
        PointName,
        Angle,
        VAngle,
        Distance,
        Length,
        Code,
        Coord,
        Elevation,
        Bear,
        Long,
    };

    struct UFieldData {
        std::wstring Name;
        std::wstring Value;  // as the record holds it
    };
    struct UFieldWindow {
        std::wstring Name;
        int Id = 0;  // 0 for a field the definition does not know
        Control Edit = Control::Plain;
        /// A number in the job's units (degrees, a zenith angle, the job's length unit).
        double Number = 0.0;
        /// The text of the field: as the record holds it, then as typed.
        std::wstring Value;
        /// The record's text reads as a number, which Number holds.
        bool HasNumber = false;
        /// The places the value shows at least: those of the record's text when the record
        /// keeps it in the job's unit, so that what is shown is all the record holds.
        int Decimals = 0;
        /// Typed in since the dialog opened.
        bool Edited = false;
    };

    /// `units` are those in force at the record's row; `job` gives the units shown and the
    /// places written. Both must outlive the dialog.
    UEditRecordDlg(const UNeutralFileFormat& format, const UJobSettings* job, FileUnits units);

    std::wstring DialogName() const override { return L"Edit Record Data"; }
    /// "Edit {1} Record" with the key.
    std::wstring GetTitle() const;

    /// Splits `text` into its key and fields; false, and nothing to show, for a comment, an
    /// empty text or an unknown key.
    bool LoadRecord(const std::wstring& text);
    /// One window per field, in the job's units; none for UNIT and AMODE, which show choices.
    void MakeFieldWindows();
    /// Makes the windows and sets the choices of UNIT and AMODE.
    void OnInitDialog() override;
    /// Takes the choices, or the windows, into the fields.
    bool OnOK() override;
    /// The key padded to 10 places and the fields "NAME=value" joined by commas; a record of
    /// one field gives its key and value.
    void GetRecordText(std::wstring& out) const;
    std::wstring GetRecordText() const;

    static Control ControlOf(int fieldId);
    /// Whether the record shows choices (UNIT: Linear and Angular; AMODE: Horizontal and
    /// Vertical Angle) instead of fields.
    bool ShowsUnitChoices() const;
    bool ShowsModeChoices() const;

    std::wstring RecordKey;
    int RecordType = 0;
    std::vector<UFieldData> Fields;
    std::vector<UFieldWindow> Windows;
    /// 0 metres, 1 feet, 2 US feet.
    int LinearChoice = 0;
    /// 0 degrees minutes seconds, 1 decimal degrees, 2 gon.
    int AngularChoice = 0;
    /// 0 north azimuth, 1 south azimuth.
    int HorizontalChoice = 0;
    /// 2 zenith, 3 nadir, 4 vertical.
    int VerticalChoice = 2;

  private:
    int FieldIndex(int id) const;
    void SetField(int id, const std::wstring& value);
    std::wstring WrittenValue(const UFieldWindow& window) const;

    const UNeutralFileFormat& RecordFormat;
    const UJobSettings* Job;
    FileUnits Units;
    /// The field id of each field, 0 for one the definition does not know.
    std::vector<int> FieldIds;
    bool SingleField = false;
    int LoadedChoices[4] = {0, 0, 0, 2};
};

}  // namespace nedit
