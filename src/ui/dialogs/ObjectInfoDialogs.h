#pragma once
// What the plan knows of a picked object, shown read-only on a double click: "Edit Point"
// (POINTDLG), "Edit Line" (LINEDLG) and "Edit Arc" (ARCDLG). Each is a heading and rows of
// a label and a value, worked out once when the dialog is made; they have OK only and
// change nothing in the stores. Values are written in the job's units and decimals.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

class UJobSettings;
class UNeditArc;
class UNeditLine;
class UNeditPt;
class USurveyDoc;

namespace nedit {

/// Where the dialogs take their formats and the names of marks and line styles. Either may
/// be null: metres, ddd.mmss and three decimals hold, and colour and mark stay empty.
struct InfoContext {
    const UJobSettings* settings = nullptr;
    USurveyDoc* job = nullptr;
};

class UObjectInfoDlg : public UDialogLogic {
  public:
    struct Row {
        std::wstring label;
        std::wstring value;
    };

    std::wstring DialogName() const override { return Title; }
    const std::wstring& GetHeading() const { return Heading; }
    const std::vector<Row>& GetRows() const { return Rows; }
    /// The value of the row with that label; empty when there is none.
    std::wstring ValueOf(const std::wstring& label) const;

  protected:
    UObjectInfoDlg(std::wstring title, const InfoContext& context);
    void Add(const std::wstring& label, const std::wstring& value);
    std::wstring Length(double value) const;
    std::wstring Angle(double degrees) const;

    InfoContext Context;
    std::wstring Heading;

  private:
    std::wstring Title;
    std::vector<Row> Rows;
};

/// "Edit Point". Form 8113 (the job's coordinate order 1) has Northing before Easting.
class POINTDLG : public UObjectInfoDlg {
  public:
    POINTDLG(const UNeditPt& point, const InfoContext& context);
};

/// "Edit Line": bearing and distance from its two ends.
class LINEDLG : public UObjectInfoDlg {
  public:
    LINEDLG(const UNeditLine& line, const InfoContext& context);
};

/// "Edit Arc": radius, length, angle, area and bearings of the arc and its chord.
class ARCDLG : public UObjectInfoDlg {
  public:
    ARCDLG(const UNeditArc& arc, const InfoContext& context);
};

}  // namespace nedit
