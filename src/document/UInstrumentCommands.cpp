#include "document/UInstrumentCommands.h"

#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <vector>

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "instruments/RawFiles.h"
#include "instruments/ULoadRawDlg.h"
#include "instruments/UNEDownload.h"
#include "platform/messages/Translate.h"
#include "platform/messages/UFileDialog.h"
#include "platform/mobile/UCeDeviceManager.h"
#include "platform/settings/DirectoryMemory.h"
#include "platform/text/Format.h"
#include "platform/text/WideText.h"
#include "report/UNeditReport.h"

std::string UInstrumentCommands::RawFilePath;

namespace {

// The pieces of a comma-separated extension list; empty pieces are passed over.
std::vector<std::wstring> Extensions(const std::wstring& text) {
    std::vector<std::wstring> pieces;
    for (std::size_t start = 0; start < text.size();) {
        const std::size_t comma = std::min(text.find(L',', start), text.size());
        if (comma > start) pieces.push_back(text.substr(start, comma - start));
        start = comma + 1;
    }
    return pieces;
}

}  // namespace

UInstrumentCommands::UInstrumentCommands(UNeditDoc& doc, UListCtrl& list, nedit::DialogHost* host,
                                         UTransferView* view)
    : Doc(doc), List(list), Host(host), View(view != nullptr ? *view : NoView) {}

void UInstrumentCommands::Tell(const std::wstring& text) {
    nedit::AppMessageBox(Host, text, nedit::mb::Ok | nedit::mb::IconExclamation);
}

bool UInstrumentCommands::MayOverwrite() {
    return List.GetItemCount() == 0 ||
           nedit::AppMessageBox(Host, nedit::Translate(L"Overwrite Existing Data?"),
                                nedit::mb::YesNo | nedit::mb::IconQuestion) == nedit::mb::IdYes;
}

void UInstrumentCommands::Reduce() {
    Doc.SetModified(1);
    if (View.Reduction([this] { return Doc.SetupDataBase(&List); }) && !Doc.GetAbortProcess())
        View.ShowNewData();
}

int UInstrumentCommands::GetDeviceDriverFileExt(const std::wstring& device, bool,
                                                std::wstring& patterns, std::wstring& list) {
    patterns.clear();
    list.clear();
    UDeviceManager* manager = Doc.GetDeviceManager();
    if (manager == nullptr) return 0;
    for (const std::wstring& extension : Extensions(manager->GetFileExtension(device))) {
        if (!list.empty()) list += L';';
        list += nedit::Format(L"*.%s", extension);
    }
    patterns = L"(" + list + L")";
    return 1;
}

// ---- Import -------------------------------------------------------------------------------

int UInstrumentCommands::OnImportRawfile() {
    StopDownload();
    UDeviceManager* manager = Doc.GetDeviceManager();
    if (manager == nullptr) return 0;
    View.BlockMouse(true);
    ULoadRawDlg choice(manager);
    const int button = Host != nullptr ? Host->Run(choice) : nedit::mb::IdCancel;
    int imported = 0;
    if ((button == ULoadRawDlg::kImport || button == ULoadRawDlg::kImportFromDevice) &&
        MayOverwrite()) {
        if (Doc.GetNReport() != nullptr && List.GetItemCount() > 0) Doc.GetNReport()->Clear();
        View.ClearForm();
        if (!manager->LoadDLL(choice.Device)) {
            Tell(manager->GetLastError());
        } else if (button == ULoadRawDlg::kImport) {
            std::wstring patterns;
            std::wstring list;
            GetDeviceDriverFileExt(choice.Device, false, patterns, list);
            nedit::UFileDialog file(
                nedit::UFileDialog::Mode::Open,
                nedit::Format(L"%s Raw Data Files %s|All Files (*.*)|*.*||", choice.Device,
                              nedit::Format(L"%s|%s", patterns, list)));
            file.InitialDir = nedit::GetInitialOpenDir(kDirectoryKey);
            std::string copy;
            const std::string path = Host->Run(file) == nedit::mb::IdOk
                                         ? LocalRawFile(file.PathName, copy)
                                         : std::string();
            if (!path.empty()) {
                List.DeleteAllItems();
                imported =
                    View.Transfer(false, [&] { return Doc.Import(nedit::FromUtf8(path), &List); });
                if (imported == 0) Tell(manager->GetLastError());
                Reduce();
            }
            if (!copy.empty()) unlink(copy.c_str());
        }
    }
    manager->DeleteDLL();
    View.BlockMouse(false);
    return imported;
}

std::string UInstrumentCommands::LocalRawFile(const std::string& path, std::string& copy) {
    if (path.empty()) return {};
    if (!IsMobileDeviceFileName(path)) {
        nedit::SetLastOpenDir(kDirectoryKey, path);
        return path;
    }
    UCeDeviceManager mobile;
    if (!mobile.LoadDll()) {
        Tell(nedit::Translate(L"Failed to load mobile driver."));
        return {};
    }
    const std::size_t dot = path.find_last_of('.');
    const std::wstring extension =
        nedit::FromUtf8(dot == std::string::npos ? std::string() : path.substr(dot + 1));
    const char* base = std::getenv("TMPDIR");
    std::string temporary =
        std::string(base != nullptr && *base != '\0' ? base : "/tmp") + "/RAWXXXXXX";
    const int fd = mkstemp(temporary.data());
    if (fd >= 0) close(fd);
    std::string converted;
    if (fd < 0 || !mobile.TransferRawFile(path, temporary, 0, 0,
                                          nedit::Translate(L"Copying file from device ..."), 0)) {
        if (fd >= 0) unlink(temporary.c_str());
        Tell(nedit::Translate(L"Failed to copy {1} from device.", {nedit::FromUtf8(path)}));
        return {};
    }
    copy = temporary;
    if (!mobile.ConvertRawFile(temporary, L"", extension, 0, L"", converted)) {
        Tell(nedit::Translate(L"Failed to convert {1}", {nedit::FromUtf8(path)}));
        return {};
    }
    return converted;
}

// ---- Download -----------------------------------------------------------------------------

int UInstrumentCommands::OnNeditDownload() {
    StopDownload();
    UDeviceManager* manager = Doc.GetDeviceManager();
    if (manager == nullptr || Host == nullptr) return 0;
    UNEDownload parameters(Host, manager);
    if (Host->Run(parameters) != nedit::mb::IdOk || !MayOverwrite()) return 0;
    SaveRaw = parameters.SaveRaw != 0;
    AckNak = parameters.AckNak != 0;
    if (!manager->LoadDLL(parameters.Instrument)) {
        Tell(manager->GetLastError());
        return 0;
    }
    if (!manager->OpenPort(parameters.Comm)) {
        Tell(manager->GetLastError());
        return GiveUp();
    }
    RawFilePath = nedit::TemporaryRawFile();
    std::string kept;  // where the user keeps the raw file
    if (SaveRaw) {
        DeviceFileExt = manager->GetFileExtension(parameters.Instrument);
        std::wstring items;
        const std::vector<std::wstring> extensions = Extensions(DeviceFileExt);
        for (const std::wstring& extension : extensions) {
            const std::wstring pattern = nedit::Format(L"*.%s", extension);
            items += nedit::Format(L"Strandix Raw Data File %s|",
                                   nedit::Format(L"(%s)|%s", pattern, pattern));
        }
        nedit::UFileDialog file(nedit::UFileDialog::Mode::Save,
                                nedit::Format(L"%sAll Files(*.*)|*.*||", items));
        if (!extensions.empty()) file.DefaultExt = extensions.front();
        file.OverwritePrompt = true;
        file.InitialDir = nedit::GetInitialOpenDir(kDirectoryKey);
        if (Host->Run(file) != nedit::mb::IdOk) return GiveUp();
        kept = file.PathName;
        nedit::SetLastOpenDir(kDirectoryKey, kept);
    }
    if (RawFilePath.empty()) {
        Tell(nedit::Translate(
            L"There is no folder of yours in the temporary directory for the raw file."));
        return GiveUp();
    }
    if (!manager->SetTranslateMode() ||
        nedit::AppMessageBox(Host, nedit::Translate(L"Start Downloading"),
                             nedit::mb::OkCancel | nedit::mb::IconInformation) != nedit::mb::IdOk) {
        return GiveUp();
    }
    DownloadActive = true;
    List.DeleteAllItems();
    manager->SetAckNak(AckNak);
    if (!View.Transfer(true,
                       [this] { return Doc.Download(nedit::FromUtf8(RawFilePath), &List); })) {
        Tell(manager->GetLastError());
        manager->DeleteDLL();
        return 0;
    }
    if (!kept.empty() && !nedit::CopyRawFile(RawFilePath, kept)) {
        Tell(nedit::Translate(L"The raw file could not be written to {1}; it is kept in {2}.",
                              {nedit::FromUtf8(kept), nedit::FromUtf8(RawFilePath)}));
    }
    Reduce();
    manager->ClosePort();
    manager->DeleteDLL();
    return 1;
}

int UInstrumentCommands::GiveUp() {
    UDeviceManager* manager = Doc.GetDeviceManager();
    manager->Abort();
    manager->ClosePort();
    manager->DeleteDLL();
    return 0;
}

void UInstrumentCommands::StopDownload() {
    if (!DownloadActive) return;
    View.BlockMouse(false);
    DownloadActive = false;
    if (UDeviceManager* manager = Doc.GetDeviceManager()) manager->DeleteDLL();
    AckNak = false;
}

void UInstrumentCommands::OnAbortProcess() {
    Doc.SetAbortProcess(true);
}

void UInstrumentCommands::OnCancelButtonClicked() {
    Doc.SetAbortProcess(true);
    DownloadActive = false;
    StopDownload();
    GiveUp();
}

int UInstrumentCommands::SaveRawFile() {
    if (!SaveRaw || Host == nullptr) return 0;
    nedit::UFileDialog file(nedit::UFileDialog::Mode::Save,
                            nedit::Format(L"Strandix Raw Data File(*.%s)|*.%s|All Files(*.*)|*.*||",
                                          DeviceFileExt, DeviceFileExt));
    file.DefaultExt = DeviceFileExt;
    file.OverwritePrompt = true;
    file.InitialDir = nedit::GetInitialOpenDir(kDirectoryKey);
    if (Host->Run(file) != nedit::mb::IdOk) return 0;
    nedit::SetLastOpenDir(kDirectoryKey, file.PathName);
    return nedit::CopyRawFile(RawFilePath, file.PathName) ? 1 : 0;
}
