#include "TimelineRecording.h"

#include <cstring>
#include <utility>

namespace orvex {

TimelineRecording::TimelineRecording(std::string path, const Sampling& sampling)
    : _path(std::move(path))
    , _fields(sampling.fields)
{
    auto [file, error] = openOutputFile(_path);
    if (!file) {
        _failure = _path + ": " + error;
        return;
    }
    _file = std::move(file);
    _buffer.emplace(*_file);
    _stream.rdbuf(&*_buffer);
    _csv.emplace(_stream);
    _timeline.emplace(_fields, *_csv);
    write();
}

void TimelineRecording::sample(Date now, const Value& display)
{
    if (!_failure.empty())
        return;
    _timeline->sample(now, display);
    write();
}

void TimelineRecording::write()
{
    _stream.flush();
    if (_buffer->error() != 0)
        _failure = _path + ": " + std::strerror(_buffer->error()); // NOLINT(concurrency-mt-unsafe)
}

} // namespace orvex
