#include "ReadAhead.h"

#include <utility>

namespace orvex {

namespace {
constexpr std::size_t kBatchBytes = std::size_t{128} << 10;
}

void ReadAhead::Batch::clear()
{
    bytes.clear();
    entries.clear();
}

ReadAhead::ReadAhead(std::unique_ptr<CaptureReader> reader)
    : CaptureReader({})
    , _reader(std::move(reader))
    , _thread([this] { read(); })
{
}

ReadAhead::~ReadAhead()
{
    {
        const std::lock_guard lock(_mutex);
        _isLeft = true;
    }
    _changed.notify_one();
    _thread.join();
}

CaptureReader::Status ReadAhead::next()
{
    while (_next == _batch.entries.size()) {
        if (_batch.following != Status::message)
            return _batch.following;
        takeBatch();
    }
    const auto& [length, time] = _batch.entries[_next++];
    const ByteView message = ByteView(_batch.bytes).subspan(_offset, length);
    _offset += length;
    return yield(message, time);
}

void ReadAhead::takeBatch()
{
    {
        std::unique_lock lock(_mutex);
        _changed.wait(lock, [this] { return _isRead; });
        std::swap(_batch, _read);
        _isRead = false;
    }
    _changed.notify_one();
    _next = 0;
    _offset = 0;
    if (_batch.following == Status::message)
        return;
    // The thread no longer uses the reader from here on.
    _omissions = _reader->omissions();
    if (_batch.following == Status::broken)
        failAs(*_reader);
}

void ReadAhead::read()
{
    Batch batch; // swapped with the others, so that all keep their storage
    while (batch.following == Status::message) {
        batch.clear();
        while (batch.bytes.size() < kBatchBytes && (batch.following = _reader->next()) == Status::message) {
            const ByteView message = _reader->message();
            batch.bytes.insert(batch.bytes.end(), message.begin(), message.end());
            batch.entries.push_back({message.size(), _reader->time()});
        }
        const Status following = batch.following;
        std::unique_lock lock(_mutex);
        _changed.wait(lock, [this] { return !_isRead || _isLeft; });
        if (_isLeft)
            return;
        std::swap(batch, _read);
        batch.following = following;
        _isRead = true;
        lock.unlock();
        _changed.notify_one();
    }
}

} // namespace orvex
