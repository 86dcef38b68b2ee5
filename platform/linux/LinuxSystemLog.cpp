#include "LinuxSystemLog.h"

#include "TextFormat.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string_view>
#include <utility>

#include <syslog.h>

namespace orvex {

namespace {
using namespace std::chrono_literals;

// How long the thread lets lines gather after the first, and how many end the wait.
constexpr auto kMoment = 1ms;
constexpr std::size_t kManyLines = QueuedSystemLog::kMostLines / 4;

constexpr std::size_t kMostPending = std::size_t{64} << 10; // bytes, for a file

void writeToStandardError(const QueuedSystemLog::Lines& lines)
{
    std::string text;
    for (const auto& line : lines)
        appendLogLine(text, line.priority, line.text);
    std::fwrite(text.data(), 1, text.size(), stderr);
    std::fflush(stderr);
}

void writeToSyslog(const QueuedSystemLog::Lines& lines)
{
    constexpr std::size_t kLongest = std::numeric_limits<int>::max();
    for (const auto& [priority, text] : lines) {
        const int value = static_cast<int>(priority);
        const int length = static_cast<int>(std::min(text.size(), kLongest));
        // Bits beyond a severity would name a facility and leave severity 0, an emergency, which daemons
        // print on every terminal.
        if (value > LOG_PRIMASK)
            syslog(LOG_ERR, "<%d>%.*s", value, length, text.data());
        else
            syslog(value, "%.*s", length, text.data());
    }
}
} // namespace

void appendLogLine(std::string& text, Priority priority, std::string_view line)
{
    text += '<';
    text += std::to_string(static_cast<int>(priority));
    text += '>';
    text += line;
    if (!line.ends_with('\n'))
        text += '\n';
}

std::unique_ptr<SystemLog> makeLinuxSystemLog(const std::string& programName)
{
    const char* destination = std::getenv("ORVEX_LOG");
    if (destination && std::string_view(destination) == "stderr")
        return std::make_unique<QueuedSystemLog>(writeToStandardError);
    static std::string name; // the C library keeps the pointer
    name = programName;
    openlog(name.c_str(), LOG_PID, LOG_USER);
    return std::make_unique<QueuedSystemLog>(writeToSyslog);
}

void QueuedSystemLog::Batch::append(Priority priority, std::string_view line)
{
    text += line;
    entries.push_back({priority, line.size()});
}

void QueuedSystemLog::Batch::clear()
{
    text.clear();
    entries.clear();
}

QueuedSystemLog::Lines QueuedSystemLog::Batch::lines() const
{
    Lines result;
    result.reserve(entries.size());
    std::size_t start = 0;
    for (const auto& [priority, length] : entries) {
        result.push_back({priority, std::string_view(text).substr(start, length)});
        start += length;
    }
    return result;
}

QueuedSystemLog::QueuedSystemLog(std::function<void(const Lines&)> writer)
    : _writer(std::move(writer))
{
    // The thread inherits a mask that blocks every signal.
    sigset_t all{};
    sigset_t before{};
    sigfillset(&all);
    pthread_sigmask(SIG_SETMASK, &all, &before);
    _thread = std::thread([this] { run(); });
    pthread_sigmask(SIG_SETMASK, &before, nullptr);
}

QueuedSystemLog::~QueuedSystemLog()
{
    {
        const std::lock_guard lock(_mutex);
        _isEnding = true;
    }
    _queued.notify_one();
    _thread.join();
}

void QueuedSystemLog::write(Priority priority, std::string_view line)
{
    std::size_t count = 0;
    {
        const std::lock_guard lock(_mutex);
        if (_queue.entries.size() >= kMostLines || _queue.text.size() + line.size() > kMostBytes) {
            ++_dropped;
            return;
        }
        _queue.append(priority, line);
        count = _queue.entries.size();
    }
    if (count == 1 || count == kManyLines)
        _queued.notify_one();
}

void QueuedSystemLog::flush()
{
    if (std::this_thread::get_id() == _thread.get_id())
        return; // the process is ending from inside the writer
    std::unique_lock lock(_mutex);
    ++_flushes;
    _queued.notify_one();
    _written.wait(lock, [this] { return _queue.entries.empty() && _dropped == 0 && !_isWriting; });
    --_flushes;
}

void QueuedSystemLog::run()
{
    Batch batch; // takes turns with the queue, so that both keep their storage
    std::unique_lock lock(_mutex);
    for (;;) {
        const auto isIdle = [this] { return _queue.entries.empty() && _dropped == 0; };
        _queued.wait(lock, [&] { return _isEnding || !isIdle(); });
        if (isIdle())
            return;
        _queued.wait_for(
            lock, kMoment, [this] { return isHurried() || _queue.entries.size() >= kManyLines; });
        std::swap(batch, _queue);
        if (const std::size_t dropped = std::exchange(_dropped, 0); dropped > 0)
            batch.append(Priority::warning, text("%zu log lines were dropped", dropped));
        _isWriting = true;
        lock.unlock();
        _writer(batch.lines());
        batch.clear();
        lock.lock();
        _isWriting = false;
        _written.notify_all();
    }
}

FileSystemLog::FileSystemLog(const std::string& path)
    : _path(path)
{
    auto [file, error] = openOutputFile(path);
    _file = std::move(file);
    if (!_file)
        _error = path + ": " + error;
}

FileSystemLog::~FileSystemLog()
{
    if (_file)
        writePending();
}

void FileSystemLog::write(Priority priority, std::string_view line)
{
    if (!_file)
        return;
    appendLogLine(_pending, priority, line);
    if (_pending.size() >= kMostPending)
        writePending();
}

void FileSystemLog::flush()
{
    if (!_file)
        return;
    writePending();
    if (std::fflush(_file.get()) != 0)
        fail();
}

void FileSystemLog::writePending()
{
    if (std::fwrite(_pending.data(), 1, _pending.size(), _file.get()) != _pending.size())
        fail();
    _pending.clear();
}

void FileSystemLog::fail()
{
    if (_error.empty())
        _error = _path + ": " + std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
}

} // namespace orvex
