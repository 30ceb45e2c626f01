#include "platform/storage/UStreamFile.h"

#include <algorithm>
#include <cstring>

#include "platform/storage/UStorage.h"
#include "platform/text/WideText.h"

UStreamFile::~UStreamFile() {
    Abort();
}

int UStreamFile::CreateStream(UStorage& storage, const std::wstring& name, unsigned /*mode*/) {
    Abort();
    if (!storage.CanWrite() || name.empty()) return 0;
    storage_ = &storage;
    name_ = name;
    writable_ = true;
    dirty_ = true;  // an empty stream is still a stream: closing it must store it
    return 1;
}

int UStreamFile::OpenStream(UStorage& storage, const std::wstring& name, unsigned mode) {
    Abort();
    if (!storage.ReadStream(name, data_)) {
        data_.clear();
        return 0;
    }
    storage_ = &storage;
    name_ = name;
    writable_ = (mode & (nedit::stgm::Write | nedit::stgm::ReadWrite)) != 0 && storage.CanWrite();
    return 1;
}

int UStreamFile::ReadString(std::wstring& line) {
    line.clear();
    std::string_view bytes;
    if (!ReadLine(bytes)) return 0;
    line = nedit::DecodeTextLine(bytes);
    return 1;
}

int UStreamFile::ReadLine(std::string_view& bytes) {
    bytes = {};
    if (!IsOpen() || position_ >= data_.size()) return 0;
    const std::size_t end = data_.find('\n', position_);
    const std::size_t stop = end == std::string::npos ? data_.size() : end;
    std::size_t length = stop - position_;
    if (length > 0 && data_[position_ + length - 1] == '\r') --length;
    bytes = std::string_view(data_).substr(position_, length);
    position_ = end == std::string::npos ? data_.size() : end + 1;
    return 1;
}

void UStreamFile::WriteString(const std::wstring& line) {
    std::string bytes = nedit::ToUtf8(line);
    bytes += '\n';
    Write(bytes.data(), bytes.size());
}

std::size_t UStreamFile::Read(void* buffer, std::size_t count) {
    if (!IsOpen() || position_ >= data_.size()) return 0;
    const std::size_t n = std::min(count, data_.size() - position_);
    std::memcpy(buffer, data_.data() + position_, n);
    position_ += n;
    return n;
}

void UStreamFile::Write(const void* data, std::size_t count) {
    if (!IsOpen() || !writable_) return;
    const char* bytes = static_cast<const char*>(data);
    const std::size_t overlap = std::min(count, data_.size() - position_);
    data_.replace(position_, overlap, bytes, count);
    position_ += count;
    dirty_ = true;
}

void UStreamFile::Close() {
    if (!IsOpen()) return;
    UStorage* storage = storage_;
    const bool dirty = dirty_ && writable_;
    storage_ = nullptr;
    if (dirty) {
        std::string bytes;
        bytes.swap(data_);
        position_ = 0;
        dirty_ = false;
        storage->WriteStream(name_, std::move(bytes));
    }
    data_.clear();
    position_ = 0;
}

void UStreamFile::Abort() {
    storage_ = nullptr;
    data_.clear();
    position_ = 0;
    writable_ = false;
    dirty_ = false;
}
