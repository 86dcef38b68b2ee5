#include "RawPackets.h"

#include "SystemLog.h"

#include <algorithm>
#include <utility>

namespace orvex {

namespace {
constexpr std::size_t kBatchesWithinLimit = 8;
}

void RawPackets::append(ByteView packet)
{
    if (_limit == 0)
        return;
    if (_size + packet.size() > _limit) {
        makeRoomFor(packet.size());
        if (packet.size() > _limit) {
            _droppedBytes += packet.size();
            return;
        }
    }
    Bytes& batch = batchWithRoomFor(packet.size());
    batch.insert(batch.end(), packet.begin(), packet.end());
    _size += packet.size();
}

void RawPackets::makeRoomFor(std::size_t length)
{
    if (!std::exchange(_hasDropped, true)) {
        systemLog(Priority::warning,
            "The raw packets since the last refresh exceed %zu bytes, dropping the oldest", _limit);
    }
    while (!_batches.empty() && _size + length > _limit) {
        _size -= _batches.front()->size();
        _droppedBytes += _batches.front()->size();
        _batches.pop_front();
    }
}

Bytes& RawPackets::batchWithRoomFor(std::size_t length)
{
    const std::size_t batchSize = _limit / kBatchesWithinLimit;
    if (_batches.empty() || (_batches.back()->size() + length > batchSize && !_batches.back()->empty())) {
        const std::size_t expected = _batches.empty() ? std::min(_expectedSize, batchSize) : batchSize;
        _batches.push_back(std::make_shared<Bytes>());
        _batches.back()->reserve(std::max(expected, length));
    }
    return *_batches.back();
}

BytesRef RawPackets::take()
{
    _expectedSize = std::exchange(_size, 0);
    _hasDropped = false;
    auto batches = std::exchange(_batches, {});
    if (batches.size() == 1)
        return batches.front();
    auto result = std::make_shared<Bytes>();
    result->reserve(_expectedSize);
    for (BytesRef& batch : batches) {
        result->insert(result->end(), batch->begin(), batch->end());
        batch.reset(); // so that the data is never held twice
    }
    return result;
}

} // namespace orvex
