// Points that the engine derived and that must outlive the run go back into the rows as
// ordinary records: adjusted points below the marker row, addition points above it. These
// writers touch only the engine's point stores and the rows, so they live beside the engine;
// what the traverse computes reaches them through those stores. The traverse points of the
// last adjustment live here too: the re-reduction of side shots asks for them.

#include "platform/geometry/Tolerance.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "records/RecordTypes.h"
#include "records/RowSource.h"
#include "reduction/UNeditDatabase.h"

namespace {

// The lowest marker row: the list is searched from its last row upward. The marker is
// ASCII, so a row is compared with it in UTF-8.
int FindMarker(const nedit::RowSource& list) {
    const std::string marker = nedit::ToUtf8(kAdjustedPointsMarker);
    for (int row = list.GetItemCount() - 1; row >= 0; --row) {
        const std::string_view text = nedit::TrimView(list.GetRowUtf8(row));
        if (text.size() == marker.size() && nedit::ToUpperUtf8(text) == marker) return row;
    }
    return -1;
}

}  // namespace

int UNeditDatabase::SaveAdjustedPt2CtrlList(nedit::RowSource* list) {
    if (list == nullptr || list->GetItemCount() == 0 || TravPtList.empty()) return 0;
    const int count = list->GetItemCount();
    int marker = FindMarker(*list);
    if (marker < 0) {
        list->AddRecord(count, kAdjustedPointsMarker);
        marker = count;
    }
    int row = marker + 1;
    // Working values, as the adjustment left them; rows below the marker are overwritten
    // one for one and rows past the last one written stay.
    for (const UNeditPt& point : TravPtList) {
        const std::wstring text = nedit::Format(L"%-10s ID=%s,E=%.3f,N=%.3f,H=%.3f", L"XYZ",
                                                point.GetID(), point.x, point.y, point.z);
        if (row < count) {
            list->SetRecord(row, text);
        } else {
            list->AddRecord(row, text);
        }
        ++row;
    }
    return 1;
}

int UNeditDatabase::SaveAdditionPt2CtrlList(nedit::RowSource* list) {
    if (list == nullptr || list->GetItemCount() == 0 || AddPtList.empty()) return 0;
    const int marker = FindMarker(*list);
    int insert_at = marker >= 0 ? marker : list->GetItemCount();
    // The rows are indexed by name once, and the index follows the rows written here.
    ForgetOtherRows();
    for (const UNeditPt& point : AddPtList) {
        double e = 0.0, n = 0.0, h = 0.0;
        const int row = FindCoordinateRow(*list, point.GetID(), kCoordinateRows, &e, &n, &h);
        const std::wstring text = FormatXYZRecord(point.GetID(), point.x, point.y, point.z);
        if (row < 0) {
            InsertRow(*list, insert_at++, text);
        } else if (!Is_Zero(point.x - e, false) || !Is_Zero(point.y - n, false) ||
                   !Is_Zero(point.z - h, false)) {
            ReplaceRow(*list, row, text);
        }
    }
    ForgetOtherRows();
    return 1;
}

void UNeditDatabase::DelAdjPts() {
    if (TravPtList.empty()) return;
    TravPtList.Clear();
    if (Rows == nullptr || Rows->GetItemCount() == 0) return;
    const int marker = FindMarker(*Rows);
    if (marker < 0) return;
    while (Rows->GetItemCount() > marker) Rows->DeleteItem(Rows->GetItemCount() - 1);
}

void UNeditDatabase::ClearAddPtList() {
    AddPtList.Clear();
}

void UNeditDatabase::UpdateTraversePoints(const std::vector<UNeditPt>* route) {
    TravPtNames.clear();
    TravPtKeys.clear();
    if (route == nullptr) return;
    for (const UNeditPt& point : *route) {
        TravPtNames.emplace_back(point.GetID(), point.x, point.y, point.z, L"", 0);
        TravPtKeys.insert(nedit::ToUpper(point.GetID()));
    }
}

bool UNeditDatabase::IsTraversePoint(std::wstring_view name) const {
    return !TravPtKeys.empty() && TravPtKeys.count(nedit::ToUpper(name)) != 0;
}

bool UNeditDatabase::GetTraversePoint(UNeditPt& point) const {
    if (!IsTraversePoint(point.GetID())) return false;
    for (const UNeditPt& entry : TravPtNames) {
        if (nedit::EqualsIgnoreCase(entry.GetID(), point.GetID())) {
            point = UNeditPt(point.GetID(), entry.x, entry.y, entry.z, L"", 0);
            return true;
        }
    }
    return false;
}
