#pragma once

#include "LogGenerator.h"

#include <memory>
#include <utility>

namespace orvex {

// A session without a telephony service: takes messages in order and asks for the display now and then, as
// the refresh of a live session does.
class OfflineSession {
public:
    // With `refreshEvery` 0, only display() asks for the display.
    OfflineSession(std::unique_ptr<LogGenerator> generator, std::size_t refreshEvery)
        : _generator(std::move(generator))
        , _refreshEvery(refreshEvery)
    {
    }

    void take(ByteView message)
    {
        _generator->updateState(_state, message);
        ++_messageCount;
        if (_refreshEvery != 0 && _messageCount % _refreshEvery == 0)
            _generator->generateLogUsingState(_state);
    }
    std::size_t messageCount() const { return _messageCount; }

    // Asks for the display once more.
    Value display() { return _generator->generateLogUsingState(_state); }
    // The display as it stands, without asking for it. Later messages change it.
    const Value& shown() const { return _state["Display"]; }
    // What a snapshot of the session stores.
    ArrayRef saveContents() const { return _generator->getSaveContentsFromState(_state); }
    std::size_t droppedRawBytes() const { return _generator->droppedRawBytes(); }

private:
    std::unique_ptr<LogGenerator> _generator;
    std::size_t _refreshEvery;
    std::size_t _messageCount = 0;
    Dictionary _state;
};

} // namespace orvex
