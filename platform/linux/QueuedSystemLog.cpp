#include "QueuedSystemLog.h"

#include "TextFormat.h"

#include <chrono>
#include <csignal>
#include <utility>

namespace orvex {

namespace {
using namespace std::chrono_literals;

// How long the thread lets lines gather once the first has come, and how many of them it waits for at most.
constexpr auto kMoment = 1ms;
constexpr std::size_t kManyLines = QueuedSystemLog::kMostLines / 4;
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
    // Signals are the business of the program's own threads.
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

} // namespace orvex
