#pragma once

#include "OutputFile.h"
#include "SystemLog.h"

#include <condition_variable>
#include <functional>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace orvex {

// The log of the system: syslog(3) under the program's name, or standard error when $ORVEX_LOG is "stderr".
// syslog does not know every priority; an unknown one becomes an error whose text begins with the value, such
// as "<16>". Standard error gets lines of the form "<PRIORITY>TEXT". The log is a QueuedSystemLog.
std::unique_ptr<SystemLog> makeLinuxSystemLog(const std::string& programName);

// Appends the line as "<PRIORITY>TEXT", with a line break unless the text ends in one.
void appendLogLine(std::string& text, Priority priority, std::string_view line);

// A log with a thread that writes, fed through a bounded queue, so that callers never wait for the
// destination. When lines come faster than the thread can write them, the excess is dropped and a line says
// how many. Any thread may log.
//
// A caller pays for little more than copying the line: the queue is one text that keeps its storage, and
// lines in quick succession wake the thread once.
class QueuedSystemLog final : public SystemLog {
public:
    struct Line {
        Priority priority = Priority::notice;
        std::string_view text;
    };
    using Lines = std::vector<Line>;

    // What the queue holds; lines beyond are dropped.
    static constexpr std::size_t kMostLines = 8192;
    static constexpr std::size_t kMostBytes = std::size_t{8} << 20;

    // The writer is called on the log's thread, with lines in order. The thread takes no signals: their
    // handlers run on the program's own threads.
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
    std::condition_variable _queued;  // wakes the thread
    std::condition_variable _written; // wakes callers of flush()
    Batch _queue;
    std::size_t _dropped = 0; // since the thread last took the queue
    int _flushes = 0;         // in progress
    bool _isWriting = false;
    bool _isEnding = false;
    std::thread _thread;
};

// A log that keeps every line, in a file of lines of the form "<PRIORITY>TEXT". Buffered, and written by the
// calling thread.
class FileSystemLog final : public SystemLog {
public:
    // Replaces an existing file.
    explicit FileSystemLog(const std::string& path);
    ~FileSystemLog() override;
    FileSystemLog(const FileSystemLog&) = delete;
    FileSystemLog& operator=(const FileSystemLog&) = delete;

    void write(Priority priority, std::string_view line) override;
    void flush() override;

    // Why the file could not be opened or written; empty while all is well. Complete after flush().
    const std::string& error() const { return _error; }

private:
    void writePending();
    void fail();

    std::string _path;
    FilePointer _file;
    std::string _error;
    std::string _pending; // lines to be written; keeps its storage
};

} // namespace orvex
