#include "transfer/DuplicatePtsDlg.h"

#include "codes/UNeditPt.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"
#include "transfer/NewPointNames.h"

using namespace nedit;

DuplicatePtsDlg::DuplicatePtsDlg(USurveyDoc* job, const std::vector<UNeditPt>& points, int index,
                                 nedit::DialogHost* host)
    : Job(job), Points(points), Index(index), Host(host) {}

const UNeditPt& DuplicatePtsDlg::GetPoint() const {
    return Points.at(static_cast<std::size_t>(Index));
}

int DuplicatePtsDlg::EndCode() const {
    if (Mode == kPrefix) return kPrefixEnd;
    if (Mode == kNewNumber) return kNumberEnd;
    return mb::IdOk;
}

bool DuplicatePtsDlg::OnOK() {
    LastRefusal.clear();
    if (Mode != kPrefix && Mode != kNewNumber) return true;
    Prefix = Trim(Prefix);
    if (Prefix.empty()) return true;
    if (ApplyAll) {
        if (CheckPtNewID(Job, Points, Prefix, Index) == 0)
            LastRefusal = Translate(L"Points with Prefix {1} Already Exist !", {Prefix});
    } else {
        std::wstring name;
        if (GetNewName(Job, name, Prefix, GetPoint().GetID()) > 0)
            LastRefusal = Translate(L"Point {1} already exists !", {name});
    }
    if (LastRefusal.empty()) return true;
    AppMessageBox(Host, Translate(L"Invalid Prefix ! {1}", {LastRefusal}), mb::Ok);
    return false;
}
