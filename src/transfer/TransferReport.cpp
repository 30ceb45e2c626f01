#include "transfer/TransferReport.h"

#include "platform/messages/Translate.h"

namespace nedit {

void TransferReport::Undone() {
    PointsAdded = PointsUpdated = 0;
    LinesAdded = LinesUpdated = 0;
    ArcsAdded = ArcsUpdated = 0;
    Circles = 0;
    PolylinesAdded = PolylinesReplaced = 0;
    Renamed.clear();
    LockedRewritten.clear();
    Kept = false;
}

std::wstring TransferReport::Summary() const {
    std::wstring text;
    if (!Left.empty()) {
        text += Translate(L"Not written to the job:");
        for (std::size_t i = 0; i < Left.size() && i < kListed; ++i) {
            text += L"\n" + Left[i].Kind + L" " + Left[i].Name + L": " + Left[i].Reason;
        }
        if (Left.size() > kListed) {
            text += L"\n" + Translate(L"and {1} more.", {std::to_wstring(Left.size() - kListed)});
        }
    }
    if (!LockedRewritten.empty()) {
        if (!text.empty()) text += L"\n";
        text += Translate(L"Points locked in the job and written over:");
        for (std::size_t i = 0; i < LockedRewritten.size() && i < kListed; ++i) {
            text += (i == 0 ? L" " : L", ") + LockedRewritten[i];
        }
        if (LockedRewritten.size() > kListed) {
            text += L" " + Translate(L"and {1} more.",
                                     {std::to_wstring(LockedRewritten.size() - kListed)});
        }
    }
    return text;
}

std::wstring TransferReport::WrittenText() const {
    const auto count = [](int n, const wchar_t* one, const wchar_t* many) {
        return std::to_wstring(n) + L" " + Translate(n == 1 ? one : many);
    };
    return count(PointsAdded + PointsUpdated, L"point", L"points") + L", " +
           count(LinesAdded + LinesUpdated, L"line", L"lines") + L", " +
           count(ArcsAdded + ArcsUpdated, L"arc", L"arcs") + L", " +
           count(Circles, L"circle", L"circles") + L", " +
           count(PolylinesAdded + PolylinesReplaced, L"polyline", L"polylines");
}

}  // namespace nedit
