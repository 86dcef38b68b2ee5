#include "FileSystemLog.h"

#include "QueuedSystemLog.h"

#include <cerrno>
#include <cstring>

namespace orvex {

FileSystemLog::FileSystemLog(const std::string& path)
    : _path(path)
    , _file(std::fopen(path.c_str(), "we"))
{
    if (!_file)
        fail();
}

void FileSystemLog::write(Priority priority, std::string_view line)
{
    if (!_file)
        return;
    _line.clear();
    appendLogLine(_line, priority, line);
    if (std::fwrite(_line.data(), 1, _line.size(), _file.get()) != _line.size())
        fail();
}

void FileSystemLog::flush()
{
    if (_file && std::fflush(_file.get()) != 0)
        fail();
}

void FileSystemLog::fail()
{
    if (_error.empty())
        _error = _path + ": " + std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
}

} // namespace orvex
