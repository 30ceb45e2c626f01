#pragma once
// The record list tells one listener of its changes; the desktop has several (the model of
// the view, the undo recorder, the pane). The fan passes every call on to each, in order.

#include <vector>

#include "document/ListInterfaces.h"

namespace nedit {

class ListEventFan : public ListEvents {
  public:
    void Add(ListEvents* listener) { listeners_.push_back(listener); }

    void RowsAboutToBeInserted(int first, int count) override;
    void RowsAboutToBeRemoved(int first, int count) override;
    void RowAboutToChange(int row) override;
    void RowsAboutToBeCleared() override;
    void RowsInserted(int first, int count) override;
    void RowsRemoved(int first, int count) override;
    void RowChanged(int row) override;
    void RowsCleared() override;
    void SelectionChanged() override;
    void HeaderChanged(const std::wstring& text) override;
    void EnsureVisible(int row) override;
    void FocusList() override;
    void FocusForm() override;
    void EditRecordRequested(const std::wstring& text, int row) override;

  private:
    template <typename Call>
    void Each(Call call) {
        for (ListEvents* listener : listeners_) call(*listener);
    }

    std::vector<ListEvents*> listeners_;
};

}  // namespace nedit
