#include "QueuedSystemLog.h"

#include "TextFormat.h"

#include <csignal>
#include <utility>

namespace orvex {

void appendLogLine(std::string& text, Priority priority, std::string_view line)
{
    text += '<';
    text += std::to_string(static_cast<int>(priority));
    text += '>';
    text += line;
    if (!line.ends_with('\n'))
        text += '\n';
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
    _changed.notify_all();
    _thread.join();
}

void QueuedSystemLog::write(Priority priority, std::string_view line)
{
    {
        const std::lock_guard lock(_mutex);
        if (_queue.size() >= kMostLines || _queuedBytes + line.size() > kMostBytes) {
            ++_dropped;
            return;
        }
        _queuedBytes += line.size();
        _queue.push_back({priority, std::string(line)});
        if (_queue.size() > 1)
            return; // the thread has been told
    }
    _changed.notify_all();
}

void QueuedSystemLog::flush()
{
    if (std::this_thread::get_id() == _thread.get_id())
        return; // the process is ending from inside the writer
    std::unique_lock lock(_mutex);
    _changed.wait(lock, [this] { return _queue.empty() && _dropped == 0 && !_isWriting; });
}

void QueuedSystemLog::run()
{
    std::unique_lock lock(_mutex);
    for (;;) {
        _changed.wait(lock, [this] { return _isEnding || !_queue.empty() || _dropped > 0; });
        if (_queue.empty() && _dropped == 0)
            return;
        Lines lines = std::exchange(_queue, {});
        _queuedBytes = 0;
        if (const std::size_t dropped = std::exchange(_dropped, 0); dropped > 0)
            lines.push_back({Priority::warning, text("%zu log lines were dropped", dropped)});
        _isWriting = true;
        lock.unlock();
        _writer(lines);
        lock.lock();
        _isWriting = false;
        _changed.notify_all();
    }
}

} // namespace orvex
