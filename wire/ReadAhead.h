#pragma once

#include "CaptureReader.h"

#include <condition_variable>
#include <mutex>
#include <thread>
#include <vector>

namespace orvex {

// Reads a capture in a thread of its own, some hundred KB ahead of whoever takes its messages, so that nobody
// waits for the file while there is something to decode. Messages and end are those of the reader it is
// given.
class ReadAhead final : public CaptureReader {
public:
    explicit ReadAhead(std::unique_ptr<CaptureReader> reader);
    ~ReadAhead() override;
    ReadAhead(const ReadAhead&) = delete;
    ReadAhead& operator=(const ReadAhead&) = delete;

    Status next() override;
    // Of the whole capture, once next() has come to its end; nothing before.
    std::string omissions() const override { return _omissions; }

private:
    // Messages back to back, and what follows them: more messages, or the end.
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

    std::unique_ptr<CaptureReader> _reader; // the thread's alone until that has ended
    Batch _batch;                           // the taker's
    std::size_t _next = 0;                  // in its entries
    std::size_t _offset = 0;                // in its bytes
    std::string _omissions;

    std::mutex _mutex;
    std::condition_variable _changed;
    Batch _read; // waits for the taker
    bool _isRead = false;
    bool _isLeft = false; // nobody takes any more
    std::thread _thread;
};

} // namespace orvex
