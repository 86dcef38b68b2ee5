#include "PeekedCapture.h"

namespace orvex {

namespace {
constexpr std::size_t kMostMessages = 10'000;
constexpr std::size_t kMostBytes = std::size_t{16} << 20;
} // namespace

TechnologyGuess::Counts PeekedCapture::peekCodes()
{
    TechnologyGuess::Counts counts;
    std::size_t bytes = 0;
    while (!_endingSeen && _peeked.size() < kMostMessages && bytes < kMostBytes) {
        if (const Status status = _reader->next(); status != Status::message) {
            _endingSeen = status;
            break;
        }
        const ByteView message = _reader->message();
        _peeked.push_back({Bytes(message.begin(), message.end()), _reader->time()});
        bytes += message.size();
        ++counts[codeOfMessage(message)];
    }
    return counts;
}

CaptureReader::Status PeekedCapture::next()
{
    if (_peeked.empty())
        return readOn();
    _current = std::move(_peeked.front().bytes);
    const std::chrono::microseconds time = _peeked.front().time;
    _peeked.pop_front();
    return yield(_current, time);
}

CaptureReader::Status PeekedCapture::readOn()
{
    const Status status = _endingSeen ? *_endingSeen : _reader->next();
    if (status == Status::message)
        return yield(_reader->message(), _reader->time());
    if (status == Status::broken)
        failAs(*_reader);
    return status;
}

} // namespace orvex
