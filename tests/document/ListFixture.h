#pragma once
// A record list wired to stand-ins for the form, the plan view, the clipboard, the dialog
// host and the widget, each of which remembers what the list asked of it.

#include <functional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "../records/RecordFixture.h"
#include "../support/HeadlessDialogHost.h"
#include "document/ListInterfaces.h"
#include "document/MemoryClipboard.h"
#include "document/UListCtrl.h"

class FakeRecordForm : public URecordForm {
  public:
    int ShowRecord(const std::wstring& text, int row) override {
        shown.emplace_back(text, row);
        return accepts ? accepts(text) : 1;
    }
    void SetModified() override { ++modified; }

    std::function<int(const std::wstring&)> accepts;  // the answer to a record; 1 when unset
    std::vector<std::pair<std::wstring, int>> shown;
    int modified = 0;
};

class FakeGraphicView : public UGraphicPointView {
  public:
    bool SetSelectedPoint(const std::wstring& name) override {
        asked.push_back(name);
        return points.count(name) > 0;
    }
    void ViewSelectedPoint() override { ++viewed; }

    std::set<std::wstring> points;
    std::vector<std::wstring> asked;
    int viewed = 0;
};

class RecordingEvents : public nedit::ListEvents {
  public:
    void SelectionChanged() override { ++selection_changes; }
    void HeaderChanged(const std::wstring& text) override { header = text; }
    void FocusForm() override { ++form_focus; }
    void EditRecordRequested(const std::wstring& text, int row) override {
        edit_requests.emplace_back(text, row);
    }
    void RowsInserted(int first, int count) override { inserted.emplace_back(first, count); }
    void RowsRemoved(int first, int count) override { removed.emplace_back(first, count); }

    int selection_changes = 0;
    int form_focus = 0;
    std::wstring header;
    std::vector<std::pair<std::wstring, int>> edit_requests;
    std::vector<std::pair<int, int>> inserted;
    std::vector<std::pair<int, int>> removed;
};

class ListFixture : public RecordFixture {
  protected:
    void SetUp() override {
        RecordFixture::SetUp();
        list.SetRecordForm(&form);
        list.SetGraphicView(&graphic);
        list.SetClipboard(&clipboard);
        list.SetDialogHost(&host);
        list.SetEvents(&events);
    }

    /// Fills the list with `count` side shots named P0, P1, ... and forgets what the form saw.
    void FillShots(int count) {
        for (int i = 0; i < count; ++i) {
            list.AddRecord(i, L"SS ID=P" + std::to_wstring(i) + L",HA=" + std::to_wstring(i));
        }
        form.shown.clear();
    }
    void Fill(const std::vector<std::wstring>& rows) {
        for (const auto& row : rows) list.AddRecord(list.GetItemCount(), row);
        form.shown.clear();
    }
    /// The point name of each row, "?" for a row without one: a short picture of the list.
    std::vector<std::wstring> Names() const {
        std::vector<std::wstring> names;
        for (const auto& row : list.GetRows()) {
            const auto id = row.find(L"ID=");
            names.push_back(
                id == std::wstring::npos ? L"?" : row.substr(id + 3, row.find(L',', id) - id - 3));
        }
        return names;
    }

    UListCtrl list{&format};
    FakeRecordForm form;
    FakeGraphicView graphic;
    nedit::MemoryClipboard clipboard;
    nedit::HeadlessDialogHost host;
    RecordingEvents events;
};
