#pragma once

#include "SystemLog.h"

#include <condition_variable>
#include <functional>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace orvex {

// Appends the line as "<PRIORITY>TEXT" and a line break, unless the text ends in one.
void appendLogLine(std::string& text, Priority priority, std::string_view line);

// A log that is written by a thread of its own through a bounded queue. It may be written to from any thread.
//
// Whoever logs pays for little more than a copy of the line: the queue is one text that keeps its storage,
// and the thread is woken once for all lines of a moment, not for each.
class QueuedSystemLog final : public SystemLog {
public:
    struct Line {
        Priority priority = Priority::notice;
        std::string_view text;
    };
    using Lines = std::vector<Line>;

    // What the queue holds at most; lines beyond are dropped and counted.
    static constexpr std::size_t kMostLines = 8192;
    static constexpr std::size_t kMostBytes = std::size_t{8} << 20;

    // The writer is called on the log's thread with lines in order.
    explicit QueuedSystemLog(std::function<void(const Lines&)> writer);
    // Writes what is queued.
    ~QueuedSystemLog() override;
    QueuedSystemLog(const QueuedSystemLog&) = delete;
    QueuedSystemLog& operator=(const QueuedSystemLog&) = delete;

    void write(Priority priority, std::string_view line) override;
    void flush() override;

private:
    // Lines back to back.
    struct Batch {
        struct Entry {
            Priority priority;
            std::size_t length;
        };

        void append(Priority priority, std::string_view line);
        void clear();
        Lines lines() const;

        std::string text;
        std::vector<Entry> entries;
    };

    void run();
    bool isHurried() const { return _isEnding || _flushes > 0; }

    std::function<void(const Lines&)> _writer;
    std::mutex _mutex;
    std::condition_variable _queued;  // something for the thread
    std::condition_variable _written; // something for those who flush
    Batch _queue;
    std::size_t _dropped = 0; // since the queue was last taken
    int _flushes = 0;         // that are waiting
    bool _isWriting = false;
    bool _isEnding = false;
    std::thread _thread;
};

} // namespace orvex
