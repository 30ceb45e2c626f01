// The download of a document: a polling loop on the one thread of the program. It takes the
// records as the driver gives them, watches the link with the time-out and lets the user
// abort; whatever arrived stays in the list.

#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "records/NamelessCoordinates.h"

int UNeditDoc::Download(const std::wstring& rawPath, UListCtrl* list) {
    using Clock = std::chrono::steady_clock;
    UDeviceManager* manager = GetDeviceManager();
    manager->SetTimeOutPeriod(DownloadTimeOut);
    if (list == nullptr || !manager->Download(rawPath, GetImportMode())) return 0;
    AbortProcessOn = true;
    SetAbortProcess(false);
    Clock::time_point timer = Clock::now();
    bool timed_out = false;
    int row = 0;
    NamelessCoordinates coordinates;
    std::wstring record;
    for (;;) {
        if (GetAbortProcess()) {
            SetAbortProcess(false);
            manager->Abort();
            break;
        }
        if (manager->GetEOF() || timed_out) {
            if (timed_out) {
                manager->Abort();
                manager->ClosePort();
            }
            break;
        }
        // A record of the terminator alone is no record and does not count as one.
        if (manager->DataAvailable() && manager->GetData(record) > 1) {
            timer = Clock::now();
            AddTransferRecord(coordinates, record, list, row++);
        }
        // The sink pumps the window's events and hears the user's abort.
        Progress->Update(row % 100, L"Downloading");
        if (Clock::now() - timer >= DownloadTimeOut) {
            timer = Clock::now();
            timed_out = manager->GetTimeOut() == 1;
        }
    }
    AbortProcessOn = false;
    SetModified(1);
    Progress->Update(100, L"");
    UpdateAllViews();
    if (timed_out) {
        nedit::AppMessageBox(
            Host,
            nedit::Translate(
                L"Timeout has occurred. Download stopped.\n (Timeout occurs after {1} seconds.)",
                {nedit::DoubleToText(static_cast<double>(DownloadTimeOut.count()) / 1000.0)}),
            nedit::mb::Ok | nedit::mb::IconExclamation);
    }
    ShowTransferMessages();
    return 1;
}

void UNeditDoc::AbortDownProcess() {
    GetDeviceManager()->Abort();
    GetDeviceManager()->ClosePort();
}
