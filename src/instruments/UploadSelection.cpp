#include "instruments/UploadSelection.h"

#include <algorithm>

#include "instruments/UUploadSource.h"
#include "platform/job/USurveyDoc.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

// A whole number of up to 18 digits, without sign or blanks.
std::optional<long long> WholeNumber(const std::wstring& text) {
    if (text.empty() || text.size() > 18) return std::nullopt;
    long long value = 0;
    for (const wchar_t c : text) {
        if (c < L'0' || c > L'9') return std::nullopt;
        value = value * 10 + (c - L'0');
    }
    return value;
}

UploadSelection::TextRange Upper(const std::wstring& from, const std::wstring& to) {
    std::wstring a = ToUpper(from);
    std::wstring b = ToUpper(to);
    if (b < a) std::swap(a, b);
    return {a, b};
}

bool InRange(const std::wstring& upper, const UploadSelection::TextRange& range) {
    return range.first <= upper && upper <= range.second;
}

bool InPointRange(const std::wstring& name, const UploadSelection::TextRange& range) {
    const auto number = WholeNumber(name);
    const auto from = WholeNumber(range.first);
    const auto to = WholeNumber(range.second);
    if (number && from && to) {
        return std::min(*from, *to) <= *number && *number <= std::max(*from, *to);
    }
    return InRange(ToUpper(name), Upper(range.first, range.second));
}

bool Listed(const std::wstring& text, const std::vector<std::wstring>& names) {
    return names.empty() || std::any_of(names.begin(), names.end(), [&](const std::wstring& name) {
               return EqualsIgnoreCase(name, text);
           });
}

std::wstring FeatureCode(const std::wstring& code) {
    const std::size_t start = code.find_first_not_of(L' ');
    if (start == std::wstring::npos) return {};
    return code.substr(start, code.find(L' ', start) - start);
}

}  // namespace

UploadSelection UploadSelection::FromDialog(UUploadSource& dialog) {
    UploadSelection selection;
    selection.layers_ = dialog.GetAllLayer() == UUploadSource::kLayersOn    ? Layers::On
                        : dialog.GetAllLayer() == UUploadSource::kLayersOff ? Layers::Off
                                                                            : Layers::All;
    std::wstring from;
    std::wstring to;
    if (dialog.GetByPtno(from, to)) selection.SetPointRange(from, to);
    if (dialog.GetByLayer(from, to)) selection.SetLayerRange(from, to);
    if (dialog.GetByCode(from, to)) selection.SetCodeRange(from, to);
    double low = 0.0;
    double high = 0.0;
    if (dialog.GetByHeight(low, high)) selection.SetHeightRange(low, high);
    return selection;
}

void UploadSelection::SetPointRange(const std::wstring& from, const std::wstring& to) {
    points_ = TextRange(from, to);
}

void UploadSelection::SetLayerRange(const std::wstring& from, const std::wstring& to) {
    layerRange_ = Upper(from, to);
}

void UploadSelection::SetCodeRange(const std::wstring& from, const std::wstring& to) {
    codeRange_ = Upper(from, to);
}

void UploadSelection::SetHeightRange(double from, double to) {
    heights_ = std::make_pair(std::min(from, to), std::max(from, to));
}

bool UploadSelection::Accepts(const UploadPoint& point) const {
    if (layers_ == Layers::On && !point.layerOn) return false;
    if (layers_ == Layers::Off && point.layerOn) return false;
    if (points_ && !InPointRange(point.name, *points_)) return false;
    if (layerRange_ && !InRange(ToUpper(point.layer), *layerRange_)) return false;
    const std::wstring feature = FeatureCode(point.code);
    if (codeRange_ && !InRange(ToUpper(feature), *codeRange_)) return false;
    if (heights_ &&
        !(point.hasHeight && heights_->first <= point.height && point.height <= heights_->second)) {
        return false;
    }
    return Listed(point.layer, layerNames_) && Listed(feature, codeNames_);
}

std::vector<UploadPoint> UploadSelection::Select(USurveyDoc& job) const {
    std::vector<UploadPoint> chosen;
    auto row = job.Database().Query(
        "SELECT p.name, p.east, p.north, p.height, p.code, COALESCE(l.name, ''), "
        "COALESCE(l.active, 1) FROM point p LEFT JOIN layer l ON l.id = p.layer_id "
        "ORDER BY p.id");
    while (row->Step()) {
        UploadPoint point;
        point.name = row->Text(0);
        point.east = row->Real(1);
        point.north = row->Real(2);
        point.hasHeight = !row->IsNull(3);
        point.height = point.hasHeight ? row->Real(3) : 0.0;
        point.code = row->Text(4);
        point.layer = row->Text(5);
        point.layerOn = row->Int(6) != 0;
        if (Accepts(point)) chosen.push_back(std::move(point));
    }
    return chosen;
}

}  // namespace nedit
