#pragma once
// "Coordinate Change To Existing Point In Database": the question when the job holds a point
// of the same name with other coordinates. The user overwrites the job's point, creates a new
// point with a new number or with a prefix before the name, or aborts the transfer, and may
// apply the choice to the rest of the run.
//
// The choices are the modes 1 (overwrite), 2 (prefix) and 3 (new number); each enables only
// its own edit. OK gives the end code of the choice (EndCode), "Abort" cancels. On OK with
// a create choice the prefix is trimmed and checked; a prefix that would give a name the job
// has already is refused with "Invalid Prefix ! ..." and the dialog stays open.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

class UNeditPt;
class USurveyDoc;

class DuplicatePtsDlg : public nedit::UDialogLogic {
  public:
    static constexpr int kMessageControl = 1014;
    /// End codes of OK: the prefix chosen, a new number chosen (overwrite ends with mb::IdOk).
    static constexpr int kPrefixEnd = 1013;
    static constexpr int kNumberEnd = 1016;
    enum Choice { kOverwrite = 1, kPrefix = 2, kNewNumber = 3 };

    /// The question about point `index` of `points`, checked against `job`; refusals are shown
    /// through `host`.
    DuplicatePtsDlg(USurveyDoc* job, const std::vector<UNeditPt>& points, int index,
                    nedit::DialogHost* host);

    std::wstring DialogName() const override {
        return L"Coordinate Change To Existing Point In Database";
    }
    /// Checks a create choice's prefix; false, after "Invalid Prefix ! ...", keeps it open.
    bool OnOK() override;

    /// Ticks a choice (1 to 3).
    void Choose(int mode) { Mode = mode; }
    bool IsPrefixEditEnabled() const { return Mode == kPrefix; }
    bool IsNumberEditEnabled() const { return Mode == kNewNumber; }
    /// The end code of OK for the choice ticked.
    int EndCode() const;
    /// Why the last OK was refused; empty when it was not.
    const std::wstring& Refusal() const { return LastRefusal; }
    /// The point in question.
    const UNeditPt& GetPoint() const;

    std::wstring Message;
    std::wstring Prefix;
    std::wstring NewNumber;
    int Mode = kOverwrite;
    bool ApplyAll = false;

  private:
    USurveyDoc* Job;
    const std::vector<UNeditPt>& Points;
    int Index;
    nedit::DialogHost* Host;
    std::wstring LastRefusal;
};
