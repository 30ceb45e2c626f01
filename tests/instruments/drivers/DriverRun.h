#pragma once
// Runs one driver of the build through its C interface, as the driver manager does, and
// collects what it gives back. Bytes can be fed whole or a few at a time, so that tests see
// that a record split across reads comes out the same.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "instruments/DriverCatalogue.h"

/// The bytes of the raw file `name` of tests/data/raw.
inline std::string RawFixture(const std::string& name) {
    std::ifstream in(std::string(SXNEDIT_TEST_DATA) + "/raw/" + name, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

/// How many of `records` begin with `start`.
inline long CountOf(const std::vector<std::string>& records, const std::string& start) {
    return std::count_if(records.begin(), records.end(),
                         [&](const std::string& record) { return record.rfind(start, 0) == 0; });
}

/// The first of `records` that begins with `start`, or empty.
inline std::string FirstOf(const std::vector<std::string>& records, const std::string& start) {
    const auto found = std::find_if(records.begin(), records.end(), [&](const std::string& record) {
        return record.rfind(start, 0) == 0;
    });
    return found == records.end() ? std::string() : *found;
}

class DriverRun {
  public:
    struct Result {
        std::vector<std::string> records;
        std::vector<std::string> messages;
        std::string sent;    // bytes the driver sent to the instrument
        bool ended = false;  // the data ended the transfer
    };

    /// The driver `file` ("gsi.so") of the build.
    explicit DriverRun(const std::string& file) {
        std::string error;
        library_ =
            nedit::PluginLibrary::Open(std::string(SXNEDIT_TEST_DRIVER_DIR) + "/" + file, error);
        EXPECT_TRUE(library_ && functions_.Resolve(*library_, error)) << error;
    }

    /// A file import of `bytes`, fed `chunk` bytes at a time.
    Result Import(std::string_view bytes, unsigned mode, std::size_t chunk = 1 << 20) {
        return Run(bytes, chunk,
                   [&](const sxn_host* host) { return functions_.import(host, mode); });
    }

    /// A download of `bytes`; the driver may answer through the host's send.
    Result Download(std::string_view bytes, unsigned mode, unsigned flags,
                    std::size_t chunk = 1 << 20) {
        return Run(bytes, chunk,
                   [&](const sxn_host* host) { return functions_.download(host, mode, flags); });
    }

    const nedit::DriverFunctions& Functions() const { return functions_; }

  private:
    template <class StartSession>
    Result Run(std::string_view bytes, std::size_t chunk, StartSession start) {
        Result result;
        const sxn_host host{&result, &OnRecord, &OnMessage, &OnSend};
        sxn_session* session = start(&host);
        EXPECT_NE(session, nullptr);
        if (session == nullptr) return result;
        for (std::size_t at = 0; at < bytes.size() && !result.ended; at += chunk) {
            const std::string_view part = bytes.substr(at, chunk);
            result.ended =
                functions_.translate(session, reinterpret_cast<const unsigned char*>(part.data()),
                                     part.size()) == SXN_END;
        }
        functions_.finish(session);
        return result;
    }

    static void OnRecord(void* context, const char* text) {
        static_cast<Result*>(context)->records.emplace_back(text);
    }
    static void OnMessage(void* context, const char* text) {
        static_cast<Result*>(context)->messages.emplace_back(text);
    }
    static long OnSend(void* context, const unsigned char* bytes, std::size_t size) {
        static_cast<Result*>(context)->sent.append(reinterpret_cast<const char*>(bytes), size);
        return static_cast<long>(size);
    }

    std::unique_ptr<nedit::PluginLibrary> library_;
    nedit::DriverFunctions functions_;
};
