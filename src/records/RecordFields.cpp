#include "records/RecordFields.h"

#include <cmath>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

double RecordValue::Number() const {
    if (!converted) return nedit::TextToDouble(text);
    // As the value's text would read: a number that is no longer finite reads as 0.
    return std::isfinite(number) ? number : 0.0;
}

std::string RecordValue::Text() const {
    return converted ? nedit::ToUtf8(nedit::DoubleToText(number)) : std::string(text);
}

std::wstring RecordValue::WideText() const {
    return converted ? nedit::DoubleToText(number) : nedit::FromUtf8(text);
}

const RecordValue* RecordFields::find(int id) const {
    for (std::size_t i = 0; i < used_; ++i) {
        if (entries_[i].first == id) return &entries_[i].second;
    }
    return nullptr;
}

RecordValue& RecordFields::operator[](int id) {
    for (std::size_t i = 0; i < used_; ++i) {
        if (entries_[i].first == id) return entries_[i].second;
    }
    if (used_ == entries_.size()) entries_.emplace_back();
    Entry& entry = entries_[used_++];
    entry.first = id;
    entry.second = RecordValue();
    return entry.second;
}
