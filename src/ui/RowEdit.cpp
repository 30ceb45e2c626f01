#include "ui/RowEdit.h"

#include "document/UListCtrl.h"

namespace nedit {

namespace {

void RemoveRows(UListCtrl& list, int row, std::size_t count) {
    for (std::size_t i = 0; i < count; ++i) list.DeleteItem(row);
}

}  // namespace

void RowEdit::Apply(UListCtrl& list) const {
    switch (kind) {
        case Kind::Insert:
            list.RestoreRows(row, texts);
            break;
        case Kind::Remove:
            RemoveRows(list, row, texts.size());
            break;
        case Kind::Change:
            list.RestoreRowText(row, texts.back());
            break;
    }
}

void RowEdit::Revert(UListCtrl& list) const {
    switch (kind) {
        case Kind::Insert:
            RemoveRows(list, row, texts.size());
            break;
        case Kind::Remove:
            list.RestoreRows(row, texts);
            break;
        case Kind::Change:
            list.RestoreRowText(row, texts.front());
            break;
    }
}

}  // namespace nedit
