#pragma once

#include "Value.h"

#include <chrono>
#include <memory>
#include <string>

namespace orvex {

// Reads the log messages of a capture file in order.
class CaptureReader {
public:
    enum class Status {
        message, // message() and time() describe it
        end,
        broken, // the file cannot be read further; error() says why. Earlier messages remain valid.
    };

    // Opens a pcap or DLF file, told apart by the first bytes and possibly compressed with gzip or xz. Never
    // null: if the file is neither, or cannot be opened, the first next() reports it.
    static std::unique_ptr<CaptureReader> open(const std::string& path);
    // The same from standard input, which may be a pipe.
    static std::unique_ptr<CaptureReader> openStandardInput();

    virtual ~CaptureReader() = default;
    CaptureReader(const CaptureReader&) = delete;
    CaptureReader& operator=(const CaptureReader&) = delete;

    virtual Status next() = 0;
    // What was skipped so far, in words for the user; empty if nothing was.
    virtual std::string omissions() const = 0;

    // Valid until the next call of next().
    ByteView message() const { return _message; }
    // Time of capture; 0 if the file does not tell.
    std::chrono::microseconds time() const { return _time; }
    // One line that includes the path.
    const std::string& error() const { return _error; }

protected:
    explicit CaptureReader(std::string path)
        : _path(std::move(path))
    {
    }

    Status yield(ByteView message, std::chrono::microseconds time)
    {
        _message = message;
        _time = time;
        return Status::message;
    }
    Status fail(const std::string& reason)
    {
        _error = _path + ": " + reason;
        return Status::broken;
    }
    // Takes over another reader's error.
    void failAs(const CaptureReader& other) { _error = other._error; }

private:
    std::string _path;
    ByteView _message;
    std::chrono::microseconds _time{};
    std::string _error;
};

} // namespace orvex
