#pragma once

#include "Value.h"

#include <chrono>
#include <memory>
#include <string>

namespace orvex {

// The log messages of a capture file, in their order.
class CaptureReader {
public:
    enum class Status {
        message, // message() and time() are those of the next one
        end,     // there are no more
        broken,  // the file cannot be read (on); error() says why. What came before stays good.
    };

    // A pcap or a DLF file, told apart by their first bytes. Never null: of a file that is neither, or cannot
    // be opened, the first next() says so.
    static std::unique_ptr<CaptureReader> open(const std::string& path);

    virtual ~CaptureReader() = default;
    CaptureReader(const CaptureReader&) = delete;
    CaptureReader& operator=(const CaptureReader&) = delete;

    virtual Status next() = 0;
    // What was left out so far, in words for the user; empty when nothing was.
    virtual std::string omissions() const = 0;

    // Holds until the next call of next().
    ByteView message() const { return _message; }
    // When it was captured, as far as the capture knows; 0 when it does not.
    std::chrono::microseconds time() const { return _time; }
    // One line with the file's path.
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
    // For the reason of another.
    void failAs(const CaptureReader& other) { _error = other._error; }

private:
    std::string _path;
    ByteView _message;
    std::chrono::microseconds _time{};
    std::string _error;
};

} // namespace orvex
