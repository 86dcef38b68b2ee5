#pragma once

#include "LogGenerator.h"

#include <memory>

namespace orvex {

// A session without a telephony service: takes messages in order and asks for the display now and then, as
// the refresh of a live session does.
class OfflineSession {
public:
    // With `refreshEvery` 0 the display is asked for by display() alone.
    OfflineSession(std::unique_ptr<LogGenerator> generator, std::size_t refreshEvery);

    void take(ByteView message);
    // Asks for the display once more.
    Value display() { return _generator->generateLogUsingState(_state); }
    // What a snapshot of the session stores.
    ArrayRef saveContents() const { return _generator->getSaveContentsFromState(_state); }
    std::size_t droppedRawBytes() const { return _generator->droppedRawBytes(); }

    std::size_t messageCount() const { return _messageCount; }

private:
    std::unique_ptr<LogGenerator> _generator;
    std::size_t _refreshEvery;
    std::size_t _messageCount = 0;
    Dictionary _state;
};

} // namespace orvex
