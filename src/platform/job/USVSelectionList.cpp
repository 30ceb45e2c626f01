#include "platform/job/USVSelectionList.h"

#include <algorithm>

bool USVSelectionList::Add(long id) {
    if (id == 0 || Contains(id)) return false;
    ids_.push_back(id);
    return true;
}

bool USVSelectionList::Contains(long id) const {
    return std::find(ids_.begin(), ids_.end(), id) != ids_.end();
}

long USVSelectionList::First() {
    cursor_ = 0;
    return Next();
}

long USVSelectionList::Next() {
    if (cursor_ >= ids_.size()) return 0;
    return ids_[cursor_++];
}
