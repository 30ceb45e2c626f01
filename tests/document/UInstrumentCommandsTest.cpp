// The pane's instrument commands with a scripted host: the dialogs, the questions, the
// file dialogs, and the reduction that follows.

#include "../support/FakeInstrument.h"
#include "InstrumentDocFixture.h"
#include "document/UInstrumentCommands.h"
#include "instruments/PortStores.h"
#include "instruments/ULoadRawDlg.h"
#include "instruments/UNEDownload.h"
#include "platform/messages/UFileDialog.h"
#include "reduction/UNeditDatabase.h"

namespace {

using namespace std::chrono_literals;

class RecordingView : public UTransferView {
  public:
    void BlockMouse(bool block) override { calls += block ? "block " : "free "; }
    void ClearForm() override { calls += "form "; }
    void ShowNewData() override { calls += "show "; }
    std::string calls;
};

class InstrumentCommands : public InstrumentDocFixture {
  protected:
    InstrumentCommands() {
        list.AddRecord(0, L"#VERSION-1.0 NEUTRAL FILE");
        list.AddRecord(1, L"NOTE OLD DATA");
    }
    /// The raw import's dialog picks `instrument` and presses `button`.
    void ChooseInstrument(const std::wstring& instrument, int button) {
        host.SetFace<ULoadRawDlg>([=](ULoadRawDlg& dialog) {
            const auto& names = dialog.GetNames();
            dialog.OnSelchangeList(static_cast<int>(
                std::find(names.begin(), names.end(), instrument) - names.begin()));
            return dialog.OnButton(button);
        });
    }
    /// A file dialog of `name` ("Open File", "Save File") answers `path`, or is cancelled.
    void ChooseFile(const std::wstring& name, const std::string& path,
                    std::wstring* filter = nullptr) {
        fileAnswers[name] = {path, filter};
        host.SetFace<nedit::UFileDialog>([this](nedit::UFileDialog& dialog) {
            const auto answer = fileAnswers.find(dialog.DialogName());
            if (answer == fileAnswers.end()) return nedit::mb::IdCancel;
            if (answer->second.filter != nullptr) *answer->second.filter = dialog.Filter;
            dialog.PathName = answer->second.path;
            return answer->second.path.empty() ? nedit::mb::IdCancel : nedit::mb::IdOk;
        });
    }

    struct FileAnswer {
        std::string path;
        std::wstring* filter;
    };
    std::map<std::wstring, FileAnswer> fileAnswers;

    RecordingView view;
    UInstrumentCommands commands{doc, list, &host, &view};
};

TEST_F(InstrumentCommands, ImportRawFileReplacesTheRowsAndReducesThem) {
    ChooseInstrument(L"Leica GSI", ULoadRawDlg::kImport);
    std::wstring filter;
    ChooseFile(L"Open File", RawFixture("RILIEVO.gsi"), &filter);
    EXPECT_EQ(commands.OnImportRawfile(), 1);
    EXPECT_EQ(filter,
              L"Leica GSI Raw Data Files (*.gsi;*.gs8;*.gs16)|*.gsi;*.gs8;*.gs16|All Files "
              L"(*.*)|*.*||");
    ASSERT_EQ(list.GetItemCount(), 25);
    EXPECT_EQ(Row(2), L"SS        ID=100,HA=103.542448,VA=88.580372,SD=0.000,CO=,HD=0.000");
    EXPECT_NE(doc.GetDatabase(), nullptr);
    EXPECT_EQ(view.calls, "block form show free ");
    EXPECT_EQ(Manager().GetLoadedName(), L"");  // unloaded again
    EXPECT_EQ(host.Messages()[0].text, L"Overwrite Existing Data?");
}

TEST_F(InstrumentCommands, ImportStopsWhereTheUserSaysNo) {
    ChooseInstrument(L"Leica GSI", ULoadRawDlg::kImport);
    host.QueueAnswer(nedit::mb::IdNo);
    EXPECT_EQ(commands.OnImportRawfile(), 0);
    EXPECT_EQ(list.GetItemCount(), 2);
    EXPECT_EQ(view.calls, "block free ");

    ChooseFile(L"Open File", "");  // the file dialog cancelled
    EXPECT_EQ(commands.OnImportRawfile(), 0);
    EXPECT_EQ(list.GetItemCount(), 2);

    ChooseInstrument(L"Leica GSI", ULoadRawDlg::kImportFromDevice);
    EXPECT_EQ(commands.OnImportRawfile(), 0);
    EXPECT_EQ(list.GetItemCount(), 2);
    EXPECT_EQ(std::count(host.DialogsRun().begin(), host.DialogsRun().end(), L"Open File"), 1);
}

TEST_F(InstrumentCommands, AFileThatCannotBeReadIsSaid) {
    ChooseInstrument(L"Neutral", ULoadRawDlg::kImport);
    ChooseFile(L"Open File", dir.File("gone.neu"));
    EXPECT_EQ(commands.OnImportRawfile(), 0);
    EXPECT_NE(MessagesShown().find(L"Failed to open"), std::wstring::npos);
}

TEST_F(InstrumentCommands, ARawFileOnAMobileDeviceIsCopiedFirst) {
    const std::string mount = dir.File("gvfs/mtp:host=collector");
    std::filesystem::create_directories(mount);
    std::filesystem::copy_file(RawFixture("RILIEVO.gsi"), mount + "/job.gsi");
    ChooseInstrument(L"Leica GSI", ULoadRawDlg::kImport);
    ChooseFile(L"Open File", mount + "/job.gsi");
    nedit::test::ScopedEnv temporary("TMPDIR", dir.Path());
    EXPECT_EQ(commands.OnImportRawfile(), 1);
    EXPECT_EQ(list.GetItemCount(), 25);
    for (const auto& entry : std::filesystem::directory_iterator(dir.Path()))
        EXPECT_NE(entry.path().filename().string().rfind("RAW", 0), 0u) << "copy left behind";
}

TEST_F(InstrumentCommands, DriverExtensionsBecomePatterns) {
    std::wstring patterns;
    std::wstring files;
    EXPECT_EQ(commands.GetDeviceDriverFileExt(L"Leica GSI", false, patterns, files), 1);
    EXPECT_EQ(patterns, L"(*.gsi;*.gs8;*.gs16)");
    EXPECT_EQ(files, L"*.gsi;*.gs8;*.gs16");
    EXPECT_EQ(commands.GetDeviceDriverFileExt(L"Nobody", false, patterns, files), 1);
    EXPECT_EQ(patterns, L"()");
    EXPECT_EQ(files, L"");
}

class DownloadCommand : public InstrumentCommands {
  protected:
    DownloadCommand() {
        nedit::PortsStore().SetDevicePath(L"COM1", instrument.Port());
        host.SetFace<UNEDownload>([](UNEDownload& dialog) {
            dialog.Instrument = L"Leica GSI";
            dialog.Comm = L"COM1";
            return dialog.OnOK() ? nedit::mb::IdOk : nedit::mb::IdCancel;
        });
    }

    nedit::test::ScopedEnv temporary{"TMPDIR", dir.Path()};
    FakeInstrument instrument;
};

TEST_F(DownloadCommand, ReceivesKeepsTheRawFileAndReduces) {
    const std::string kept = dir.File("day1.gsi");
    std::wstring filter;
    ChooseFile(L"Save File", kept, &filter);
    const std::string rilievo = ReadFile(RawFixture("RILIEVO.gsi"));
    instrument.Play([&](FakeInstrument& link) {
        link.Wait(100ms);
        link.SendLines(rilievo, 2ms);
        link.Send("\x04");
    });
    EXPECT_EQ(commands.OnNeditDownload(), 1);
    EXPECT_EQ(filter,
              L"Strandix Raw Data File (*.gsi)|*.gsi|Strandix Raw Data File (*.gs8)|*.gs8|"
              L"Strandix Raw Data File (*.gs16)|*.gs16|All Files(*.*)|*.*||");
    EXPECT_EQ(list.GetItemCount(), 25);
    EXPECT_EQ(ReadFile(kept), rilievo + "\x04");
    EXPECT_EQ(ReadFile(UInstrumentCommands::GetRawFilePath()), rilievo + "\x04");
    EXPECT_NE(UInstrumentCommands::GetRawFilePath().find("/OUTTEMP.$$$"), std::string::npos);
    EXPECT_NE(doc.GetDatabase(), nullptr);
    EXPECT_TRUE(commands.IsDownloadActive());
    EXPECT_EQ(commands.GetDeviceFileExt(), L"gsi,gs8,gs16");
    EXPECT_FALSE(Manager().IsPortOpen());

    // The raw file again, to another place; then the command's end.
    ChooseFile(L"Save File", dir.File("copy.gsi"));
    EXPECT_EQ(commands.SaveRawFile(), 1);
    EXPECT_EQ(ReadFile(dir.File("copy.gsi")), rilievo + "\x04");
    commands.StopDownload();
    EXPECT_FALSE(commands.IsDownloadActive());
    EXPECT_FALSE(commands.GetAckNak());
}

TEST_F(DownloadCommand, NoToOverwriteLeavesTheRowsAndLoadsNoDriver) {
    host.QueueAnswer(nedit::mb::IdNo);
    EXPECT_EQ(commands.OnNeditDownload(), 0);
    EXPECT_EQ(list.GetItemCount(), 2);
    EXPECT_EQ(host.Messages().back().text, L"Overwrite Existing Data?");
    EXPECT_EQ(Manager().GetLoadedName(), L"");
}

TEST_F(DownloadCommand, CancellingTheStartOrTheRawFileClosesEverything) {
    host.QueueAnswer(nedit::mb::IdYes);     // overwrite
    host.QueueAnswer(nedit::mb::IdCancel);  // "Start Downloading"
    ChooseFile(L"Save File", dir.File("day1.gsi"));
    EXPECT_EQ(commands.OnNeditDownload(), 0);
    EXPECT_EQ(host.Messages().back().text, L"Start Downloading");
    EXPECT_FALSE(Manager().IsPortOpen());
    EXPECT_EQ(list.GetItemCount(), 2);
    ChooseFile(L"Save File", "");
    EXPECT_EQ(commands.OnNeditDownload(), 0);
    EXPECT_FALSE(Manager().IsPortOpen());
    EXPECT_EQ(Manager().GetLoadedName(), L"");
}

TEST_F(DownloadCommand, APortThatCannotBeOpenedIsSaid) {
    nedit::PortsStore().SetDevicePath(L"COM1", "/nonexistent/ttyUSB9");
    EXPECT_EQ(commands.OnNeditDownload(), 0);
    EXPECT_EQ(host.Messages().back().text, L"There is no serial port /nonexistent/ttyUSB9.");
    EXPECT_EQ(list.GetItemCount(), 2);
}

TEST_F(DownloadCommand, AnAbortBeforeTheFirstRecordStillReducesTheEmptyList) {
    AbortAtRows abort(list, 0);
    doc.SetProgressSink(&abort);
    ChooseFile(L"Save File", dir.File("day1.gsi"));
    EXPECT_EQ(commands.OnNeditDownload(), 1);
    doc.SetProgressSink(nullptr);
    EXPECT_EQ(list.GetItemCount(), 0);
    EXPECT_EQ(doc.GetModified(), 1);
    EXPECT_NE(doc.GetDatabase(), nullptr);
}

}  // namespace
