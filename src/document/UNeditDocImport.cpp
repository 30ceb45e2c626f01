// The raw file import of a document, and what the import and the download share.

#include "document/ProfileStore.h"
#include "document/UListCtrl.h"
#include "document/UNeditDoc.h"
#include "platform/messages/DialogHost.h"
#include "records/NamelessCoordinates.h"
#include "sxnedit_driver.h"

UDeviceManager* UNeditDoc::GetDeviceManager() {
    if (!DeviceManager) {
        DeviceManager = std::make_unique<UDeviceManager>(
            nedit::ProfileStore().ReadSurveyCodeControl(), 0, false);
        DeviceManager->SetDialogHost(Host);
    }
    return DeviceManager.get();
}

void UNeditDoc::SetDeviceManager(std::unique_ptr<UDeviceManager> manager) {
    DeviceManager = std::move(manager);
    if (DeviceManager) DeviceManager->SetDialogHost(Host);
}

unsigned UNeditDoc::GetImportMode() const {
    if (ImportMode != 0) return ImportMode;
    unsigned mode = SXN_MODE_DMS;
    if (Settings.GetAngleUnit() == nedit::AngleUnit::Degrees) mode = SXN_MODE_DEGREES;
    if (Settings.GetAngleUnit() == nedit::AngleUnit::Gons) mode = SXN_MODE_GONS;
    switch (Settings.GetLengthUnit()) {
        case nedit::LengthUnit::Feet:
            return mode | SXN_MODE_FEET;
        case nedit::LengthUnit::USFeet:
            return mode | SXN_MODE_US_FEET;
        default:
            return mode | SXN_MODE_METRES;
    }
}

int UNeditDoc::Import(const std::wstring& path, UListCtrl* list) {
    UDeviceManager* manager = GetDeviceManager();
    if (list == nullptr || !manager->Import(path, GetImportMode())) return 0;
    NamelessCoordinates coordinates;
    std::wstring record;
    int row = 0;
    while (!manager->GetEOF()) {
        if (GetAbortProcess()) {
            manager->Abort();
            break;
        }
        if (manager->DataAvailable() && manager->GetData(record) > 0 && !record.empty()) {
            AddTransferRecord(coordinates, record, list, row++);
            Progress->Update(row / 25 % 100, L"Importing Data");
        }
    }
    // A record the driver still holds goes in as it is.
    if (manager->GetDataRecord(record) > 0 && !record.empty())
        list->AddRecord(list->GetItemCount(), record);
    ShowTransferMessages();
    Progress->Update(100, L"");
    SetModified(1);
    UpdateAllViews();
    return 1;
}

void UNeditDoc::AddTransferRecord(NamelessCoordinates& coordinates, const std::wstring& record,
                                  UListCtrl* list, int row) {
    list->AddRecord(row, coordinates.Complete(*this, GetRecordType(record), record));
}

void UNeditDoc::ShowTransferMessages() {
    for (const std::wstring& message : GetDeviceManager()->TakeMessages()) {
        nedit::AppMessageBox(Host, message, nedit::mb::Ok | nedit::mb::IconExclamation);
    }
}
