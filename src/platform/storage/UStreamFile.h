#pragma once
// One named stream of a storage, read and written as a whole in memory: streams hold the
// records of a raw-data document and its settings, which are small. Text goes out as UTF-8
// lines ending in a line feed, and comes in as a file's lines do: a line that is not valid
// UTF-8 (a neutral file of an older program, stored as it was) is read as Latin-1.
//
// What is written reaches the storage only through Close. Abort, or destroying an open
// stream without Close, discards the writes, so a failure in the middle of writing never
// leaves half a stream behind.

#include <cstddef>
#include <string>
#include <string_view>

class UStorage;

class UStreamFile {
  public:
    UStreamFile() = default;
    ~UStreamFile();
    UStreamFile(const UStreamFile&) = delete;
    UStreamFile& operator=(const UStreamFile&) = delete;

    /// Starts a new, empty stream `name` in `storage`, replacing any of that name when closed.
    /// 0 when the storage is not open or cannot be written, or the name is empty.
    int CreateStream(UStorage& storage, const std::wstring& name, unsigned mode);
    /// Opens the stream for reading, and for writing when `mode` asks for it; 0 when there is
    /// no such stream.
    int OpenStream(UStorage& storage, const std::wstring& name, unsigned mode);

    /// The next line without its line end (LF or CR LF); 0 at the end of the stream.
    int ReadString(std::wstring& line);
    /// The same line's bytes as they are stored, good until the stream changes.
    int ReadLine(std::string_view& bytes);
    /// Writes `line` and a line feed at the current position.
    void WriteString(const std::wstring& line);
    /// Up to `count` bytes from the current position; gives how many were read.
    std::size_t Read(void* buffer, std::size_t count);
    void Write(const void* data, std::size_t count);
    /// Room for `bytes` bytes to be written without the stream growing.
    void Reserve(std::size_t bytes) { data_.reserve(bytes); }

    std::size_t GetLength() const { return data_.size(); }
    std::size_t GetPosition() const { return position_; }
    void SeekToBegin() { position_ = 0; }

    /// Hands the written bytes to the storage and closes the stream. Throws nedit::JobError
    /// when the database fails; the stream is closed all the same.
    void Close();
    /// Closes the stream and forgets what was written.
    void Abort();
    bool IsOpen() const { return storage_ != nullptr; }

  private:
    UStorage* storage_ = nullptr;
    std::wstring name_;
    std::string data_;
    std::size_t position_ = 0;
    bool writable_ = false;
    bool dirty_ = false;
};
