#include "reduction/ObservationModel.h"

std::size_t TargetList::PositionOf(const std::wstring& name) const {
    if (by_name_) {
        const auto found = by_name_->find(name);
        return found == by_name_->end() ? targets_.size() : found->second;
    }
    for (std::size_t i = 0; i < targets_.size(); ++i) {
        if (targets_[i]->SSName == name) return i;
    }
    return targets_.size();
}

SSSTRUCT* TargetList::Find(const std::wstring& name) const {
    const std::size_t position = PositionOf(name);
    return position == targets_.size() ? nullptr : targets_[position].get();
}

void TargetList::Append(std::unique_ptr<SSSTRUCT> target) {
    if (by_name_) {
        by_name_->emplace(target->SSName, targets_.size());
    } else if (targets_.size() + 1 >= kIndexFrom) {
        by_name_ = std::make_unique<std::unordered_map<std::wstring, std::size_t>>();
        for (std::size_t i = 0; i < targets_.size(); ++i) by_name_->emplace(targets_[i]->SSName, i);
        by_name_->emplace(target->SSName, targets_.size());
    }
    targets_.push_back(std::move(target));
}

std::unique_ptr<SSSTRUCT> TargetList::Replace(SSSTRUCT* old, std::unique_ptr<SSSTRUCT> fresh) {
    const std::size_t position = PositionOf(old->SSName);
    if (by_name_) {
        by_name_->erase(old->SSName);
        by_name_->emplace(fresh->SSName, position);
    }
    std::unique_ptr<SSSTRUCT> taken = std::move(targets_[position]);
    targets_[position] = std::move(fresh);
    return taken;
}

void TargetList::Clear() {
    targets_.clear();
    by_name_.reset();
}
