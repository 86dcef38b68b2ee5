#include "FileSystemLog.h"

#include "QueuedSystemLog.h"

#include <cerrno>
#include <cstring>

namespace orvex {

namespace {
constexpr std::size_t kMostPending = std::size_t{64} << 10;
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
