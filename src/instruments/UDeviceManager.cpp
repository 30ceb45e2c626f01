#include "instruments/UDeviceManager.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "instruments/UPortSetting.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/Translate.h"
#include "platform/text/WideText.h"

namespace {

constexpr std::size_t kFileChunk = 64 * 1024;
constexpr std::size_t kLinkChunk = 4096;

std::wstring SystemError() {
    return nedit::FromUtf8(std::strerror(errno));
}

}  // namespace

struct UDeviceManager::Loaded {
    const nedit::DriverInfo* info = nullptr;
    std::unique_ptr<nedit::PluginLibrary> library;
    nedit::DriverFunctions functions;
};

UDeviceManager::UDeviceManager(const std::wstring& profileText, int, bool)
    : UDeviceManager(profileText, 0, false, nedit::DriverCatalogue::DefaultDirectory()) {}

UDeviceManager::UDeviceManager(const std::wstring& profileText, int, bool, std::string directory)
    : ProfileText(profileText), Directory(std::move(directory)) {}

UDeviceManager::~UDeviceManager() {
    DeleteDLL();
    ClosePort();
}

int UDeviceManager::Fail(const std::wstring& message) {
    LastError = message;
    return 0;
}

// ---- The drivers --------------------------------------------------------------------------

const nedit::DriverCatalogue& UDeviceManager::Catalogue() {
    if (!Drivers) Drivers = std::make_unique<nedit::DriverCatalogue>(Directory);
    return *Drivers;
}

int UDeviceManager::GetNameList(std::vector<std::wstring>& names) {
    names.clear();
    for (const nedit::DriverInfo& driver : Catalogue().Drivers()) names.push_back(driver.name);
    return static_cast<int>(names.size());
}

std::wstring UDeviceManager::GetDeviceDescription(const std::wstring& name) {
    const nedit::DriverInfo* driver = Catalogue().Find(name);
    return driver != nullptr ? driver->description : std::wstring();
}

void UDeviceManager::ShowDeviceDetails(const std::wstring& name) {
    const nedit::DriverInfo* driver = Catalogue().Find(name);
    if (driver == nullptr) return;
    nedit::AppMessageBox(Host,
                         nedit::Translate(L"{1}\n{2}\nRaw file extensions: {3}\nDriver file: {4}",
                                          {driver->name, driver->description, driver->extensions,
                                           nedit::FromUtf8(driver->path)}),
                         nedit::mb::Ok | nedit::mb::IconInformation);
}

std::wstring UDeviceManager::GetFileExtension(const std::wstring& name) {
    const nedit::DriverInfo* driver = Catalogue().Find(name);
    return driver != nullptr ? driver->extensions : std::wstring();
}

const std::vector<nedit::RefusedDriver>& UDeviceManager::GetRefusedDrivers() {
    return Catalogue().Refused();
}

int UDeviceManager::LoadDLL(const std::wstring& name) {
    DeleteDLL();
    const nedit::DriverInfo* info = Catalogue().Find(name);
    if (info == nullptr) return Fail(nedit::Translate(L"There is no driver for {1}.", {name}));
    auto loaded = std::make_unique<Loaded>();
    loaded->info = info;
    std::string error;
    loaded->library = nedit::PluginLibrary::Open(info->path, error);
    if (!loaded->library || !loaded->functions.Resolve(*loaded->library, error)) {
        return Fail(nedit::Translate(L"The driver {1} cannot be loaded: {2}.",
                                     {nedit::FromUtf8(info->path), nedit::FromUtf8(error)}));
    }
    Driver = std::move(loaded);
    return 1;
}

int UDeviceManager::DeleteDLL() {
    Abort();
    if (Upload != nullptr) Driver->functions.abort(Upload);
    Upload = nullptr;
    Driver.reset();
    return 1;
}

std::wstring UDeviceManager::GetLoadedName() const {
    return Driver ? Driver->info->name : std::wstring();
}

// ---- The port ------------------------------------------------------------------------------

int UDeviceManager::OpenPort(const std::wstring& port) {
    return OpenPort(port, UPortSetting::LoadSettings(port));
}

int UDeviceManager::OpenPort(const std::wstring& port, const nedit::SerialSettings& settings) {
    if (!UPortSetting::OpenComm(port, Port) || !Port.Apply(settings)) {
        const std::wstring error = nedit::FromUtf8(Port.LastError());
        Port.Close();
        return Fail(error);
    }
    return 1;
}

int UDeviceManager::ClosePort() {
    Port.Close();
    return 1;
}

int UDeviceManager::SetTranslateMode() {
    if (!Driver) return Fail(nedit::Translate(L"No driver is loaded."));
    if (!Port.IsOpen()) return Fail(nedit::Translate(L"No port is open."));
    return 1;
}

// ---- The transfer ----------------------------------------------------------------------------

int UDeviceManager::Download(const std::wstring& rawPath, unsigned mode) {
    Abort();
    if (!SetTranslateMode()) return 0;
    RawFile = open(nedit::ToUtf8(rawPath).c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
    if (RawFile < 0) {
        return Fail(
            nedit::Translate(L"Cannot write the raw file {1}: {2}.", {rawPath, SystemError()}));
    }
    const sxn_host host{this, &OnRecord, &OnMessage, &OnSend};
    Session = Driver->functions.download(&host, mode, AckNak ? SXN_DOWNLOAD_ACKNAK : 0u);
    if (Session == nullptr) {
        CloseFiles();
        return Fail(
            nedit::Translate(L"The driver {1} did not start the download.", {Driver->info->name}));
    }
    RawPath = rawPath;
    From = Source::Link;
    Ended = false;
    Lost = false;
    RawWriteFailed = false;
    BytesReceived = 0;
    LastByte = std::chrono::steady_clock::now();
    return 1;
}

int UDeviceManager::Import(const std::wstring& rawPath, unsigned mode) {
    Abort();
    if (!Driver) return Fail(nedit::Translate(L"No driver is loaded."));
    InputFile = open(nedit::ToUtf8(rawPath).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    struct stat status {};
    if (InputFile < 0) {
        return Fail(nedit::Translate(L"Failed to open {1}: {2}.", {rawPath, SystemError()}));
    }
    if (fstat(InputFile, &status) != 0 || !S_ISREG(status.st_mode)) {
        CloseFiles();
        return Fail(nedit::Translate(L"{1} is not a file.", {rawPath}));
    }
    fcntl(InputFile, F_SETFL, 0);
    const sxn_host host{this, &OnRecord, &OnMessage, nullptr};
    Session = Driver->functions.import(&host, mode);
    if (Session == nullptr) {
        CloseFiles();
        return Fail(
            nedit::Translate(L"The driver {1} did not start the import.", {Driver->info->name}));
    }
    From = Source::File;
    Ended = false;
    Lost = false;
    BytesReceived = 0;
    return 1;
}

int UDeviceManager::GetEOF() {
    return Ended && Records.empty() ? 1 : 0;
}

int UDeviceManager::DataAvailable() {
    if (Records.empty() && !Ended) ReadSource();
    return Records.empty() ? 0 : 1;
}

int UDeviceManager::GetData(std::wstring& record) {
    record.clear();
    if (Records.empty()) return 0;
    record = nedit::FromUtf8(Records.front());
    Records.pop_front();
    if (record.size() >= kLineBuffer) record.resize(kLineBuffer - 1);
    return static_cast<int>(record.size()) + 1;
}

int UDeviceManager::GetDataRecord(std::wstring& record) {
    return GetEOF() ? 0 : GetData(record);
}

int UDeviceManager::GetTimeOut() {
    if (Session == nullptr) return 0;
    const auto idle = std::chrono::duration_cast<std::chrono::milliseconds>(
        std::chrono::steady_clock::now() - LastByte);
    return Driver->functions.timeOut(Session, static_cast<unsigned>(idle.count()),
                                     static_cast<unsigned>(TimeOutPeriod.count()));
}

void UDeviceManager::Abort() {
    if (Session != nullptr) Driver->functions.abort(Session);
    Session = nullptr;
    Records.clear();
    Ended = true;
    CloseFiles();
}

bool UDeviceManager::CanUpload() const {
    return Driver && Driver->functions.CanUpload();
}

int UDeviceManager::StartUpload(unsigned mode, std::string* file) {
    Abort();
    if (!Driver) return Fail(nedit::Translate(L"No driver is loaded."));
    if (!CanUpload()) {
        return Fail(
            nedit::Translate(L"The driver {1} cannot upload points.", {Driver->info->name}));
    }
    if (file == nullptr && !Port.IsOpen()) return Fail(nedit::Translate(L"No port is open."));
    if (Upload != nullptr) Driver->functions.abort(Upload);
    UploadFile = file;
    if (file != nullptr) file->clear();
    SendFailed = false;
    const sxn_host host{this, &OnRecord, &OnMessage, &OnSend};
    Upload = Driver->functions.upload(&host, mode);
    if (Upload == nullptr) {
        return Fail(
            nedit::Translate(L"The driver {1} did not start the upload.", {Driver->info->name}));
    }
    return 1;
}

int UDeviceManager::UploadPoint(const std::string& name, const std::string& code, double east,
                                double north, double height, bool hasHeight) {
    if (Upload == nullptr) return -1;
    const int sent = Driver->functions.uploadPoint(Upload, name.c_str(), code.c_str(), east, north,
                                                   height, hasHeight ? 1 : 0);
    if (sent >= 0 && !SendFailed) return sent;
    Driver->functions.abort(Upload);
    Upload = nullptr;
    if (!SendFailed) Fail(nedit::Translate(L"The driver {1} failed.", {Driver->info->name}));
    return -1;
}

int UDeviceManager::EndUpload() {
    if (Upload == nullptr) return 0;
    Driver->functions.finish(Upload);
    Upload = nullptr;
    if (SendFailed) return 0;
    const auto wait = static_cast<int>(TimeOutPeriod.count());
    if (UploadFile == nullptr && !Port.Drain(wait)) return Fail(nedit::FromUtf8(Port.LastError()));
    return 1;
}

std::vector<std::wstring> UDeviceManager::TakeMessages() {
    std::vector<std::wstring> taken;
    taken.swap(Messages);
    return taken;
}

void UDeviceManager::ReadSource() {
    unsigned char bytes[kFileChunk];
    if (From == Source::File) {
        const ssize_t count = read(InputFile, bytes, sizeof bytes);
        if (count > 0) {
            Feed(bytes, static_cast<std::size_t>(count));
            return;
        }
        if (count < 0 && errno == EINTR) return;
        if (count < 0)
            Messages.push_back(
                nedit::Translate(L"Reading the raw file failed: {1}.", {SystemError()}));
        EndSession();
        return;
    }
    const long count = Port.Read(bytes, kLinkChunk, kPollMilliseconds);
    if (count > 0) {
        LastByte = std::chrono::steady_clock::now();
        if (RawFile >= 0 && write(RawFile, bytes, static_cast<std::size_t>(count)) != count &&
            !RawWriteFailed) {
            RawWriteFailed = true;
            Messages.push_back(nedit::Translate(
                L"Writing the raw file {1} failed: {2}; the download went on without it.",
                {RawPath, SystemError()}));
        }
        Feed(bytes, static_cast<std::size_t>(count));
    } else if (count < 0) {
        Lost = true;
        Messages.push_back(nedit::FromUtf8(Port.LastError()));
        EndSession();
    }
}

void UDeviceManager::Feed(const unsigned char* bytes, std::size_t size) {
    BytesReceived += static_cast<long long>(size);
    if (Driver->functions.translate(Session, bytes, size) == SXN_END) EndSession();
}

void UDeviceManager::EndSession() {
    if (Session != nullptr) Driver->functions.finish(Session);
    Session = nullptr;
    Ended = true;
    CloseFiles();
}

void UDeviceManager::CloseFiles() {
    if (InputFile >= 0) close(InputFile);
    if (RawFile >= 0) close(RawFile);
    InputFile = -1;
    RawFile = -1;
}

void UDeviceManager::OnRecord(void* context, const char* text) {
    static_cast<UDeviceManager*>(context)->Records.emplace_back(text);
}

void UDeviceManager::OnMessage(void* context, const char* text) {
    static_cast<UDeviceManager*>(context)->Messages.push_back(nedit::FromUtf8(text));
}

long UDeviceManager::OnSend(void* context, const unsigned char* bytes, std::size_t size) {
    auto* manager = static_cast<UDeviceManager*>(context);
    if (manager->Upload == nullptr) return manager->Port.Write(bytes, size);
    if (manager->UploadFile != nullptr) {
        manager->UploadFile->append(reinterpret_cast<const char*>(bytes), size);
        return static_cast<long>(size);
    }
    const long sent =
        manager->Port.WriteAll(bytes, size, static_cast<int>(manager->TimeOutPeriod.count()));
    if (sent < 0 && !manager->SendFailed) {
        manager->SendFailed = true;
        manager->Fail(nedit::FromUtf8(manager->Port.LastError()));
    }
    return sent;
}
