#pragma once
// "Modified Selected Records": one change for many rows at once. The user ticks what to
// change (the code or the instrument height of station records, the code or the target
// height of observation records) and gives the new value; the pane applies it to every
// selected row. A box can be ticked only when the selection holds rows of its kind, and a
// value can be typed only while its box is ticked.
//
// GetValues gives the change as the system has always passed it: four comma-separated
// tokens, "CO=station code", "HI=%.3f", "CO=target code", "HT=%.3f", a token left empty when
// its box is clear, and a mask of what changes (1, 2, 4, 8 in that order). UpdateRecord
// applies it to one record.
//
// Decisions:
// - Heights are typed in the job's length unit and written in the unit in force at each
//   row (GetValues for that unit), so a file kept in feet gets feet.
// - A token replaces the field of its name where the record has one, wherever it stands;
//   otherwise it goes to the field's place in the record's layout, or, when another field
//   stands there, to the end. So a record written in another order loses no field.

#include <string>

#include "platform/messages/DialogHost.h"
#include "platform/units/Units.h"

namespace nedit {

class NEdit_Global_Edit : public UDialogLogic {
  public:
    static constexpr int kDialogId = 8026;
    // The check boxes.
    static constexpr int kStnCodeBox = 1011;
    static constexpr int kInstHeightBox = 1013;
    static constexpr int kTargetHeightBox = 1015;
    static constexpr int kTargetCodeBox = 1017;
    // The kinds of rows selected (Mask).
    static constexpr int kStationRows = 1;
    static constexpr int kTargetRows = 2;
    // The change mask of GetValues.
    static constexpr int kChangeStnCode = 1;
    static constexpr int kChangeInstHeight = 2;
    static constexpr int kChangeTargetCode = 4;
    static constexpr int kChangeTargetHeight = 8;

    /// `mask`: the kinds of rows selected; `jobLength`: the unit heights are typed in.
    explicit NEdit_Global_Edit(int mask, LengthUnit jobLength = LengthUnit::Metres)
        : Mask(mask), JobLength(jobLength) {}

    std::wstring DialogName() const override { return L"Modified Selected Records"; }

    /// The kind a row of record type `type` adds to the mask: station records (STN) give
    /// kStationRows, observations (BS, SS, SS2) kTargetRows, others 0.
    static int MaskOf(int type);
    /// Whether the box `box` can be ticked: the station boxes with station rows selected,
    /// the target boxes with any other kind.
    bool IsBoxEnabled(int box) const;
    /// Whether the value of box `box` can be typed: its box can be ticked and is.
    bool IsValueEnabled(int box) const;
    /// The four tokens of the change, heights written in `fileLength`; gives the change mask.
    int GetValues(std::wstring& values, LengthUnit fileLength) const;
    /// The same with heights in the job's unit.
    int GetValues(std::wstring& values) const { return GetValues(values, JobLength); }

    /// Applies the change to `record`, a row of type `type`: station code and instrument
    /// height to STN, target height and code to BS, SS and SS2, the code to PSX and PSN. A
    /// token that is empty, or whose bit is not in `mask`, changes nothing. Gives 1 for a row
    /// of those types, else 0.
    static int UpdateRecord(std::wstring& record, int type, int mask, const std::wstring& values);

    int ModifyStnCode = 0;
    int ModifyInstHeight = 0;
    int ModifyTargetCode = 0;
    int ModifyTargetHeight = 0;
    std::wstring StnCode;
    std::wstring TargetCode;
    double InstHeight = 0.0;
    double TargetHeight = 0.0;
    int Mask = 0;

  private:
    const int& BoxOf(int box) const;

    LengthUnit JobLength;
};

}  // namespace nedit
