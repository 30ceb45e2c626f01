#include "ui/ListEventFan.h"

namespace nedit {

void ListEventFan::RowsAboutToBeInserted(int first, int count) {
    Each([&](ListEvents& l) { l.RowsAboutToBeInserted(first, count); });
}
void ListEventFan::RowsAboutToBeRemoved(int first, int count) {
    Each([&](ListEvents& l) { l.RowsAboutToBeRemoved(first, count); });
}
void ListEventFan::RowAboutToChange(int row) {
    Each([&](ListEvents& l) { l.RowAboutToChange(row); });
}
void ListEventFan::RowsAboutToBeCleared() {
    Each([&](ListEvents& l) { l.RowsAboutToBeCleared(); });
}
void ListEventFan::RowsInserted(int first, int count) {
    Each([&](ListEvents& l) { l.RowsInserted(first, count); });
}
void ListEventFan::RowsRemoved(int first, int count) {
    Each([&](ListEvents& l) { l.RowsRemoved(first, count); });
}
void ListEventFan::RowChanged(int row) {
    Each([&](ListEvents& l) { l.RowChanged(row); });
}
void ListEventFan::RowsCleared() {
    Each([&](ListEvents& l) { l.RowsCleared(); });
}
void ListEventFan::SelectionChanged() {
    Each([&](ListEvents& l) { l.SelectionChanged(); });
}
void ListEventFan::HeaderChanged(const std::wstring& text) {
    Each([&](ListEvents& l) { l.HeaderChanged(text); });
}
void ListEventFan::EnsureVisible(int row) {
    Each([&](ListEvents& l) { l.EnsureVisible(row); });
}
void ListEventFan::FocusList() {
    Each([&](ListEvents& l) { l.FocusList(); });
}
void ListEventFan::FocusForm() {
    Each([&](ListEvents& l) { l.FocusForm(); });
}
void ListEventFan::EditRecordRequested(const std::wstring& text, int row) {
    Each([&](ListEvents& l) { l.EditRecordRequested(text, row); });
}

}  // namespace nedit
