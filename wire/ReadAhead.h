#pragma once

#include "CaptureReader.h"

#include <condition_variable>
#include <mutex>
#include <thread>
#include <vector>

namespace orvex {

// Reads a capture in a thread of its own, some hundred KB ahead, so that decoding does not wait for the file.
// Returns what the wrapped reader returns.
class ReadAhead final : public CaptureReader {
public:
    explicit ReadAhead(std::unique_ptr<CaptureReader> reader);
    ~ReadAhead() override;
    ReadAhead(const ReadAhead&) = delete;
    ReadAhead& operator=(const ReadAhead&) = delete;

    Status next() override;
    // Of the whole capture, after next() has reached its end; nothing before.
    std::string omissions() const override { return _omissions; }

private:
    // Messages back to back, and whether the end follows.
    struct Batch {
        struct Entry {
            std::size_t length;
            std::chrono::microseconds time;
        };

        void clear();

        Bytes bytes;
        std::vector<Entry> entries;
        Status following = Status::message;
    };

    void read();
    void takeBatch();

    std::unique_ptr<CaptureReader> _reader; // the thread's until it has ended
    Batch _batch;                           // the caller's
    std::size_t _next = 0;                  // index of its next entry
    std::size_t _offset = 0;                // of its next message
    std::string _omissions;

    std::mutex _mutex;
    std::condition_variable _changed;
    Batch _read; // ready for the caller
    bool _isRead = false;
    bool _isLeft = false; // the caller is gone
    std::thread _thread;
};

} // namespace orvex
