#include "OfflineSession.h"

namespace orvex {

OfflineSession::OfflineSession(std::unique_ptr<LogGenerator> generator, std::size_t refreshEvery)
    : _generator(std::move(generator))
    , _refreshEvery(refreshEvery)
{
}

void OfflineSession::take(ByteView message)
{
    _generator->updateState(_state, message);
    ++_messageCount;
    if (_refreshEvery != 0 && _messageCount % _refreshEvery == 0)
        _generator->generateLogUsingState(_state);
}

} // namespace orvex
