#include "records/FieldMap.h"

#include <algorithm>

FieldMap::const_iterator FieldMap::find(int id) const {
    return std::find_if(begin(), end(), [id](const Entry& entry) { return entry.first == id; });
}

FieldMap::iterator FieldMap::find(int id) {
    return std::find_if(begin(), end(), [id](const Entry& entry) { return entry.first == id; });
}

std::wstring& FieldMap::operator[](int id) {
    const iterator found = find(id);
    if (found != end()) return found->second;
    if (used_ == entries_.size()) entries_.emplace_back();
    Entry& entry = entries_[used_++];
    entry.first = id;
    entry.second.clear();
    return entry.second;
}
