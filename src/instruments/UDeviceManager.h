#pragma once
// The driver manager: the instruments' drivers, the serial port and the transfer that runs
// through them. A document owns one. Its operations are the driver contract the import and
// the download have always been written against; see the table of each below.
//
// A transfer: LoadDLL(name) loads the driver; Import(file, mode), or OpenPort(port) and
// Download(rawPath, mode), start it; the caller then polls GetEOF, DataAvailable and GetData
// until the source has ended, asks GetTimeOut when no record has come for a while, and ends
// with Abort, ClosePort and DeleteDLL, all of which may be called again without harm.
//
// Decisions:
// - The manager reads the file or the port and hands the bytes to the driver; the driver
//   only translates. What the instrument sends is written to the raw file as it comes, so
//   the raw file holds everything even when the driver could read none of it.
// - DataAvailable waits for the port up to 50 ms when nothing is waiting, so a polling loop
//   neither spins nor stops answering.
// - GetEOF is set once the source has ended and every record has been taken: the last
//   records a driver held back come through GetData like the others, and GetDataRecord
//   gives a record only if one is still waiting.
// - The second argument of Download carries the import mode, as Import's does.
// - Failures name their cause in GetLastError(); what the driver says about the data (a
//   file of another format, blocks it could not read) is kept for TakeMessages().

#include <chrono>
#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "instruments/DriverCatalogue.h"
#include "platform/serial/SerialPort.h"

namespace nedit {
class DialogHost;
}

class UDeviceManager {
  public:
    /// A record and its terminator: no record is longer than 255 characters.
    static constexpr std::size_t kLineBuffer = 256;
    static constexpr std::chrono::milliseconds kDefaultTimeOutPeriod{10000};
    static constexpr int kPollMilliseconds = 50;

    /// `profileText` is the profile's "Survey Code Control" entry, kept and passed on unread.
    /// Drivers come from DriverCatalogue::DefaultDirectory(), tried on first use.
    UDeviceManager(const std::wstring& profileText, int, bool);
    /// Drivers from `directory`.
    UDeviceManager(const std::wstring& profileText, int, bool, std::string directory);
    ~UDeviceManager();
    UDeviceManager(const UDeviceManager&) = delete;
    UDeviceManager& operator=(const UDeviceManager&) = delete;

    // ---- The drivers -------------------------------------------------------------------
    /// The instrument names, in the order of their files; gives their count.
    int GetNameList(std::vector<std::wstring>& names);
    /// One line that describes the driver; empty for a name without a driver.
    std::wstring GetDeviceDescription(const std::wstring& name);
    /// Shows name, description, extensions and file of the driver through the host.
    void ShowDeviceDetails(const std::wstring& name);
    /// The raw file extensions, comma-separated, without dots.
    std::wstring GetFileExtension(const std::wstring& name);
    /// The libraries that were refused, with why.
    const std::vector<nedit::RefusedDriver>& GetRefusedDrivers();
    const nedit::DriverCatalogue& Catalogue();

    /// Loads the driver of `name` (any case); 0, with GetLastError(), when there is none or
    /// it cannot be loaded. A driver loaded before is unloaded first.
    int LoadDLL(const std::wstring& name);
    /// Ends a running transfer and unloads the driver; 1 also when none is loaded.
    int DeleteDLL();
    /// The name of the loaded driver; empty when none.
    std::wstring GetLoadedName() const;

    // ---- The port ------------------------------------------------------------------------
    /// Opens the port ("COM1", or a device path) with its [Ports] settings; 0, with
    /// GetLastError(), when it cannot be opened or set.
    int OpenPort(const std::wstring& port);
    /// Opens the port with the values given instead of its [Ports] entry.
    int OpenPort(const std::wstring& port, const nedit::SerialSettings& settings);
    /// Closes the port; 1 also when it is not open.
    int ClosePort();
    bool IsPortOpen() const { return Port.IsOpen(); }
    /// Ready to translate a download: a driver is loaded and the port is open.
    int SetTranslateMode();

    // ---- The transfer ----------------------------------------------------------------------
    /// Starts receiving from the open port; every byte goes to `rawPath` (made or emptied)
    /// as it comes. 0 when no driver or port is ready, the raw file cannot be written or the
    /// driver does not start.
    int Download(const std::wstring& rawPath, unsigned mode);
    /// Starts translating the raw file `rawPath`. 0 when no driver is loaded, the file is
    /// not a readable regular file or the driver does not start.
    int Import(const std::wstring& rawPath, unsigned mode);
    /// Non-zero when the source has ended and every record has been taken (or after Abort).
    int GetEOF();
    /// Non-zero when a record waits; reads the source when none does.
    int DataAvailable();
    /// Takes the next record: gives its length with its terminator, 0 when there is none.
    int GetData(std::wstring& record);
    /// After the end: a record still waiting, the same way.
    int GetDataRecord(std::wstring& record);
    /// 1 when the driver counts the link as dead.
    int GetTimeOut();
    /// Stops a running transfer; what was not taken is dropped.
    void Abort();

    // ---- The upload ---------------------------------------------------------------------------
    // StartUpload, a call of UploadPoint for each point, EndUpload. The bytes the driver
    // writes go to the open port, or into `file` for the caller to write.
    /// True when the loaded driver writes points for its instrument.
    bool CanUpload() const;
    /// Starts an upload with coordinates in the linear unit of `mode`: into `*file` (emptied
    /// first) when given, else to the open port. 0, with GetLastError(), when no driver that
    /// uploads is loaded, no port is open or the driver does not start.
    int StartUpload(unsigned mode, std::string* file = nullptr);
    /// 1 sent; 0 the driver's format cannot hold the point (TakeMessages says why); -1 the
    /// link failed (GetLastError), and the upload has ended.
    int UploadPoint(const std::string& name, const std::string& code, double east, double north,
                    double height, bool hasHeight);
    /// Ends the upload: the driver sends what closes the data, and a port is waited on until
    /// all has left it. 0, with GetLastError(), when that fails.
    int EndUpload();

    // ---- Around the contract ----------------------------------------------------------------
    void SetDialogHost(nedit::DialogHost* host) { Host = host; }
    /// Acknowledgements (ACK/NAK) during the next download.
    void SetAckNak(bool ackNak) { AckNak = ackNak; }
    /// The period after which GetTimeOut is asked; the driver is told it.
    void SetTimeOutPeriod(std::chrono::milliseconds period) { TimeOutPeriod = period; }
    std::chrono::milliseconds GetTimeOutPeriod() const { return TimeOutPeriod; }
    const std::wstring& GetProfileText() const { return ProfileText; }
    /// Why the last operation failed.
    const std::wstring& GetLastError() const { return LastError; }
    /// What the driver and the link said during the transfer, for the user; emptied.
    std::vector<std::wstring> TakeMessages();
    /// True when the link closed or failed before the data ended the download.
    bool LinkLost() const { return Lost; }
    long long GetBytesReceived() const { return BytesReceived; }

  private:
    struct Loaded;
    enum class Source { None, File, Link };

    int Fail(const std::wstring& message);
    /// Reads what the source has and gives it to the driver.
    void ReadSource();
    void Feed(const unsigned char* bytes, std::size_t size);
    /// The source has ended: the driver gives what it held back and the session ends.
    void EndSession();
    void CloseFiles();

    static void OnRecord(void* context, const char* text);
    static void OnMessage(void* context, const char* text);
    static long OnSend(void* context, const unsigned char* bytes, std::size_t size);

    std::wstring ProfileText;
    std::string Directory;
    std::unique_ptr<nedit::DriverCatalogue> Drivers;
    std::unique_ptr<Loaded> Driver;
    nedit::SerialPort Port;
    nedit::DialogHost* Host = nullptr;
    bool AckNak = false;
    std::chrono::milliseconds TimeOutPeriod = kDefaultTimeOutPeriod;

    sxn_session* Session = nullptr;
    Source From = Source::None;
    int InputFile = -1;  // the raw file of an import
    int RawFile = -1;    // the raw file a download writes
    std::wstring RawPath;
    bool RawWriteFailed = false;
    bool Ended = true;
    bool Lost = false;
    std::deque<std::string> Records;
    std::vector<std::wstring> Messages;
    std::wstring LastError;
    long long BytesReceived = 0;
    std::chrono::steady_clock::time_point LastByte;
    sxn_session* Upload = nullptr;
    std::string* UploadFile = nullptr;  // where the upload goes when not to the port
    bool SendFailed = false;
};
