#include "instruments/UUploadSource.h"

#include <utility>

namespace {

// Puts the pair in order in the dialog and gives it.
template <class Value>
int Ordered(Value& from, Value& to, Value& outFrom, Value& outTo, int flag) {
    if (to < from) std::swap(from, to);
    outFrom = from;
    outTo = to;
    return flag;
}

}  // namespace

UUploadSource::UUploadSource(nedit::DialogHost* parent, const ULayerSource* document)
    : Parent(parent), Document(document) {}

void UUploadSource::OnInitDialog() {
    AddComboLayer(kLayerFromList);
    AddComboLayer(kLayerToList);
}

int UUploadSource::Create_Dlg() {
    return Parent != nullptr && Parent->Run(*this) == nedit::mb::IdOk ? 1 : 0;
}

int UUploadSource::GetByPtno(std::wstring& from, std::wstring& to) {
    return Ordered(PointFrom, PointTo, from, to, ByPtRange);
}

int UUploadSource::GetByLayer(std::wstring& from, std::wstring& to) {
    return Ordered(LayerFrom, LayerTo, from, to, ByLayer);
}

int UUploadSource::GetByCode(std::wstring& from, std::wstring& to) {
    return Ordered(CodeFrom, CodeTo, from, to, ByCode);
}

int UUploadSource::GetByHeight(double& from, double& to) {
    return Ordered(HeightFrom, HeightTo, from, to, ByHeight);
}

void UUploadSource::AddComboLayer(int id) {
    std::vector<std::wstring>* items = id == kLayerFromList ? &LayersFrom
                                       : id == kLayerToList ? &LayersTo
                                                            : nullptr;
    if (items == nullptr || Document == nullptr) return;
    items->clear();
    for (const std::wstring& name : Document->GetLayerList()) {
        if (name.empty()) break;
        items->push_back(name);
    }
}

const std::vector<std::wstring>& UUploadSource::GetLayerItems(int id) const {
    return id == kLayerToList ? LayersTo : LayersFrom;
}
