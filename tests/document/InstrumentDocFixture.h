#pragma once
// A raw-data document with the build's drivers and a scripted dialog host, for imports and
// downloads; settings files go to a folder of the test's own.

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <memory>
#include <string>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/UDeviceManager.h"
#include "platform/messages/ProgressSink.h"
#include "platform/text/WideText.h"

class InstrumentDocFixture : public ::testing::Test {
  protected:
    InstrumentDocFixture() {
        doc.SetDialogHost(&host);
        doc.SetDeviceManager(
            std::make_unique<UDeviceManager>(L"", 0, false, SXNEDIT_TEST_DRIVER_DIR));
    }

    static std::string RawFixture(const std::string& name) {
        return std::string(SXNEDIT_TEST_DATA) + "/raw/" + name;
    }
    static std::string ReadFile(const std::string& path) {
        std::ifstream in(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
    }
    UDeviceManager& Manager() { return *doc.GetDeviceManager(); }
    std::wstring Row(int row) { return list.GetItemText(row); }
    /// The texts of the messages shown so far, one after the other.
    std::wstring MessagesShown() const {
        std::wstring texts;
        for (const auto& message : host.Messages()) texts += message.text + L"\n";
        return texts;
    }

    nedit::test::TempDir dir;
    nedit::test::ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    nedit::HeadlessDialogHost host;
    UNeditDoc doc{nullptr};
    UListCtrl& list = doc.OpenList();
};

/// A progress sink that asks for an abort once the list holds `rows` rows.
class AbortAtRows : public nedit::ProgressSink {
  public:
    AbortAtRows(const UListCtrl& list, int rows) : list_(list), rows_(rows) {}
    void Update(int, const std::wstring&) override {
        if (list_.GetItemCount() >= rows_) RequestAbort();
    }

  private:
    const UListCtrl& list_;
    int rows_;
};
